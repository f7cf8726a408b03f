#!/usr/bin/env bash
# about: the pictures are up to date, reference and man pages have no warning, links between pages lead somewhere
# needs: doxygen=doxygen python3=python3 mandoc=mandoc
# limit: 300
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"

draw_pictures() {
    local program picture
    for program in "$root"/docs/pictures/*.py; do
        python3 "$program" "$root/build/docs/pictures" || return
    done
    for picture in "$root"/build/docs/pictures/*.svg; do
        diff -q "$picture" "$root/docs/pictures/" || return
    done
}

step "pictures" draw_pictures
step "doxygen" bash -c "cd '$root' && doxygen docs/Doxyfile"
step "man pages" mandoc -T lint -W warning "$root"/docs/man/*.1

broken=0
cd "$root"
for page in *.md docs/*.md; do
    # Links to files of this tree only: no scheme, no place within the same page, none in a block of code.
    for link in $(sed '/^```/,/^```/d' "$page" | grep -oE '\]\([^)#: ]+' | cut -c3-); do
        [ -e "$(dirname "$page")/$link" ] || { echo "$page: no such file: $link" >&2; broken=1; }
    done
done
exit $broken
