#!/usr/bin/env bash
# about: every row of the benchmark table runs, once and shortly
# needs: libgtest-dev=/usr/include/gtest/gtest.h libgmock-dev=/usr/include/gmock/gmock.h libbenchmark-dev=/usr/include/benchmark/benchmark.h
# limit: 600
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"

build release tessal_bench
log=$(mktemp)
trap 'rm -f "$log"' EXIT
"$root/build/release/benchmarks/tessal_bench" --rounds 1 --min-time 0.001 >"$log" || { cat "$log"; exit 1; }
tail -n 1 "$log"
