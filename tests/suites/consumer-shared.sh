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

# What is exported belongs to a class or function that a public header names.
exported=$(nm --dynamic --defined-only --demangle "$library" | sed -nE 's/^[0-9a-f]+ [TDBR] //p')
private=
while read -r symbol; do
    name=$(grep -oE '[A-Za-z_][A-Za-z0-9_]*' <<<"${symbol%%(*}" | grep -vxE 'vtable|typeinfo|for|name|operator|HostKit|std|new|delete' | head -n 1)
    grep -qrw -- "$name" "$installed/include" || private+="$symbol"$'\n'
done <<<"$exported"
[ -z "$private" ] || { echo "Exported, but in no public header:"$'\n'"$private" >&2; exit 1; }
echo "$soname, $(wc -l <<<"$exported") symbols"
