#!/usr/bin/env bash
# SPDX-License-Identifier: Apache-2.0
# The checks beyond the tests: formatting, shell scripts, the library with a second compiler and its
# tests under sanitizers, static analysis, and an installation that others can build against.
set -euo pipefail
cd "$(dirname "$0")/.."

step() { printf '\n=== %s\n' "$*"; }

scripts/dependencies.sh check

step "Formatting"
git ls-files '*.c' '*.h' '*.cpp' '*.hpp' | xargs clang-format --dry-run --Werror

step "Shell scripts"
git ls-files '*.sh' .ci/run | xargs shellcheck

# The tests of the stand-in and of imsctl take most of the building and belong to the programs, not
# to what applications link: `scripts/test.sh asan` runs them too.
parts=(call dictionary ims login poc record_tree reg settings sms ss support vt xdm)
step "The library and its tests with the second compiler, under Address-, Leak- and UBSanitizer"
cmake --preset asan -B build/clang \
    -DCMAKE_C_COMPILER=clang -DCMAKE_CXX_COMPILER=clang++ >/dev/null
cmake --build build/clang --target "${parts[@]/#/tests.}"
ctest --test-dir build/clang --progress --output-on-failure --no-tests=error --parallel 4 \
    --label-regex "^($(IFS='|' && echo "${parts[*]}"))\$"

step "Static analysis of the library"
git ls-files 'src/*.cpp' 'platform/*.cpp' |
    xargs -P "$(nproc)" -n 4 clang-tidy --quiet -p build/clang

step "Installation"
scripts/check-install.sh

step "The library of a device"
scripts/check-device.sh
