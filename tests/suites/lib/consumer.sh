# For the consumer suites: installs the library as others find it, and builds tests/consumer against it.

# The folder of this suite's own builds.
work=$root/build/suites/$(basename "$0" .sh)
installed=$work/installed

# install_library static|shared|windows: a fresh installation. The static one is that of preset release.
install_library() {
    local build=$root/build/release
    rm -rf "$installed" "$work/consumer"
    case $1 in
        static) quietly configure_preset release ;;
        shared) build=$root/build/suites/shared; configure_shared "$build" ;;
        windows) build=$work/library; configure_shared "$build" -DCMAKE_TOOLCHAIN_FILE="$root/cmake/mingw-w64.cmake" ;;
    esac
    step "library built, $1" cmake --build "$build" --parallel "$jobs" --target TessalUtility
    local component
    for component in library data development; do  # the tools, which the preset has too, are not built here
        quietly cmake --install "$build" --prefix "$installed" --component "$component"
    done
    quietly diff <(cd "$root/include" && ls) <(cd "$installed/include/TessalUtility" && ls)
}

configure_shared() {
    quietly configure "$1" -DCMAKE_BUILD_TYPE=Release -DBUILD_SHARED_LIBS=ON -DTESSAL_TESTS=OFF -DTESSAL_EXAMPLES=OFF "${@:2}"
}

# make_packages [OPTION...]: a shared build with the tools, and its packages in the folder packages.
make_packages() {
    rm -rf "$installed" "$work/packages" "$work/consumer"
    mkdir -p "$installed"
    configure_shared "$work/library" -DTESSAL_EXAMPLES=ON "$@"
    step "library and tools built" cmake --build "$work/library" --parallel "$jobs"
    step "packages made" cpack --config "$work/library/CPackConfig.cmake" -B "$work/packages"
}

# build_consumer [OPTION...]: builds the consumer and runs its tests.
build_consumer() {
    rm -rf "$work/consumer"
    quietly cmake -S "$root/tests/consumer" -B "$work/consumer" -G Ninja -DCMAKE_BUILD_TYPE=Release \
        -DCMAKE_CXX_COMPILER_LAUNCHER="$(command -v ccache || true)" -DCMAKE_PREFIX_PATH="$installed" "$@"
    step "consumer built" cmake --build "$work/consumer" --parallel "$jobs"
    run_tests "$work/consumer"
}

# use_tools [EMULATOR...]: the installed tools, once each: the prompt asks a device, and the generator writes a file. No
# data file is named to them.
use_tools() (
    set -euo pipefail
    ending=${1:+.exe}
    unset TESSAL_DATA_PATH
    cd "$work"
    : >address
    timeout 120 "$@" "$installed/bin/tessal_device$ending" --tcp 0 >address 2>&1 </dev/null &
    until grep ^tcp: address; do
        sleep 0.1
        kill -0 $!
    done
    address=$(tr -d '\r' <address | grep ^tcp:)
    timeout 60 "$@" "$installed/bin/tessal_batch$ending" - <<<"setcable -port $address"$'\n'identify | grep 'position 3: '
    "$@" "$installed/bin/tessal_device$ending" --quit --tcp "${address#tcp:}"
    wait $!
    printf '\x12\xA5' >a.bin
    "$@" "$installed/bin/tessal_prom$ending" -generic -output boot -data a.bin
    grep :0200000048A511 boot.mcs
)
export -f use_tools
