#!/usr/bin/env bash
# Starts programs in a folder with libraries of the names that they need, and expects that none of these
# is loaded.
#
#   foreign-library-test.sh COMPILER PROGRAM...
set -euo pipefail
compiler=$1
shift

folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT
cd "$folder"
mkdir -m 700 home
export QT_QPA_PLATFORM=offscreen HOME=$folder/home XDG_RUNTIME_DIR=$folder/home
unset LD_LIBRARY_PATH
ulimit -c 0

# A program that loads it ends before it begins.
cat > foreign.c << 'END'
#include <stdlib.h>

__attribute__((constructor)) static void begin(void)
{
    abort();
}
END

failed=0
wrong() {
    echo "$1"
    failed=1
}

for program in "$@"; do
    name=$(basename "$program")
    # All but the C library, which the foreign one needs itself.
    mapfile -t libraries < <(readelf -d "$program" | sed -nE 's/.*\(NEEDED\).*\[(.*)\]/\1/p' |
        grep -vE '^(libc|ld-linux.*)\.so')
    for library in "${libraries[@]}"; do
        mkdir here here/lib here/bin
        "$compiler" -x c -shared -fPIC -Wl,-soname,"$library" -o "here/$library" foreign.c
        cp "here/$library" here/lib
        cp "here/$library" here/bin
        output=$(cd here && "$program" --version 2>&1) || wrong "$name takes $library of the current folder: $output"
        grep -q '[0-9]\.[0-9]' <<< "$output" || wrong "$name, beside a foreign $library, says: $output"
        # What is told to take it must fail, or nothing was tried.
        if (cd here && LD_LIBRARY_PATH=. "$program" --version > ../said 2>&1); then
            wrong "$name does without $library"
        fi
        rm -r here
    done
done
exit $failed
