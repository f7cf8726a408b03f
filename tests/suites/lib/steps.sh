# For ./run, ./test and the suites: what a build needs, and quiet steps.

root=$(cd "$(dirname "${BASH_SOURCE[0]}")/../../.." && pwd)
jobs=$(nproc)
build_needs=(cmake=cmake ninja-build=ninja g++=g++)
test_needs=(libgtest-dev=/usr/include/gtest/gtest.h libgmock-dev=/usr/include/gmock/gmock.h)

# quietly COMMAND...: shows what the command prints only when it fails.
quietly() {
    local log status=0
    log=$(mktemp)
    "$@" >"$log" 2>&1 </dev/null || status=$?
    if [ $status -ne 0 ]; then
        cat "$log" >&2
        echo "Failed: $*" >&2
    fi
    rm -f "$log"
    return $status
}

# step TEXT COMMAND...: a quiet command, told with its seconds.
step() {
    local text=$1 start=$SECONDS
    shift
    quietly "$@" || return
    echo "$text ($((SECONDS - start)) s)"
}

# configure BUILD_DIRECTORY [OPTION...]
configure() {
    cmake -S "$root" -B "$1" -G Ninja "${@:2}"
}

# configure_preset PRESET [OPTION...]
configure_preset() {
    (cd "$root" && cmake --preset "$@")
}

# build PRESET [TARGET...]
build() {
    local preset=$1
    shift
    quietly configure_preset "$preset"
    step "built by preset $preset" cmake --build "$root/build/$preset" --parallel "$jobs" ${1:+--target "$@"}
}

# run_tests BUILD_DIRECTORY [CTEST_OPTION...]: tells how many have passed; a directory without tests has failed.
run_tests() {
    local log status=0
    log=$(mktemp)
    ctest --test-dir "$1" --parallel "$jobs" --no-tests=error --output-on-failure "${@:2}" >"$log" 2>&1 </dev/null || status=$?
    if [ $status -eq 0 ]; then
        sed -n 's/^100% tests passed, 0 tests failed out of \([0-9]*\)$/\1 tests passed/p; s/^Total Test time (real) = */in /p' "$log" |
            paste -sd ' '
    else
        cat "$log" >&2
    fi
    rm -f "$log"
    return $status
}
