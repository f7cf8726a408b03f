#!/usr/bin/env bash
# about: each fuzz target for a bounded time over its seeds (FUZZ_SECONDS, else 10)
# needs: clang=clang++ libclang-rt-dev
# limit: 900
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"

fuzz_one() {
    local name=$1 program=$root/build/fuzz/tests/fuzz/fuzz_$1 work=$root/build/suites/fuzz/$1
    rm -rf "$work"
    mkdir -p "$work/found"
    local seeds=$root/tests/fuzz/corpus/$name words=$root/tests/fuzz/corpus/$name.dict
    local options=(-max_total_time="${FUZZ_SECONDS:-10}" -timeout=10 -rss_limit_mb=4096 -artifact_prefix="$work/")
    [ ! -f "$words" ] || options+=(-dict="$words")
    [ -d "$seeds" ] || seeds=
    if ! "$program" "${options[@]}" "$work/found" ${seeds:+"$seeds"} >"$work/log" 2>&1 </dev/null; then
        tail -n 60 "$work/log" >&2
        echo "fuzz_$name failed; the input is in $work" >&2
        return 1
    fi
    echo "fuzz_$name: $(sed -n 's/^Done \([0-9]* runs\) in \([0-9]*\) second.*/\1 in \2 s/p' "$work/log")"
}

build fuzz fuzz_targets
names=$(cd "$root/tests/fuzz" && ls fuzz_*.cpp 2>/dev/null | sed 's/^fuzz_//; s/\.cpp$//')
export root
export -f fuzz_one
xargs -r -n 1 -P "$jobs" bash -c 'fuzz_one "$1"' fuzz_one <<<"$names"
