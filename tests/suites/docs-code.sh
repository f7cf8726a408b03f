#!/usr/bin/env bash
# about: every block of code in README.md, CONTRIBUTING.md and docs/ is compiled or run
# needs: python3=python3 mandoc=mandoc bsdextrautils=col
# limit: 1500
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"

build dev TessalUtility tessal_batch tessal_device tessal_prom guide_transport
scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT
mkdir "$scratch/work"
python3 "$root/tests/docs/blocks.py" "$root" "$root/build/dev" "$scratch/work"

# Man pages tell every option of their tool.
for tool in tessal_batch tessal_device tessal_prom; do
    told=$(mandoc -T ascii "$root/docs/man/$tool.1" | col -b)
    for option in $(LC_ALL=C "$root/build/dev/examples/$tool" --help 2>&1 | grep -oE '(^|[ |[{])--?[A-Za-z-]+' | tr -d ' |[{' | sort -u); do
        [[ $told == *"$option"* ]] || { echo "$tool.1 does not tell $option." >&2; exit 1; }
    done
done
echo "man pages tell all options"
