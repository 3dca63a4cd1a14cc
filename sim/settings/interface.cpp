// SPDX-License-Identifier: Apache-2.0
#include "sim/settings/interface.hpp"

#include "sim/bus/replies.hpp"

namespace sim {

namespace {

using enum Caller;

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

// The dictionary that is the only argument.
OfferedEntries entries_of(const Request &request) {
    const auto dictionary = Variant::adopt(g_variant_get_child_value(request.arguments.get(), 0));
    OfferedEntries entries;
    for (gsize i = 0; i < g_variant_n_children(dictionary.get()); ++i)
        entries.push_back(
            offered(Variant::adopt(g_variant_get_child_value(dictionary.get(), i)).get()));
    return entries;
}

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

} // namespace

const MethodRow<SettingsInterface> SettingsInterface::kMethods[] = {
    {"GetGlobalSettings", "(s)", "(ia{sv})", kAnybody, &SettingsInterface::get_global_settings},
    {"UpdateGlobalSettings", "(a{sv})", "(i)", kAnybody,
     &SettingsInterface::update_global_settings},
    {"AddGlobalSettings", "(a{sv})", "(i)", kAnybody, &SettingsInterface::add_global_settings},
    {"DeleteGlobalSettings", "(s)", "(i)", kAnybody, &SettingsInterface::delete_global_settings},
    {"GetProfileList", "()", "(iuaa{sv})", kAnybody, &SettingsInterface::get_profile_list},
    {"UpdateProfile", "(a{sv})", "(i)", kAnybody, &SettingsInterface::update_profile},
    {"AddProfile", "(a{sv})", "(i)", kAnybody, &SettingsInterface::add_profile},
    {"DeleteProfile", "(i)", "(i)", kAnybody, &SettingsInterface::delete_profile},
    {"SetNetworkEnvironment", "(i)", "(i)", kAnybody, &SettingsInterface::set_network_environment},
    {"GetNetworkEnvironment", "()", "(ii)", kAnybody, &SettingsInterface::get_network_environment},
};

Interface SettingsInterface::describe() {
    return {"org.kelvo.ims.Settings", bind_methods<SettingsInterface>(*this, kMethods), {}};
}

Answer<Variant> SettingsInterface::get_global_settings(const Request &request) {
    const auto [name] = request.unpack<std::string>();
    const auto set = settings_.find_set(request.slot, name);
    if (!set)
        return set.refusal();
    GVariantBuilder dictionary;
    g_variant_builder_init(&dictionary, G_VARIANT_TYPE_VARDICT);
    add_entries(dictionary, global_settings_fields(), **set);
    return wire::pack(Result::kOk, Variant(g_variant_builder_end(&dictionary)));
}

Answer<Variant> SettingsInterface::update_global_settings(const Request &request) {
    return result_of(settings_.update_set(request.slot, entries_of(request)));
}

Answer<Variant> SettingsInterface::add_global_settings(const Request &request) {
    return result_of(settings_.add_set(request.slot, entries_of(request)));
}

Answer<Variant> SettingsInterface::delete_global_settings(const Request &request) {
    const auto [name] = request.unpack<std::string>();
    return result_of(settings_.delete_set(request.slot, name));
}

Answer<Variant> SettingsInterface::get_profile_list(const Request &request) {
    const auto &profiles = settings_.of(request.slot).profiles;
    GVariantBuilder list;
    g_variant_builder_init(&list, G_VARIANT_TYPE("aa{sv}"));
    for (const auto &profile : profiles) {
        g_variant_builder_open(&list, G_VARIANT_TYPE_VARDICT);
        add_entries(list, profile_fields(), profile);
        g_variant_builder_close(&list);
    }
    return wire::pack(Result::kOk, static_cast<std::uint32_t>(profiles.size()),
                      Variant(g_variant_builder_end(&list)));
}

Answer<Variant> SettingsInterface::update_profile(const Request &request) {
    return result_of(settings_.update_profile(request.slot, entries_of(request)));
}

Answer<Variant> SettingsInterface::add_profile(const Request &request) {
    return result_of(settings_.add_profile(request.slot, entries_of(request)));
}

Answer<Variant> SettingsInterface::delete_profile(const Request &request) {
    const auto [id] = request.unpack<std::int32_t>();
    return result_of(settings_.delete_profile(request.slot, id));
}

Answer<Variant> SettingsInterface::set_network_environment(const Request &request) {
    const auto [type] = request.unpack<std::int32_t>();
    return result_of(settings_.set_network_environment(request.slot, type));
}

Answer<Variant> SettingsInterface::get_network_environment(const Request &request) {
    return wire::pack(Result::kOk, settings_.of(request.slot).network_environment);
}

} // namespace sim
