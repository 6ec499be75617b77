#!/usr/bin/env bash
# Installs the Debian packages that building zel needs, when they are missing.
# Usage: scripts/deps.sh [5|6]   (the Qt major version; 5 by default)
set -euo pipefail

qt_major="${1:-5}"
packages=(g++ cmake make pkg-config libboost-dev libgtest-dev libgmock-dev libbenchmark-dev valgrind)
if [ "$qt_major" = 6 ]; then
  packages+=(qt6-base-dev qt6-5compat-dev)
else
  packages+=(qtbase5-dev)
fi

missing=()
for p in "${packages[@]}"; do
  dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q "install ok installed" || missing+=("$p")
done
[ ${#missing[@]} -eq 0 ] && exit 0

echo "Installing missing packages: ${missing[*]}"
sudo=""
[ "$(id -u)" -eq 0 ] || sudo="sudo"
$sudo apt-get update -qq
DEBIAN_FRONTEND=noninteractive $sudo apt-get install -y -qq --no-install-recommends "${missing[@]}" >/dev/null
