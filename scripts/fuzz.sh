#!/usr/bin/env bash
# Builds the libFuzzer targets with clang and runs each for a while.
#   fuzz.sh [seconds per target, default 120]
set -euo pipefail
top=$(cd "$(dirname "$0")/.." && pwd)
seconds=${1:-120}
bash "$top/scripts/deps.sh" build
dir=$top/build-fuzz
CC=clang CXX=clang++ bash "$top/scripts/build.sh" "$dir" -DPRADILON_FUZZ=ON -DPRADILON_GUI=OFF \
  -DPRADILON_TESTS=OFF -DPRADILON_BENCH=OFF
for target in fuzz_datendatei fuzz_zahlwert fuzz_datum; do
  corpus=$top/fuzz-corpus/$target
  mkdir -p "$corpus"
  echo "== $target ($seconds s)"
  "$dir/fuzz/$target" "$corpus" -max_total_time="$seconds" -print_final_stats=1 2>&1 | tail -4
done
