// SPDX-License-Identifier: Apache-2.0
// Settings sets and the network environment.
#include "imsctl/settings/actions.hpp"
#include "imsctl/settings/exchange.hpp"
#include "imsctl/settings/module.hpp"

#include <fmt/format.h>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

constexpr std::string_view kReadOnly = "the service tells its value, but takes none";
constexpr FixedKey kFixedSettings[] = {
    {"name", "it says which set is meant; a set is copied by: imsctl settings add NEW --from OLD"},
    {kReadOnlyKeys[0], kReadOnly},
    {kReadOnlyKeys[1], kReadOnly},
};

Assignments<SettingsRecord> assignments_or_refusal(const std::vector<std::string> &texts,
                                                   const char *hint) {
    auto assignments = parse_assignments<SettingsRecord>(texts, hint);
    refuse_fixed<SettingsRecord>(assignments, kFixedSettings, hint);
    return assignments;
}

Action prepare_settings_list_keys(Arguments &) {
    return list_keys<SettingsRecord>();
}

Action prepare_settings_get(Arguments &arguments) {
    const auto name = arguments.text("NAME", "the set");
    const auto keys =
        arguments.some_names("KEY", "these only; all when left out", key_names<SettingsRecord>());
    const auto secrets = secrets_flag(arguments);
    return [=](Invocation &run) {
        const auto set = read_set(run.client(), *name);
        const Fields fields = fields_of(*set, *keys);
        Json values = Json::object();
        add_json(values, fields);
        run.output().result({{"name", *name}, {"settings", values}},
                            Shown(*secrets).fields(fields));
    };
}

constexpr const char *kSettingsSetHint = "try: imsctl settings set default ringing_timer=180";

Action prepare_settings_set(Arguments &arguments) {
    const auto name = arguments.text("NAME", "the set");
    const auto texts = arguments.texts("CHANGE", "KEY=VALUE, for example ringing_timer=180",
                                       assignment_starts<SettingsRecord>());
    const auto secrets = secrets_flag(arguments);
    return [=](Invocation &run) {
        const auto assignments = assignments_or_refusal(*texts, kSettingsSetHint);
        const auto set = read_set(run.client(), *name);
        const Changes changes =
            change_record<SettingsRecord>(run, ims_update_global_settings, *set, assignments);
        show_changes(run, {"name", *name}, changes, Shown(*secrets));
    };
}

constexpr const char *kSettingsAddHint =
    "try: imsctl settings add roaming --from default rcs_version=2";

std::vector<std::string_view> lost_in_copy(const SettingsRecord &set) {
    std::vector<std::string_view> names;
    for (const auto &key : keys_of<SettingsRecord>())
        if (is_read_only(key) && value_of(set, key) != empty_value(type_of(key)))
            names.push_back(key.name);
    return names;
}

Action prepare_settings_add(Arguments &arguments) {
    const auto name = arguments.text("NAME", "the new set");
    const auto texts = arguments.some_texts("CHANGE", "KEY=VALUE, for example rcs_version=2",
                                            assignment_starts<SettingsRecord>());
    const auto from = arguments.text_or(
        "--from", "the set to take the other values from; empty, false or 0 when left out", "");
    return [=](Invocation &run) {
        const auto assignments = assignments_or_refusal(*texts, kSettingsAddHint);
        const auto set =
            from->empty() ? new_record<SettingsRecord>() : read_set(run.client(), *from);
        store(*set, *find_key<SettingsRecord>("name"), *name);
        assign_all(*set, assignments);
        if (from->empty())
            fill_gaps(*set);
        send_record<SettingsRecord>(run, ims_add_global_settings, *set);
        note_not_written(run, lost_in_copy(*set));
        run.output().result({{"name", *name}});
    };
}

Action prepare_settings_delete(Arguments &arguments) {
    const auto name = arguments.text("NAME", "the set");
    return [=](Invocation &run) {
        const auto set = new_record<SettingsRecord>();
        store(*set, *find_key<SettingsRecord>("name"), *name);
        run.request({{"name", *name}},
                    with_record<SettingsRecord>(ims_delete_global_settings, *set));
    };
}

Action prepare_settings_diff(Arguments &arguments) {
    const auto first_name = arguments.text("FIRST", "a set");
    const auto second_name = arguments.text("SECOND", "another one");
    const auto secrets = secrets_flag(arguments);
    return [=](Invocation &run) {
        const auto first = read_set(run.client(), *first_name);
        const auto second = read_set(run.client(), *second_name);
        const Changes different = differences(*first, *second);
        run.output().result({{"first", *first_name},
                             {"second", *second_name},
                             {"different", to_json(different, "first", "second")}},
                            different.empty() ? "no difference"
                                              : Shown(*secrets).changes(different, "|"));
    };
}

Action prepare_get_environment(Arguments &) {
    return [](Invocation &run) {
        std::int32_t type = 0;
        run.client().query(
            [&](ims_h handle) { return ims_get_network_environment(handle, &type); });
        run.output().result({{"environment_type", std::int64_t{type}}});
    };
}

Action prepare_set_environment(Arguments &arguments) {
    return with_number(arguments.number("TYPE", "the type, as the service defines it"),
                       ims_set_network_environment);
}

constexpr Verb kSettingsVerbs[] = {
    {"settings list-keys", "list the keys of a set and their types", "settings list-keys",
     prepare_settings_list_keys},
    {"settings get", "show a set", "settings get default ringing_timer min_se",
     prepare_settings_get},
    {"settings set", "change keys of a set", "settings set default ringing_timer=180",
     prepare_settings_set},
    {"settings add", "add a set", "settings add roaming --from default rcs_version=2",
     prepare_settings_add},
    {"settings delete", "delete a set", "settings delete roaming", prepare_settings_delete},
    {"settings export", "write a set to a JSON file", "settings export default default.json",
     prepare_export},
    {"settings import", "change or add the set that a JSON file holds",
     "settings import default.json", prepare_import},
    {"settings diff", "show where two sets differ", "settings diff default roaming",
     prepare_settings_diff},
    {"network-environment get", "show the type of network environment", "network-environment get",
     prepare_get_environment},
    {"network-environment set", "set the type of network environment", "network-environment set 1",
     prepare_set_environment},
};

} // namespace

std::span<const Verb> settings_verbs() {
    return kSettingsVerbs;
}

} // namespace imsctl
