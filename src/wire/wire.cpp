// SPDX-License-Identifier: Apache-2.0
#include "wire.hpp"

#include <algorithm>
#include <cstring>

namespace ims {

Variant peeled(GVariant *value) noexcept {
    Variant content{g_variant_ref(value)};
    while (g_variant_is_of_type(content.get(), G_VARIANT_TYPE_VARIANT))
        content.reset(g_variant_get_variant(content.get()));
    return content;
}

namespace wire {

Variant to_variant(const char *text, const char *) noexcept {
    if (text == nullptr)
        text = "";
    return g_utf8_validate(text, -1, nullptr) ? owned(g_variant_new_string(text)) : nullptr;
}

Variant to_variant(const Variant &value, const char *type) noexcept {
    return Variant{has_type(value.get(), type) ? g_variant_ref(value.get()) : nullptr};
}

gsize size_of(const char *text) noexcept {
    return text != nullptr ? std::strlen(text) + 1 : 1;
}

gsize size_of(const Variant &value) noexcept {
    return value ? g_variant_get_size(value.get()) : 0;
}

void from_variant(GVariant *child, std::int32_t &value) noexcept {
    value = g_variant_is_of_type(child, G_VARIANT_TYPE_BOOLEAN) ? g_variant_get_boolean(child)
                                                                : g_variant_get_int32(child);
}

void from_variant(GVariant *child, Variant &value) noexcept {
    value.reset(g_variant_is_of_type(child, G_VARIANT_TYPE_VARIANT) ? g_variant_get_variant(child)
                                                                    : g_variant_ref(child));
}

void fill(std::span<std::int32_t> values, GVariant *boxed_array) noexcept {
    std::fill(values.begin(), values.end(), 0);
    const Variant array = peeled(boxed_array);
    if (!has_type(array.get(), "ai"))
        return;
    gsize count = 0;
    const auto *first = static_cast<const std::int32_t *>(
        g_variant_get_fixed_array(array.get(), &count, sizeof(std::int32_t)));
    std::copy_n(first, std::min(count, values.size()), values.begin());
}

Variant tuple_of(std::span<const Variant> children) noexcept {
    if (std::any_of(children.begin(), children.end(), [](const Variant &child) { return !child; }))
        return nullptr;
    GVariantBuilder tuple;
    g_variant_builder_init(&tuple, G_VARIANT_TYPE_TUPLE);
    for (const Variant &child : children)
        g_variant_builder_add_value(&tuple, child.get());
    return owned(g_variant_builder_end(&tuple));
}

bool has_type(GVariant *value, const char *type) noexcept {
    return value != nullptr && g_str_equal(g_variant_get_type_string(value), type);
}

} // namespace wire

TextArray::TextArray() noexcept {
    g_variant_builder_init(&builder_, G_VARIANT_TYPE_STRING_ARRAY);
}

TextArray::~TextArray() {
    g_variant_builder_clear(&builder_);
}

void TextArray::add(const char *text) noexcept {
    const Variant element = wire::to_variant(text, "s");
    if (element)
        g_variant_builder_add_value(&builder_, element.get());
    else
        valid_ = false;
}

Variant TextArray::finish() noexcept {
    return valid_ ? owned(g_variant_builder_end(&builder_)) : nullptr;
}

Text base64_encode(const std::uint8_t *bytes, std::int32_t count) noexcept {
    const gsize size = bytes != nullptr && count > 0 ? static_cast<gsize>(count) : 0;
    return Text{g_base64_encode(bytes, size)};
}

Decoded base64_decode(const char *text) noexcept {
    Decoded decoded;
    decoded.bytes.reset(g_base64_decode(text, &decoded.count));
    return decoded;
}

} // namespace ims
