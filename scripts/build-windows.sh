#!/usr/bin/env bash
# Builds qrxdeck.exe and the examples for Windows, and a ZIP archive of the program: build-windows.sh [FOLDER]
set -euo pipefail

root=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
folder=${1-$root/build/windows-package}
mkdir -p "$folder"
folder=$(cd "$folder" && pwd)
cd "$root"
scripts/build.sh windows all
(cd build/windows && cpack -B "$folder" && rm -rf "$folder/_CPack_Packages")
ls -l "$folder"
