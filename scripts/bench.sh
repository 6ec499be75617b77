#!/usr/bin/env bash
# Builds zel in Release with its benchmarks and runs every benchmark program.
# Each program prints Google Benchmark's rows and then a table of ratios
# against the floor or peer measured in the same run.
# Usage: scripts/bench.sh [benchmark options]   (e.g. --benchmark_repetitions=3,
#   --benchmark_filter=hub; they are passed to every program)
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/deps.sh 5
build=build/bench
cmake -S . -B "$build" -DCMAKE_BUILD_TYPE=Release -DZEL_BUILD_BENCHMARKS=ON -DZEL_BUILD_TESTS=OFF \
  -DZEL_BUILD_EXAMPLES=OFF >/dev/null
cmake --build "$build" -j "$(nproc)" >/dev/null

status=0
found=0
for program in "$build"/bench/bench_*; do
  [ -f "$program" ] && [ -x "$program" ] || continue
  found=1
  echo "== $(basename "$program")"
  "$program" "$@" || status=1
  echo
done
if [ "$found" = 0 ]; then
  echo "no benchmark programs in $build/bench" >&2
  exit 1
fi
exit "$status"
