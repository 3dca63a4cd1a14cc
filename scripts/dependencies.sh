#!/usr/bin/env bash
# SPDX-License-Identifier: Apache-2.0
# Usage: dependencies.sh build|bench|check
# Sees to it that the Debian packages are there that building and testing ("build"), the benchmarks
# ("bench") or the stricter checks ("check") need: installs them with the rights to, says what is
# missing without.
set -euo pipefail

build=(cmake dbus-daemon g++ libcli11-dev libfmt-dev libglib2.0-dev libgtest-dev libgmock-dev
    ninja-build nlohmann-json3-dev pkg-config python3 shared-mime-info)
bench=(libbenchmark-dev valgrind)
check=(clang clang-format clang-tidy doxygen libclang-rt-14-dev shellcheck)

case "${1:-}" in
build) wanted=("${build[@]}") ;;
bench) wanted=("${build[@]}" "${bench[@]}") ;;
check) wanted=("${build[@]}" "${bench[@]}" "${check[@]}") ;;
*)
    echo "usage: $0 build|bench|check" >&2
    exit 2
    ;;
esac

missing=()
for package in "${wanted[@]}"; do
    # shellcheck disable=SC2016 # the field name is dpkg-query's
    [[ $(dpkg-query -W -f='${db:Status-Status}' "$package" 2>/dev/null) == installed ]] ||
        missing+=("$package")
done
((${#missing[@]})) || exit 0

if ((EUID == 0)); then
    as_root=()
elif sudo -n true 2>/dev/null; then
    as_root=(sudo -n)
else
    echo "Missing packages. Install them as root, then run this again:" >&2
    echo "    apt-get install --no-install-recommends ${missing[*]}" >&2
    exit 1
fi
echo "Installing ${missing[*]}"
"${as_root[@]}" apt-get -qq update
"${as_root[@]}" env DEBIAN_FRONTEND=noninteractive \
    apt-get -qq -y install --no-install-recommends "${missing[@]}" >/dev/null
