# Completion of tessal_batch for bash. The program tells what can follow, from its data file; where it tells nothing,
# file names are completed.
_tessal_batch() {
    local IFS=$'\n'
    COMPREPLY=($("$1" --complete-words "${COMP_WORDS[@]:1:COMP_CWORD}" 2>/dev/null | cut -f 1))
}
complete -o bashdefault -o default -F _tessal_batch tessal_batch
