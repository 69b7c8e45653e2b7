#!/usr/bin/env bash
# What completes the command line in a shell is installed where the shells look for it.
#
#   completion-test.sh PREFIX ZSH_FOLDER
set -euo pipefail
for file in share/bash-completion/completions/kareport "share/zsh/$2/_kareport" share/fish/vendor_completions.d/kareport.fish; do
    if ! grep -q 'Made by "kareport completion' "$1/$file"; then
        echo "$1/$file is missing or is not what the program makes" >&2
        exit 1
    fi
done
bash -n "$1/share/bash-completion/completions/kareport"
# Files of other shells begin with what these look for.
[ "$(head -n 1 "$1/share/zsh/$2/_kareport")" = '#compdef kareport' ]
