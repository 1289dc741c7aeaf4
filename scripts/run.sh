#!/usr/bin/env bash
# Installs what is missing, builds, and runs the program.
set -euo pipefail
top=$(cd "$(dirname "$0")/.." && pwd)
bash "$top/scripts/deps.sh" build
bash "$top/scripts/build.sh" "$top/build" -DPRADILON_TESTS=OFF -DPRADILON_BENCH=OFF
scratch=$(mktemp -d)
cp "$top/examples/beispiel.prd" "$scratch/"
"$top/build/cli/pradilon-cli" plan "$scratch/beispiel.prd" 01.01.2027 31.03.2027
"$top/build/cli/pradilon-cli" plan-text "$scratch/beispiel.prd"
echo "Plan written to $scratch/PLAN.TXT"
