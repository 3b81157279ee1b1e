#!/usr/bin/env bash
# Checks that each README.md block introduced by a line "<!-- file: PATH -->"
# holds exactly the text of PATH (relative to the repository).
#   readme_example_test.sh <repository>
set -uo pipefail
root=${1:?usage: readme_example_test.sh <repository>}
checked=0
failures=0
while IFS= read -r path; do
  block=$(awk -v marker="<!-- file: $path -->" '
    $0 == marker { found = 1; next }
    found && /^```/ { if (inside) exit; inside = 1; next }
    inside { print }' "$root/README.md")
  if ! diff -u --label "$path" --label "README.md block" "$root/$path" <(printf '%s\n' "$block"); then
    echo "FAIL: the README block for $path is not the file's text"
    failures=$((failures + 1))
  fi
  checked=$((checked + 1))
done < <(sed -n 's/^<!-- file: \(.*\) -->$/\1/p' "$root/README.md")
if [ "$checked" -lt 2 ]; then
  echo "FAIL: README.md quotes $checked files; the consumer's CMakeLists.txt and main.cpp expected"
  exit 1
fi
[ "$failures" = 0 ] && echo "readme_example_test: $checked blocks match their files"
