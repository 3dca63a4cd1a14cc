// SPDX-License-Identifier: Apache-2.0
#include "sim/bus/wire.hpp"

#include <algorithm>

namespace sim::wire {

namespace {

bool is_base64_letter(char letter) {
    return g_ascii_isalnum(letter) || letter == '+' || letter == '/';
}

} // namespace

Texts texts_in(GVariant *variant) {
    const auto content = Variant::adopt(g_variant_get_variant(variant));
    if (!g_variant_is_of_type(content.get(), G_VARIANT_TYPE_STRING_ARRAY))
        return std::nullopt;
    std::vector<std::string> texts;
    for (gsize i = 0; i < g_variant_n_children(content.get()); ++i) {
        const auto text = Variant::adopt(g_variant_get_child_value(content.get(), i));
        texts.emplace_back(g_variant_get_string(text.get(), nullptr));
    }
    return texts;
}

Numbers numbers_in(GVariant *variant) {
    const auto content = Variant::adopt(g_variant_get_variant(variant));
    if (!g_variant_is_of_type(content.get(), G_VARIANT_TYPE("ai")))
        return std::nullopt;
    gsize count = 0;
    const auto *first = static_cast<const std::int32_t *>(
        g_variant_get_fixed_array(content.get(), &count, sizeof(std::int32_t)));
    return std::vector<std::int32_t>(first, first + count);
}

Variant peeled(Variant value) {
    while (g_variant_is_of_type(value.get(), G_VARIANT_TYPE_VARIANT))
        value = Variant::adopt(g_variant_get_variant(value.get()));
    return value;
}

std::optional<std::string> decode_base64(const std::string &text) {
    const auto padding = text.size() - std::min(text.size(), text.find_last_not_of('=') + 1);
    const auto letters = std::string_view(text).substr(0, text.size() - padding);
    if (text.size() % 4 != 0 || padding > 2 || !std::ranges::all_of(letters, is_base64_letter))
        return std::nullopt;
    gsize length = 0;
    guchar *const bytes = g_base64_decode(text.c_str(), &length);
    std::string decoded(reinterpret_cast<const char *>(bytes), length);
    g_free(bytes);
    return decoded;
}

std::string encode_base64(std::string_view bytes) {
    return GText(g_base64_encode(reinterpret_cast<const guchar *>(bytes.data()), bytes.size()))
        .get();
}

Variant refusal(std::string_view signature, std::size_t result_index, Result code) {
    const std::string type_text(signature);
    const auto *type = G_VARIANT_TYPE(type_text.c_str());
    // No data at all stands for the default of every member.
    const Variant empty(g_variant_new_from_data(type, nullptr, 0, FALSE, nullptr, nullptr));
    std::vector<GVariant *> members;
    for (gsize i = 0; i < g_variant_n_children(empty.get()); ++i)
        members.push_back(i == result_index ? write(code)
                                            : g_variant_get_child_value(empty.get(), i));
    Variant tuple(g_variant_new_tuple(members.data(), members.size()));
    for (std::size_t i = 0; i < members.size(); ++i)
        if (i != result_index)
            g_variant_unref(members[i]);
    return tuple;
}

} // namespace sim::wire
