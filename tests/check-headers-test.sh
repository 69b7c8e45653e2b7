#!/usr/bin/env bash
# The check of the installed headers finds one too many and one that is missing.
set -euo pipefail
cd "$(dirname "$0")/.."

folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT
while read -r header; do
    cp "$header" "$folder"
done < <(scripts/public-headers.sh)

failed=0
expect() { # status, what is wrong otherwise
    local status=0
    scripts/check-headers.sh "$folder" > "$folder.said" || status=$?
    [ "$status" -eq "$1" ] || { echo "$2"; cat "$folder.said"; failed=1; }
    rm -f "$folder.said"
}
expect 0 'the listed headers were not accepted'
touch "$folder/ReportParts.h"
expect 1 'a header that is not listed was accepted'
rm "$folder/ReportParts.h" "$folder/UReportDoc.h"
expect 1 'a header that is missing was accepted'
exit $failed
