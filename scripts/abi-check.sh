#!/usr/bin/env bash
# Compares the public ABI of libzel and libzel_platform (the Qt 5 build of
# scripts/test.sh, in build/qt5) with the baselines recorded in abi/, one per
# SONAME (abi/libzel.so.1.abi.gz). Fails on any incompatible change: a
# change that breaks applications built against the baseline needs a new
# SONAME (and a baseline recorded for it). Compatible additions pass and are
# listed.
# Usage: scripts/abi-check.sh [--update]
#   --update  record the current ABI as the baseline of its SONAME
set -euo pipefail
cd "$(dirname "$0")/.."

update=0
[ "${1:-}" = --update ] && update=1

scripts/deps.sh 5
command -v abidw >/dev/null || { echo "abi-check: abidw not found (Debian abigail-tools)" >&2; exit 1; }

build=build/qt5
echo "== ABI check: building ${build}"
cmake -S . -B "$build" -DCMAKE_BUILD_TYPE=RelWithDebInfo -DZEL_QT_MAJOR=5 >/dev/null
cmake --build "$build" -j "$(nproc)" --target zel zel_platform >/dev/null

status=0
check() {
  local library="$1"
  shift
  local headers=()
  for dir in "$@"; do headers+=(--headers-dir "$dir"); done
  local soname
  soname="$(readelf -d "$build/$library" | sed -n 's/.*(SONAME).*\[\(.*\)\]/\1/p')"
  local baseline="abi/${soname}.abi.gz"
  local current
  current="$(mktemp)"
  abidw "${headers[@]}" --drop-private-types --drop-undefined-syms --no-corpus-path --no-show-locs \
    --no-comp-dir-path --no-parameter-names --out-file "$current" "$build/$library"
  if [ "$update" = 1 ]; then
    gzip -9n -c "$current" >"$baseline"
    echo "$soname: baseline recorded in $baseline"
  elif [ ! -f "$baseline" ]; then
    echo "$soname: no baseline; record one with scripts/abi-check.sh --update" >&2
    status=1
  else
    local recorded
    recorded="$(mktemp)"
    gunzip -c "$baseline" >"$recorded"
    local rc=0
    abidiff --suppressions abi/zel.suppr --drop-private-types --no-show-locs "$recorded" "$current" \
      >"$current.report" || rc=$?
    if [ $((rc & 8)) -ne 0 ]; then
      cat "$current.report"
      echo "$soname: INCOMPATIBLE with its baseline; keep the ABI or raise the SONAME" >&2
      status=1
    elif [ $((rc & 3)) -ne 0 ]; then
      cat "$current.report" >&2
      echo "$soname: abidiff failed ($rc)" >&2
      status=1
    elif [ $((rc & 4)) -ne 0 ]; then
      cat "$current.report"
      echo "$soname: compatible with its baseline (additions above; record them with --update)"
    else
      echo "$soname: same ABI as its baseline"
    fi
    rm -f "$recorded" "$current.report"
  fi
  rm -f "$current"
}

check libzel.so include "$build/include"
check libzel_platform.so platform
exit "$status"
