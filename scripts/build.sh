#!/usr/bin/env bash
# Configures a preset where that has not been done, and builds it. Shows the build's output only when it fails.
#
#   scripts/build.sh PRESET
set -euo pipefail
cd "$(dirname "$0")/.."
preset=$1

log=$(mktemp)
trap 'rm -f "$log"' EXIT
if ! { [ -f "build/$preset/build.ninja" ] || cmake --preset "$preset"; } > "$log" 2>&1 ||
   ! cmake --build --preset "$preset" >> "$log" 2>&1; then
    cat "$log" >&2
    exit 1
fi
