#!/usr/bin/env bash
# Prints the size of the test code against the size of the code it tests.
#
# Both are counted in characters with white space left out, after dropping
# blank lines and comment lines (// and /* */ in C++ and JavaScript, # in shell).
#   tests:  tests/ (C++, JavaScript and shell; fuzz targets and the consumer included)
#   code:   include/, src/, zebcore/, zebscripting/, tools/ (C++; benchmarks excluded)
set -euo pipefail
cd "$(dirname "$0")/.."

count() {  # count <file...>: non-white characters outside comment lines
  [ "$#" -eq 0 ] && { echo 0; return; }
  awk '
    FNR == 1 { in_block = 0; shell = (FILENAME ~ /\.sh$/) }
    {
      line = $0
      if (in_block) { if (line ~ /\*\//) { in_block = 0 } ; next }
      if (line ~ /^[ \t]*\/\*/) { if (line !~ /\*\//) { in_block = 1 } ; next }
      if (line ~ /^[ \t]*\/\//) next
      if (shell && line ~ /^[ \t]*#/) next
      gsub(/[ \t\r]/, "", line)
      total += length(line)
    }
    END { print total + 0 }' "$@"
}

mapfile -t test_files < <(git ls-files -co --exclude-standard tests |
  grep -E '\.(cpp|h|js|sh)$' | grep -v '/corpus/')
mapfile -t code_files < <(git ls-files -co --exclude-standard include src zebcore zebscripting tools |
  grep -E '\.(cpp|h|c)$' || true)

tests=$(count "${test_files[@]}")
code=$(count "${code_files[@]}")
printf 'tests: %d characters in %d files\n' "$tests" "${#test_files[@]}"
printf 'code:  %d characters in %d files\n' "$code" "${#code_files[@]}"
awk -v t="$tests" -v c="$code" 'BEGIN { printf "share: %.1f%%\n", c ? 100 * t / c : 0 }'
