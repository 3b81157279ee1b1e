#!/usr/bin/env bash
# Runs zebmediatypes-console on real input and checks its output and exit codes.
#   console_test.sh <path to zebmediatypes-console>
set -uo pipefail
console=${1:?usage: console_test.sh <zebmediatypes-console>}
failures=0

# expect <name> <wanted exit code> <wanted stdout> <wanted stderr pattern> -- <command...>
expect() {
  local name=$1 code=$2 out=$3 err=$4
  shift 5
  local got_out got_err got_code
  got_out=$("$@" 2>/tmp/console_test.$$)
  got_code=$?
  got_err=$(cat /tmp/console_test.$$)
  rm -f /tmp/console_test.$$
  if [ "$got_code" != "$code" ]; then
    echo "FAIL $name: exit code $got_code, wanted $code"; failures=$((failures + 1))
  fi
  if [ "$got_out" != "$out" ]; then
    printf 'FAIL %s: output\n  got:    %s\n  wanted: %s\n' "$name" "$got_out" "$out"
    failures=$((failures + 1))
  fi
  if [ -n "$err" ] && { ! grep -q -- "$err" <<<"$got_err" || [ "$(wc -l <<<"$got_err")" != 1 ]; }; then
    echo "FAIL $name: standard error '$got_err' lacks '$err'"; failures=$((failures + 1))
  fi
  if [ -z "$err" ] && [ -n "$got_err" ]; then
    echo "FAIL $name: unexpected standard error '$got_err'"; failures=$((failures + 1))
  fi
}

df="Timecode at time 1800 in a 29.97 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps is: 00;01;00;02"
ndf="Timecode at time 1800 in a 29.97 fps clip, displayed at 29.97 fps Non-Drop-Frame Timecode fps is: 00:01:00:00"
back="00;01;00;02 in a 29.97 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps is: 60.06 seconds (1800 frames)"

expect "one command" 0 "$df" "" -- "$console" zebmediatypes.TimeToTimecode 1800 29.97 29.97 -d
expect "non-drop" 0 "$ndf" "" -- "$console" zebmediatypes.TimeToTimecode 1800 29.97 29.97
expect "typed back" 0 "$back" "" -- "$console" zebmediatypes.TimecodeToTime "00;01;00;02" 29.97 29.97 -d
expect "unknown command" 2 "" "unknown command 'nosuch'" -- "$console" nosuch 1 2 3
expect "unknown option" 2 "" "unknown option '--bogus'" -- "$console" --bogus
# Arguments reach the command joined by blanks: one that is empty or holds a
# blank would shift the others, so it is refused.
expect "empty argument" 2 "" "argument 2 is empty" -- "$console" zebmediatypes.TimecodeToTime "" 25 25
expect "empty command" 2 "" "argument 1 is empty" -- "$console" ""
expect "blank inside" 2 "" "argument 2 holds a blank" -- "$console" zebmediatypes.TimecodeToTime "1 2" 25 25
expect "line break inside" 2 "" "argument 3 holds a blank" -- "$console" zebmediatypes.TimecodeToTime 1 $'25\n' 25

usage=$("$console" --help); code=$?
if [ $code != 0 ] || ! grep -q '^usage: zebmediatypes-console' <<<"$usage"; then
  echo "FAIL --help: exit $code, output '$usage'"; failures=$((failures + 1))
fi
help=$("$console" help); code=$?
if [ $code != 0 ] || ! grep -q '^zebmediatypes.TimeToTimecode$' <<<"$help" ||
   ! grep -q '^zebmediatypes.TimecodeToTime$' <<<"$help" ||
   ! grep -q 'This command will convert a timecode string' <<<"$help"; then
  echo "FAIL help: exit $code, output '$help'"; failures=$((failures + 1))
fi
if awk 'length > 80 { found = 1 } END { exit !found }' <<<"$help"; then
  echo "FAIL help: lines wider than 80 columns"; failures=$((failures + 1))
fi

# Lines from standard input, until "quit": the line after it is not run.
lines=$(printf '%s\n' "zebmediatypes.TimeToTimecode 1800 29.97 29.97 -d" "" \
  "  zebmediatypes.TimecodeToTime   00;01;00;02 29.97 29.97 -d" quit \
  "zebmediatypes.TimeToTimecode 1800 29.97 29.97")
expect "reading until quit" 0 "$df"$'\n'"$back" "" -- "$console" <<<"$lines"
# ... and until the end of input; an unknown line is reported and reading goes on.
lines=$(printf '%s\n' "nosuch" "zebmediatypes.TimeToTimecode 1800 29.97 29.97")
expect "reading until the end" 2 "$ndf" "unknown command 'nosuch'" -- "$console" <<<"$lines"
expect "empty input" 0 "" "" -- "$console" </dev/null

if [ $failures != 0 ]; then
  echo "console_test: $failures failures"
  exit 1
fi
echo "console_test: all passed"
