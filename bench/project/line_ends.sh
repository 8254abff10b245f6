#!/usr/bin/env bash
# Opens a 200,000-sample project written with LF line ends and the same project with
# CR LF line ends (as every file from Windows has them) with `tourlet-cli project`,
# several runs each; prints the median times and the peak memory of both and their
# ratios. BUILD_DIR is the benchmark build folder.
set -euo pipefail
build="${BUILD_DIR:-build-bench}"
writer="$build/bench/gpx/bench_gpx_read"
cli="$build/bin/tourlet-cli"
runs="${RUNS:-5}"
for exe in "$writer" "$cli"; do [ -x "$exe" ] || { echo "missing $exe"; exit 1; }; done
folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT
"$writer" --write-gpx="$folder/long.gpx"
"$cli" convert "$folder/long.gpx" -o "$folder/lf.zkgeo" --aliasing 0 >/dev/null
sed 's/$/\r/' "$folder/lf.zkgeo" >"$folder/crlf.zkgeo"
samples=$(grep -c '^\[curvepoint[0-9]' "$folder/lf.zkgeo")

median() { sort -n | awk '{v[NR]=$1} END {print (NR % 2) ? v[(NR+1)/2] : (v[NR/2] + v[NR/2+1]) / 2}'; }
# One line per run: elapsed milliseconds and peak resident kilobytes.
measure() {
  for _ in $(seq "$runs"); do
    /usr/bin/time -f '%e %M' "$cli" project "$1" 2>&1 >/dev/null | tail -1 | awk '{printf "%d %d\n", $1 * 1000, $2}'
  done
}
lf=$(measure "$folder/lf.zkgeo")
crlf=$(measure "$folder/crlf.zkgeo")
lf_ms=$(awk '{print $1}' <<<"$lf" | median); lf_kb=$(awk '{print $2}' <<<"$lf" | median)
crlf_ms=$(awk '{print $1}' <<<"$crlf" | median); crlf_kb=$(awk '{print $2}' <<<"$crlf" | median)

echo "project: $samples samples, $(( $(stat -c %s "$folder/lf.zkgeo") / 1000000 )) MB, $runs runs each"
echo "LF:    median ${lf_ms} ms, peak ${lf_kb} kB"
echo "CR LF: median ${crlf_ms} ms, peak ${crlf_kb} kB"
awk -v a="$crlf_ms" -v b="$lf_ms" 'BEGIN {printf "time CR LF / LF: %.2f (goal <= 1.3)\n", a / b}'
awk -v a="$crlf_kb" -v b="$lf_kb" 'BEGIN {printf "peak memory CR LF / LF: %.2f (goal <= 1.3)\n", a / b}'
