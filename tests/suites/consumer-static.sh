#!/usr/bin/env bash
# about: a program finds the installed package, static
# needs: 
# limit: 600
set -euo pipefail
source "$(dirname "${BASH_SOURCE[0]}")/lib/steps.sh"
source "$(dirname "${BASH_SOURCE[0]}")/lib/consumer.sh"

install_library -DBUILD_SHARED_LIBS=OFF
build_consumer
