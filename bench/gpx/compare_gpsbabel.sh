#!/usr/bin/env bash
# Times the reference conversion of the benchmark's generated track, for comparison with
# bench_gpx_read. BUILD_DIR is the benchmark build folder.
set -euo pipefail
exe="${BUILD_DIR:-build-bench}/bench/gpx/bench_gpx_read"
command -v gpsbabel >/dev/null || { echo "gpsbabel not installed, skipped"; exit 0; }
[ -x "$exe" ] || { echo "missing $exe"; exit 1; }
folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT
"$exe" --write-gpx="$folder/long.gpx"
best=""
for _ in 1 2 3; do
  start=$(date +%s%N)
  gpsbabel -i gpx -f "$folder/long.gpx" -o unicsv -F /dev/null
  ms=$(( ($(date +%s%N) - start) / 1000000 ))
  [ -z "$best" ] || [ "$ms" -lt "$best" ] && best=$ms
done
echo "gpsbabel -i gpx -o unicsv on $(du -m "$folder/long.gpx" | cut -f1) MB: best of 3 ${best} ms"
