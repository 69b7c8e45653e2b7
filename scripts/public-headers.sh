#!/usr/bin/env bash
# Prints the headers that a host includes, one a line: those that the CMake files of the folders name as HEADERS.
set -euo pipefail
cd "$(dirname "$0")/.."

find host templates page formats report print view ui -name CMakeLists.txt | sort | while read -r list; do
    sed -nE '/^ +HEADERS/,/^ +(PRIVATE_HEADERS|SOURCES)/{/^ +(PRIVATE_HEADERS|SOURCES)/!p}' "$list" |
        tr ' ' '\n' | sed -n "s|.*\.h\$|$(dirname "$list")/&|p"
done
