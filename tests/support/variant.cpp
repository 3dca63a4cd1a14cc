// SPDX-License-Identifier: Apache-2.0
#include "tests/support/variant.hpp"

#include <stdexcept>
#include <vector>

namespace test {

Variant parse(std::string_view type, std::string_view text) {
    if (type.empty())
        return nullptr;
    const std::string type_string{type};
    GError *error = nullptr;
    GVariant *value = g_variant_parse(G_VARIANT_TYPE(type_string.c_str()), text.data(),
                                      text.data() + text.size(), nullptr, &error);
    if (!value) {
        const std::string why = error->message;
        g_error_free(error);
        throw std::invalid_argument("\"" + std::string{text} + "\" as " + type_string + ": " + why);
    }
    return Variant{value};
}

Variant share(GVariant *value) {
    return Variant{value ? g_variant_ref_sink(value) : nullptr};
}

Variant with_first(GVariant *tuple, GVariant *first) {
    const Variant owned_first = share(first);
    std::vector<Variant> owners;
    std::vector<GVariant *> children{owned_first.get()};
    for (gsize i = 1; i < g_variant_n_children(tuple); ++i) {
        owners.emplace_back(g_variant_get_child_value(tuple, i));
        children.push_back(owners.back().get());
    }
    return share(g_variant_new_tuple(children.data(), children.size()));
}

std::string to_text(GVariant *value) {
    if (!value)
        return "(nothing)";
    gchar *printed = g_variant_print(value, TRUE);
    std::string text = std::string{g_variant_get_type_string(value)} + " " + printed;
    g_free(printed);
    return text;
}

} // namespace test
