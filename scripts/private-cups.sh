#!/usr/bin/env bash
# Starts a print server of its own, with queues that write each job into a folder, and runs a command with it.
#
#   scripts/private-cups.sh FOLDER COMMAND [ARGUMENT...]
#
# The jobs of the default queue, Whole, arrive as FOLDER/arrived/job.pdf; Refusing takes no jobs, Stopped keeps them.
# The server needs neither systemd nor D-Bus, listens on a socket in the folder only, and ends with the command. Its process
# number is in FOLDER/server.pid. Exits with the command's status, or with 77 where no server can be started.
set -euo pipefail

folder=$(realpath -m "$1")
shift
PATH=$PATH:/usr/sbin:/sbin
ppd=/usr/share/ppd/cupsfilters/Generic-PDF_Printer-PDF.ppd
for needed in cupsd lpadmin lpstat; do
    command -v "$needed" > /dev/null || { echo "$needed is not installed" >&2; exit 77; }
done
[ -r "$ppd" ] || { echo "$ppd is not installed" >&2; exit 77; }

mkdir -p "$folder"/{etc/ppd,state,log,spool/tmp,cache,arrived}
# The filters of a queue run as another user.
chmod 755 "$folder"
socket=$folder/state/cups.sock
# The length of a socket's address is limited.
[ ${#socket} -lt 100 ] || { echo "the path of the folder is too long for a socket" >&2; exit 77; }

cat > "$folder/etc/cupsd.conf" << CONF
Listen $socket
LogLevel warn
Browsing No
WebInterface No
DefaultAuthType None
MaxJobs 0
<Location />
  Order allow,deny
  Allow all
</Location>
<Policy default>
  <Limit All>
    Order deny,allow
  </Limit>
</Policy>
CONF
cat > "$folder/etc/cups-files.conf" << CONF
FileDevice Yes
ServerRoot $folder/etc
StateDir $folder/state
CacheDir $folder/cache
RequestRoot $folder/spool
TempDir $folder/spool/tmp
AccessLog $folder/log/access
ErrorLog $folder/log/error
PageLog $folder/log/page
CONF

cupsd -f -c "$folder/etc/cupsd.conf" -s "$folder/etc/cups-files.conf" &
server=$!
echo $server > "$folder/server.pid"
trap 'kill $server 2> /dev/null || true; wait $server 2> /dev/null || true' EXIT
export CUPS_SERVER=$socket

# lpstat answers 0 also without a server; what it says is what counts.
for ((i = 0; i < 100; i++)); do
    lpstat -r 2> /dev/null | grep -q 'is running' && break
    kill -0 $server 2> /dev/null || { echo "the print server has ended: $(tail -n 3 "$folder/log/error")" >&2; exit 77; }
    sleep 0.05
done
lpstat -r 2> /dev/null | grep -q 'is running' || { echo "the print server does not answer" >&2; exit 77; }

for queue in Whole Refusing Stopped; do
    target=job.pdf
    [ $queue = Whole ] || target=$queue.pdf
    lpadmin -p $queue -E -v "file:$folder/arrived/$target" -P "$ppd" -o PageSize=A4 2> "$folder/log/lpadmin" ||
        { cat "$folder/log/lpadmin" >&2; exit 77; }
done
lpadmin -d Whole
cupsreject Refusing
cupsdisable Stopped

"$@"
