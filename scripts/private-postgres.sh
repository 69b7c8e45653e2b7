#!/usr/bin/env bash
# Starts a PostgreSQL server of its own and runs a command with it.
#
#   scripts/private-postgres.sh FOLDER COMMAND [ARGUMENT...]
#
# The server listens on a socket in the folder only and ends with the command. The command finds it by PGHOST; the user
# survey may do everything in the database survey, the user guarded needs the password "open sesame". The server refuses
# to run as root: then it runs as the user postgres, or nobody. Its process number is in FOLDER/server.pid. Exits with
# the command's status, or with 77 where no server can be started.
set -euo pipefail

folder=$(realpath -m "$1")
shift
bin=$(ls -d /usr/lib/postgresql/*/bin 2> /dev/null | sort -V | tail -n 1)
[ -n "$bin" ] && [ -x "$bin/initdb" ] || { echo "the server of PostgreSQL is not installed" >&2; exit 77; }
# The length of a socket's address is limited.
[ ${#folder} -lt 80 ] || { echo "the path of the folder is too long for a socket" >&2; exit 77; }

mkdir -p "$folder/data"
as_user=()
if [ "$(id -u)" -eq 0 ]; then
    user=postgres
    id -u $user > /dev/null 2>&1 || user=nobody
    as_user=(setpriv --reuid="$user" --regid="$(id -gn $user)" --clear-groups env HOME="$folder")
    chmod 755 "$folder"
    chown -R "$user" "$folder/data"
fi
cd "$folder"
chmod 700 data
"${as_user[@]}" "$bin/initdb" -D "$folder/data" -U survey -A trust -E UTF8 --locale=C --no-sync \
    > "$folder/initdb.log" 2>&1 || { echo "the database cannot be made: $(tail -n 3 "$folder/initdb.log")" >&2; exit 77; }
printf 'local all guarded scram-sha-256\nlocal all all trust\n' > "$folder/pg_hba.conf"
cat "$folder/pg_hba.conf" > "$folder/data/pg_hba.conf"
mkdir -p "$folder/socket"
[ ${#as_user[@]} -eq 0 ] || chown "$user" "$folder/socket"

"${as_user[@]}" "$bin/postgres" -D "$folder/data" -k "$folder/socket" -c listen_addresses= -c fsync=off \
    -c shared_buffers=16MB -c max_connections=20 > "$folder/server.log" 2>&1 < /dev/null &
server=$!
echo $server > "$folder/server.pid"
trap 'kill -INT $server 2> /dev/null || true; wait $server 2> /dev/null || true' EXIT
export PGHOST=$folder/socket PGUSER=survey PGDATABASE=survey

for ((i = 0; i < 200; i++)); do
    "$bin/psql" -d postgres -c 'SELECT 1' > /dev/null 2>&1 && break
    kill -0 $server 2> /dev/null || { echo "the server has ended: $(tail -n 3 "$folder/server.log")" >&2; exit 77; }
    sleep 0.05
done
"$bin/psql" -q -d postgres -c 'CREATE DATABASE survey' -c "CREATE USER guarded PASSWORD 'open sesame'" ||
    { echo "the server does not answer" >&2; exit 77; }

"$@"
