#!/usr/bin/env bash
# Prints every place where a source is not formatted as .clang-format says. `--fix` formats the sources instead.
set -euo pipefail
cd "$(dirname "$0")/.."

mode=(--dry-run -Werror)
[ "${1:-}" = --fix ] && mode=(-i)
find host templates page formats report print view ui geometry sources jobs apps tests bench fuzz tools examples -name '*.h' -o -name '*.cpp' | xargs clang-format "${mode[@]}"
