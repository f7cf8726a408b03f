#!/usr/bin/env bash
# about: unit tests of the 64-bit Windows build, under Wine
# needs: g++-mingw-w64-x86-64-posix=x86_64-w64-mingw32-g++-posix googletest=/usr/src/googletest/CMakeLists.txt wine64=/usr/lib/wine/wine64
# limit: 1500
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"

# The locks are tortured for a minute.
export TESSAL_TORTURE_SECONDS=${TESSAL_TORTURE_SECONDS:-60}
build windows
run_tests "$root/build/windows"
