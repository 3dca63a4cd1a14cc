// SPDX-License-Identifier: Apache-2.0
// D-Bus values written as text, for tables of what is sent and answered.
#pragma once

#include <gio/gio.h>

#include <memory>
#include <string>
#include <string_view>

namespace test {

struct VariantUnref {
    void operator()(GVariant *value) const { g_variant_unref(value); }
};
using Variant = std::unique_ptr<GVariant, VariantUnref>;

// A value of this type from GVariant text. No type at all: no value. Throws when the text is wrong.
Variant parse(std::string_view type, std::string_view text);

// A further reference.
Variant share(GVariant *value);

// The same tuple with another first member.
Variant with_first(GVariant *tuple, GVariant *first);

// The value with its type as GVariant text, for comparing and for messages.
std::string to_text(GVariant *value);

} // namespace test
