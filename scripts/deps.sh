#!/usr/bin/env bash
# Installs the Debian packages that building zel needs, when they are missing.
# Usage: scripts/deps.sh [5|6]   (the Qt major version; 5 by default)
set -euo pipefail

qt_major="${1:-5}"
packages=(g++ cmake make pkg-config libboost-dev libgtest-dev libgmock-dev libbenchmark-dev valgrind locales
  abigail-tools)
# The SQL stores: Qt SQL's SQLite and PostgreSQL drivers, libpq for
# notifications, and the PostgreSQL server that the tests start privately
# (scripts/pg-cluster.sh, binaries under /usr/lib/postgresql/*/bin).
packages+=(libpq-dev postgresql)
if [ "$qt_major" = 6 ]; then
  packages+=(qt6-base-dev qt6-5compat-dev libqt6sql6-sqlite libqt6sql6-psql)
else
  packages+=(qtbase5-dev libqt5sql5-sqlite libqt5sql5-psql)
fi

sudo=""
[ "$(id -u)" -eq 0 ] || sudo="sudo"

missing=()
for p in "${packages[@]}"; do
  dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q "install ok installed" || missing+=("$p")
done
if [ ${#missing[@]} -gt 0 ]; then
  echo "== Installing missing packages: ${missing[*]}"
  echo "== Updating the package lists"
  $sudo apt-get update -qq
  echo "== Downloading and installing ${#missing[@]} packages (a few minutes on a fresh machine)"
  if ! DEBIAN_FRONTEND=noninteractive $sudo apt-get install -y -q --no-install-recommends "${missing[@]}" 2>&1 \
    | { grep --line-buffered -E '^(Setting up|E:)' || true; }; then
    echo "deps: apt-get install failed" >&2
    exit 1
  fi
fi

# The locale tests run under de_DE.UTF-8: generate it when it is missing.
if ! locale -a 2>/dev/null | grep -qix 'de_DE\.utf-\?8'; then
  echo "Generating the locale de_DE.UTF-8"
  if [ -f /etc/locale.gen ]; then
    grep -q '^de_DE\.UTF-8 UTF-8' /etc/locale.gen \
      || echo 'de_DE.UTF-8 UTF-8' | $sudo tee -a /etc/locale.gen >/dev/null
    $sudo locale-gen >/dev/null
  else
    $sudo locale-gen de_DE.UTF-8 >/dev/null
  fi
fi
