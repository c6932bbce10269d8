#!/usr/bin/env bash
# Builds the demo program (Release, in build-demo/) and runs it; it writes its
# images to demo-out/ (or to the directory given as the first argument) and
# this script lists them. Installs the build packages first when they are
# missing (apt-get as root).
set -euo pipefail
cd "$(dirname "${BASH_SOURCE[0]}")/.."
. tools/deps.sh

pvx_need_packages cmake g++ make
jobs=$(pvx_jobs)
out=${1:-demo-out}

cmake -S . -B build-demo -DCMAKE_BUILD_TYPE=Release \
    -DPVX_BUILD_TESTS=OFF -DPVX_BUILD_BENCH=OFF -DPVX_BUILD_DEMO=ON -DPVX_SANITIZE=OFF
cmake --build build-demo -j"$jobs" --target pvx_demo
./build-demo/demo/pvx_demo "$out"
echo
echo "images in $out/:"
ls -l "$out"
