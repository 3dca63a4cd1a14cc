#!/usr/bin/env bash
# SPDX-License-Identifier: Apache-2.0
# Installs into a directory of its own and builds an application against it in both ways that an
# application would: pkg-config from C, the CMake package from C++.
set -euo pipefail
cd "$(dirname "$0")/.."

work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
prefix=$work/prefix

cmake --preset debug -B "$work/build" -DIMS_BUILD_TOOLS=OFF -DBUILD_TESTING=OFF \
    >/dev/null
cmake --build "$work/build"
cmake --install "$work/build" --prefix "$prefix" >/dev/null

for file in dbus/interfaces/*.xml; do
    cmp "$file" "$prefix/share/dbus-1/interfaces/${file##*/}"
done
cmp dbus/org.kelvo.ims.conf "$prefix/share/dbus-1/system.d/org.kelvo.ims.conf"
echo "contract: ok"

libraries=$(dirname "$(find "$prefix" -name 'libkelvo-ims.so')")
export PKG_CONFIG_PATH=$libraries/pkgconfig

cat >"$work/app.c" <<'APP'
#include <ims.h>
int main(void) { return ims_init(0, NULL) == IMS_ERROR_INVALID_PARAMETER ? 0 : 1; }
APP
# shellcheck disable=SC2046 # flags are words
cc -std=c99 -Wall -Werror "$work/app.c" -o "$work/app" $(pkg-config --cflags --libs kelvo-ims) \
    -Wl,-rpath,"$libraries"
"$work/app" 2>/dev/null
echo "pkg-config: ok"

mkdir "$work/app-cmake"
cp "$work/app.c" "$work/app-cmake/app.cpp"
cat >"$work/app-cmake/CMakeLists.txt" <<'APP'
cmake_minimum_required(VERSION 3.25)
project(app LANGUAGES CXX)
find_package(kelvo-ims 1 REQUIRED)
add_executable(app app.cpp)
target_link_libraries(app PRIVATE kelvo-ims::kelvo-ims)
APP
cmake -G Ninja -S "$work/app-cmake" -B "$work/app-build" -DCMAKE_PREFIX_PATH="$prefix" >/dev/null
cmake --build "$work/app-build" >/dev/null
"$work/app-build/app" 2>/dev/null
echo "CMake package: ok"
