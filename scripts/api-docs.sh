#!/usr/bin/env bash
# Makes the pages of all public headers in out/api/html.
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/packages.sh docs
mkdir -p out/api
{
    cat docs/Doxyfile
    # What is installed is what is public.
    printf 'INPUT ='
    sed -n '/ HEADERS/,/PRIVATE_HEADERS\|SOURCES/p' {host/*,templates,page,formats/*,report,print,view,ui}/CMakeLists.txt |
        tr ' ' '\n' | grep '\.h$' | sort -u |
        while read -r header; do find host templates page formats report print view ui -name "$header" -printf ' %p'; done
    echo
} > out/api/Doxyfile
doxygen -q out/api/Doxyfile
echo "The pages begin with out/api/html/index.html"
