#!/usr/bin/env bash
# about: every row of the benchmark table runs, once and shortly
# needs: libgtest-dev=/usr/include/gtest/gtest.h libgmock-dev=/usr/include/gmock/gmock.h libbenchmark-dev=/usr/include/benchmark/benchmark.h libboost-dev=/usr/include/boost/dynamic_bitset.hpp python3=python3
# limit: 600
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"

build release tessal_bench
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
mkdir "$work/pictures"
"$root/build/release/benchmarks/tessal_bench" --rounds 1 --min-time 0.001 --report "$work" >"$work/log" ||
    { cat "$work/log"; exit 1; }
rows=$(grep -c '^| [a-z]' "$work/benchmarks.md")
[ "$rows" -eq "$(($("$root/build/release/benchmarks/tessal_bench" --list | wc -l) + 1))" ] ||
    { echo "The page has $rows rows with the heading." >&2; exit 1; }
python3 -c 'import sys, xml.dom.minidom as xml; xml.parse(sys.argv[1])' "$work/pictures/benchmarks.svg"
tail -n 1 "$work/log"
