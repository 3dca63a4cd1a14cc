#!/usr/bin/env bash
# SPDX-License-Identifier: Apache-2.0
# The checks beyond the tests: formatting, shell scripts, everything with a second compiler, static
# analysis, and an installation that others can build against.
set -euo pipefail
cd "$(dirname "$0")/.."

step() { printf '\n=== %s\n' "$*"; }

scripts/dependencies.sh check

step "Formatting"
git ls-files '*.c' '*.h' '*.cpp' '*.hpp' | xargs clang-format --dry-run --Werror

step "Shell scripts"
git ls-files '*.sh' .ci/run | xargs shellcheck

step "Everything with the second compiler"
cmake --preset debug -B build/clang -DIMS_BUILD_BENCH=ON \
    -DCMAKE_C_COMPILER=clang -DCMAKE_CXX_COMPILER=clang++ >/dev/null
cmake --build build/clang

# analyse CHECKS FILES...
analyse() {
    git ls-files "${@:2}" | xargs -P "$(nproc)" -n 4 clang-tidy --quiet --checks="$1" -p build/clang
}

step "Static analysis of the library"
analyse '' 'src/*.cpp' 'platform/*.cpp'

# Without the search along every path through a function: on these it takes longer than all else.
step "Static analysis of the stand-in and the command line"
analyse '-clang-analyzer-*' 'sim/*.cpp' 'tools/*.cpp'

step "Installation"
scripts/check-install.sh

step "The library of a device"
scripts/check-device.sh
