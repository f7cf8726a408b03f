#!/bin/sh
# check.sh MODEL FOLDER: checks the model by spin in a new folder below FOLDER, in several sizes, and that the faults put
# in on purpose are found.
set -eu
work=$(mktemp -d "$2/model.XXXXXX")
trap 'rm -rf "$work"' EXIT
cp "$1" "$work/model.pml"
cd "$work"

# check EXPECTED DEFINES...: the number of errors that spin finds must be the expected one.
check() {
    expected=$1
    shift
    spin "$@" -a model.pml > /dev/null
    cc -O1 -DSAFETY -DCOLLAPSE -DMEMLIM=2000 -o pan pan.c
    ./pan -m100000 > output
    grep -q "errors: $expected" output || { cat output; echo "FAILED: $*"; exit 1; }
    if grep -q 'Search not completed' output && [ "$expected" = 0 ]; then cat output; exit 1; fi
    echo "$expected errors, $(grep 'states, stored' output | tr -s ' '): $*"
}

check 0 -DPROCESSES=3 -DROUNDS=1 -DCRASHES=2
check 0 -DPROCESSES=2 -DROUNDS=2 -DCRASHES=1
check 0 -DPROCESSES=2 -DROUNDS=2 -DCRASHES=1 -DLEAVES
check 1 -DPROCESSES=2 -DROUNDS=1 -DCRASHES=0 -DWITHOUT_WAITING
check 1 -DPROCESSES=2 -DROUNDS=1 -DCRASHES=1 -DWITHOUT_COUNTING
