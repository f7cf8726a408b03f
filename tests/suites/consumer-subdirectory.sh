#!/usr/bin/env bash
# about: a program builds the library as a part of itself, with a strange option or two of its own
# needs: 
# limit: 900
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"
source "$(dirname "${BASH_SOURCE[0]}")/lib/consumer.sh"

# Neither the library's tests nor its warnings-as-errors may come along.
build_consumer -DCMAKE_BUILD_TYPE=Debug -DTESSAL_SOURCE="$root" -DCMAKE_CXX_FLAGS=-Wdouble-promotion
strangers=$(cd "$work/consumer" && ninja -t targets all | grep -E '^[^:]*(test_|tessal_batch|gtest)' || true)
[ -z "$strangers" ] || { echo "Built, but not asked for: $strangers" >&2; exit 1; }
! grep -q -- -Werror "$work/consumer/build.ninja" || { echo "-Werror has come along." >&2; exit 1; }
