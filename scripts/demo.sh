#!/usr/bin/env bash
# Builds zel and runs its demo: a tour of the library against the in-memory
# backend. Arguments are passed to the demo (try --help).
set -euo pipefail
cd "$(dirname "$0")/.."

# Progress goes to stderr, a line per stage and the build's own progress, so
# that a first run of several minutes is never silent; stdout is the demo's.
scripts/deps.sh 5 >&2
build=build/release
echo "== Configuring zel in $build" >&2
cmake -S . -B "$build" -DCMAKE_BUILD_TYPE=Release -DZEL_BUILD_TESTS=OFF >/dev/null
echo "== Building zel and the demo (the first build takes a few minutes)" >&2
if ! cmake --build "$build" -j "$(nproc)" 2>&1 \
  | { grep --line-buffered -E '^\[ *[0-9]+%\] (Building|Linking)|error' >&2 || true; }; then
  echo "demo: the build failed; the whole output: cmake --build $build" >&2
  exit 1
fi
echo "== Running the demo" >&2
if [ -x "$build/examples/zel-demo" ]; then
  exec "$build/examples/zel-demo" "$@"
fi
exec "$build/examples/zel-trace-example" "$@"
