#!/usr/bin/env bash
# The whole test suite, from a fresh clone:
#   1. installs the Debian packages (scripts/install-deps.sh);
#   2. clang build with AddressSanitizer + UndefinedBehaviorSanitizer and
#      libFuzzer instrumentation, warnings as errors: every unit test, then each
#      fuzz target for a short, bounded time (ZMT_FUZZ_SECONDS, default 30);
#   3. g++ ThreadSanitizer build: the tests that exercise shared state;
#   4. g++ optimized build, warnings as errors: the exhaustive sweeps, the
#      benchmarks built (not run), the tools, install, the consumer project
#      built against the install, and the installed script runner running the
#      example script.
# Build folders live under build/ (ZMT_BUILD_ROOT to move them).
set -euo pipefail
cd "$(dirname "$0")/.."
root=$(pwd)
out=${ZMT_BUILD_ROOT:-$root/build}
jobs=${ZMT_JOBS:-$(nproc)}
fuzz_seconds=${ZMT_FUZZ_SECONDS:-30}

bash scripts/install-deps.sh

step() { printf '\n==== [%4ds] %s\n' "$SECONDS" "$*"; }

configure() {  # configure <dir> <cmake args...>
  local dir=$1; shift
  cmake -S "$root" -B "$dir" -G "Unix Makefiles" -Wno-dev "$@" >/dev/null
}

step "clang ASan + UBSan build: unit tests"
CXX=clang++-14 configure "$out/asan" -DCMAKE_BUILD_TYPE=Debug -DZMT_WERROR=ON \
  -DZMT_SANITIZE=address,undefined -DZMT_BUILD_FUZZERS=ON -DCMAKE_CXX_FLAGS="-O1"
cmake --build "$out/asan" -j "$jobs"
ASAN_OPTIONS=detect_leaks=1:abort_on_error=1 UBSAN_OPTIONS=print_stacktrace=1 \
  ctest --test-dir "$out/asan" -L 'unit|concurrency' --output-on-failure -j "$jobs"

step "libFuzzer targets from the same build (${fuzz_seconds}s each)"
ZMT_FUZZ_SECONDS=$fuzz_seconds bash scripts/fuzz.sh "$out/asan"

step "ThreadSanitizer build: concurrency tests"
configure "$out/tsan" -DCMAKE_BUILD_TYPE=Debug -DZMT_WERROR=ON -DZMT_SANITIZE=thread \
  -DZMT_CONCURRENCY_TESTS_ONLY=ON -DZMT_BUILD_TOOLS=OFF -DCMAKE_CXX_FLAGS="-O1"
cmake --build "$out/tsan" -j "$jobs"
TSAN_OPTIONS=halt_on_error=1:second_deadlock_stack=1 \
  ctest --test-dir "$out/tsan" -L concurrency --output-on-failure --no-tests=ignore

step "g++ optimized build: exhaustive sweeps, benchmarks, tools, install, consumer"
configure "$out/release" -DCMAKE_BUILD_TYPE=Release -DZMT_WERROR=ON -DZMT_BUILD_BENCHMARKS=ON \
  -DCMAKE_INSTALL_PREFIX="$out/install"
cmake --build "$out/release" -j "$jobs"
ctest --test-dir "$out/release" -L exhaustive --output-on-failure -j "$jobs"
rm -rf "$out/install"
cmake --install "$out/release" >/dev/null
cmake -S "$root/tests/consumer" -B "$out/consumer" -DCMAKE_PREFIX_PATH="$out/install" >/dev/null
cmake --build "$out/consumer" -j "$jobs"
LD_LIBRARY_PATH="$out/install/lib" "$out/consumer/zebmediatypes-consumer"
"$out/install/bin/zebmediatypes-script" "$out/install/share/zebmediatypes/examples/time.js"

step "All checks passed"
