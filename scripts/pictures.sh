#!/usr/bin/env bash
# Draws every window into PNG files: light and dark, at 100 % and 200 %.
#
#   scripts/pictures.sh [FOLDER]     FOLDER is out/pictures unless given
#   scripts/pictures.sh --guides     renews the pictures of the guides in docs/pictures as well
set -euo pipefail
cd "$(dirname "$0")/.."
guides=
[ "${1:-}" = --guides ] && { guides=yes; shift; }
folder=${1:-out/pictures}

scripts/packages.sh build test
scripts/build.sh dev
for scale in 1 2; do
    QT_SCALE_FACTOR=$scale build/dev/tools/pictures/ka_pictures --suffix "-light-${scale}x" "$folder"
    QT_SCALE_FACTOR=$scale build/dev/tools/pictures/ka_pictures --dark --suffix "-dark-${scale}x" "$folder"
done
if [ -n "$guides" ]; then
    mkdir -p docs/pictures
    # Those that a guide shows.
    grep -oh 'pictures/[a-z-]*\.png' docs/*.md README.md | sort -u | while read -r picture; do
        name=$(basename "$picture" .png)
        cp "$folder/$name-light-1x.png" "docs/pictures/$name.png"
    done
fi
