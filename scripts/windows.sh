#!/usr/bin/env bash
# Cross-builds what the programs need on 64-bit Windows.
set -euo pipefail
cd "$(dirname "$0")/.."

usage() {
    cat << 'TEXT'
usage: scripts/windows.sh

Cross-builds Qt and the libraries for 64-bit Windows on Debian 12. Needs nothing but a shell: what is missing is
installed from Debian's packages first. All is built from Debian's source packages, whose checksums are checked,
and kept for the next time. Qt takes most of the time, and 2 GB of disk.

A build that was broken off goes on where it was. The cache is ${XDG_CACHE_HOME:-$HOME/.cache}/kareport-windows
and can be deleted at any time. KAREPORT_JOBS says how many compilers run at a time; all processors otherwise.

CMake finds the libraries with the toolchain file cmake/mingw-w64.cmake, and the list of their folders that is
printed in the end as KAREPORT_WINDOWS_PREFIX.
TEXT
}

case "${1:-}" in
'') ;;
--help | -h) usage; exit 0 ;;
*) usage >&2; exit 1 ;;
esac

. scripts/windows/cache.sh
. scripts/windows/sources.sh
. scripts/windows/libraries.sh
. scripts/windows/qt.sh

scripts/packages.sh build windows
mkdir -p "$windows_cache/build"
# Two at a time would build into the same folders.
exec 7> "$windows_cache/lock"
flock 7

windows_update_lists
windows_libraries
echo "KAREPORT_WINDOWS_PREFIX=$windows_prefixes"
