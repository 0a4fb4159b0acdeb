#!/bin/sh
# Builds the consumer project one way and runs it on an example program,
# comparing its output with expected.txt.
#   run.sh installed|subdirectory|pkgconfig SOURCE_DIR BUILD_DIR WORK_DIR GENERATOR CXX
set -eu
mode=$1 source=$2 build=$3 work=$4 generator=$5 cxx=$6
here=$source/tests/consumer
program=$source/examples/vex-pic/program.c
mkdir -p "$work"
case "$mode" in
  installed|pkgconfig)
    # The library as built, installed into an empty prefix: nothing is rebuilt.
    prefix=$work/prefix
    rm -rf "$prefix"
    cmake --install "$build" --prefix "$prefix" >/dev/null
    ;;
esac
case "$mode" in
  installed)
    cmake -S "$here" -B "$work/build" -G "$generator" -DCMAKE_CXX_COMPILER="$cxx" \
      -DCMAKE_PREFIX_PATH="$prefix" >/dev/null
    cmake --build "$work/build" >/dev/null
    exe=$work/build/list_devices
    ;;
  subdirectory)
    cmake -S "$here" -B "$work/build" -G "$generator" -DCMAKE_CXX_COMPILER="$cxx" \
      -DCMAKE_BUILD_TYPE=Release -DROBOTCONFIG_SOURCE_DIR="$source" >/dev/null
    cmake --build "$work/build" >/dev/null
    exe=$work/build/list_devices
    ;;
  pkgconfig)
    exe=$work/list_devices
    # Sources before the libraries: the library is static.
    # shellcheck disable=SC2046
    "$cxx" -o "$exe" "$here/list_devices.cpp" \
      $(PKG_CONFIG_PATH=$prefix/lib/pkgconfig pkg-config --cflags --libs robotconfig)
    ;;
  *) echo "unknown mode $mode" >&2; exit 2 ;;
esac
"$exe" "$program" 2 >"$work/out.txt"
diff -u "$here/expected.txt" "$work/out.txt"
# The block it prints is the one the tool writes.
if [ "$mode" = installed ]; then
  "$prefix/bin/robotcfg" generate --platform vexpic "$program" >"$work/tool.txt"
  sed -n '/^#pragma/,$p' "$work/out.txt" | diff -u "$work/tool.txt" -
fi
