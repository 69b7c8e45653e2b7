#!/usr/bin/env bash
# Builds a library whose headers are wrong in one way each, and expects scripts/check-exports.py to say so.
#
#   check-exports-test.sh COMPILER
set -euo pipefail
cd "$(dirname "$0")/.."
compiler=$1

folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT
mkdir "$folder/headers"
cat > "$folder/headers/Declared.h" << 'END'
#define KAREPORT_EXPORT __attribute__((visibility("default")))
namespace kareport
{
class KAREPORT_EXPORT Declared
{
public:
    virtual ~Declared();
    template <typename T> T twice(T value);
};
KAREPORT_EXPORT int declaredToo(int value);
} // namespace kareport
END
cat > "$folder/library.cpp" << 'END'
#include "headers/Declared.h"
#include <string>
namespace kareport
{
Declared::~Declared() = default;
template <typename T> T Declared::twice(T value) { return value + value; }
template std::string Declared::twice<std::string>(std::string);
int declaredToo(int value) { return value; }
#ifdef FUNCTION
KAREPORT_EXPORT int unlisted() { return 1; }
#endif
#ifdef TEMPLATE
template <typename T> KAREPORT_EXPORT std::string unlistedOf(T) { return "a"; }
template std::string unlistedOf<int>(int);
#endif
#ifdef CLASS
class KAREPORT_EXPORT Unlisted
{
public:
    virtual ~Unlisted();
};
Unlisted::~Unlisted() = default;
#endif
} // namespace kareport
END

failed=0
expect() { # what is said, empty for nothing; options of the compiler
    local said=$1 output
    shift
    "$compiler" -std=c++20 -fPIC -shared -fvisibility=hidden "$@" -o "$folder/library.so" "$folder/library.cpp"
    output=$(scripts/check-exports.py "$folder/headers" "$folder/library.so" || true)
    if [ -z "$said" ] && [ -n "$output" ] || ! grep -qF -- "$said" <<< "$output"; then
        printf 'with %s: "%s" was expected, this was said: %s\n' "$*" "$said" "$output"
        failed=1
    fi
}

expect ''
expect 'kareport::unlisted() is offered' -DFUNCTION
expect 'kareport::unlistedOf<int>(int) is offered' -DTEMPLATE
expect 'vtable for kareport::Unlisted is offered' -DCLASS
sed -i '$i KAREPORT_EXPORT int missing();' "$folder/headers/Declared.h"
expect 'missing is declared, and no library offers it'
sed -i '/missing/d; $i class KAREPORT_EXPORT Gone { void go(); };' "$folder/headers/Declared.h"
expect 'class Gone is declared, and no library offers any of it'
exit $failed
