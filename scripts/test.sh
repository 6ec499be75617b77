#!/usr/bin/env bash
# Builds zel and runs its tests; exits non-zero on any failure.
# Usage: scripts/test.sh [--qt 6] [--sanitize address,undefined|thread] [--label LABEL] [--only REGEX]
#   --qt 6        build against Qt 6 instead of Qt 5
#   --sanitize S  build with the given sanitizers (-fsanitize=S)
#   --label LABEL run only the tests whose ctest label matches LABEL (ctest -L), e.g.
#                 threads, postgresql or 'threads|postgresql'
#   --only REGEX  run only the tests whose names match REGEX (ctest -R)
# Each variant builds in its own folder, build/<variant>.
# The tests that need PostgreSQL run against a private cluster that this
# script starts for the run and removes afterwards (scripts/with-postgresql.sh);
# with ZEL_TEST_POSTGRESQL_URL already set they use that server instead, and
# when no server can be started they are reported as skipped.
set -euo pipefail
cd "$(dirname "$0")/.."
arguments=("$@")

qt_major=5
sanitize=""
only=""
label=""
while [ $# -gt 0 ]; do
  case "$1" in
    --qt) qt_major="$2"; shift 2 ;;
    --sanitize) sanitize="$2"; shift 2 ;;
    --only) only="$2"; shift 2 ;;
    --label) label="$2"; shift 2 ;;
    *) echo "unknown option: $1" >&2; exit 2 ;;
  esac
done

scripts/deps.sh "$qt_major"

if [ -z "${ZEL_TEST_POSTGRESQL_URL:-}" ] && [ -z "${ZEL_TEST_POSTGRESQL_TRIED:-}" ]; then
  exec scripts/with-postgresql.sh env ZEL_TEST_POSTGRESQL_TRIED=1 "$0" "${arguments[@]}"
fi

variant="qt${qt_major}${sanitize:+-${sanitize//,/-}}"
build="build/${variant}"
build_type=RelWithDebInfo
[ -n "$sanitize" ] && build_type=Debug
jobs="$(nproc)"

echo "== zel tests: ${variant}"
cmake -S . -B "$build" -DCMAKE_BUILD_TYPE="$build_type" -DZEL_QT_MAJOR="$qt_major" \
  -DZEL_SANITIZE="$sanitize" -DZEL_BUILD_TESTS=ON >/dev/null
cmake --build "$build" -j "$jobs"

export ASAN_OPTIONS="detect_leaks=1:abort_on_error=1"
export UBSAN_OPTIONS="print_stacktrace=1:halt_on_error=1"
export TSAN_OPTIONS="halt_on_error=1 second_deadlock_stack=1 suppressions=$PWD/tests/support/tsan.supp"
export QT_QPA_PLATFORM=offscreen
ctest --test-dir "$build" --output-on-failure -j "$jobs" ${label:+-L "$label"} ${only:+-R "$only"}
