#!/usr/bin/env bash
# Builds zel in Release with its benchmarks and runs every benchmark program.
# Each program prints Google Benchmark's rows and then a table of ratios
# against the floor or peer measured in the same run, with PASS or FAIL for
# each target; the last lines list every target of every program.
# Usage: scripts/bench.sh [--smoke] [benchmark options]
#   --smoke  one short pass of every row at small sizes (CI: they build and run)
#   benchmark options (e.g. --benchmark_repetitions=3, --benchmark_filter=hub)
#   are passed to every program. Exits 1 when a program fails, not on a FAIL.
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/deps.sh 5
build=build/bench
cmake -S . -B "$build" -DCMAKE_BUILD_TYPE=Release -DZEL_BUILD_BENCHMARKS=ON -DZEL_BUILD_TESTS=OFF \
  -DZEL_BUILD_EXAMPLES=OFF >/dev/null
cmake --build "$build" -j "$(nproc)" >/dev/null

args=()
for arg in "$@"; do
  if [ "$arg" = --smoke ]; then
    export ZEL_BENCH_SMOKE=1
    args+=(--benchmark_min_time=0.001)
  else
    args+=("$arg")
  fi
done

status=0
found=0
summary="$(mktemp)"
trap 'rm -f "$summary"' EXIT
for program in "$build"/bench/bench_*; do
  [ -f "$program" ] && [ -x "$program" ] || continue
  found=1
  echo "== $(basename "$program")"
  "$program" "${args[@]}" | tee -a "$summary" || status=1
  echo
done
if [ "$found" = 0 ]; then
  echo "no benchmark programs in $build/bench" >&2
  exit 1
fi
if [ -n "${ZEL_BENCH_SMOKE:-}" ]; then
  echo "smoke run: every program built and ran; targets are judged only at full size"
  exit "$status"
fi
echo "== targets"
grep -E "target <= " "$summary" | sed -E 's/^.*target <= ([0-9.]+x): (PASS|FAIL) \((.*)\)$/\2  \3 (at most \1)/' || true
passed=$(grep -c ": PASS (" "$summary" || true)
failed=$(grep -c ": FAIL (" "$summary" || true)
echo "targets met: ${passed} of $((passed + failed))"
exit "$status"
