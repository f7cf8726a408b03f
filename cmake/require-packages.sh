#!/usr/bin/env bash
# Installs what is missing through Debian's package manager, and says so.
#
#     cmake/require-packages.sh PACKAGE=PROBE...
#
# PROBE tells that the package is there already, however it came: a command's name, or an absolute path. Without
# "=PROBE" the package manager is asked.
set -euo pipefail

fail() {
    echo "$*" >&2
    exit 1
}

is_there() {
    local package=${1%%=*} probe=${1#*=}
    case $1 in
        *=/*) [ -e "$probe" ] ;;
        *=*) command -v "$probe" >/dev/null ;;
        *) [ "$(dpkg-query -W -f '${db:Status-Status}' "$package" 2>/dev/null)" = installed ] ;;
    esac
}

list_missing() {
    missing=()
    local need
    for need in "$@"; do
        is_there "$need" || [[ " ${missing[*]} " == *" ${need%%=*} "* ]] || missing+=("${need%%=*}")
    done
}

# The words to put before a command that must run as root.
find_rights() {
    rights=(env DEBIAN_FRONTEND=noninteractive)
    if [ "$(id -u)" -ne 0 ]; then
        command -v sudo >/dev/null ||
            fail "Not installed: ${missing[*]}. Installing needs root, and there is no sudo; as root: apt-get install ${missing[*]}"
        sudo -n true 2>/dev/null || [ -t 0 ] ||
            fail "Not installed: ${missing[*]}. Installing needs root, and sudo asks for a password; first: sudo apt-get install ${missing[*]}"
        rights=(sudo "${rights[@]}")
    fi
}

list_missing "$@"
[ ${#missing[@]} -gt 0 ] || exit 0
command -v apt-get >/dev/null ||
    fail "Not installed: ${missing[*]} (names of Debian's packages). This system has no apt-get; install their like with its own package manager."
find_rights

echo "Installing through apt-get: ${missing[*]}"
log=$(mktemp)
trap 'rm -f "$log"' EXIT
apt=(apt-get -o DPkg::Lock::Timeout=300 -o Acquire::Retries=3)
# Old lists may still do, so only the installation's own failure counts.
"${rights[@]}" "${apt[@]}" update >"$log" 2>&1 </dev/null || true
if ! "${rights[@]}" "${apt[@]}" install -y --no-install-recommends "${missing[@]}" >>"$log" 2>&1 </dev/null; then
    tail -n 20 "$log" >&2
    fail "apt-get could not install ${missing[*]} (its last words stand above); is the network there, and are the package sources right?"
fi
list_missing "$@"
[ ${#missing[@]} -eq 0 ] || fail "Installed, but still not found: ${missing[*]}"
