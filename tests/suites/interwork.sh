#!/usr/bin/env bash
# about: the libraries of both hosts talk over TCP, each as server and as client
# needs: g++-mingw-w64-x86-64-posix=x86_64-w64-mingw32-g++-posix googletest=/usr/src/googletest/CMakeLists.txt wine64=/usr/lib/wine/wine64
# limit: 900
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"

build dev transport_peer
build windows transport_peer

export WINEPREFIX=$root/build/wine WINEDEBUG=-all WINEDLLOVERRIDES=mscoree,mshtml=
linux=("$root/build/dev/tests/transport_peer")
windows=(/usr/lib/wine/wine64 "$root/build/windows/tests/transport_peer.exe")
mkdir -p "$WINEPREFIX"
work=$(mktemp -d)
server=
trap '[ -z "$server" ] || kill "$server" 2>/dev/null || true; rm -rf "$work"' EXIT

# told_port: the port that the server has printed; a Windows program ends its lines with a carriage return.
told_port() {
    for ((tenths = 0; tenths < 600; ++tenths)); do
        sed -n 's/\r$//; s/^port //p' "$work/server" | grep . && return
        sleep 0.1
    done
    echo "the server told no port" >&2
    return 1
}

# talk TEXT SERVER CLIENT: the names of two arrays, the commands.
talk() {
    local -n server_command=$2 client_command=$3
    timeout 120 "${server_command[@]}" server >"$work/server" 2>&1 </dev/null &
    server=$!
    local port
    port=$(told_port)
    step "$1" timeout 60 "${client_command[@]}" client "$port"
    wait "$server" || { cat "$work/server" >&2; exit 1; }
    server=
}

talk "server on Linux, client on Windows" linux windows
talk "server on Windows, client on Linux" windows linux
