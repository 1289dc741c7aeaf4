#!/usr/bin/env bash
# Installs what is missing, builds, and runs every test through CTest.
#   test.sh              the whole suite
#   test.sh --sanitize   the whole suite under AddressSanitizer and UndefinedBehaviorSanitizer
set -euo pipefail
top=$(cd "$(dirname "$0")/.." && pwd)
bash "$top/scripts/deps.sh" test
dir=$top/build-test
opts=()
if [ "${1:-}" = --sanitize ]; then
  dir=$top/build-asan
  opts=(-DPRADILON_SANITIZE=ON -DPRADILON_BENCH=OFF -DCMAKE_BUILD_TYPE=Debug)
  export ASAN_OPTIONS=detect_leaks=1 UBSAN_OPTIONS=print_stacktrace=1:halt_on_error=1
fi
bash "$top/scripts/build.sh" "$dir" "${opts[@]}"
cd "$dir"
ctest --output-on-failure -j "$(nproc)" --timeout 300
