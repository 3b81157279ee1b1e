#!/usr/bin/env bash
# The main job: builds the library and its console program, then converts times
# and timecode with it, from the command line and from lines on standard input.
set -euo pipefail
cd "$(dirname "$0")/.."
bash scripts/install-deps.sh
out=${ZMT_BUILD_ROOT:-build}/main
cmake -S . -B "$out" -DCMAKE_BUILD_TYPE=Release -DZMT_BUILD_TESTS=OFF >/dev/null
cmake --build "$out" -j "$(nproc)" >/dev/null
console="$out/tools/zebmediatypes-console"

run() { printf '$ zebmediatypes-console %s\n' "$*"; "$console" "$@"; }

# 1800 frames at 29.97 fps, drop-frame and not, and the drop-frame timecode
# typed back.
run zebmediatypes.TimeToTimecode 1800 29.97 29.97 -d
run zebmediatypes.TimeToTimecode 1800 29.97 29.97
run zebmediatypes.TimecodeToTime "00;01;00;02" 29.97 29.97 -d
# Seconds, snapped to the nearest source frame.
run zebmediatypes.TimeToTimecode -s 8.03 25 25

# The same program reading one command a line until "quit".
echo '$ zebmediatypes-console <<lines'
"$console" <<'LINES'
zebmediatypes.TimeToTimecode 86400 23.976 25
zebmediatypes.TimeToTimecode 17982 29.97 29.97 -d
zebmediatypes.TimecodeToTime 00;10;00;00 29.97 29.97 -d
zebmediatypes.TimecodeToTime 1:2:3:4:5 25 25
quit
LINES
