#!/usr/bin/env bash
# Prints every place where a source is not formatted as .clang-format says. `--fix` formats the sources instead.
set -euo pipefail
cd "$(dirname "$0")/.."

mode=(--dry-run -Werror)
[ "${1:-}" = --fix ] && mode=(-i)
find host templates page output report view ui apps tests bench fuzz pictures examples -name '*.h' -o -name '*.cpp' | xargs clang-format "${mode[@]}"
