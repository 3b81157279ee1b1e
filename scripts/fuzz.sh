#!/usr/bin/env bash
# Runs every fuzz target of a fuzz build for ZMT_FUZZ_SECONDS seconds each
# (default 20), starting from its seed corpus. A crash, a sanitizer report or a
# leak fails the run. For a longer session:
#   ZMT_FUZZ_SECONDS=3600 bash scripts/fuzz.sh build/asan
set -euo pipefail
build=${1:?usage: fuzz.sh <fuzz build folder>}
seconds=${ZMT_FUZZ_SECONDS:-20}
list="$build/fuzzers.txt"
[ -s "$list" ] || { echo "fuzz.sh: no fuzz targets in $list"; exit 0; }
passed=0
while read -r name exe corpus; do
  [ -n "$name" ] || continue
  work=$(mktemp -d)
  [ -d "$corpus" ] && cp -rL "$corpus"/. "$work"/
  echo "fuzz: $name for ${seconds}s"
  ASAN_OPTIONS=detect_leaks=1 "$exe" -max_total_time="$seconds" -timeout=10 -rss_limit_mb=2048 \
    -print_final_stats=0 "$work" 2> "$work.log" || { tail -50 "$work.log"; echo "fuzz: $name FAILED"; exit 1; }
  tail -1 "$work.log"
  rm -rf "$work" "$work.log"
  passed=$((passed + 1))
done < "$list"
echo "fuzz: $passed targets ran clean"
