#!/usr/bin/env bash
# about: unit tests under AddressSanitizer and UndefinedBehaviorSanitizer, build by clang++
# needs: libgtest-dev=/usr/include/gtest/gtest.h libgmock-dev=/usr/include/gmock/gmock.h clang=clang++ libclang-rt-dev
# limit: 1500
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"

build asan
run_tests "$root/build/asan"
