# Completion of tessal_batch for fish. The program tells what can follow and what it means, from its data file; where it
# tells nothing, file names are completed.
function __tessal_batch_complete
    set -l words (commandline -opc)
    set -l current (commandline -ct)
    set -l lines ($words[1] --complete-words $words[2..-1] "$current" 2>/dev/null)
    if test (count $lines) -gt 0
        printf '%s\n' $lines
    else
        __fish_complete_path "$current"
    end
end
complete -c tessal_batch -f -a '(__tessal_batch_complete)'
