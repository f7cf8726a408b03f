#!/usr/bin/env bash
# about: the pictures are up to date, the reference builds without a warning, links between pages lead somewhere
# needs: doxygen=doxygen python3=python3
# limit: 300
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"

draw_pictures() {
    python3 "$root/docs/pictures/bits.py" "$root/build/docs/pictures"
    local picture
    for picture in "$root"/build/docs/pictures/*.svg; do
        diff -q "$picture" "$root/docs/pictures/" || return
    done
}

step "pictures" draw_pictures
step "doxygen" bash -c "cd '$root' && doxygen docs/Doxyfile"

broken=0
cd "$root"
for page in *.md docs/*.md; do
    # Links to files of this tree only: no scheme, no place within the same page, none in a block of code.
    for link in $(sed '/^```/,/^```/d' "$page" | grep -oE '\]\([^)#: ]+' | cut -c3-); do
        [ -e "$(dirname "$page")/$link" ] || { echo "$page: no such file: $link" >&2; broken=1; }
    done
done
exit $broken
