#!/usr/bin/env bash
# about: programs built by hand with the flags that pkg-config tells, static and shared
# needs: pkg-config=pkg-config libgtest-dev=/usr/include/gtest/gtest.h libgmock-dev=/usr/include/gmock/gmock.h libbenchmark-dev=/usr/include/benchmark/benchmark.h
# limit: 600
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"
source "$(dirname "${BASH_SOURCE[0]}")/lib/consumer.sh"

for kind in static shared; do
    install_library $kind
    mkdir -p "$work/consumer"
    PKG_CONFIG_PATH=$(dirname "$(find "$installed" -name tessalutility.pc)")
    export PKG_CONFIG_PATH
    read -ra flags <<<"$(pkg-config --cflags --libs tessalutility)"
    quietly g++ -std=c++17 "$root/tests/consumer/main.cpp" "${flags[@]}" -o "$work/consumer/consumer"
    LD_LIBRARY_PATH=$(pkg-config --variable=libdir tessalutility) quietly "$work/consumer/consumer"
    echo "$kind: $(pkg-config --modversion tessalutility), ${flags[*]#*"$root"/}"
done
