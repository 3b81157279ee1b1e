#!/usr/bin/env bash
# Runs zebmediatypes-console on real input and checks its output and exit codes.
#   console_test.sh <path to zebmediatypes-console>
set -uo pipefail
console=${1:?usage: console_test.sh <zebmediatypes-console>}
failures=0

# expect <name> <wanted exit code> <wanted stdout> <wanted stderr pattern> -- <command...>
# An empty pattern wants an empty standard error, any other exactly one line.
expect() {
  local name=$1 code=$2 out=$3 err=$4 got_out got_err got_code
  shift 5
  got_out=$("$@" 2>/tmp/console_test.$$)
  got_code=$?
  got_err=$(cat /tmp/console_test.$$)
  rm -f /tmp/console_test.$$
  if [ "$got_code" != "$code" ] || [ "$got_out" != "$out" ] ||
     { [ -z "$err" ] && [ -n "$got_err" ]; } ||
     { [ -n "$err" ] && { ! grep -q -- "$err" <<<"$got_err" || [ "$(wc -l <<<"$got_err")" != 1 ]; }; }; then
    printf 'FAIL %s: exit %s, output "%s", error "%s"\n' "$name" "$got_code" "$got_out" "$got_err"
    failures=$((failures + 1))
  fi
}

df="Timecode at time 1800 in a 29.97 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps is: 00;01;00;02"
ndf="Timecode at time 1800 in a 29.97 fps clip, displayed at 29.97 fps Non-Drop-Frame Timecode fps is: 00:01:00:00"
back="00;01;00;02 in a 29.97 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps is: 60.06 seconds (1800 frames)"

expect "one command" 0 "$df" "" -- "$console" zebmediatypes.TimeToTimecode 1800 29.97 29.97 -d
expect "typed back" 0 "$back" "" -- "$console" zebmediatypes.TimecodeToTime "00;01;00;02" 29.97 29.97 -d
# What the commands print after "fps is: ": frames are truncated, seconds snap
# to the nearest frame, times beyond +-100 hours are clamped (hours wrap), and a
# timecode that does not read or has no source rate is INVALID.
while IFS='|' read -r arguments want; do
  # shellcheck disable=SC2086  # the arguments are split at blanks on purpose
  got=$("$console" $arguments)
  if [ "${got##*fps is: }" != "$want" ]; then
    echo "FAIL $arguments: '$got' does not end in '$want'"; failures=$((failures + 1))
  fi
done <<'ROWS'
zebmediatypes.TimeToTimecode 48 23.976 25|00:00:01:23
zebmediatypes.TimeToTimecode 1.9 25 25|00:00:00:01
zebmediatypes.TimeToTimecode -S 8.03 25 25|00:00:08:01
zebmediatypes.TimeToTimecode -s 60.06 29.97 29.97 -d|00;01;00;02
zebmediatypes.TimeToTimecode -s abc 25 25|00:00:00:00
zebmediatypes.TimeToTimecode -s 1e300 25 25|04:00:00:00
zebmediatypes.TimecodeToTime -00:00:01:00 25 25|-1 seconds (-25 frames)
zebmediatypes.TimecodeToTime 1:2:3:4:5 25 25|INVALID
zebmediatypes.TimecodeToTime 00:00:01:00 0 0|INVALID
ROWS
expect "unknown command" 2 "" "unknown command 'nosuch'" -- "$console" nosuch 1 2 3
expect "unknown option" 2 "" "unknown option '--bogus'" -- "$console" --bogus
# Arguments reach the command joined by blanks: one that is empty or holds a
# blank would shift the others, so it is refused.
expect "empty argument" 2 "" "argument 2 is empty" -- "$console" zebmediatypes.TimecodeToTime "" 25 25
expect "blank inside" 2 "" "argument 2 holds a blank" -- "$console" zebmediatypes.TimecodeToTime "1 2" 25 25
expect "line break inside" 2 "" "argument 3 holds a blank" -- "$console" zebmediatypes.TimecodeToTime 1 $'25\n' 25

# Help: the usage, then every command and its text within 80 columns.
help=$("$console" --help && "$console" help); code=$?
if [ $code != 0 ] || ! grep -q '^usage: zebmediatypes-console' <<<"$help" ||
   ! grep -q '^zebmediatypes.TimeToTimecode$' <<<"$help" ||
   ! grep -q 'This command will convert a timecode string' <<<"$help" ||
   awk 'length > 80 { found = 1 } END { exit !found }' <<<"$help"; then
  echo "FAIL help: exit $code, output '$help'"; failures=$((failures + 1))
fi

# Lines from standard input, until "quit": the line after it is not run.
lines=$(printf '%s\n' "zebmediatypes.TimeToTimecode 1800 29.97 29.97 -d" "" \
  "  zebmediatypes.TimecodeToTime   00;01;00;02 29.97 29.97 -d" quit \
  "zebmediatypes.TimeToTimecode 1800 29.97 29.97")
expect "reading until quit" 0 "$df"$'\n'"$back" "" -- "$console" <<<"$lines"
# ... and until the end of input; an unknown line is reported and reading goes on.
lines=$(printf '%s\n' "nosuch" "zebmediatypes.TimeToTimecode 1800 29.97 29.97")
expect "reading until the end" 2 "$ndf" "unknown command 'nosuch'" -- "$console" <<<"$lines"

if [ $failures != 0 ]; then
  echo "console_test: $failures failures"
  exit 1
fi
echo "console_test: all passed"
