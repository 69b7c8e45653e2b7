#!/usr/bin/env bash
# Says which headers are installed and not listed for hosts, or listed and not installed; exit status 1 when there is one.
#
#   scripts/check-headers.sh FOLDER     the folder of the installed headers
set -euo pipefail
installed=$(realpath "$1")
cd "$(dirname "$0")/.."

listed=$(scripts/public-headers.sh | sed 's|.*/||' | sort)
found=$(find "$installed" -mindepth 1 -printf '%P\n' | sort)
extra=$(comm -13 <(printf '%s\n' "$listed") <(printf '%s\n' "$found"))
missing=$(comm -23 <(printf '%s\n' "$listed") <(printf '%s\n' "$found"))
[ -z "$extra" ] || printf 'Installed, but not among the HEADERS of a folder:\n%s\n' "$extra"
[ -z "$missing" ] || printf 'Among the HEADERS of a folder, but not installed:\n%s\n' "$missing"
[ -z "$extra$missing" ]
