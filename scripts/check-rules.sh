#!/usr/bin/env bash
# Rules that a compiler does not check. Prints every line that breaks one.
set -euo pipefail
cd "$(dirname "$0")/.."

failed=0
report() { # what is wrong, and the lines that grep has found
    if [ -n "$2" ]; then
        printf '%s\n%s\n' "$1" "$2"
        failed=1
    fi
}
sources=$(find host templates groups page formats report print view ui sheets geometry sources rows exports jobs preview apps tests bench fuzz tools examples -name '*.h' -o -name '*.cpp' | sort)

report 'Headers are included by their name alone, so that layers hold:' \
    "$(grep -nE '#include "(\.\./|[a-z]+/)' $sources || true)"
report 'Operating-system headers belong into files named for the system (Posix or Windows in their names):' \
    "$(grep -nE '#include <(unistd|fcntl|poll|io|sys/[a-z]+|windows|winsock2|sh[a-z]+api|shlobj|pthread)(\.h)?>' $sources | grep -vE '(Posix|Windows)[A-Za-z]*\.(cpp|h):' || true)"
report 'Nothing asks which system it is: what differs is in a pair of files, ...Posix.cpp and ...Windows.cpp, behind one header:' \
    "$(grep -nE '^ *# *(if|ifdef|ifndef|elif)\b.*\b(_?WIN(32|64)|_MSC_VER|__MINGW[0-9A-Z_]*|__(linux|unix|APPLE)__|Q_OS_[A-Z0-9]+|Q_CC_[A-Z]+)\b' $sources || true)"
report 'Each half of a pair has the other one and its header:' \
    "$(for half in $(printf '%s\n' $sources | grep -vE '^(tests|bench|fuzz|tools|examples)/' | grep 'Posix\.cpp$'); do
        for other in "${half%Posix.cpp}Windows.cpp" "${half%Posix.cpp}.h"; do
            [ -e "$other" ] || echo "$other"
        done
    done)"
report 'A test is not skipped without a reason:' \
    "$(grep -nE 'GTEST_SKIP\(\);|DISABLED_' $sources || true)"
report 'No shell is started:' \
    "$(grep -nE '\b(std::)?system\(|\bpopen\(' $sources | grep -v 'QLocale::system()' || true)"
report 'Message boxes and labels are made in host/frame/PlainWidgets.cpp, as others take texts of files for HTML:' \
    "$(grep -nE '\bQ(MessageBox|ErrorMessage|InputDialog)\b|new QLabel|\bQLabel( [a-z][A-Za-z]*)?[({]' $sources docs/*.md |
        grep -vE '^(tests/|host/frame/PlainWidgets\.cpp:)' || true)"
report 'A tool tip of an item, or at a place, goes through plainToolTip:' \
    "$(grep -nE 'ToolTipRole|QToolTip::showText' $sources | grep -vE '^tests/|plainToolTip' || true)"
report 'A progress dialog shows what it does in a label of its own that is plain (setLabel):' \
    "$(grep -lE '\bQProgressDialog [a-z]|new QProgressDialog' $sources | xargs -r grep -L 'setLabel(plainLabel' || true)"
report 'Reports that a program was tried with do not stay in the root:' \
    "$(find . -maxdepth 1 -type f -regex '.*\.\(rep\|rtf\|pdf\|csv\|html\|xlsx\|jsonl\)' | sort)"
report 'Every header guards itself:' \
    "$(for header in $(printf '%s\n' $sources | grep '\.h$'); do head -n 1 "$header" | grep -q '#pragma once' || echo "$header"; done)"
report 'Every header that a host includes stands in its guide (those of the records together):' \
    "$(scripts/public-headers.sh | while read -r header; do
        name=$(basename "$header")
        grep -q "\`$name\`" docs/guide-host.md || [ "${name#sXml}" != "$name" ] || echo "$header"
    done)"
exit $failed
