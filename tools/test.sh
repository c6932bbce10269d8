#!/usr/bin/env bash
# Builds pvx (Release, in build/) and runs every test. Installs the build and
# test packages first when they are missing (apt-get as root). Exits non-zero
# when anything fails. The benchmarks are left out to keep it quick; see
# README.md for them.
set -euo pipefail
cd "$(dirname "${BASH_SOURCE[0]}")/.."
. tools/deps.sh

pvx_need_packages cmake g++ make libgtest-dev pkg-config binutils
jobs=$(pvx_jobs)

cmake -S . -B build -DCMAKE_BUILD_TYPE=Release -DPVX_BUILD_TESTS=ON -DPVX_BUILD_BENCH=OFF -DPVX_SANITIZE=OFF
cmake --build build -j"$jobs"
cd build
ctest --output-on-failure -j"$jobs"
