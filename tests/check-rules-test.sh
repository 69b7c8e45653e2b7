#!/usr/bin/env bash
# Breaks a rule at a time in a small tree, and expects scripts/check-rules.sh to say where.
set -euo pipefail
cd "$(dirname "$0")/.."

folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT
cp -r scripts "$folder"
cd "$folder"
# The folders that the script looks into, and no public header but one that its guide names.
sed -n 's/^sources=$(find \(.*\) -name .*/\1/p' scripts/check-rules.sh | sed 's/ -name.*//' | xargs mkdir -p docs
printf '#!/bin/sh\necho host/Known.h\n' > scripts/public-headers.sh
printf '#pragma once\n' > host/Known.h
printf '`Known.h`\n' > docs/guide-host.md

fail() {
    echo "$1" >&2
    exit 1
}

scripts/check-rules.sh > said || fail "a tree without a fault is refused: $(cat said)"

check() { # the file that is wrong, its content, and what is said
    mkdir -p "$(dirname "$1")"
    [ ! -e "$1" ] || cp "$1" kept
    printf '%s\n' "$2" >> "$1"
    if scripts/check-rules.sh > said; then
        fail "$1 is not refused: $2"
    fi
    grep -qF "$3" said || fail "$1 is not named: $(cat said)"
    rm "$1"
    [ ! -e kept ] || mv kept "$1"
}

check examples/host/main.cpp 'QMessageBox::warning(nullptr, report->GetTitle(), text);' examples/host/main.cpp:1
check examples/host/plain.cpp 'auto *label = new QLabel(report->GetTitle());' examples/host/plain.cpp:1
check apps/kareport-desk/Other.cpp 'QLabel label(path, this);' apps/kareport-desk/Other.cpp:1
check docs/guide-host.md '    QMessageBox::information(this, title, text);' docs/guide-host.md:2
check view/Other.cpp 'item->setData(Qt::ToolTipRole, path);' view/Other.cpp:1
check a.rep 'TALVEN' ./a.rep
check trial.pdf '%PDF-1.6' ./trial.pdf
check sources/Other.h 'struct Other;' sources/Other.h
check host/Unlisted.cpp '#include "../Known.h"' host/Unlisted.cpp:1
