#!/usr/bin/env bash
# Says what in the Debian packages of a folder would help an attacker, and where their libraries and headers differ; exit
# status 1 when there is something.
#
#   scripts/check-packages.sh FOLDER
set -euo pipefail
packages=$(realpath "$1")
cd "$(dirname "$0")/.."

unpacked=$(mktemp -d)
trap 'rm -rf "$unpacked"' EXIT
for package in "$packages"/*.deb; do
    dpkg-deb -x "$package" "$unpacked"
done
for file in usr/bin/kareport usr/bin/kareport-desk usr/include/KaReport; do
    [ -e "$unpacked/$file" ] || { echo "$file is in no package"; exit 1; }
done
scripts/check-binaries.sh --in "$unpacked"
mapfile -t libraries < <(find "$unpacked" -type f -name '*.so.*')
scripts/check-exports.py "$unpacked/usr/include/KaReport" "${libraries[@]}"
scripts/check-headers.sh "$unpacked/usr/include/KaReport"
tests/package/completion-test.sh "$unpacked/usr" vendor-completions
