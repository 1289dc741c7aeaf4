#!/usr/bin/env bash
# Installs what is missing, builds, and starts the window program.
# Without a display, start it under a virtual one: xvfb-run -a bash scripts/run.sh
set -euo pipefail
top=$(cd "$(dirname "$0")/.." && pwd)
bash "$top/scripts/deps.sh" build
bash "$top/scripts/build.sh" "$top/build" -DPRADILON_TESTS=OFF -DPRADILON_BENCH=OFF
if [ -z "${DISPLAY:-}" ] && [ -z "${WAYLAND_DISPLAY:-}" ] && [ -z "${QT_QPA_PLATFORM:-}" ]; then
  echo "Built $top/build/app/pradilon, but there is no display to show it on." >&2
  echo "Start it under a virtual display instead: xvfb-run -a bash scripts/run.sh" >&2
  echo "(Debian packages xvfb and xauth; 'bash scripts/deps.sh test' installs them.)" >&2
  exit 2
fi
# The sample parish lies next to the program, where "Datei öffnen" starts.
if [ -f "$top/examples/beispiel.prd" ]; then
  cp -n "$top/examples/beispiel.prd" "$top/build/app/" 2>/dev/null || true
fi
exec "$top/build/app/pradilon"
