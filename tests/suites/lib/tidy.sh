# For the suites of clang-tidy.

# tidy BUILD_FOLDER UNIT...: looks at units with the commands of the build that has them; tells how many there were.
tidy() {
    local folder=$1
    shift
    printf '%s\n' "$@" | xargs -P "$jobs" -n 1 bash -c 'tidy_one "$@"' tidy_one "$folder"
    echo "$# units"
}

tidy_one() {
    local log
    log=$(clang-tidy -quiet -p "$1" "$2" 2>&1) || { grep -v ' warnings\? generated' <<<"$log" >&2; return 1; }
}
export -f tidy_one
