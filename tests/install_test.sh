#!/usr/bin/env bash
# The installed package where it ends up: installs the build into a scratch
# prefix, moves the prefix, then with no LD_LIBRARY_PATH runs the console
# program and the example script from it, checks the RUNPATH and pkg-config
# file, and builds and runs tests/consumer against it.
#   install_test.sh <build dir> <source dir> <C++ compiler> <bindir> <libdir>
set -euo pipefail
build=$1 source=$2 cxx=$3 bindir=$4 libdir=$5
work=$build/installed_package
rm -rf "$work"
mkdir -p "$work"
cmake --install "$build" --prefix "$work/installed" >/dev/null
mv "$work/installed" "$work/moved"
prefix=$work/moved
unset LD_LIBRARY_PATH

out=$("$prefix/$bindir/zebmediatypes-console" zebmediatypes.TimeToTimecode 1800 29.97 29.97 -d)
[[ $out == *"is: 00;01;00;02" ]] || { echo "FAIL: console from the moved prefix said '$out'"; exit 1; }
out=$("$prefix/$bindir/zebmediatypes-script" "$prefix/share/zebmediatypes/examples/time.js")
[[ $out == *"timecode 00;01;00;02"* ]] || { echo "FAIL: the example script said '$out'"; exit 1; }
for file in "$prefix/$libdir"/lib{zebmediatypes,zebscripting,zebcore}.so "$prefix/$bindir/zebmediatypes-script"; do
  readelf -d "$file" | grep -q 'RUNPATH.*\[\$ORIGIN' || { echo "FAIL: $file has no \$ORIGIN RUNPATH"; exit 1; }
done

cflags=$(PKG_CONFIG_PATH=$prefix/$libdir/pkgconfig pkg-config --cflags zebmediatypes)
[[ $cflags != *-std=* ]] || { echo "FAIL: pkg-config forces a standard: $cflags"; exit 1; }
include=${cflags#-I}
[ -f "${include%% *}/zebmediatypes/zebmediatypes.h" ] ||
  { echo "FAIL: pkg-config include path '$cflags' is not the moved prefix's"; exit 1; }

cmake -S "$source/tests/consumer" -B "$work/consumer" -DCMAKE_CXX_COMPILER="$cxx" \
  -DCMAKE_PREFIX_PATH="$prefix" >/dev/null
cmake --build "$work/consumer" >/dev/null
"$work/consumer/zebmediatypes-consumer"
echo "install_test: the moved prefix runs and builds the consumer"
