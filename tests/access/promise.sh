#!/bin/sh
# promise.sh PAGE PROGRAM [MODEL_CHECK...]: prints the table of docs/sharing.md with what its tests say now. The last
# column of each row names the tests, in the form of a filter; "model" is the check of the model.
page=$1
program=$2
shift 2
failed=0

# Prints how a row's tests end: "holds", "skipped" where nothing could run, or "FAILS".
judge() {
    output=$("$program" --gtest_filter="$1" 2>&1) || { echo FAILS; return; }
    case $output in
        *'0 tests from 0 test suites ran'*) echo 'FAILS (no such test)' ;;
        *'[  SKIPPED ]'*) echo skipped ;;
        *) echo holds ;;
    esac
}

while IFS='|' read -r _ fault outcome tests _; do
    case $tests in
        *'`'*) ;;
        *) continue ;;
    esac
    filter=$(echo "$tests" | tr -d ' `' | tr ',' ':')
    if [ "$filter" = model ]; then
        if [ $# -eq 0 ]; then verdict=skipped; elif "$@" > /dev/null 2>&1; then verdict=holds; else verdict=FAILS; fi
    else
        verdict=$(judge "$filter")
    fi
    case $verdict in FAILS*) failed=1 ;; esac
    printf '%-8s %s\n         %s\n' "$verdict" "$(echo "$fault" | sed 's/^ *//; s/ *$//')" \
        "$(echo "$outcome" | sed 's/^ *//; s/ *$//')"
done < "$page"
exit $failed
