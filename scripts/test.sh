#!/usr/bin/env bash
# SPDX-License-Identifier: Apache-2.0
# Usage: test.sh [PRESET] [CTEST OPTIONS...]
# Builds everything and runs all tests; PRESET is debug (the default), release or asan.
set -euo pipefail
cd "$(dirname "$0")/.."

preset=debug
case "${1:-}" in
debug | release | asan)
    preset=$1
    shift
    ;;
esac

scripts/dependencies.sh build
cmake --preset "$preset" >/dev/null
cmake --build --preset "$preset"
ctest --preset "$preset" --progress "$@"
