#!/usr/bin/env bash
# Times the PROM file generator as a whole process: 16 MiB to Intel hex, beside the peers that are installed.
#
#     benchmarks/prom_files.sh [GENERATOR [ROUNDS]]
#
# GENERATOR is build/release/examples/tessal_prom unless told. Each peer and the generator run in turn; a ratio is the
# median over the rounds of theirs / ours in the same round, of wall-clock time and of processor time. The exit status
# is 1 when a ratio of wall-clock times is below its goal.
set -euo pipefail

root=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
generator=$(realpath "${1:-$root/build/release/examples/tessal_prom}")
rounds=${2:-11}
folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT
cd "$folder"
head -c 16M /dev/urandom >data.bin

ours() { "$generator" -generic -disableswap -output ours -data data.bin >/dev/null; }

# seconds COMMAND: its wall-clock and its processor time.
seconds() {
    local TIMEFORMAT='%R %U %S'
    { time "$@"; } 2>&1 | awk '{ print $1, $2 + $3 }'
}

# What both have written must be the data.
same_image() {
    command -v objcopy >/dev/null || return 0
    objcopy -I ihex -O binary peer.mcs peer.bin
    objcopy -I ihex -O binary ours.mcs ours.bin
    cmp peer.bin data.bin
    cmp ours.bin data.bin
}

# compare GOAL PEER...: a row of the table for the peer's command; false below the goal.
compare() {
    local goal=$1
    shift
    command -v "$1" >/dev/null || { echo "$1 is not installed" && return; }
    "$@"
    ours
    same_image
    for _ in $(seq "$rounds"); do
        echo "$(seconds "$@") $(seconds ours)"
    done >rounds.txt
    awk -v peer="$1" -v goal="$goal" '
        function median(values, i, j, swap) {
            for (i = 1; i <= NR; ++i)
                for (j = i + 1; j <= NR; ++j)
                    if (values[j] < values[i]) { swap = values[i]; values[i] = values[j]; values[j] = swap }
            return values[int((NR + 1) / 2)]
        }
        {
            theirs[NR] = $1; ours[NR] = $3
            wall[NR] = $1 / ($3 > 0 ? $3 : 0.001)
            processor[NR] = $2 / ($4 > 0 ? $4 : 0.001)
        }
        END {
            ratio = median(wall)
            printf "%-9s %7.0f ms  ours %5.0f ms  %5.1f times faster, %5.1f in processor time  goal %2d  %s\n",
                peer, 1000 * median(theirs), 1000 * median(ours), ratio, median(processor), goal,
                (ratio >= goal ? "met" : "missed")
            exit (ratio < goal)
        }' rounds.txt
}

status=0
compare 10 srec_cat data.bin -binary -o peer.mcs -intel || status=1
compare 3 objcopy -I binary -O ihex data.bin peer.mcs || status=1
exit "$status"
