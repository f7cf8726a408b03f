#!/usr/bin/env bash
# about: a program finds the installed package, shared, and nothing private is exported
# needs: 
# limit: 600
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"
source "$(dirname "${BASH_SOURCE[0]}")/lib/consumer.sh"

install_library shared
build_consumer

library=$(find "$installed" -name 'libTessalUtility.so')
soname=$(objdump -p "$library" | sed -n 's/ *SONAME *//p')
[[ $soname =~ ^libTessalUtility\.so\.[0-9]+$ ]] || { echo "The soname is $soname." >&2; exit 1; }

# What is exported belongs to a class or function that a public header names: the first word of the symbol that is not C++'s.
symbols=$(nm --dynamic --defined-only --demangle "$library" | sed -nE 's/^[0-9a-f]+ [TDBR] //p')
words=$(grep -rohE '[A-Za-z_][A-Za-z0-9_]*' "$installed/include" | sort -u)
private=$(awk '
    NR == FNR { public[$0]; next }
    {
        count = split($0, part, /[^A-Za-z0-9_]+/)
        for (i = 1; i <= count; ++i)
            if (part[i] !~ /^(|vtable|typeinfo|for|name|operator|HostKit|std|new|delete)$/) break
        if (!(part[i] in public)) print
    }' <(echo "$words") <(echo "$symbols"))
[ -z "$private" ] || { echo "Exported, but in no public header:"$'\n'"$private" >&2; exit 1; }
echo "$soname, $(wc -l <<<"$symbols") symbols"
