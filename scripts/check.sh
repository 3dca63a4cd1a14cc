#!/usr/bin/env bash
# SPDX-License-Identifier: Apache-2.0
# The checks beyond the tests: formatting, shell scripts, who includes whom, the reference
# documentation, the library and the programs with a second compiler and under sanitizers, static
# analysis, and an installation that others can build against.
set -euo pipefail
cd "$(dirname "$0")/.."

step() { printf '\n=== %s\n' "$*"; }

scripts/dependencies.sh check

step "Formatting"
git ls-files '*.c' '*.h' '*.cpp' '*.hpp' | xargs clang-format --dry-run --Werror

step "Shell scripts"
git ls-files '*.sh' .ci/run | xargs shellcheck

step "Who may know whom"
scripts/check-layers.py

step "Reference documentation"
scripts/check-reference.py --self-test
scripts/check-reference.py

# Sanitized are the library with its tests, and the programs. The tests that run the programs are
# those that the test command has built: to build them again would take longer than all else here.
# `scripts/test.sh asan` builds and runs everything sanitized.
export ASAN_OPTIONS=exitcode=99 UBSAN_OPTIONS=exitcode=99
# GLib's own allocator would hide what is leaked.
export G_SLICE=always-malloc
parts=(call contract dictionary ims login poc record_tree reg settings sms ss support vt xdm)
step "The library, its tests and the programs with the second compiler, under Address-, Leak- and UBSanitizer"
cmake --preset asan -B build/clang \
    -DCMAKE_C_COMPILER=clang -DCMAKE_CXX_COMPILER=clang++ >/dev/null
cmake --build build/clang --target "${parts[@]/#/tests.}" ims-sim imsctl
ctest --test-dir build/clang --progress --output-on-failure --no-tests=error --parallel 4 \
    --label-regex "^($(IFS='|' && echo "${parts[*]}"))\$"

# A program that a test kills, or whose failure a test expects, shows what was found in a report.
step "The sanitized programs"
reports=$PWD/build/clang/reports
rm -rf "$reports"
mkdir "$reports"
cmake --preset debug >/dev/null
cmake --build --preset debug
IMS_PROGRAMS=$PWD/build/clang/bin ASAN_OPTIONS=exitcode=99:log_path=$reports/report \
    UBSAN_OPTIONS=exitcode=99:log_path=$reports/report \
    ctest --preset debug --progress --label-regex '^programs$'
if [[ -n $(ls -A "$reports") ]]; then
    cat "$reports"/*
    exit 1
fi
unset ASAN_OPTIONS UBSAN_OPTIONS G_SLICE

# The files of a folder are analysed as one, as they are compiled: each alone would go through the
# heavy headers again. That a file includes files is what joins them.
step "Static analysis"
cmake --preset asan -B build/tidy -DCMAKE_C_COMPILER=clang -DCMAKE_CXX_COMPILER=clang++ \
    -DIMS_SANITIZE= -DIMS_JOIN_FOLDERS=ON -DCMAKE_DISABLE_PRECOMPILE_HEADERS=ON \
    -DBUILD_TESTING=OFF >/dev/null
cmake --build build/tidy --target sim/interfaces.cpp
run-clang-tidy -quiet -p build/tidy -j "$(nproc)" -checks=-bugprone-suspicious-include

step "Installation"
scripts/check-install.sh

step "The library of a device"
scripts/check-device.sh
