#!/usr/bin/env bash
# road.sh CASE tcp|pipe BATCH DEVICE [EMULATOR]: a PROM in another process is programmed, or something goes wrong and is
# told, with the port free again and no half a file.
set -euo pipefail
name=$1
shift
source "$(dirname "${BASH_SOURCE[0]}")/device.sh"

cable='setcable -port auto
assignfile -p 1 -file image.bin'

# The port can be had again, and nothing was left of the file that was to be read back.
nothing_stays() {
    asked 0 'port taken' 'setcable -port auto'
    [ -z "$(ls | grep '^back' || true)" ] || fail "left behind: $(ls)"
}

# start_typing: a prompt that takes what is written to descriptor 9; what it says is in the file said.
start_typing() {
    mkfifo typed
    "${batch[@]}" - <typed >said 2>&1 &
    typing=$!
    exec 9>typed
}

# What is programmed is what is read back; a larger PROM beside it; without an erasure old and new content mix. What
# switches ask for can be preferred.
normal() {
    serve
    image image.bin 1000003
    image large.bin $((16 << 20))
    asked 0 'device checksum' "$cable -ver 0
assignfile -p 2 -file large.bin
program -p 1 2 -e -v
readback -p 1 -file back.bin
readback -p 2 -file back2.bin
closecable"
    cmp image.bin back.bin
    cmp large.bin back2.bin
    cmp image.bin prom
    [ "$(grep -c 'Calculated checksum matches expected checksum' <<<"$printed")" -eq 2 ] || fail "$printed"

    tr 0-4 5-9 <image.bin >other.bin
    asked 1 'is the first that differs' "$cable
assignfile -p 1 -file other.bin
program -p 1 -v"
    asked 0 'matches expected' "$cable
assignfile -p 1 -file other.bin
preference EraseBeforeProgram true
preference VerifyAfterProgram true
preference FileOverwrite true
program -p 1
readback -p 1 -file back.bin"
    cmp other.bin back.bin
}

flipped() {
    serve --flip-bit 655361
    image image.bin 100000
    asked 1 'standard input:3: The calculated checksum (0x[0-9a-f]*) differs from the expected checksum (0x[0-9a-f]*)' \
        "$cable
program -p 1 -e -v"
    grep -q 'position 1: byte 0x14000 is the first that differs: 30 in the file, 32 in the device' <<<"$printed" ||
        fail "$printed"
    nothing_stays
}

# The device ends itself in the middle of a block, which it programs or is read from.
vanished() {
    image image.bin 200000
    serve --vanish-after 100000
    asked 1 'standard input:3: position 1: programming ended at byte 65536 of 200000: the device is gone' "$cable
program -p 1"
    cp image.bin prom
    serve --vanish-after 100000
    asked 1 'standard input:3: position 1: reading back ended at byte 65536 of 200000: the device is gone' "$cable
readback -p 1 -file back.bin
closecable"
    nothing_stays
}

killed() {
    image image.bin 2000000
    serve --slow 100000
    start_typing
    printf '%s\nprogram -p 1\n' "$cable" >&9
    await said 'programming: 2. %'
    kill "$served"
    await said 'standard input:3: position 1: programming ended at byte .*: the device is gone'
    exec 9>&-
    status=0
    wait "$typing" || status=$?
    typing=
    [ $status -eq 1 ] || fail "status $status: $(cat said)"
    nothing_stays
}

locked() {
    serve
    start_typing
    echo 'setcable -port auto' >&9
    await said 'port taken'
    asked 1 "standard input:1: $address: the port is in use by another process; 1 other client is attached" \
        'setcable -port auto'
    asked 1 'the port is in use by another process' 'erase -p 1'
    echo closecable >&9
    await said 'port given back'
    asked 0 'position 1: erased' 'erase -p 1'
    exec 9>&-
    wait "$typing"
    typing=
}

# ^C between two blocks, and at a prompt that waits for its next line.
interrupted() {
    image prom 2000000
    serve --slow 100000
    interrupt_at 'reading back: 2. %' 'readback -p 1 -file back.bin'
    grep -q '^standard input:2: position 1: reading back ended at byte .*: interrupted' said || fail "$(cat said)"
    interrupt_at 'port taken' ''
}

# interrupt_at TEXT LINE: the signal comes when the prompt has said the text at the line.
interrupt_at() {
    local status=0
    start_typing
    printf 'setcable -port auto\n%s\n' "$2" >&9
    await said "$1"
    kill -INT "$typing"
    wait "$typing" || status=$?
    typing=
    exec 9>&-
    rm typed
    [ $status -eq 130 ] && grep -q '^standard input: interrupted' said || fail "status $status: $(cat said)"
    nothing_stays
}

# Lines that cannot be carried out: each is told with its number, and the next one is taken.
refused() {
    serve
    image image.bin 100
    : >empty.bin
    image large.bin 2097153
    asked 1 '19 lines: 7 checked, 0 refused as expected, 12 refused' 'program -p 1
verify -p 4
erase -p 3
assignfile -p 1 -file absent.bin
program -p 1
assignfile -p 1 -file empty.bin
program -p 1
assignfile -p 1 -file large.bin
program -p 1
assignfile -p 1 -file image.mcs
program -p 1
assignfile -p 1 -file image.bin
readback -p 1
readback -p 1 -file absent/back.bin
checksum -p 1 -expect 1
setcable -port auto -speed 5000001
program -p 1 -e -v
preference StopOnError true
readback -p 1 -file image.bin
not reached'
    while read -r expected; do
        grep -q "^standard input:$expected" <<<"$printed" || fail "not told: $expected: $printed"
    done <<'EXPECTED'
1: position 1: no file is assigned
2: position 4: the chain has 3 devices
3: position 3: sim-logic is no PROM of the catalogue
5: position 1: absent.bin cannot be read
7: position 1: empty.bin is empty
9: position 1: large.bin holds 2097153 bytes, the PROM 2097152
11: position 1: image.mcs is no binary file
13: position 1: no file is given
14: .*absent/back.bin cannot be written
15: The calculated checksum (0x1fe00000) differs from the expected checksum (0x00000001)
16: Invalid speed 5000001
19: position 1: image.bin is there already
EXPECTED
    nothing_stays
}

"$name"
