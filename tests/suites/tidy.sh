#!/usr/bin/env bash
# about: clang-tidy over every unit of the library and the examples, with its headers
# needs: clang-tidy=clang-tidy clang=clang++
# limit: 1800
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"
source "$(dirname "${BASH_SOURCE[0]}")/lib/tidy.sh"

cd "$root"
quietly configure_preset dev
# There are no headers of the other host for clang.
tidy build/dev $(find s hostkit exceptions deviceprofile imagetools platform examples -name '*.cpp' -not -path '*/windows/*' | sort)
