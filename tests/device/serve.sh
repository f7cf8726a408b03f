#!/usr/bin/env bash
# serve.sh tcp|pipe DEVICE BATCH [EMULATOR]: starts a device, asks it through the prompt, twice, with clients in between
# that send rubbish and vanish, and ends it.
set -euo pipefail

transport=$1
read -ra emulator <<<"${4:-}"
device=("${emulator[@]}" "$2")
batch=("${emulator[@]}" "$3")
name=tessal_device_test_$$
[ "$transport" = pipe ] && where=(--pipe "$name") || where=(--tcp 0)

work=$(mktemp -d)
touch "$work/device"
timeout 150 "${device[@]}" "${where[@]}" >"$work/device" 2>&1 </dev/null &
server=$!
trap 'kill "$server" 2>/dev/null || true; rm -rf "$work"' EXIT

fail() {
    echo "$1" >&2
    exit 1
}

for ((tenths = 0; tenths < 600; ++tenths)); do
    address=$(tr -d '\r' <"$work/device" | grep "^$transport:" || true)
    [ -z "$address" ] || break
    sleep 0.1
done
[ -n "$address" ] || fail "the device does not serve: $(cat "$work/device")"

# asked STATUS TEXT LINES: what the prompt prints for the lines, and its exit status.
asked() {
    local status=0 printed
    printed=$(timeout 60 "${batch[@]}" - <<<"$3" 2>&1) || status=$?
    [ $status -eq "$1" ] && grep -q -- "$2" <<<"$printed" || fail "status $status, wanted $1 and \"$2\": $printed"
}

asked 0 "position 3: sim-logic, device code 02A20093" "setcable -port $address
identify"
if [ "$transport" = tcp ]; then
    for bytes in '\x05\0' '\xff\xff\xff\x7fabc' '\xff\xff\xff\xff' '\x09\0\0\0no number' '\x02\0\0\x009\n'; do
        exec 3<>"/dev/tcp/127.0.0.1/${address#tcp:}"
        printf "$bytes" >&3
        exec 3>&-
    done
fi
child=$(cat "/proc/$server/task/$server/children" 2>/dev/null || true)
memory=$(awk '/^VmHWM/ { print $2 }' "/proc/${child%% *}/status" 2>/dev/null || echo 0)
[ "$memory" -lt 500000 ] || fail "a length from the wire took $memory KiB"
TESSAL_DEVICE=$address asked 0 "position 1: sim-prom-4m, device code 05045093" identify

[ "$transport" = pipe ] || where=(--tcp "${address#tcp:}")
timeout 60 "${device[@]}" --quit "${where[@]}"
wait "$server" || fail "the device ended with an error: $(cat "$work/device")"
TESSAL_DEVICE=$address asked 1 "no device answers at $address" identify
TESSAL_DEVICE=usb2 asked 1 "neither pipe:NAME nor tcp:PORT" identify
