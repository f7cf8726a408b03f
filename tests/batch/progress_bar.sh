#!/usr/bin/env bash
# On a terminal the progress stands on one line, which a closing line replaces; NO_COLOR keeps it free of colour.
#
#     progress_bar.sh PROGRAM DATA
set -euo pipefail

script -qec true /dev/null </dev/null >/dev/null 2>&1 || { echo "skipped: there is no pseudo-terminal"; exit 77; }
folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT
truncate -s 3M "$folder/zeros"
echo "checksum -file zeros" >"$folder/lines"
cd "$folder"

# What a terminal of 70 columns gets, a line for each return of the cursor.
shown() {
    script -qec "stty cols 70; env TERM=xterm NO_COLOR=$1 '$2' --data '$3' lines" /dev/null </dev/null | tr '\r' '\n'
}

# expect PATTERN TEXT: some line of the text has the form.
expect() {
    grep -Eq "$1" <<<"$2" || { printf 'no line is like\n%s\nin\n%s\n' "$1" "$2" >&2 && exit 1; }
}

plain=$(shown 1 "$@")
expect '^  checksum of zeros  \[#+-+\]   50 %  +[0-9.]+ [KMG]iB/s  +[0-9:]+ left$' "$plain"
expect '^ {69}$' "$plain"
expect '^  checksum of zeros: 3.0 MiB in [0-9.]+ s, [0-9.]+ [KMG]iB/s$' "$plain"
[[ $plain != *$'\e'* ]] || { echo "escape sequences in spite of NO_COLOR" >&2 && exit 1; }
[ -z "$(awk 'length > 69 && /%/' <<<"$plain")" ] || { echo "lines wider than the terminal" >&2 && exit 1; }
expect $'\\[\e\\[32m#+\e\\[0m-+\\]' "$(shown "" "$@")"
