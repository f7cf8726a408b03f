#!/usr/bin/env bash
# about: a program finds the installed package, static
# needs: libgtest-dev=/usr/include/gtest/gtest.h libgmock-dev=/usr/include/gmock/gmock.h libbenchmark-dev=/usr/include/benchmark/benchmark.h
# limit: 600
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"
source "$(dirname "${BASH_SOURCE[0]}")/lib/consumer.sh"

install_library static
build_consumer
