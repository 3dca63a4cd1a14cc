#!/usr/bin/env bash
# SPDX-License-Identifier: Apache-2.0
# The checks beyond the tests: formatting, shell scripts, everything but the programs' tests with a
# second compiler and under sanitizers, static analysis, and an installation that others can build
# against.
set -euo pipefail
cd "$(dirname "$0")/.."

step() { printf '\n=== %s\n' "$*"; }

scripts/dependencies.sh check

step "Formatting"
git ls-files '*.c' '*.h' '*.cpp' '*.hpp' | xargs clang-format --dry-run --Werror

step "Shell scripts"
git ls-files '*.sh' .ci/run | xargs shellcheck

# All tests built a second time would take longer than all else here: of those that belong to the
# programs, the ones that run them are run once more as the test command has built them, with
# sanitized programs. `scripts/test.sh asan` builds and runs everything sanitized.
parts=(call dictionary ims login poc record_tree reg settings sms ss support vt xdm)
step "The library, its tests and the programs with the second compiler, under Address-, Leak- and UBSanitizer"
cmake --preset asan -B build/clang \
    -DCMAKE_C_COMPILER=clang -DCMAKE_CXX_COMPILER=clang++ >/dev/null
cmake --build build/clang --target "${parts[@]/#/tests.}" ims-sim imsctl
ctest --test-dir build/clang --progress --output-on-failure --no-tests=error --parallel 4 \
    --label-regex "^($(IFS='|' && echo "${parts[*]}"))\$"

step "The sanitized programs"
cmake --preset debug >/dev/null
cmake --build --preset debug
IMS_PROGRAMS=$PWD/build/clang/bin ctest --preset debug --progress --label-regex '^programs$'

step "Static analysis of the library"
git ls-files 'src/*.cpp' 'platform/*.cpp' |
    xargs -P "$(nproc)" -n 4 clang-tidy --quiet -p build/clang

step "Installation"
scripts/check-install.sh

step "The library of a device"
scripts/check-device.sh
