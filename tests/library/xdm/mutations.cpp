// SPDX-License-Identifier: Apache-2.0
#include "tests/library/xdm/mutations.hpp"

namespace test {
namespace {

// Copies a document and counts the entries that it meets.
class Copier {
  public:
    using OnEntry = std::function<bool(std::size_t, GVariantBuilder *, const char *, GVariant *)>;

    explicit Copier(OnEntry on_entry) : on_entry_{std::move(on_entry)} {}

    GVariant *copy(GVariant *value) {
        if (g_variant_is_of_type(value, G_VARIANT_TYPE_VARDICT))
            return copy_dictionary(value);
        if (g_variant_is_of_type(value, G_VARIANT_TYPE("aa{sv}")))
            return copy_list(value);
        return value; // the builder takes a reference of its own
    }
    std::size_t count() const { return count_; }

  private:
    GVariant *copy_list(GVariant *list) {
        GVariantBuilder builder;
        g_variant_builder_init(&builder, G_VARIANT_TYPE("aa{sv}"));
        for (gsize at = 0; at < g_variant_n_children(list); ++at) {
            const Variant child{g_variant_get_child_value(list, at)};
            g_variant_builder_add_value(&builder, copy(child.get()));
        }
        return g_variant_builder_end(&builder);
    }
    GVariant *copy_dictionary(GVariant *dictionary) {
        GVariantBuilder builder;
        g_variant_builder_init(&builder, G_VARIANT_TYPE_VARDICT);
        GVariantIter entries;
        g_variant_iter_init(&entries, dictionary);
        const char *key = nullptr;
        GVariant *content = nullptr;
        while (g_variant_iter_next(&entries, "{&sv}", &key, &content)) {
            const Variant owner{content};
            if (!on_entry_(count_++, &builder, key, content))
                g_variant_builder_add(&builder, "{sv}", key, copy(content));
        }
        return g_variant_builder_end(&builder);
    }

    OnEntry on_entry_;
    std::size_t count_ = 0;
};

} // namespace

std::size_t entries_in(GVariant *document) {
    Copier copier{[](auto...) { return false; }};
    const Variant copy = share(copier.copy(document));
    return copier.count();
}

Variant with_changed_entry(GVariant *document, std::size_t number, const Change &change) {
    Copier copier{
        [&](std::size_t at, GVariantBuilder *dictionary, const char *key, GVariant *content) {
            if (at == number)
                change(dictionary, key, content);
            return at == number;
        }};
    return share(copier.copy(document));
}

} // namespace test
