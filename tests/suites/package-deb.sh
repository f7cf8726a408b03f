#!/usr/bin/env bash
# about: Debian packages of library, data, headers and tools, unpacked and used: CMake, pkg-config, tools, completion, pages
# needs: dpkg-dev=dpkg-shlibdeps file=file pkg-config=pkg-config man-db=man
# limit: 600
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"
source "$(dirname "${BASH_SOURCE[0]}")/lib/consumer.sh"

make_packages -DCMAKE_INSTALL_PREFIX=/usr
installed=$work/installed/usr
for package in "$work"/packages/*.deb; do
    quietly dpkg -x "$package" "$work/installed"
done
libraries=$(dirname "$(find "$installed" -name 'libTessalUtility.so')")

# field PACKAGE FIELD: what a package says about itself.
field() {
    dpkg-deb --field "$work"/packages/"$1"_*.deb "$2"
}
# expect TEXT PATTERN
expect() {
    [[ $1 =~ $2 ]] || { echo "\"$1\" does not match \"$2\"." >&2; exit 1; }
}
soname=$(objdump -p "$libraries/libTessalUtility.so" | sed -n 's/ *SONAME *//p')
library=libtessalutility${soname##*.}
expect "$(field "$library" Depends)" 'tessalutility-data \(>= .*libc6 .*libstdc\+\+6'
expect "$(field tessalutility-data Architecture)" '^all$'
expect "$(field libtessalutility-dev Depends)" "$library \(= "
expect "$(field tessal-tools Depends)" "$library \(= .*libc6 "
expect "$(dpkg-deb --ctrl-tarfile "$work"/packages/"$library"_*.deb | tar -xO ./shlibs)" "libTessalUtility ${soname##*.} $library"

build_consumer
export LD_LIBRARY_PATH=$libraries PKG_CONFIG_PATH=$libraries/pkgconfig
read -ra flags <<<"$(pkg-config --cflags --libs tessalutility)"
quietly g++ -std=c++17 "$root/tests/consumer/main.cpp" "${flags[@]}" -o "$work/consumer/by-flags"
quietly "$work/consumer/by-flags"

export installed work
step "tools used" bash -c 'use_tools "$@"' use_tools
expect "$("$installed/bin/tessal_batch" -c help erase)" 'Erase devices'
bash -c 'source "$1" && complete -p tessal_batch' bash "$installed/share/bash-completion/completions/tessal_batch" >/dev/null
for tool in tessal_batch tessal_device tessal_prom; do
    expect "$(MANPATH=$installed/share/man man "$tool" 2>&1)" "$tool"
done
for folder in doc/$library/copyright zsh/site-functions/_tessal_batch fish/vendor_completions.d/tessal_batch.fish; do
    [ -f "$installed/share/$folder" ] || { echo "$folder is missing." >&2; exit 1; }
done
echo "$(cd "$work/packages" && ls *.deb | paste -sd ' ')"
