#!/usr/bin/env bash
# Builds zel and runs its demo: a tour of the library against the in-memory
# backend. Arguments are passed to the demo (try --help).
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/deps.sh 5
build=build/release
cmake -S . -B "$build" -DCMAKE_BUILD_TYPE=Release -DZEL_BUILD_TESTS=OFF >/dev/null
cmake --build "$build" -j "$(nproc)" >/dev/null
if [ -x "$build/examples/zel-demo" ]; then
  exec "$build/examples/zel-demo" "$@"
fi
exec "$build/examples/zel-trace-example" "$@"
