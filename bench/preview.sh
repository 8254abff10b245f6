#!/usr/bin/env bash
# The preview's pace in the program's window under Xvfb (software rendering).
set -euo pipefail
build=${BUILD_DIR:-build-bench}
cmake --build "$build" --target preview-pace >/dev/null
xvfb-run -a -s "-screen 0 1296x839x24" "$build/bin/preview-pace" --first-screen
xvfb-run -a -s "-screen 0 1296x839x24" "$build/bin/preview-pace" "${PREVIEW_SECONDS:-10}"
