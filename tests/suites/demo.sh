#!/usr/bin/env bash
# about: ./run carries out the demonstration, without and with a fault, and lines from standard input
# needs: 
# limit: 600
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"

step "demonstration over a pipe" "$root/run"
step "demonstration over TCP" "$root/run" --tcp

# expect STATUS TEXT SCRIPT: the lines of SCRIPT through ./run -.
expect() {
    local status=0 printed
    printed=$("$root/run" - <<<"$3" 2>&1) || status=$?
    if [ $status -ne "$1" ] || ! grep -q -- "$2" <<<"$printed"; then
        echo "$printed" >&2
        echo "Status $status, wanted $1 and a line with \"$2\": $3" >&2
        exit 1
    fi
}
expect 0 identify identify
expect 1 "unknown command" no_such_command
! printed=$("$root/run" --flip-bit 9 2>&1) || { echo "A flipped bit has been passed over: $printed" >&2; exit 1; }
grep -q "differs from the expected checksum" <<<"$printed"
echo "lines from standard input, good and bad"
