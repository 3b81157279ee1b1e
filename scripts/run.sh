#!/usr/bin/env bash
# The main job: builds the library and its tools and shows them at work.
set -euo pipefail
cd "$(dirname "$0")/.."
bash scripts/install-deps.sh
out=${ZMT_BUILD_ROOT:-build}/main
cmake -S . -B "$out" -DCMAKE_BUILD_TYPE=Release -DZMT_BUILD_TESTS=OFF >/dev/null
cmake --build "$out" -j "$(nproc)" >/dev/null
"$out/tools/zebmediatypes-demo"
