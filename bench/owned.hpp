// SPDX-License-Identifier: Apache-2.0
// Owners for what GLib hands out.
#pragma once

#include <gio/gio.h>

#include <memory>

namespace bench {

template <auto Function>
struct Releaser {
    template <typename T>
    void operator()(T *held) const noexcept {
        Function(held);
    }
};

template <typename T, auto Function>
using Owned = std::unique_ptr<T, Releaser<Function>>;

using Connection = Owned<GDBusConnection, g_object_unref>;
using Message = Owned<GDBusMessage, g_object_unref>;
using MainLoop = Owned<GMainLoop, g_main_loop_unref>;
using Variant = Owned<GVariant, g_variant_unref>;

} // namespace bench
