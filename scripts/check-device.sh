#!/usr/bin/env bash
# SPDX-License-Identifier: Apache-2.0
# Builds the library as for a device, whose own library provides the feature query and the logger,
# and an application that calls it: those two functions are the ones that are called.
set -euo pipefail
cd "$(dirname "$0")/.."

work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT

cat >"$work/device.c" <<'DEVICE'
#include "platform.h"
#include <stdarg.h>
#include <stdio.h>
int system_info_get_custom_bool(const char *key, bool *value) {
    printf("asked for %s\n", key);
    *value = false;
    return 0;
}
int __dlog_print(int buffer, int priority, const char *tag, const char *format, ...) {
    (void)format;
    return printf("logged %d %d %s\n", buffer, priority, tag);
}
DEVICE
cc -shared -fPIC -Iplatform "$work/device.c" -o "$work/libdevice.so"

configure() {
    cmake --preset debug -B "$work/build" -DIMS_BUILD_TOOLS=OFF -DBUILD_TESTING=OFF \
        -DIMS_PLATFORM=device "$@" >"$work/output" 2>&1
}

if configure; then
    echo "a device without libraries was accepted" >&2
    exit 1
fi
grep -q 'needs -DIMS_PLATFORM_LIBS' "$work/output"

configure "-DIMS_PLATFORM_LIBS=-L$work -ldevice" || {
    cat "$work/output" >&2
    exit 1
}
cmake --build "$work/build"
needed=$(readelf -d "$work/build/lib/libkelvo-ims.so" | grep NEEDED)
grep -q libdevice.so <<<"$needed"
if grep -q kelvo-ims-host <<<"$needed"; then
    echo "the library of a device needs the host's" >&2
    exit 1
fi

cat >"$work/app.c" <<'APP'
#include <ims.h>
int main(void) { return ims_init(0, NULL) == IMS_ERROR_NOT_SUPPORTED ? 0 : 1; }
APP
cc -std=c99 -Wall -Werror -Iinclude "$work/app.c" -o "$work/app" -L"$work/build/lib" -lkelvo-ims \
    -Wl,-rpath,"$work/build/lib" -Wl,-rpath-link,"$work"
said=$(LD_LIBRARY_PATH=$work "$work/app")
[ "$said" = "asked for kelvo.org/feature/network.telephony.ims
logged 2 6 MEGORE" ]
echo "device: ok"
