#!/usr/bin/env bash
# about: the tests with Thread in their names, under ThreadSanitizer
# needs: libgtest-dev=/usr/include/gtest/gtest.h libgmock-dev=/usr/include/gmock/gmock.h clang=clang++ libclang-rt-dev
# limit: 600
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"

# Only the programs that hold such a test are built.
programs=$(cd "$root/tests" && grep -lE '^TEST.*Thread' */test_*.cpp | sed 's|/.*||; s|^|test_|' | sort -u) || true
if [ -z "$programs" ]; then
    echo "no test has Thread in its name"
    exit 0
fi
build tsan $programs
run_tests "$root/build/tsan" -R Thread
