// SPDX-License-Identifier: Apache-2.0
#include "sim/settings/model.hpp"

#include "sim/settings/entries.hpp"

#include <algorithm>

namespace sim {

namespace {

using Records = std::vector<SettingsRecord>;

const std::string &name_of(const SettingsFields &fields, const SettingsRecord &record) {
    return std::get<std::string>(record[fields.place_of("name")]);
}

std::int32_t id_of(const SettingsRecord &profile) {
    return std::get<std::int32_t>(profile[profile_fields().place_of("id")]);
}

template <typename List>
auto find_named(const SettingsFields &fields, List &records, std::string_view name) {
    return std::ranges::find_if(
        records, [&](const auto &record) { return name_of(fields, record) == name; });
}

template <typename List>
auto find_profile(List &profiles, std::int32_t id) {
    return std::ranges::find(profiles, id, id_of);
}

Refusal unknown_set(const Records &sets, std::string_view name) {
    std::string names;
    for (const auto &set : sets)
        names += fmt::format("{}\"{}\"", names.empty() ? "" : ", ",
                             name_of(global_settings_fields(), set));
    return refuse(Result::kUnknownRecord, "there is no settings set \"{}\": the sets are {}", name,
                  names.empty() ? "none" : names);
}

Refusal unknown_profile(const Records &profiles, std::int32_t id) {
    std::string ids;
    for (const auto &profile : profiles)
        ids += fmt::format("{}{}", ids.empty() ? "" : ", ", id_of(profile));
    return refuse(Result::kUnknownRecord, "there is no profile {}: the profiles are {}", id,
                  ids.empty() ? "none" : ids);
}

void apply(SettingsRecord &record, const SettingsChanges &changes) {
    for (const auto &[place, value] : changes)
        record[place] = value;
}

// The value of a key that has to come.
template <typename T>
Answer<T> demand(const SettingsFields &fields, const SettingsChanges &changes,
                 std::string_view key) {
    const auto found =
        std::ranges::find(changes, fields.place_of(key), &SettingsChanges::value_type::first);
    if (found == changes.end())
        return refuse(Result::kInvalidArgument, "the key \"{}\" is missing", key);
    return std::get<T>(found->second);
}

Answer<std::string> demand_name(const SettingsFields &fields, const SettingsChanges &changes) {
    auto name = demand<std::string>(fields, changes, "name");
    if (name && name->empty())
        return refuse(Result::kInvalidArgument, "the name is empty");
    return name;
}

// A profile is known by its id; its name is its own too.
struct ProfileIdentity {
    std::int32_t id;
    std::string name;
};

Answer<ProfileIdentity> demand_identity(const SettingsChanges &changes) {
    const auto id = demand<std::int32_t>(profile_fields(), changes, "id");
    if (!id)
        return id.refusal();
    const auto name = demand_name(profile_fields(), changes);
    if (!name)
        return name.refusal();
    return ProfileIdentity{*id, *name};
}

} // namespace

SlotSettings SlotSettings::shipped() {
    return {0, {global_settings_fields().shipped()}, shipped_profiles()};
}

SettingsModel::SettingsModel(int slots) : slots_(slots, SlotSettings::shipped()) {}

void SettingsModel::restore(int slot, SlotSettings settings) {
    slots_[slot] = std::move(settings);
}

Status SettingsModel::commit(int slot, SlotSettings next) {
    if (keeper_)
        if (const auto error = keeper_(slot, next))
            return refuse(Result::kFailed, "the change cannot be kept: {}", *error);
    restore(slot, std::move(next));
    return Done{};
}

Answer<const SettingsRecord *> SettingsModel::find_set(int slot, std::string_view name) const {
    const auto &sets = of(slot).sets;
    const auto found = find_named(global_settings_fields(), sets, name);
    if (found == sets.end())
        return unknown_set(sets, name);
    return &*found;
}

Status SettingsModel::update_set(int slot, const OfferedEntries &entries) {
    const auto &fields = global_settings_fields();
    const auto changes = check_entries(fields, &SettingsField::update, entries);
    if (!changes)
        return changes.refusal();
    const auto name = demand_name(fields, *changes);
    if (!name)
        return name.refusal();
    SlotSettings next = of(slot);
    const auto set = find_named(fields, next.sets, *name);
    if (set == next.sets.end())
        return unknown_set(next.sets, *name);
    apply(*set, *changes);
    return commit(slot, std::move(next));
}

Status SettingsModel::add_set(int slot, const OfferedEntries &entries) {
    const auto &fields = global_settings_fields();
    const auto changes = check_entries(fields, &SettingsField::add, entries);
    if (!changes)
        return changes.refusal();
    const auto name = demand_name(fields, *changes);
    if (!name)
        return name.refusal();
    SlotSettings next = of(slot);
    if (find_named(fields, next.sets, *name) != next.sets.end())
        return refuse(Result::kDuplicate, "there is a settings set \"{}\" already", *name);
    // Two keys never come, so that a new set starts from the shipped values.
    apply(next.sets.emplace_back(fields.shipped()), *changes);
    return commit(slot, std::move(next));
}

Status SettingsModel::delete_set(int slot, std::string_view name) {
    SlotSettings next = of(slot);
    const auto set = find_named(global_settings_fields(), next.sets, name);
    if (set == next.sets.end())
        return unknown_set(next.sets, name);
    next.sets.erase(set);
    return commit(slot, std::move(next));
}

Status SettingsModel::update_profile(int slot, const OfferedEntries &entries) {
    const auto &fields = profile_fields();
    const auto changes = check_entries(fields, &SettingsField::update, entries);
    if (!changes)
        return changes.refusal();
    const auto identity = demand_identity(*changes);
    if (!identity)
        return identity.refusal();
    SlotSettings next = of(slot);
    const auto profile = find_profile(next.profiles, identity->id);
    if (profile == next.profiles.end())
        return unknown_profile(next.profiles, identity->id);
    const auto namesake = find_named(fields, next.profiles, identity->name);
    if (namesake != next.profiles.end() && namesake != profile)
        return refuse(Result::kDuplicate, "profile {} has the name \"{}\" already",
                      id_of(*namesake), identity->name);
    apply(*profile, *changes);
    return commit(slot, std::move(next));
}

Status SettingsModel::add_profile(int slot, const OfferedEntries &entries) {
    const auto &fields = profile_fields();
    const auto changes = check_entries(fields, &SettingsField::add, entries);
    if (!changes)
        return changes.refusal();
    const auto identity = demand_identity(*changes);
    if (!identity)
        return identity.refusal();
    SlotSettings next = of(slot);
    if (find_profile(next.profiles, identity->id) != next.profiles.end())
        return refuse(Result::kDuplicate, "there is a profile {} already", identity->id);
    const auto namesake = find_named(fields, next.profiles, identity->name);
    if (namesake != next.profiles.end())
        return refuse(Result::kDuplicate, "profile {} has the name \"{}\" already",
                      id_of(*namesake), identity->name);
    apply(next.profiles.emplace_back(fields.blank()), *changes);
    return commit(slot, std::move(next));
}

Status SettingsModel::delete_profile(int slot, std::int32_t id) {
    SlotSettings next = of(slot);
    const auto profile = find_profile(next.profiles, id);
    if (profile == next.profiles.end())
        return unknown_profile(next.profiles, id);
    next.profiles.erase(profile);
    return commit(slot, std::move(next));
}

Status SettingsModel::set_network_environment(int slot, std::int32_t type) {
    if (type < 0 || type > kLastNetworkEnvironment)
        return refuse(Result::kInvalidArgument, "a network environment is 0 to {}, not {}",
                      kLastNetworkEnvironment, type);
    SlotSettings next = of(slot);
    next.network_environment = type;
    return commit(slot, std::move(next));
}

std::optional<std::string> find_contradiction(const SlotSettings &settings) {
    const auto names_differ = [](const SettingsFields &fields, const Records &records) {
        return std::ranges::all_of(records, [&](const auto &record) {
            const auto &name = name_of(fields, record);
            return !name.empty() && &*find_named(fields, records, name) == &record;
        });
    };
    if (!names_differ(global_settings_fields(), settings.sets))
        return "a settings set has no name, or two have the same";
    if (!names_differ(profile_fields(), settings.profiles))
        return "a profile has no name, or two have the same";
    for (const auto &profile : settings.profiles)
        if (&*find_profile(settings.profiles, id_of(profile)) != &profile)
            return fmt::format("two profiles have the id {}", id_of(profile));
    if (settings.network_environment < 0 ||
        settings.network_environment > SettingsModel::kLastNetworkEnvironment)
        return fmt::format("there is no network environment {}", settings.network_environment);
    return std::nullopt;
}

} // namespace sim
