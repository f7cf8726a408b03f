#!/usr/bin/env bash
# about: the archive for 64-bit Windows, unpacked: a program uses its DLL, and its tools run, under Wine
# needs: g++-mingw-w64-x86-64-posix=x86_64-w64-mingw32-g++-posix wine64=/usr/lib/wine/wine64
# limit: 600
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"
source "$(dirname "${BASH_SOURCE[0]}")/lib/consumer.sh"

make_packages -DCMAKE_TOOLCHAIN_FILE="$root/cmake/mingw-w64.cmake"
mkdir -p "$installed"
archive=$(basename "$work"/packages/*.zip)
(cd "$installed" && quietly cmake -E tar xf "$work/packages/$archive")
installed=$installed/${archive%.zip}
for file in bin/libTessalUtility.dll lib/libTessalUtility.dll.a lib/cmake/TessalUtility/TessalUtilityConfig.cmake \
    include/TessalUtility/TessalUtility.h share/TessalUtility/tessal.acd bin/tessal_device.exe; do
    [ -f "$installed/$file" ] || { echo "$file is not in $archive." >&2; exit 1; }
done
# Windows looks for a DLL beside the program.
build_consumer -DCMAKE_TOOLCHAIN_FILE="$root/cmake/mingw-w64.cmake" -DCMAKE_FIND_ROOT_PATH="$installed" -DCMAKE_RUNTIME_OUTPUT_DIRECTORY="$installed/bin"

export WINEPREFIX=$root/build/wine WINEDEBUG=-all WINEDLLOVERRIDES=mscoree,mshtml=
export installed work
step "tools used" bash -c 'use_tools "$@"' use_tools /usr/lib/wine/wine64
echo "$archive: $(find "$installed" -type f | wc -l) files"
