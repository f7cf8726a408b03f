#!/usr/bin/env bash
# serve.sh tcp|pipe BATCH DEVICE [EMULATOR]: a device is asked through the prompt, twice, with clients in between that
# send rubbish and vanish, and is told to end.
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/device.sh"

serve
unset TESSAL_DEVICE
asked 0 "position 3: sim-logic, device code 02A20093" "setcable -port $address
identify"
if [ "$transport" = tcp ]; then
    # Messages that are cut short, too long or no records; blocks of impossible lengths, at impossible places.
    for bytes in '\x05\0' '\xff\xff\xff\x7fabc' '\xff\xff\xff\xff' '\x09\0\0\0no number' '\x02\0\0\x009\n' \
        '\x0a\0\0\0004 0 0 -100' '\x0e\0\0\0004 0 0 99999999' '\x0a\0\0\0005 0 -9 100' '\x0e\0\0\0005 0 0 2000000' \
        '\x09\0\0\0005 99 0 1' '\x08\0\0\0004 2 0 1x' '\x08\0\0\0003 -1 0 0' '\x07\0\0\0005 2 0 0'; do
        exec 3<>"/dev/tcp/127.0.0.1/${address#tcp:}"
        printf "$bytes" >&3
        exec 3>&-
    done
fi
child=$(cat "/proc/$served/task/$served/children" 2>/dev/null || true)
memory=$(awk '/^VmHWM/ { print $2 }' "/proc/${child%% *}/status" 2>/dev/null || echo 0)
[ "$memory" -lt 500000 ] || fail "a length from the wire took $memory KiB"
TESSAL_DEVICE=$address asked 0 "position 1: zqr16p, device code 05045093" identify
TESSAL_DEVICE=$address asked 0 "Device checksum is  01fe00000" "checksum -p 1"

timeout 60 "${device[@]}" --quit "${where[@]}"
wait "$served" || fail "the device ended with an error: $(cat served)"
TESSAL_DEVICE=$address asked 1 "no device answers at $address" identify
TESSAL_DEVICE=usb2 asked 1 "neither pipe:NAME nor tcp:PORT" identify
