#!/usr/bin/env bash
# Installs the Debian packages the build and the tests need, and only those that are missing,
# so that a second run costs nothing.
#   deps.sh build   - compiler, CMake, Qt 6
#   deps.sh test    - the above plus test tools (GoogleTest, Benchmark, poppler, fonts, Xvfb, CUPS)
set -euo pipefail

want=(g++ cmake ninja-build qt6-base-dev qt6-base-dev-tools libgl-dev)
if [ "${1:-build}" = test ]; then
  want+=(libgtest-dev libgmock-dev libbenchmark-dev poppler-utils fonts-dejavu-core xvfb xauth
         cups printer-driver-cups-pdf)
fi

missing=()
for p in "${want[@]}"; do
  dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q 'install ok installed' || missing+=("$p")
done
[ ${#missing[@]} -eq 0 ] && exit 0

echo "Installing: ${missing[*]}"
if [ "$(id -u)" -ne 0 ]; then SUDO=sudo; else SUDO=; fi
$SUDO apt-get update -qq
DEBIAN_FRONTEND=noninteractive $SUDO apt-get install -y -qq --no-install-recommends "${missing[@]}" >/dev/null
