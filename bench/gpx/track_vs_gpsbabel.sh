#!/usr/bin/env bash
# Reads and converts a generated 200,000-point GPX track with `tourlet-cli track` and reads
# it with gpsbabel, several runs each; prints the medians, their ratio and the peak memory
# of the conversion against the file size. BUILD_DIR is the benchmark build folder.
set -euo pipefail
build="${BUILD_DIR:-build-bench}"
writer="$build/bench/gpx/bench_gpx_read"
cli="$build/bin/tourlet-cli"
runs="${RUNS:-5}"
command -v gpsbabel >/dev/null || { echo "gpsbabel not installed, skipped"; exit 0; }
for exe in "$writer" "$cli"; do [ -x "$exe" ] || { echo "missing $exe"; exit 1; }; done
folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT
track="$folder/long.gpx"
"$writer" --write-gpx="$track"
bytes=$(stat -c %s "$track")

median() { sort -n | awk '{v[NR]=$1} END {print (NR % 2) ? v[(NR+1)/2] : (v[NR/2] + v[NR/2+1]) / 2}'; }
elapsed_ms() {
  local start=$(date +%s%N)
  "$@" >/dev/null
  echo $(( ($(date +%s%N) - start) / 1000000 ))
}

ours=(); theirs=()
for _ in $(seq "$runs"); do
  ours+=("$(elapsed_ms "$cli" track "$track")")
  theirs+=("$(elapsed_ms gpsbabel -i gpx -f "$track" -o unicsv -F /dev/null)")
done
our_median=$(printf '%s\n' "${ours[@]}" | median)
their_median=$(printf '%s\n' "${theirs[@]}" | median)
peak_kb=$(/usr/bin/time -f %M "$cli" track "$track" 2>&1 >/dev/null | tail -1)

echo "track file: $((bytes / 1000000)) MB, $runs runs each"
echo "tourlet-cli track (read + convert): median ${our_median} ms"
echo "gpsbabel -i gpx -o unicsv (read):   median ${their_median} ms"
awk -v a="$our_median" -v b="$their_median" 'BEGIN {printf "ratio of medians: %.2f (goal < 1)\n", a / b}'
awk -v k="$peak_kb" -v s="$bytes" 'BEGIN {printf "peak memory: %.1f MB = %.2f x file size (goal < 10)\n", k / 1024, k * 1024 / s}'
