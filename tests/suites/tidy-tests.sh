#!/usr/bin/env bash
# about: clang-tidy over the tests, the fuzz targets and the benchmarks
# needs: clang-tidy=clang-tidy clang=clang++ libgtest-dev=/usr/include/gtest/gtest.h libgmock-dev=/usr/include/gmock/gmock.h libbenchmark-dev=/usr/include/benchmark/benchmark.h libboost-dev=/usr/include/boost/dynamic_bitset.hpp
# limit: 1800
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"
source "$(dirname "${BASH_SOURCE[0]}")/lib/tidy.sh"

cd "$root"
for preset in dev release fuzz; do
    quietly configure_preset "$preset"
done
tidy build/dev $(find tests -name '*.cpp' | grep -vE '/windows/|^tests/(fuzz|wine|consumer)/' | sort)
tidy build/release benchmarks/*.cpp
tidy build/fuzz tests/fuzz/*.cpp
