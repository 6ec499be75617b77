#!/usr/bin/env bash
# A private PostgreSQL cluster for the tests: initdb into a folder, listening
# only on a Unix socket in that folder, run as an unprivileged user.
#
#   scripts/pg-cluster.sh start DIR   create and start a cluster in DIR (new or empty);
#                                     prints the connection URL on stdout
#   scripts/pg-cluster.sh stop DIR    stop the cluster at once and remove DIR
#   scripts/pg-cluster.sh pause DIR   stop the server at once, keeping its data
#   scripts/pg-cluster.sh resume DIR  start a paused server again
#
# As root the cluster runs as the user "postgres" (from Debian's postgresql
# package); otherwise as the calling user. The superuser role is "zel_owner",
# trusted on the socket only (other roles need their password); the database
# is "zel". pause and resume let the
# tests take the server away from running sessions and give it back.
set -euo pipefail

usage() { echo "usage: $0 start|stop|pause|resume DIR" >&2; exit 2; }
cmd="${1:-}"
dir="${2:-}"
[ -n "$cmd" ] && [ -n "$dir" ] || usage

pgbin="$(ls -d /usr/lib/postgresql/*/bin 2>/dev/null | sort -V | tail -n 1 || true)"
[ -n "$pgbin" ] && [ -x "$pgbin/initdb" ] \
  || { echo "pg-cluster: PostgreSQL server binaries not found under /usr/lib/postgresql/*/bin" >&2; exit 3; }

run_as=()
if [ "$(id -u)" -eq 0 ]; then
  id postgres >/dev/null 2>&1 || { echo "pg-cluster: running as root but there is no user \"postgres\" to run the server" >&2; exit 3; }
  run_as=(runuser -u postgres --)
fi

server_start() {
  # Only the Unix socket in DIR: no TCP port, so parallel clusters never clash.
  "${run_as[@]}" "$pgbin/pg_ctl" -D "$dir/data" -l "$dir/server.log" -w -t 60 \
    -o "-c listen_addresses='' -c unix_socket_directories='$dir' -c fsync=off" start >/dev/null \
    || { cat "$dir/server.log" >&2; exit 1; }
}

case "$cmd" in
  start)
    mkdir -p "$dir"
    dir="$(cd "$dir" && pwd)"
    # The socket's path (DIR/.s.PGSQL.5432) must fit the 107 bytes of sun_path.
    [ ${#dir} -le 90 ] || { echo "pg-cluster: folder path too long for a Unix socket: $dir" >&2; exit 2; }
    if [ "$(id -u)" -eq 0 ]; then
      chown postgres: "$dir"
      # The server user must reach DIR through every folder above it.
      "${run_as[@]}" test -x "$dir" \
        || { echo "pg-cluster: user \"postgres\" cannot enter $dir (check the permissions of the folders above it)" >&2; exit 1; }
    fi
    "${run_as[@]}" "$pgbin/initdb" -D "$dir/data" -U zel_owner --auth=trust -E UTF8 --locale=C.UTF-8 >"$dir/initdb.log" 2>&1 \
      || { cat "$dir/initdb.log" >&2; exit 1; }
    # zel_owner is trusted on the socket; every other role logs in with its
    # password (so that the tests can meet a wrong one).
    printf 'local all zel_owner trust\nlocal all all scram-sha-256\n' >"$dir/data/pg_hba.conf"
    server_start
    "${run_as[@]}" "$pgbin/createdb" -h "$dir" -U zel_owner zel
    echo "postgresql://zel_owner@/zel?host=$dir"
    ;;
  stop)
    if [ -f "$dir/data/postmaster.pid" ]; then
      "${run_as[@]}" "$pgbin/pg_ctl" -D "$dir/data" -m immediate -w stop >/dev/null 2>&1 || true
    fi
    rm -rf "$dir"
    ;;
  pause)
    [ -d "$dir/data" ] || { echo "pg-cluster: no cluster in $dir" >&2; exit 1; }
    "${run_as[@]}" "$pgbin/pg_ctl" -D "$dir/data" -m immediate -w stop >/dev/null
    ;;
  resume)
    [ -d "$dir/data" ] || { echo "pg-cluster: no cluster in $dir" >&2; exit 1; }
    server_start
    ;;
  *)
    usage ;;
esac
