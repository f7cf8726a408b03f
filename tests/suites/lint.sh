#!/usr/bin/env bash
# about: form: clang-format, host tests in their place, headers that stand alone
# needs: clang-format=clang-format
# limit: 300
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"

cd "$root"
library=(include s hostkit exceptions deviceprofile imagetools platform)
failed=0
complain() {
    echo "$*" >&2
    failed=1
}

# The files of these folders with one of the endings .h and .cpp; a folder may be missing.
sources() {
    { find "$@" -name '*.h' -o -name '*.cpp' 2>/dev/null || true; } | sort
}

sources "${library[@]}" examples benchmarks tests | xargs clang-format --dry-run -Werror ||
    complain "clang-format -i puts these right."

# The border header knows the two hosts' export marks; all else that differs is in platform/ and hostkit/.
hosts=$(grep -rnE '\b_WIN32\b|\b__linux__\b' --include='*.h' --include='*.cpp' "${library[@]}" examples benchmarks 2>/dev/null |
    grep -vE '^(platform/|hostkit/|include/TessalExport\.h:)') || true
[ -z "$hosts" ] || complain "$hosts"$'\n'"Hosts are told apart in platform/ and hostkit/ only."

listed=$(sed -n 's/^#include "\(.*\)"$/\1/p' include/TessalUtility.h)
expected=$(cd include && ls *.h | grep -vx TessalUtility.h | LC_ALL=C sort)
[ "$listed" = "$expected" ] ||
    complain "include/TessalUtility.h does not list each header once, sorted:"$'\n'"$(diff <(echo "$listed") <(echo "$expected"))"

compile_text() {
    g++ -std=c++17 -fsyntax-only -Iinclude -Wall -Wextra -Wpedantic -Wconversion -Wshadow -Werror -x c++ - <<<"$1"
}
export -f compile_text
xargs -P "$jobs" -I{} bash -c 'compile_text "#include \"{}\""' <<<"$expected" || complain "A header does not stand alone."
compile_text "$(tac <<<"$expected" | sed 's/.*/#include "&"/')" || complain "The headers depend on their order."

for script in run test .ci/run cmake/*.sh tests/suites/*.sh tests/suites/lib/*.sh tests/*/*.sh examples/batch/completion/*.bash; do
    bash -n "$script" || complain "$script is no script."
done

count_lines() {
    sources "$@" | xargs cat | wc -l
}
code=$(count_lines "${library[@]}" examples)
tests=$(count_lines tests)
share=$((100 * tests / code))
echo "$(wc -w <<<"$expected") headers; $code lines of library and examples, $tests of tests: $share %"
[ $share -le 33 ] || complain "The tests take more than a third of the code."
exit $failed
