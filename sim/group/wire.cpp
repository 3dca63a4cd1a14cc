// SPDX-License-Identifier: Apache-2.0
#include "sim/group/wire.hpp"

#include "sim/bus/wire.hpp"

#include <optional>

namespace sim::wire {

namespace {

// The deepest place of a document is the 9th: a member's status in a type-4 rule.
constexpr int kDeepest = 16;
constexpr std::size_t kMostValues = 1'000'000;

GVariant *write_entries(const GroupDictionary &dictionary);

class TreeBuilder {
  public:
    GroupDictionary dictionary(GVariant *value) {
        GroupDictionary entries;
        const Descent descent(*this);
        const auto count = limited(g_variant_n_children(value));
        entries.reserve(count);
        for (gsize i = 0; i < count; ++i) {
            const auto entry = Variant::adopt(g_variant_get_child_value(value, i));
            const auto key = Variant::adopt(g_variant_get_child_value(entry.get(), 0));
            const auto content = Variant::adopt(g_variant_get_child_value(entry.get(), 1));
            entries.push_back({g_variant_get_string(key.get(), nullptr), {unwrapped(content)}});
        }
        return entries;
    }

    GroupDictionaries dictionaries(GVariant *value) {
        GroupDictionaries list;
        const Descent descent(*this);
        const auto count = limited(g_variant_n_children(value));
        list.reserve(count);
        for (gsize i = 0; i < count; ++i)
            list.push_back(dictionary(Variant::adopt(g_variant_get_child_value(value, i)).get()));
        return list;
    }

    // What is too large or too deep, or nothing.
    const std::optional<Refusal> &refusal() const { return refusal_; }

  private:
    // One level down, as long as this lives.
    class Descent {
      public:
        explicit Descent(TreeBuilder &builder) : builder_(builder) { ++builder_.depth_; }
        Descent(const Descent &) = delete;
        Descent &operator=(const Descent &) = delete;
        ~Descent() { --builder_.depth_; }

      private:
        TreeBuilder &builder_;
    };

    // How many children are still read.
    gsize limited(gsize count) {
        values_ += count;
        if (!refusal_ && depth_ > kDeepest)
            refusal_ =
                refuse(Result::kInvalidArgument, "it is nested deeper than {} levels", kDeepest);
        if (!refusal_ && values_ > kMostValues)
            refusal_ =
                refuse(Result::kInvalidArgument, "it holds more than {} values", kMostValues);
        return refusal_ ? 0 : count;
    }

    decltype(GroupValue::content) unwrapped(Variant wrapped) {
        const auto value = peeled(std::move(wrapped));
        const std::string_view type = g_variant_get_type_string(value.get());
        if (type == "x")
            return std::int64_t{g_variant_get_int64(value.get())};
        if (type == "b")
            return g_variant_get_boolean(value.get()) != FALSE;
        if (type == "s")
            return std::string(g_variant_get_string(value.get(), nullptr));
        if (type == "a{sv}")
            return dictionary(value.get());
        if (type == "aa{sv}")
            return dictionaries(value.get());
        return ForeignValue{std::string(type)};
    }

    int depth_ = 0;
    std::size_t values_ = 0;
    std::optional<Refusal> refusal_;
};

template <typename T>
Answer<T> checked(const TreeBuilder &builder, T value) {
    return builder.refusal() ? Answer<T>(*builder.refusal()) : std::move(value);
}

GVariant *write_value(const GroupValue &value) {
    if (const auto *number = std::get_if<std::int64_t>(&value.content))
        return g_variant_new_int64(*number);
    if (const auto *flag = std::get_if<bool>(&value.content))
        return g_variant_new_boolean(*flag);
    if (const auto *text = std::get_if<std::string>(&value.content))
        return g_variant_new_string(text->c_str());
    if (const auto *dictionary = std::get_if<GroupDictionary>(&value.content))
        return write_entries(*dictionary);
    GVariantBuilder list;
    g_variant_builder_init(&list, G_VARIANT_TYPE("aa{sv}"));
    for (const auto &dictionary : std::get<GroupDictionaries>(value.content))
        g_variant_builder_add_value(&list, write_entries(dictionary));
    return g_variant_builder_end(&list);
}

GVariant *write_entries(const GroupDictionary &dictionary) {
    GVariantBuilder builder;
    g_variant_builder_init(&builder, G_VARIANT_TYPE_VARDICT);
    for (const auto &[key, value] : dictionary)
        g_variant_builder_add(&builder, "{sv}", key.c_str(), write_value(value));
    return g_variant_builder_end(&builder);
}

} // namespace

Answer<GroupDictionary> read_dictionary(GVariant *dictionary) {
    TreeBuilder builder;
    auto entries = builder.dictionary(dictionary);
    return checked(builder, std::move(entries));
}

Answer<GroupDictionaries> read_dictionaries(GVariant *list) {
    TreeBuilder builder;
    auto dictionaries = builder.dictionaries(list);
    return checked(builder, std::move(dictionaries));
}

Variant write_dictionary(const GroupDictionary &dictionary) {
    return Variant(write_entries(dictionary));
}

} // namespace sim::wire
