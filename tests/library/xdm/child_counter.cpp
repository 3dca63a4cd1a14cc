// SPDX-License-Identifier: Apache-2.0
#include "tests/library/xdm/child_counter.hpp"

#include <glib.h>

#include <dlfcn.h>

namespace {
std::size_t g_count = 0;
}

// Stands in front of GLib's.
extern "C" __attribute__((visibility("default"))) GVariant *
g_variant_get_child_value(GVariant *value, gsize index) {
    static const auto glibs = reinterpret_cast<GVariant *(*)(GVariant *, gsize)>(
        dlsym(RTLD_NEXT, "g_variant_get_child_value"));
    ++g_count;
    return glibs(value, index);
}

namespace test {

std::size_t children_taken() {
    return g_count;
}

} // namespace test
