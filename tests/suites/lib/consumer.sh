# For the consumer suites: installs the library as others find it, and builds tests/consumer against it.

# The folder of this suite's own builds; a suite always starts with a fresh installation.
work=$root/build/suites/$(basename "$0" .sh)
installed=$work/installed

# install_library [OPTION...]: builds the library alone and installs it.
install_library() {
    rm -rf "$installed" "$work/consumer"
    quietly configure "$work/library" -DCMAKE_BUILD_TYPE=Release -DTESSAL_TESTS=OFF -DTESSAL_EXAMPLES=OFF \
        -DCMAKE_INSTALL_PREFIX="$installed" "$@"
    step "library built" cmake --build "$work/library" --parallel "$jobs"
    quietly cmake --install "$work/library"
    quietly check_headers
}

check_headers() {
    diff <(cd "$root/include" && ls) <(cd "$installed/include/TessalUtility" && ls)
}

# build_consumer [OPTION...]: builds the consumer and runs its tests.
build_consumer() {
    rm -rf "$work/consumer"
    quietly cmake -S "$root/tests/consumer" -B "$work/consumer" -G Ninja -DCMAKE_BUILD_TYPE=Release \
        -DCMAKE_PREFIX_PATH="$installed" "$@"
    step "consumer built" cmake --build "$work/consumer" --parallel "$jobs"
    run_tests "$work/consumer"
}
