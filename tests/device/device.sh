# For tests that run a simulated device and the prompt as two processes:
#
#     source device.sh pipe|tcp BATCH DEVICE [EMULATOR]
#
# gives a temporary folder, which is entered, and the functions below. What was started is ended by its id.

transport=$1
read -ra emulator <<<"${4:-}"
batch=("${emulator[@]}" "$2")
device=("${emulator[@]}" "$3")
work=$(mktemp -d)
cd "$work"
served=
typing=
clean_up() {
    local id
    for id in $served $typing; do
        kill "$id" 2>/dev/null || true
        wait "$id" 2>/dev/null || true
    done
    rm -rf "$work"
}
trap clean_up EXIT

fail() {
    echo "$1" >&2
    exit 1
}

# await FILE TEXT: waits, for a bounded time, until the file holds a line with the text.
await() {
    local tries
    for ((tries = 0; tries < 3000; ++tries)); do
        grep -q -- "$2" "$1" && return
        sleep 0.02
    done
    fail "never said \"$2\": $(cat "$1")"
}

# serve [OPTION...]: starts a device with its content in the file prom; its address is in $address and TESSAL_DEVICE.
serve() {
    where=(--tcp 0)
    if [ "$transport" = pipe ]; then
        where=(--pipe "tessal_device_test_$$")
    fi
    : >served
    timeout 150 "${device[@]}" "${where[@]}" --content prom "$@" >served 2>&1 </dev/null &
    served=$!
    await served "^$transport:"
    address=$(sed -n "s/\r\$//; /^$transport:/p" served)
    export TESSAL_DEVICE=$address
    [ "$transport" = pipe ] || where=(--tcp "${address#tcp:}")
}

# asked STATUS TEXT LINES: the prompt prints the text for these lines and ends with this status. What it printed is in
# $printed.
asked() {
    local status=0
    printed=$(timeout 60 "${batch[@]}" - <<<"$3" 2>&1) || status=$?
    printed=${printed//$'\r'/}
    if [ $status -ne "$1" ] || ! grep -q -- "$2" <<<"$printed"; then
        fail "status $status, wanted $1 and \"$2\": $printed"
    fi
}

# image FILE BYTES: a file whose bytes do not repeat at any block's length.
image() {
    awk -v bytes="$2" 'BEGIN { for (n = 0; n < bytes; n += 10) printf "%09d\n", n }' >"$1"
    truncate -s "$2" "$1"
}
