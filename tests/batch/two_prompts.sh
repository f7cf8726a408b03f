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

# A second prompt is told this.
second() {
    local printed
    printed=$("$program" --data "$data" - <<<'setcable -port lpt20' 2>&1) || true
    grep -q "$1" <<<"$printed" || { echo "The second prompt said: $printed" >&2; exit 1; }
}

mkfifo "$folder/typed"
"$program" --data "$data" -i <"$folder/typed" >"$folder/first" 2>&1 &
exec 9>"$folder/typed"
echo 'setcable -port lpt20' >&9
await 'port taken'

second 'the port is in use by another process; 1 other client is attached'
echo 'closecable' >&9
await 'port given back'
second 'port taken'
echo 'quit' >&9
