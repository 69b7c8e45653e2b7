#!/usr/bin/env bash
# Draws every window into PNG files: light and dark, at 100 % and 200 %.
#
#   scripts/pictures.sh [FOLDER]     FOLDER is out/pictures unless given
set -euo pipefail
cd "$(dirname "$0")/.."
folder=${1:-out/pictures}

scripts/packages.sh build test
scripts/build.sh dev
for scale in 1 2; do
    QT_SCALE_FACTOR=$scale build/dev/pictures/ka_pictures --suffix "-light-${scale}x" "$folder"
    QT_SCALE_FACTOR=$scale build/dev/pictures/ka_pictures --dark --suffix "-dark-${scale}x" "$folder"
done
