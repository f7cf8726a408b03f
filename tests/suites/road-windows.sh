#!/usr/bin/env bash
# about: the demonstration of ./run on 64-bit Windows, both programs under Wine
# needs: g++-mingw-w64-x86-64-posix=x86_64-w64-mingw32-g++-posix googletest=/usr/src/googletest/CMakeLists.txt wine64=/usr/lib/wine/wine64
# limit: 900
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"

build windows tessal_batch tessal_device

export TESSAL_EMULATOR=/usr/lib/wine/wine64 WINEPREFIX=$root/build/wine WINEDEBUG=-all WINEDLLOVERRIDES=mscoree,mshtml=
mkdir -p "$WINEPREFIX"
demonstrate() {
    timeout 200 bash "$root/examples/demonstrate.sh" "$root/build/windows/examples/tessal_batch.exe" \
        "$root/build/windows/examples/tessal_device.exe" "$@"
}
step "demonstration over a pipe" demonstrate
step "demonstration over TCP" demonstrate --tcp
! printed=$(demonstrate --flip-bit 9 2>&1) || { echo "A flipped bit has been passed over: $printed" >&2; exit 1; }
grep -q "differs from the expected checksum" <<<"$printed"
echo "a flipped bit is told"
