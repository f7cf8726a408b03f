#!/usr/bin/env bash
# about: unit tests, debug build by g++
# needs: libgtest-dev=/usr/include/gtest/gtest.h libgmock-dev=/usr/include/gmock/gmock.h
# limit: 900
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"

build dev
run_tests "$root/build/dev"
