// SPDX-License-Identifier: Apache-2.0
// Owners for what GLib hands out.
#pragma once

#include <gio/gio.h>

#include <memory>

namespace ims {

template <auto Function>
struct Releaser {
    template <typename T>
    void operator()(T *held) const noexcept {
        Function(held);
    }
};

template <typename T, auto Function>
using Owned = std::unique_ptr<T, Releaser<Function>>;

using Text = Owned<char, g_free>;
using Bytes = Owned<guchar, g_free>;
using ByteArray = Owned<GByteArray, g_byte_array_unref>;
using Error = Owned<GError, g_error_free>;
using Connection = Owned<GDBusConnection, g_object_unref>;
using HashTable = Owned<GHashTable, g_hash_table_destroy>;

// One full reference. GLib's constructors return floating values: see owned().
using Variant = Owned<GVariant, g_variant_unref>;

inline Variant owned(GVariant *floating) noexcept {
    return Variant{g_variant_ref_sink(floating)};
}

} // namespace ims
