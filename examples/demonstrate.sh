#!/usr/bin/env bash
# The demonstration: a simulated device in a process of its own, and the batch prompt that programs it.
#
#     demonstrate.sh BATCH DEVICE [--tcp] [OPTION...]
#
# The options are those of the device, for faults. The files go to a temporary directory. The exit status is the
# prompt's, or 1 when what was read back is not what was programmed. TESSAL_EMULATOR in the environment is the command
# that starts programs of another host.
set -euo pipefail

here=$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd)
read -ra emulator <<<"${TESSAL_EMULATOR-}"
batch=("${emulator[@]}" "$1")
device=("${emulator[@]}" "$2")
shift 2

work=$(mktemp -d)
served=
# The device ends by its id, whatever has happened.
clean_up() {
    [ -z "$served" ] || kill "$served" 2>/dev/null || true
    [ -z "$served" ] || wait "$served" 2>/dev/null || true
    rm -rf "$work"
}
trap clean_up EXIT
trap 'exit 130' INT TERM

if [ "${1-}" = --tcp ]; then
    shift
    where=(--tcp 0)
elif [ ${#emulator[@]} -eq 0 ]; then
    where=(--pipe "$work/port")
else
    where=(--pipe "tessal_demonstration_$$")
fi

cp "$here/batch/demo.batch" "$here/batch/boot.mem" "$work"
cd "$work"
: >address  # so that it is there before the device's shell has opened it
"${device[@]}" "${where[@]}" --content prom "$@" >address 2>&1 </dev/null &
served=$!
for ((tries = 0; tries < 500; ++tries)); do
    grep -qE '^(pipe|tcp):' address && break
    kill -0 "$served" 2>/dev/null || break
    sleep 0.02
done
TESSAL_DEVICE=$(sed -nE 's/\r$//; /^(pipe|tcp):/p' address)
export TESSAL_DEVICE
[[ $TESSAL_DEVICE =~ ^(pipe|tcp): ]] || { echo "The device does not serve: $(cat address)" >&2; exit 2; }

status=0
"${batch[@]}" demo.batch || status=$?
if [ $status -eq 0 ]; then
    cmp board.bin readback.bin
    echo "what was read back is what was programmed"
fi
exit $status
