#!/usr/bin/env bash
# Lays out a tree of files as a kernel shows it, from the text that tests/data/hosts keeps of it.
#
#     lay_out_host.sh TREE DIRECTORY
set -euo pipefail

rm -rf "$2"
while IFS= read -r line; do
    case $line in
        '#'*) ;;
        *' -> '*)
            mkdir -p "$(dirname "$2/${line%% -> *}")"
            ln -s "${line##* -> }" "$2/${line%% -> *}"
            ;;
        *'| '*) printf '%b\n' "${line#*| }" >>"$file" ;;
        */) mkdir -p "$2/$line" ;;
        *)
            file=$2/$line
            mkdir -p "$(dirname "$file")"
            : >"$file"
            ;;
    esac
done <"$1"
