#!/usr/bin/env bash
# Encodes the same synthetic 1920x1080 frames with `tourlet-cli encode` (through the
# export worker and the encoder library) and with the ffmpeg command line reading the
# raw BGRX frames from a pipe with the codec settings of the library, several runs
# each, and prints the ratio of the median wall times. Goal: at most 1.2.
set -euo pipefail

build=${BUILD_DIR:-build}
cli="$build/bin/tourlet-cli"
frames=${FRAMES:-300}
runs=${RUNS:-3}
size=1920x1080

[ -x "$cli" ] || { echo "encode.sh: $cli is not built" >&2; exit 1; }
command -v ffmpeg >/dev/null || { echo "encode.sh: ffmpeg is not installed" >&2; exit 1; }

tmp=$(mktemp -d)
trap 'rm -rf "$tmp"' EXIT

now() { date +%s.%N; }
calc() { awk "BEGIN { print $1 }"; }
median() { printf '%s\n' "$@" | sort -g | awk '{v[NR]=$1} END {print (NR%2) ? v[(NR+1)/2] : (v[NR/2]+v[NR/2+1])/2}'; }

ours=()
theirs=()
for run in $(seq "$runs"); do
    start=$(now)
    "$cli" encode --frames "$frames" --size "$size" -o "$tmp/ours.mp4" >"$tmp/ours.json"
    ours+=("$(calc "$(now) - $start")")

    # Same settings as the library: x264 veryfast, 40 Mbit/s, key frame every 2 s,
    # BT.709 limited range, index at the front.
    start=$(now)
    "$cli" encode --frames "$frames" --size "$size" --raw -o - |
        ffmpeg -v error -y -f rawvideo -pix_fmt bgra -s "$size" -r 30 -i - \
            -vf scale=out_color_matrix=bt709:out_range=tv -pix_fmt yuv420p \
            -c:v libx264 -preset veryfast -b:v 40M -g 60 \
            -colorspace bt709 -color_primaries bt709 -color_trc bt709 -color_range tv \
            -movflags +faststart "$tmp/ffmpeg.mp4"
    theirs+=("$(calc "$(now) - $start")")
    echo "run $run: tourlet-cli ${ours[-1]} s, ffmpeg ${theirs[-1]} s"
done

m_ours=$(median "${ours[@]}")
m_theirs=$(median "${theirs[@]}")
printf 'frames %d at %s, %d runs each\n' "$frames" "$size" "$runs"
printf 'median tourlet-cli %.2f s (%.1f fps), median ffmpeg %.2f s (%.1f fps)\n' \
    "$m_ours" "$(calc "$frames / $m_ours")" "$m_theirs" "$(calc "$frames / $m_theirs")"
printf 'ratio tourlet-cli / ffmpeg = %.3f (goal <= 1.2)\n' "$(calc "$m_ours / $m_theirs")"
