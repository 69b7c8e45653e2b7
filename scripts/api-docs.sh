#!/usr/bin/env bash
# Makes the pages of the headers that a host includes in out/api/html. They begin with the guide for hosts. Fails, after the
# pages are made, when a public member has no sentence.
#
#   scripts/api-docs.sh [FOLDER]     FOLDER: where the pages go instead, as for a check
set -euo pipefail
cd "$(dirname "$0")/.."
[ $# -gt 0 ] || scripts/packages.sh docs
folder=${1:-out/api}
mkdir -p "$folder"

# They are shown as they are installed. Functions that are outside of a class are shown where the file says that it is
# documented.
rm -rf "$folder/include"
mkdir -p "$folder/include/KaReport"
while read -r header; do
    sed 's|^#pragma once$|/** @file */|' "$header" > "$folder/include/KaReport/$(basename "$header")"
done < <(scripts/public-headers.sh)
{
    cat docs/Doxyfile
    echo "OUTPUT_DIRECTORY = $folder"
    echo "STRIP_FROM_PATH = $folder/include"
    echo "STRIP_FROM_INC_PATH = $folder/include"
    echo "INPUT = docs/guide-host.md $folder/include/KaReport"
} > "$folder/Doxyfile"
doxygen -q "$folder/Doxyfile"
echo "The pages begin with $folder/html/index.html"
