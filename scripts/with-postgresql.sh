#!/usr/bin/env bash
# Runs a command with a private PostgreSQL cluster (scripts/pg-cluster.sh):
#
#   scripts/with-postgresql.sh CMD [ARGS...]
#
# Starts a cluster in a fresh temporary folder, exports
#   ZEL_TEST_POSTGRESQL_URL      the URL of its database "zel"
#   ZEL_TEST_POSTGRESQL_CLUSTER  the folder (for scripts/pg-cluster.sh pause|resume)
#   ZEL_TEST_POSTGRESQL_SCRIPT   the path of scripts/pg-cluster.sh
# runs CMD, then stops and removes the cluster however CMD ends, and exits with
# CMD's status. When no cluster can be started it says so and runs CMD without
# the variables (the tests that need the server then skip themselves).
set -uo pipefail

[ $# -gt 0 ] || { echo "usage: $0 CMD [ARGS...]" >&2; exit 2; }
script="$(cd "$(dirname "$0")" && pwd)/pg-cluster.sh"

cluster=""
cleanup() {
  if [ -n "$cluster" ]; then
    "$script" stop "$cluster" || true
    rm -rf "$cluster" "$cluster.log"
    cluster=""
  fi
}
trap cleanup EXIT
trap 'exit 130' INT
trap 'exit 143' TERM
trap 'exit 129' HUP

dir="$(mktemp -d /tmp/zel-pg.XXXXXX)"
# Guarded by the trap from here on: a cluster folder is removed on any exit.
cluster="$dir"
if url="$("$script" start "$dir" 2>"$dir.log")"; then
  rm -f "$dir.log"
  export ZEL_TEST_POSTGRESQL_URL="$url"
  export ZEL_TEST_POSTGRESQL_CLUSTER="$dir"
  export ZEL_TEST_POSTGRESQL_SCRIPT="$script"
  echo "with-postgresql: private cluster at $dir" >&2
else
  echo "with-postgresql: could not start a PostgreSQL cluster; running without ZEL_TEST_POSTGRESQL_URL (the PostgreSQL tests will be skipped):" >&2
  sed 's/^/  /' "$dir.log" >&2 || true
  rm -f "$dir.log"
  "$script" stop "$dir" >/dev/null 2>&1 || true
  rm -rf "$dir"
  cluster=""
  unset ZEL_TEST_POSTGRESQL_URL ZEL_TEST_POSTGRESQL_CLUSTER ZEL_TEST_POSTGRESQL_SCRIPT
fi

"$@"
status=$?
cleanup
exit $status
