// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/glib_ref.hpp"
#include "sim/base/result.hpp"

#include <concepts>
#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <type_traits>
#include <vector>

// Between C++ values and the members of a D-Bus tuple. What comes in has had its signature
// checked; what a variant holds has not.
namespace sim::wire {

// A variant that should hold an array of texts; nothing when it holds something else.
using Texts = std::optional<std::vector<std::string>>;
// The same with 32-bit numbers.
using Numbers = std::optional<std::vector<std::int32_t>>;

Texts texts_in(GVariant *variant);
Numbers numbers_in(GVariant *variant);

// What a variant holds, in however many further variants.
Variant peeled(Variant value);

template <typename T>
T read(GVariant *member) {
    if constexpr (std::same_as<T, std::int32_t>)
        return g_variant_get_int32(member);
    else if constexpr (std::is_enum_v<T>)
        return static_cast<T>(g_variant_get_int32(member));
    else if constexpr (std::same_as<T, std::uint8_t>)
        return g_variant_get_byte(member);
    else if constexpr (std::same_as<T, bool>)
        return g_variant_get_boolean(member) != FALSE;
    else if constexpr (std::same_as<T, std::string>)
        return g_variant_get_string(member, nullptr);
    else if constexpr (std::same_as<T, Numbers>)
        return numbers_in(member);
    else {
        static_assert(std::same_as<T, Texts>);
        return texts_in(member);
    }
}

inline GVariant *write(std::int32_t value) {
    return g_variant_new_int32(value);
}
inline GVariant *write(std::uint32_t value) {
    return g_variant_new_uint32(value);
}
inline GVariant *write(std::uint8_t value) {
    return g_variant_new_byte(value);
}
inline GVariant *write(bool value) {
    return g_variant_new_boolean(value);
}
GVariant *write(const char *value) = delete; // would become a boolean
inline GVariant *write(const std::string &value) {
    return g_variant_new_string(value.c_str());
}
inline GVariant *write(std::span<const std::int32_t> values) {
    return g_variant_new_variant(g_variant_new_fixed_array(G_VARIANT_TYPE_INT32, values.data(),
                                                           values.size(), sizeof(std::int32_t)));
}
inline GVariant *write(std::span<const std::string> values) {
    GVariantBuilder builder;
    g_variant_builder_init(&builder, G_VARIANT_TYPE_STRING_ARRAY);
    for (const auto &value : values)
        g_variant_builder_add(&builder, "s", value.c_str());
    return g_variant_new_variant(g_variant_builder_end(&builder));
}
template <typename T>
requires std::is_enum_v<T> GVariant *write(T value) {
    static_assert(std::same_as<std::underlying_type_t<T>, std::int32_t>);
    return g_variant_new_int32(static_cast<std::int32_t>(value));
}

// Standard alphabet with padding, and nothing else.
std::optional<std::string> decode_base64(const std::string &text);
std::string encode_base64(std::string_view bytes);

// A tuple of this type with empty members around its result.
Variant refusal(std::string_view signature, std::size_t result_index, Result code);

} // namespace sim::wire
