#!/usr/bin/env bash
# Builds programs that are wrong in one way each, and expects scripts/check-binaries.sh to say so.
#
#   check-binaries-test.sh COMPILER
set -euo pipefail
cd "$(dirname "$0")/.."
compiler=$1

folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT
cat > "$folder/main.cpp" << 'END'
#include <cstdio>
#include <cstring>

int main(int, char **argv)
{
    char name[64];
    std::strcpy(name, argv[0]);
    int (*const print)(const char *) = std::puts;
    std::printf("%s\n", name);
    return print(name) < 0;
}
END

# shellcheck disable=SC2054 # the commas belong to the options
good=(-O2 -U_FORTIFY_SOURCE -D_FORTIFY_SOURCE=2 -fstack-protector-strong -fPIE -pie -Wl,-z,relro -Wl,-z,now)
[ "$(uname -m)" != x86_64 ] || good+=(-fcf-protection)

# What differs in how it is linked only is compiled once.
compile() { # options of the compiler; sets `object`
    local option options=()
    for option; do
        [[ $option == -Wl,* ]] || options+=("$option")
    done
    object=$folder/main$(printf '%s' "${options[@]}").o
    [ -f "$object" ] || "$compiler" "${good[@]}" "${options[@]}" -c -o "$object" "$folder/main.cpp"
}

failed=0
expect() { # what is said, empty for nothing; options of the check before "--", of the compiler after it
    local said=$1 options=() output
    shift
    while [ "$1" != -- ]; do
        options+=("$1")
        shift
    done
    shift
    compile "$@"
    "$compiler" "${good[@]}" "$@" -o "$folder/program" "$object"
    output=$(scripts/check-binaries.sh "${options[@]}" "$folder/program" || true)
    if [ -z "$said" ] && [ -n "$output" ] || ! grep -qF -- "$said" <<< "$output"; then
        printf 'with %s: "%s" was expected, this was said: %s\n' "$*" "$said" "$output"
        failed=1
    fi
}

# shellcheck disable=SC2016 # the loader replaces $ORIGIN
{
    expect '' --
    expect '' -- -Wl,-rpath,'$ORIGIN'
    expect '' -- -Wl,-rpath,'$ORIGIN/../lib:$ORIGIN'
    expect 'an empty element' -- -Wl,-rpath,'$ORIGIN:'
    expect 'an empty element' -- -Wl,-rpath,'$ORIGIN::$ORIGIN/../lib'
    expect 'an empty element' -- -Wl,-rpath,':$ORIGIN'
    expect 'an empty element' -- -Wl,--disable-new-dtags -Wl,-rpath,'$ORIGIN:'
    expect 'the element "$ORIGINAL/lib"' -- -Wl,-rpath,'$ORIGINAL/lib'
}
expect 'the element "."' -- -Wl,-rpath,.
expect 'the element "lib"' -- -Wl,-rpath,lib
expect 'the element "/opt/lib"' -- -Wl,-rpath,/opt/lib
expect 'the element "."' --paths-only -- -Wl,-rpath,.
expect '' --outside -- -Wl,-rpath,/opt/lib -no-pie -fno-pie
expect 'an empty element' --outside -- -Wl,-rpath,/opt/lib:
expect 'the element "lib"' --outside -- -Wl,-rpath,/opt/lib:lib
expect 'loaded at a fixed address' -- -no-pie -fno-pie
expect 'no GNU_RELRO' -- -Wl,-z,norelro
expect 'no BIND_NOW' -- -Wl,-z,lazy
expect 'its stack can be executed' -- -Wl,-z,execstack
expect 'no function guards its stack' -- -fno-stack-protector
expect '_FORTIFY_SOURCE: printf' -- -U_FORTIFY_SOURCE -fno-builtin
expect '' --paths-only -- -no-pie -fno-pie -fno-stack-protector -Wl,-z,lazy
[ "$(uname -m)" != x86_64 ] || expect 'no endbr64' -- -fcf-protection=none

# Of a folder, all that can be run or loaded is looked at, wherever it is, and nothing else.
mkdir -p "$folder/tree/bin" "$folder/tree/lib/more"
compile
mkdir -p "$folder/tree/CMakeFiles"
cp "$object" "$folder/main.cpp" "$folder/tree/bin"
"$compiler" "${good[@]}" -Wl,-rpath,. -o "$folder/tree/CMakeFiles/a.out" "$object"
in_folder() { # what is said of the folder in each line, and in how many
    local output
    output=$(scripts/check-binaries.sh --in "$folder/tree" || true)
    if [ "$(grep -c . <<< "$output")" != "$2" ] || [ "$(grep -cF -- "$1" <<< "$output")" -lt "$2" ]; then
        printf 'of the folder, "%s" was expected %d times, this was said: %s\n' "$1" "$2" "$output"
        failed=1
    fi
}
in_folder 'no program or library was found' 1
"$compiler" "${good[@]}" -o "$folder/tree/bin/program" "$object"
in_folder '' 0
"$compiler" "${good[@]}" -Wl,-rpath,. -o "$folder/tree/lib/more/library.so.1" "$object"
"$compiler" "${good[@]}" -Wl,-rpath,. -o "$folder/tree/bin/other" "$object"
in_folder 'the element "."' 2

if scripts/check-binaries.sh "$folder/main.cpp" > "$folder/said" || ! grep -q 'cannot be read' "$folder/said"; then
    echo 'what is not a program was taken for one'
    failed=1
fi
exit $failed
