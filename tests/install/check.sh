#!/usr/bin/env bash
# check.sh BUILD_DIR: installs BUILD_DIR into a scratch prefix and builds and
# runs a small C program against it, once through pkg-config and once as a
# CMake project through find_package(pvx).
set -euo pipefail
build=$(cd "${1:?usage: check.sh BUILD_DIR}" && pwd)
here=$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd)
tmp=$(mktemp -d)
trap 'rm -rf "$tmp"' EXIT
prefix=$tmp/prefix

cmake --install "$build" --prefix "$prefix" >/dev/null
echo "install check: installed into $prefix"
pcdir=$(dirname "$(find "$prefix" -name pvxi.pc | head -n 1)")
libdir=$(dirname "$pcdir")

# pkg-config
export PKG_CONFIG_PATH=$pcdir
flags=$(pkg-config --cflags --libs pvxi)
echo "install check: pkg-config --cflags --libs pvxi: $flags"
# shellcheck disable=SC2086
cc -std=c99 -Wall -Wextra -pedantic -Werror "$here/consumer.c" -o "$tmp/consumer_pc" $flags
LD_LIBRARY_PATH=$libdir "$tmp/consumer_pc"

# find_package(pvx)
cmake -S "$here" -B "$tmp/consumer-build" -DCMAKE_PREFIX_PATH="$prefix" -DCMAKE_BUILD_TYPE=Release >/dev/null
cmake --build "$tmp/consumer-build" >/dev/null
LD_LIBRARY_PATH=$libdir "$tmp/consumer-build/consumer"
"$tmp/consumer-build/consumer_static"
echo "install check: pkg-config and find_package(pvx) consumers ok"
