#!/usr/bin/env bash
# about: a program fetches the source, an archive on this disk, and builds it as a part of itself
# needs:
# limit: 900
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"
source "$(dirname "${BASH_SOURCE[0]}")/lib/consumer.sh"

rm -rf "$work"
mkdir -p "$work"
quietly tar -C "$root" -czf "$work/TessalUtility.tar.gz" --exclude=./build --exclude=./.git --exclude=./.cache .
build_consumer -DCMAKE_BUILD_TYPE=Debug -DTESSAL_ARCHIVE="$work/TessalUtility.tar.gz"
