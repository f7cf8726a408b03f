#!/usr/bin/env bash
# completion.sh bash|zsh|fish TESSAL_BATCH COMPLETIONS DATA: asks a shell how command lines of the prompt can go on, by the
# completion file in the folder COMPLETIONS. A shell that is not there is left out, and that is said.
set -euo pipefail

shell=$1
PATH=$(dirname "$2"):$PATH
completions=$3
export TESSAL_DATA_PATH=$4
command -v "$shell" >/dev/null || { echo "skipped: $shell is not installed"; exit 0; }
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
cd "$work"
touch erase.batch

# asked LINE: the words that may stand last in the line.
asked_bash() {
    bash --norc -c '
        source "$1"
        read -ra COMP_WORDS <<<"$2"
        case $2 in *\ ) COMP_WORDS+=("") ;; esac
        COMP_CWORD=$((${#COMP_WORDS[@]} - 1))
        _tessal_batch tessal_batch
        printf "%s\n" "${COMPREPLY[@]}"
        complete -p tessal_batch >/dev/null
    ' bash "$completions/tessal_batch.bash" "$1"
}

asked_fish() {
    fish --no-config -c 'source $argv[1]; complete -C $argv[2]' "$completions/tessal_batch.fish" "$1" | cut -f 1
}

asked_zsh() {
    zsh -f -c '
        words=("${(@Qz)2}")
        [[ $2 != *\  ]] || words+=("")
        CURRENT=$#words
        _describe() { print -rl -- "${(@P)2%%:*}" }
        _files() { print -rl -- ${words[CURRENT]}* }
        source $1
    ' zsh "$completions/_tessal_batch" "$1"
}

# typed_zsh KEYS: what the line reads after a person has typed the keys at a terminal.
typed_zsh() {
    TERM=vt100 timeout 60 zsh -f -c '
        zmodload zsh/zpty
        zpty shell zsh -f -i
        zpty -w shell "fpath=($1 \$fpath); autoload -U compinit; compinit -D -u; \
            show() { print -r -- \$BUFFER >line }; zle -N show; bindkey ^X show; touch ready"
        until [[ -e ready ]]; do zpty -r -t shell; sleep 0.1; done
        zpty -w -n shell "$2"$'\''\x18'\''
        until [[ -s line ]]; do zpty -r -t shell; sleep 0.1; done
        zpty -d shell
    ' zsh "$completions" "$1" >/dev/null
    cat line
}

# expect LINE WORD...: all of these are offered.
expect() {
    local line=$1 word offered
    shift
    offered=$("asked_$shell" "$line")
    for word in "$@"; do
        grep -xF -- "$word" <<<"$offered" >/dev/null ||
            { echo "$shell does not offer \"$word\" for \"$line\" but:"$'\n'"$offered" >&2; exit 1; }
    done
}

expect 'tessal_batch -c re' readback
expect 'tessal_batch -c p' preference program
expect 'tessal_batch -c generate -fo' -format
expect 'tessal_batch -c generate -format ' mcs exo
expect 'tessal_batch --st' --stop-on-error
if [ "$shell" = zsh ]; then
    line=$(typed_zsh $'tessal_batch -c re\t')
    [ "$line" = "tessal_batch -c readback " ] || { echo "A tab gives: $line" >&2; exit 1; }
fi
[ "$shell" = bash ] || expect 'tessal_batch era' erase.batch
echo "$shell completes commands, switches and values"
