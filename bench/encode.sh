#!/usr/bin/env bash
# Encodes the same synthetic 1920x1080 frames with `tourlet-cli encode` (through the
# export worker and the encoder library) and with the ffmpeg command line reading the
# raw BGRX frames from a pipe with the codec settings of the library, several runs
# each, interleaved, and prints the ratio of the median wall times (goal: at most 1.2).
# The CPU time ratio is printed too: it is less disturbed by other load on the machine.
set -euo pipefail

build=${BUILD_DIR:-build}
cli="$build/bin/tourlet-cli"
frames=${FRAMES:-300}
runs=${RUNS:-5}
size=1920x1080

[ -x "$cli" ] || { echo "encode.sh: $cli is not built" >&2; exit 1; }
command -v ffmpeg >/dev/null || { echo "encode.sh: ffmpeg is not installed" >&2; exit 1; }

tmp=$(mktemp -d)
trap 'rm -rf "$tmp"' EXIT

calc() { awk "BEGIN { print $1 }"; }
median() { printf '%s\n' "$@" | sort -g | awk '{v[NR]=$1} END {print (NR%2) ? v[(NR+1)/2] : (v[NR/2]+v[NR/2+1])/2}'; }

with_worker() {
    "$cli" encode --frames "$frames" --size "$size" -o "$tmp/ours.mp4" >"$tmp/ours.json"
}

# Same settings as the library: x264 veryfast, 40 Mbit/s, key frame every 2 s,
# BT.709 limited range, index at the front.
with_ffmpeg() {
    "$cli" encode --frames "$frames" --size "$size" --raw -o - |
        ffmpeg -v error -y -f rawvideo -pix_fmt bgra -s "$size" -r 30 -i - \
            -vf scale=out_color_matrix=bt709:out_range=tv -pix_fmt yuv420p \
            -c:v libx264 -preset veryfast -b:v 40M -g 60 \
            -colorspace bt709 -color_primaries bt709 -color_trc bt709 -color_range tv \
            -movflags +faststart "$tmp/ffmpeg.mp4"
}

# Prints "wall cpu" in seconds for one call.
measure() {
    local TIMEFORMAT='%R %U %S' times
    times=$({ time "$@" 2>"$tmp/stderr" ; } 2>&1) || { cat "$tmp/stderr" >&2; return 1; }
    set -- $times
    echo "$1 $(calc "$2 + $3")"
}

ours_wall=(); ours_cpu=(); ff_wall=(); ff_cpu=()
for run in $(seq "$runs"); do
    read -r wall cpu < <(measure with_worker) && [ -n "$wall" ] || { echo "encode.sh: tourlet-cli failed" >&2; exit 1; }
    ours_wall+=("$wall"); ours_cpu+=("$cpu")
    read -r wall cpu < <(measure with_ffmpeg) && [ -n "$wall" ] || { echo "encode.sh: ffmpeg failed" >&2; exit 1; }
    ff_wall+=("$wall"); ff_cpu+=("$cpu")
    echo "run $run: tourlet-cli ${ours_wall[-1]} s (cpu ${ours_cpu[-1]} s), ffmpeg ${ff_wall[-1]} s (cpu ${ff_cpu[-1]} s)"
done

ow=$(median "${ours_wall[@]}"); fw=$(median "${ff_wall[@]}")
oc=$(median "${ours_cpu[@]}"); fc=$(median "${ff_cpu[@]}")
printf 'frames %d at %s, %d runs each, %d cores\n' "$frames" "$size" "$runs" "$(nproc)"
printf 'median tourlet-cli %.2f s (%.1f fps), median ffmpeg %.2f s (%.1f fps)\n' \
    "$ow" "$(calc "$frames / $ow")" "$fw" "$(calc "$frames / $fw")"
printf 'cpu ratio tourlet-cli / ffmpeg = %.3f\n' "$(calc "$oc / $fc")"
printf 'ratio tourlet-cli / ffmpeg = %.3f (goal <= 1.2)\n' "$(calc "$ow / $fw")"
