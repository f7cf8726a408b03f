#!/usr/bin/env bash
# Two prompts side by side: the second one is told that the first has the port, and gets it when that gives it back.
#
#     two_prompts.sh PROGRAM DATA
set -euo pipefail

program=$1
data=$2
folder=$(mktemp -d)
trap 'exec 9>&- || true; wait || true; rm -rf "$folder"' EXIT

# Waits, for a bounded time, until the first prompt has said the words.
await() {
    for _ in $(seq 200); do
        grep -q "$1" "$folder/first" && return
        sleep 0.05
    done
    echo "The first prompt never said \"$1\":" >&2
    cat "$folder/first" >&2
    exit 1
}

second() {
    printf 'setcable -port lpt20\n' | "$program" --data "$data" - 2>&1 || true
}

mkfifo "$folder/typed"
"$program" --data "$data" -i <"$folder/typed" >"$folder/first" 2>&1 &
exec 9>"$folder/typed"
echo 'setcable -port lpt20' >&9
await 'port taken'

second | grep -q 'the port is in use by another process; 1 other client is attached'
echo 'closecable' >&9
await 'port given back'
second | grep -q 'port taken'
echo 'quit' >&9
