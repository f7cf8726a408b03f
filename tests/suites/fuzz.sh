#!/usr/bin/env bash
# about: each fuzz target for a bounded time over its seeds (FUZZ_SECONDS, else 10)
# needs: clang=clang++ libclang-rt-dev
# limit: 900
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"

names=$(cd "$root/tests/fuzz" && find . -name 'fuzz_*.cpp' | sed 's|.*/fuzz_||; s|\.cpp$||' | sort)
if [ -z "$names" ]; then
    echo "no fuzz target"
    exit 0
fi

fuzz_one() {
    local name=$1 work=$root/build/suites/fuzz/$1
    local seeds=$root/tests/fuzz/corpus/$name words=$root/tests/fuzz/$name.dict
    rm -rf "$work"
    mkdir -p "$work/found"
    cd "$work"
    local options=(-max_total_time="${FUZZ_SECONDS:-10}" -timeout=10 -rss_limit_mb=4096)
    [ ! -f "$words" ] || options+=(-dict="$words")
    [ -d "$seeds" ] || seeds=
    if ! "$root/build/fuzz/tests/fuzz/fuzz_$name" "${options[@]}" found ${seeds:+"$seeds"} >log 2>&1 </dev/null; then
        tail -n 60 log >&2
        echo "fuzz_$name failed; its input is in $work" >&2
        return 1
    fi
    echo "fuzz_$name: $(sed -n 's/^Done \([0-9]* runs\) in \([0-9]*\) second.*/\1 in \2 s/p' log)"
}

build fuzz fuzz_targets
export root
export -f fuzz_one
xargs -n 1 -P "$jobs" bash -c 'fuzz_one "$1"' fuzz_one <<<"$names"
