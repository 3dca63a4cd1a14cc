// SPDX-License-Identifier: Apache-2.0
// Registration profiles.
#include "imsctl/settings/actions.hpp"
#include "imsctl/settings/module.hpp"
#include "imsctl/settings/profile_choice.hpp"

#include <algorithm>
#include <fmt/format.h>
#include <fmt/ranges.h>
#include <limits>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

using ProfileList = RecordPtr<ims_profile_list_s>;

ProfileList read_profiles(Client &client) {
    ProfileList list(new ims_profile_list_s());
    client.query([&](ims_h handle) { return ims_get_profile_list_info(handle, list.get()); });
    return list;
}

std::span<ProfileRecord> profiles_in(ims_profile_list_s &list) {
    return {list.profiles, list.count};
}

Argument<std::string> profile_place(Arguments &arguments) {
    return arguments.text("PROFILE", "its id or its name");
}

Field id_field(const ProfileRecord &profile) {
    return {"id", std::int64_t{profile.id}};
}

Action prepare_profile_list_keys(Arguments &) {
    return list_keys<ProfileRecord>();
}

Action prepare_profile_list(Arguments &) {
    return [](Invocation &run) {
        static const std::vector<std::string> kTold = {"id", "enabled", "name", "mccmnc",
                                                       "network"};
        const ProfileList list = read_profiles(run.client());
        Json array = Json::array();
        std::vector<std::string> lines;
        for (const ProfileRecord &profile : profiles_in(*list)) {
            add_json(array.emplace_back(Json::object()), fields_of(profile));
            lines.push_back(to_text(fields_of(profile, kTold)));
        }
        run.output().result({{"profiles", array}}, lines.empty()
                                                       ? "no profiles"
                                                       : fmt::format("{}", fmt::join(lines, "\n")));
    };
}

Action prepare_profile_show(Arguments &arguments) {
    const auto choice = profile_place(arguments);
    const auto keys =
        arguments.some_names("KEY", "these only; all when left out", key_names<ProfileRecord>());
    const auto secrets = secrets_flag(arguments);
    return [=](Invocation &run) {
        const ProfileList list = read_profiles(run.client());
        const Fields fields = fields_of(ProfileChoice(*choice).among(profiles_in(*list)), *keys);
        Json values = Json::object();
        add_json(values, fields);
        run.output().result({{"profile", values}}, Shown(*secrets).fields(fields));
    };
}

constexpr const char *kProfileSetHint = "try: imsctl profile set 1 port=5061";

Action prepare_profile_set(Arguments &arguments) {
    const auto choice = profile_place(arguments);
    const auto texts = arguments.texts("CHANGE", "KEY=VALUE, for example port=5061",
                                       assignment_starts<ProfileRecord>());
    const auto secrets = secrets_flag(arguments);
    return [=](Invocation &run) {
        constexpr FixedKey kFixedKeys[] = {{"id", "it says which profile is meant"}};
        const auto assignments = parse_assignments<ProfileRecord>(*texts, kProfileSetHint);
        refuse_fixed<ProfileRecord>(assignments, kFixedKeys, kProfileSetHint);
        const ProfileList list = read_profiles(run.client());
        ProfileRecord &profile = ProfileChoice(*choice).among(profiles_in(*list));
        const Changes changes =
            change_record<ProfileRecord>(run, ims_update_profile, profile, assignments);
        show_changes(run, id_field(profile), changes, Shown(*secrets));
    };
}

constexpr const char *kProfileAddHint = "try: imsctl profile add backup --from 1 port=5061";

std::int32_t free_id(std::span<const ProfileRecord> profiles) {
    std::int32_t highest = 0;
    for (const ProfileRecord &profile : profiles)
        highest = std::max(highest, profile.id);
    if (highest == std::numeric_limits<std::int32_t>::max())
        throw Failure(FailureKind::kUsage, "no id follows the highest one: give one by id=N",
                      kProfileAddHint);
    return highest + 1;
}

Action prepare_profile_add(Arguments &arguments) {
    const auto name = arguments.text("NAME", "the new profile's name");
    const auto texts =
        arguments.some_texts("CHANGE", "KEY=VALUE, for example port=5061; id=N chooses its id",
                             assignment_starts<ProfileRecord>());
    const auto from = arguments.text_or(
        "--from", "the profile to take the other values from; empty, false or 0 when left out", "");
    return [=](Invocation &run) {
        constexpr FixedKey kFixedKeys[] = {{"name", "it is given as NAME"}};
        const auto assignments = parse_assignments<ProfileRecord>(*texts, kProfileAddHint);
        refuse_fixed<ProfileRecord>(assignments, kFixedKeys, kProfileAddHint);
        const ProfileList list = read_profiles(run.client());
        const auto empty = new_record<ProfileRecord>();
        fill_gaps(*empty);
        ProfileRecord &profile =
            from->empty() ? *empty : ProfileChoice(*from).among(profiles_in(*list));
        const bool has_id = std::any_of(assignments.begin(), assignments.end(),
                                        [](const auto &each) { return each.key->name == "id"; });
        if (!has_id)
            profile.id = free_id(profiles_in(*list));
        store(profile, *find_key<ProfileRecord>("name"), *name);
        assign_all(profile, assignments);
        send_record<ProfileRecord>(run, ims_add_profile, profile);
        run.output().result({id_field(profile), {"name", *name}});
    };
}

Action prepare_profile_delete(Arguments &arguments) {
    const auto choice = profile_place(arguments);
    return [=](Invocation &run) {
        const ProfileChoice chosen(*choice);
        ProfileRecord profile{};
        if (chosen.id()) {
            profile.id = *chosen.id();
        } else {
            const ProfileList list = read_profiles(run.client());
            profile.id = chosen.among(profiles_in(*list)).id;
        }
        run.request({id_field(profile)}, with_record<ProfileRecord>(ims_delete_profile, profile));
    };
}

constexpr Verb kProfileVerbs[] = {
    {"profile list", "list the registration profiles", "profile list", prepare_profile_list},
    {"profile list-keys", "list the keys of a profile and their types", "profile list-keys",
     prepare_profile_list_keys},
    {"profile show", "show a profile", "profile show 1 pcscf port", prepare_profile_show},
    {"profile set", "change keys of a profile", "profile set 1 port=5061", prepare_profile_set},
    {"profile add", "add a profile", "profile add backup --from 1 port=5061", prepare_profile_add},
    {"profile delete", "delete a profile", "profile delete backup", prepare_profile_delete},
};

} // namespace

std::span<const Verb> profile_verbs() {
    return kProfileVerbs;
}

} // namespace imsctl
