#!/usr/bin/env bash
# about: every block of code in README.md, CONTRIBUTING.md and docs/ is compiled or run
# needs: python3=python3 doxygen=doxygen
# limit: 900
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"

build dev TessalUtility tessal_batch tessal_device tessal_prom guide_transport
scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT
mkdir "$scratch/work"
python3 "$root/tests/docs/blocks.py" "$root" "$root/build/dev" "$scratch/work"
