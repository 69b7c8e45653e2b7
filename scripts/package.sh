#!/usr/bin/env bash
# Makes the Debian packages in out/packages.
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/packages.sh build package
scripts/build.sh package
mkdir -p out/packages
cpack --config build/package/CPackConfig.cmake -B out/packages
rm -rf out/packages/_CPack_Packages

# What is in the packages keeps out what a folder or a file may try, and offers what its headers declare.
unpacked=$(mktemp -d)
trap 'rm -rf "$unpacked"' EXIT
for package in out/packages/*.deb; do
    dpkg-deb -x "$package" "$unpacked"
done
mapfile -t binaries < <(find "$unpacked" -type f \( -path '*/bin/*' -o -name '*.so.*' \))
scripts/check-binaries.sh "${binaries[@]}"
mapfile -t libraries < <(find "$unpacked" -type f -name '*.so.*')
scripts/check-exports.py "$unpacked/usr/include/KaReport" "${libraries[@]}"
scripts/check-headers.sh "$unpacked/usr/include/KaReport"
ls -l out/packages
