#!/usr/bin/env bash
# SPDX-License-Identifier: Apache-2.0
# Usage: test.sh [PRESET] [CTEST OPTIONS...]
# Builds everything and runs all tests; PRESET is debug (the default), release or asan. Without ctest
# options every exported function is listed first, with the method that it calls.
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
# What the tests cover, for ctest hides what a passing test prints. Whether it passes is ctest's to
# say.
if [[ $# -eq 0 ]]; then
    "build/$preset/bin/contract_test" --gtest_brief=1 \
        --gtest_filter=LibraryOnTheBus.EveryExportedFunctionIsCovered || true
fi
ctest --preset "$preset" --progress "$@"
