#!/usr/bin/env bash
# Makes tests/golden/ again from the examples. Read the difference before you commit it.
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/build.sh release
for job in examples/*.json; do
    name=$(basename "$job" .json)
    build/release/bin/kareport render "$job" -o "tests/golden/$name.rep" -o "tests/golden/$name.txt" \
        -o "tests/golden/$name.rtf"
done
git --no-pager diff --stat -- tests/golden
