// SPDX-License-Identifier: Apache-2.0
#include "sim/settings/interface.hpp"

#include "sim/bus/ask.hpp"

namespace sim {

namespace {

OfferedEntry offered(GVariant *entry) {
    const auto key = Variant::adopt(g_variant_get_child_value(entry, 0));
    const auto holder = Variant::adopt(g_variant_get_child_value(entry, 1));
    const auto value = Variant::adopt(g_variant_get_variant(holder.get()));
    OfferedEntry made{g_variant_get_string(key.get(), nullptr), {}};
    const std::string_view type = g_variant_get_type_string(value.get());
    if (type == "i")
        made.value = g_variant_get_int32(value.get());
    else if (type == "b")
        made.value = g_variant_get_boolean(value.get()) != FALSE;
    else if (type == "s")
        made.value = std::string(g_variant_get_string(value.get(), nullptr));
    else
        made.value = ForeignValue{std::string(type)};
    return made;
}

} // namespace

template <>
struct wire::Form<OfferedEntries> {
    static constexpr std::string_view kSignature = "a{sv}";
    static OfferedEntries read(const Variant &dictionary) {
        OfferedEntries entries;
        for (gsize i = 0; i < g_variant_n_children(dictionary.get()); ++i)
            entries.push_back(
                offered(Variant::adopt(g_variant_get_child_value(dictionary.get(), i)).get()));
        return entries;
    }
};

namespace {

using enum Caller;

GVariant *travelling(const SettingsField &field, const SettingValue &value) {
    const auto *number = std::get_if<std::int32_t>(&value);
    if (number && field.get == Form::kText)
        return wire::write(std::to_string(*number));
    return std::visit([](const auto &content) { return wire::write(content); }, value);
}

void add_entries(GVariantBuilder &builder, const SettingsFields &fields,
                 const SettingsRecord &record) {
    for (std::size_t place = 0; place < fields.size(); ++place)
        g_variant_builder_add(&builder, "{sv}", fields[place].key.c_str(),
                              travelling(fields[place], record[place]));
}

Answer<wire::Dictionary> get_global_settings(const SettingsModel &settings, int slot,
                                             std::string_view name) {
    const auto set = settings.find_set(slot, name);
    if (!set)
        return set.refusal();
    GVariantBuilder dictionary;
    g_variant_builder_init(&dictionary, G_VARIANT_TYPE_VARDICT);
    add_entries(dictionary, global_settings_fields(), **set);
    return wire::Dictionary{Variant(g_variant_builder_end(&dictionary))};
}

std::tuple<std::uint32_t, wire::Dictionaries> get_profile_list(const SettingsModel &settings,
                                                               int slot) {
    const auto &profiles = settings.of(slot).profiles;
    GVariantBuilder list;
    g_variant_builder_init(&list, G_VARIANT_TYPE("aa{sv}"));
    for (const auto &profile : profiles) {
        g_variant_builder_open(&list, G_VARIANT_TYPE_VARDICT);
        add_entries(list, profile_fields(), profile);
        g_variant_builder_close(&list);
    }
    return {static_cast<std::uint32_t>(profiles.size()), {Variant(g_variant_builder_end(&list))}};
}

std::int32_t get_network_environment(const SettingsModel &settings, int slot) {
    return settings.of(slot).network_environment;
}

constexpr MethodRow<SettingsModel> kMethods[] = {
    {"GetGlobalSettings", ask<get_global_settings>, kAnybody},
    {"UpdateGlobalSettings", ask<&SettingsModel::update_set>, kAnybody},
    {"AddGlobalSettings", ask<&SettingsModel::add_set>, kAnybody},
    {"DeleteGlobalSettings", ask<&SettingsModel::delete_set>, kAnybody},
    {"GetProfileList", ask<get_profile_list>, kAnybody},
    {"UpdateProfile", ask<&SettingsModel::update_profile>, kAnybody},
    {"AddProfile", ask<&SettingsModel::add_profile>, kAnybody},
    {"DeleteProfile", ask<&SettingsModel::delete_profile>, kAnybody},
    {"SetNetworkEnvironment", ask<&SettingsModel::set_network_environment>, kAnybody},
    {"GetNetworkEnvironment", ask<get_network_environment>, kAnybody},
};

} // namespace

Interface SettingsInterface::describe() {
    return {"org.kelvo.ims.Settings", bind_methods(kMethods, settings_), {}};
}

} // namespace sim
