#!/usr/bin/env bash
# about: unit tests, optimised build by g++
# needs: libgtest-dev=/usr/include/gtest/gtest.h libgmock-dev=/usr/include/gmock/gmock.h libbenchmark-dev=/usr/include/benchmark/benchmark.h zsh=zsh fish=fish python3=python3 srecord=srec_cmp spin=spin gdb=gdb
# limit: 1500
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"

# The locks are tortured for a minute.
export TESSAL_TORTURE_SECONDS=${TESSAL_TORTURE_SECONDS:-60}
build release
run_tests "$root/build/release"
