#!/usr/bin/env bash
# Makes the Debian packages in out/packages.
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/packages.sh build package
scripts/build.sh package
mkdir -p out/packages
cpack --config build/package/CPackConfig.cmake -B out/packages
rm -rf out/packages/_CPack_Packages

scripts/check-packages.sh out/packages
ls -l out/packages
