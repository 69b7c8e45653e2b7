#!/usr/bin/env bash
# Prints every place where a source is not formatted as .clang-format says.
#
#   scripts/check-format.sh [--since STAMP | --fix]
#
#   --since STAMP  looks only at what was changed after the last check that passed with this file, which it keeps
#   --fix          formats the sources instead
set -euo pipefail
cd "$(dirname "$0")/.."

mode=(--dry-run -Werror)
changed=()
stamp=
case "${1:-}" in
--fix) mode=(-i) ;;
--since)
    stamp=$2
    # The beginning of the check counts, as a source may be written meanwhile.
    touch "$stamp.new"
    # Another style, or another formatter, says something else about every source.
    if [ -f "$stamp" ] && [ "$stamp" -nt .clang-format ] && [ "$stamp" -nt "$(readlink -f "$(command -v clang-format)")" ] &&
       [ "$stamp" -nt "$0" ]; then
        changed=(-newer "$stamp")
    fi ;;
esac
find host templates groups page formats report print view ui sheets geometry sources rows exports jobs preview apps tests bench fuzz tools examples \
    "${changed[@]}" \( -name '*.h' -o -name '*.cpp' \) -print0 | xargs -0 -r clang-format "${mode[@]}"
[ -z "$stamp" ] || mv "$stamp.new" "$stamp"
