#!/usr/bin/env bash
# about: clang-tidy over every unit, with its headers
# needs: clang-tidy=clang-tidy clang=clang++ libgtest-dev=/usr/include/gtest/gtest.h libgmock-dev=/usr/include/gmock/gmock.h libbenchmark-dev=/usr/include/benchmark/benchmark.h
# limit: 1800
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"

# Each unit is looked at with the commands of the build that has it.
tidy_one() {
    local log
    log=$(clang-tidy -quiet -p "$1" "$2" 2>&1) || { grep -v ' warnings\? generated' <<<"$log" >&2; return 1; }
}
cd "$root"
for preset in dev release fuzz; do
    quietly configure_preset "$preset"
done
units=$({
    { find s hostkit exceptions deviceprofile imagetools platform examples tests -name '*.cpp' 2>/dev/null || true; } |
        grep -vE '/windows/|^tests/(fuzz|wine|consumer)/' | sed 's|^|build/dev |'
    find benchmarks -name '*.cpp' | sed 's|^|build/release |'
    find tests/fuzz -name '*.cpp' | sed 's|^|build/fuzz |'
} | sort)
export -f tidy_one
xargs -n 2 -P "$jobs" bash -c 'tidy_one "$1" "$2"' tidy_one <<<"$units"
echo "$(wc -l <<<"$units") units"
