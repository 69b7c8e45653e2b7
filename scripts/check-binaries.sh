#!/usr/bin/env bash
# Says what in programs and libraries (ELF) would help an attacker: a search path that leads into the current folder, and
# protections that the build was to put in and did not. Prints one line for each; exit status 1 when there is one.
#
#   scripts/check-binaries.sh [--paths-only | --outside] FILE...
#   scripts/check-binaries.sh --in FOLDER
#
# --in looks at every program and library in a folder and those below it.
# --paths-only looks at the search paths alone, as for tests, which are built without the protections.
# --outside does so too, and lets them lead into absolute folders, as those of a program do that is not installed.
set -euo pipefail

paths_only=0
outside=0
case "${1:-}" in
--paths-only) paths_only=1; shift ;;
--outside) paths_only=1; outside=1; shift ;;
esac
[ $# -gt 0 ] || { echo "usage: check-binaries.sh [--paths-only | --outside] FILE... | --in FOLDER" >&2; exit 1; }
if [ "$1" = --in ]; then
    # Not object files, nor what CMake builds to look at the compiler.
    mapfile -d '' candidates < <(find "$2" -type f ! -name '*.o' ! -path '*/CMakeFiles/*' -print0 | sort -z)
    set --
    for file in "${candidates[@]}"; do
        if [ "$(head -c 4 "$file" | od -An -c | tr -d ' ')" = '177ELF' ]; then
            set -- "$@" "$file"
        fi
    done
    [ $# -gt 0 ] || { echo "no program or library was found"; exit 1; }
fi

failed=0
wrong() { # file, what is wrong
    echo "$1: $2"
    failed=1
}

# Each element must begin at the file's own folder. An empty one is the current folder, and so is what a relative one
# begins at; an absolute one is a folder of the machine that it was built on.
check_paths() {
    local path element
    path=$(sed -nE 's/.*\((RPATH|RUNPATH)\).*\[(.*)\]$/\2/p' <<< "$dynamic")
    grep -qE '\((RPATH|RUNPATH)\)' <<< "$dynamic" || return 0
    while IFS= read -r -d : element; do
        # shellcheck disable=SC2016 # the loader replaces $ORIGIN
        case "$element" in
            '$ORIGIN' | '$ORIGIN/'*) ;;
            '') wrong "$file" "the search path [$path] has an empty element, which is the current folder" ;;
            /*) [ $outside = 1 ] || wrong "$file" "the search path [$path] has the element \"$element\": one at \$ORIGIN was expected" ;;
            *) wrong "$file" "the search path [$path] has the element \"$element\": one at \$ORIGIN was expected" ;;
        esac
    done <<< "$path:"
}

check_protections() {
    local header headers symbols
    header=$(readelf -hW "$file")
    headers=$(readelf -lW "$file")
    symbols=$(readelf -sW --dyn-syms "$file" | sed -E 's/@.*//' | awk '$7 == "UND" { print $8 }' | sort -u)
    grep -qE 'Type: +EXEC' <<< "$header" && wrong "$file" "it is loaded at a fixed address"
    grep -q 'GNU_RELRO' <<< "$headers" || wrong "$file" "its tables of addresses stay writable (no GNU_RELRO)"
    grep -qE 'BIND_NOW|FLAGS.* NOW' <<< "$dynamic" || wrong "$file" "addresses are bound late (no BIND_NOW)"
    grep -E 'GNU_STACK' <<< "$headers" | grep -q 'RWE' && wrong "$file" "its stack can be executed"
    grep -qx '__stack_chk_fail' <<< "$symbols" || wrong "$file" "no function guards its stack"
    # Only functions that the compiler always has a checked form of, also where it cannot know the buffer's size.
    local plain
    plain=$(grep -xE 'v?[fs]?printf|snprintf|longjmp' <<< "$symbols" | paste -sd' ' || true)
    [ -z "$plain" ] || wrong "$file" "functions are called without the checks of _FORTIFY_SOURCE: $plain"
    if grep -q 'X86-64' <<< "$header"; then
        # Two come from the compiler's own start-up code.
        local targets
        targets=$(objdump -d --no-show-raw-insn "$file" | grep -c 'endbr64' || true)
        [ "$targets" -gt 2 ] || wrong "$file" "jumps are not guarded (no endbr64)"
    fi
}

for file in "$@"; do
    if ! dynamic=$(readelf -dW "$file" 2> /dev/null); then
        wrong "$file" "it cannot be read as a program or library"
        continue
    fi
    check_paths
    [ $paths_only = 1 ] || check_protections
done
exit $failed
