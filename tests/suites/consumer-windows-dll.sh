#!/usr/bin/env bash
# about: a 64-bit Windows program uses the DLL, under Wine
# needs: g++-mingw-w64-x86-64-posix=x86_64-w64-mingw32-g++-posix wine64=/usr/lib/wine/wine64
# limit: 600
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"
source "$(dirname "${BASH_SOURCE[0]}")/lib/consumer.sh"

install_library windows
for file in bin/libTessalUtility.dll lib/libTessalUtility.dll.a; do
    [ -f "$installed/$file" ] || { echo "$file is not installed." >&2; exit 1; }
done
# Windows looks for a DLL beside the program.
build_consumer -DCMAKE_TOOLCHAIN_FILE="$root/cmake/mingw-w64.cmake" -DCMAKE_FIND_ROOT_PATH="$installed" -DCMAKE_RUNTIME_OUTPUT_DIRECTORY="$installed/bin"
