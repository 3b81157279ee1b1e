#!/usr/bin/env bash
# Runs zebmediatypes-script on real input and checks its output and exit codes.
#   script_runner_test.sh <path to zebmediatypes-script> <examples folder>
set -uo pipefail
runner=${1:?usage: script_runner_test.sh <zebmediatypes-script> <examples folder>}
examples=${2:?usage: script_runner_test.sh <zebmediatypes-script> <examples folder>}
failures=0
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT

# expect <name> <wanted exit code> <wanted stdout> <wanted stderr (exact, or *)> -- <command...>
expect() {
  local name=$1 wanted="$2|$3|$4" err=$4 out code
  shift 5
  out=$("$@" 2>"$work/err")
  code=$?
  [ "$err" = "*" ] || err=$(cat "$work/err")
  if [ "$code|$out|$err" != "$wanted" ]; then
    printf 'FAIL %s\n  got:    %s\n  wanted: %s\n' "$name" "$code|$out|$err" "$wanted"
    failures=$((failures + 1))
  fi
}

printf 'var t = new zebmediatypes.TickTime();\nt.ticksNumber = 5;\nt.seconds = NaN;\n' > "$work/refused.js"
printf 'print(scriptArgs.length, scriptArgs.join("|"));\n' > "$work/args.js"
printf 'print(1 + 1)\nnew zebmediatypes.TickTime().ticks\nundefined\nnosuch\nprint("after")\n' > "$work/lines"

expect "-e" 0 "2 x 3.5" "" -- "$runner" -e 'print(1 + 1, "x", 3.5)'
expect "arguments" 0 "3 a|b c|" "" -- "$runner" "$work/args.js" a "b c" ""
expect "refused write" 1 "" "$work/refused.js:3: RangeError: TickTime.seconds: the value was refused" -- "$runner" "$work/refused.js"
expect "thrown value" 1 "" "<code>:0: Error: uncaught 5" -- "$runner" -e 'throw 5'
expect "syntax error" 1 "" "*" -- "$runner" -e '('
expect "timeout" 1 "" "<code>:1: RangeError: execution timeout" -- "$runner" --timeout 0.2 -e 'while (true) {}'
expect "memory" 1 "" "*" -- "$runner" --memory 4 -e 'var s = "x", a = []; while (true) { s += s; a.push(s + a.length); }'
expect "no file" 2 "" "zebmediatypes-script: cannot read $work/none.js" -- "$runner" "$work/none.js"
expect "bad option" 2 "" "*" -- "$runner" --bogus
expect "bad timeout" 2 "" "*" -- "$runner" --timeout x -e '1'
expect "-e without code" 2 "" "*" -- "$runner" -e
expect "lines" 0 "$(printf '2\n0\nafter')" "<stdin>:1: ReferenceError: identifier 'nosuch' undefined" -- "$runner" < "$work/lines"
expect "example" 0 "$(printf '60.06 s is 15256200960000 ticks, timecode 00;01;00;02\n00;10;00;00 is 599.9994 s\na 59.94 field lasts 1001/60000 s\naudio: 48000 Hz, 24 bit, 5.1 (L, R, C, LFE, Ls, Rs)\nvideo: pixel format uyvy true\nrefused: RangeError TickTime.ticksNumber: the value was refused')" "" -- "$runner" "$examples/time.js"

if [ "$failures" -ne 0 ]; then
  echo "$failures failures"
  exit 1
fi
echo "script runner: all cases hold"
