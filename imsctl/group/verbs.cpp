// SPDX-License-Identifier: Apache-2.0
// Group documents: as a whole, their members and rules, and what the service tells of groups.
#include "imsctl/group/document.hpp"
#include "imsctl/group/module.hpp"
#include "imsctl/group/requests.hpp"
#include "imsctl/group/schema.hpp"
#include "imsctl/output/failure.hpp"

#include <algorithm>
#include <fmt/format.h>
#include <fmt/ranges.h>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

Action prepare_create(Arguments &arguments) {
    const auto file = arguments.text("FILE", "the document as JSON; - is standard input");
    return [=](Invocation &run) {
        Storage storage;
        const ims_xdm_group_info_s &group = *read_group(*file, storage);
        run.request({{"group_uri", std::string(group.group_uri)}},
                    with_record(ims_xdm_create_group, group));
    };
}

Action prepare_delete(Arguments &arguments) {
    const auto group = group_place(arguments);
    return [=](Invocation &run) {
        run.request({{"group_uri", *group}},
                    [&](ims_h handle, ims_response_cb callback, void *user_data) {
                        return ims_xdm_delete_group(handle, group->c_str(), callback, user_data);
                    });
    };
}

Action prepare_show(Arguments &arguments) {
    const auto uri = group_place(arguments);
    const auto channel = arguments.text_or("--channel", "the group's channel", "");
    return [=](Invocation &run) {
        ims_xdm_group_info_s asked{};
        put_uri(asked.group_uri, *uri, "GROUP");
        asked.channel_id = channel->data();
        const Json group = fetch<ims_xdm_group_info_s>(
            run, with_record<ims_xdm_group_info_s>(ims_xdm_fetch_shared_group, asked));
        run.output().result(group, outline(group));
    };
}

using TextRequest = int (*)(ims_h, const char *text, ims_response_cb, void *);

template <class Record>
Json fetch_about(Invocation &run, TextRequest request, const std::string &text) {
    return fetch<Record>(run, [&](ims_h handle, ims_response_cb callback, void *user_data) {
        return request(handle, text.c_str(), callback, user_data);
    });
}

Argument<std::string> optional_text(Arguments &arguments) {
    return arguments.text_or("TEXT", "what the service is to look for; it defines what", "");
}

// "sip:team@example.org display_name="Team" members=2"
std::string list_line(const Json &group) {
    if (group.is_null())
        return "- no document";
    const Json &properties = group["group_properties"];
    const Json &members = group["group_member_list"];
    const Json &contacts = members.is_null() ? members : members["contacts"];
    return fmt::format(
        "{} display_name={} members={}", escape(group["group_uri"].get<std::string>()),
        properties.is_null() ? "-" : quote(properties["display_name"].get<std::string>()),
        contacts.is_null() ? 0 : contacts.size());
}

Action prepare_list(Arguments &arguments) {
    const auto text = optional_text(arguments);
    return [=](Invocation &run) {
        const Json list =
            fetch_about<ims_xdm_shared_group_list_s>(run, ims_xdm_fetch_all_shared_groups, *text);
        std::vector<std::string> lines;
        for (const Json &group : list["groups"])
            lines.push_back(list_line(group));
        run.output().result(list, lines.empty() ? "no groups"
                                                : fmt::format("{}", fmt::join(lines, "\n")));
    };
}

template <class Record>
Action shown(const Argument<std::string> &text, TextRequest request) {
    return [=](Invocation &run) {
        const Json record = fetch_about<Record>(run, request, *text);
        run.output().result(record, outline(record));
    };
}

Action prepare_lists(Arguments &arguments) {
    return shown<ims_xdm_participant_groups_s>(optional_text(arguments),
                                               ims_xdm_fetch_all_participant_groups);
}

Action prepare_profile(Arguments &arguments) {
    return shown<ims_xdm_user_profile_s>(optional_text(arguments),
                                         ims_xdm_fetch_shared_user_profile);
}

Action prepare_participants(Arguments &arguments) {
    return shown<ims_xdm_participant_info_s>(
        arguments.text("SESSION", "the session or group to ask about"),
        ims_xdm_get_participant_info);
}

ims_xdm_member_entry_s member_with(const std::string &uri) {
    ims_xdm_member_entry_s member{};
    put_uri(member.uri, uri, "URI");
    return member;
}

ims_xdm_member_list_s *members_of(const std::vector<std::string> &uris, const std::string &file,
                                  Storage &storage) {
    if (uris.empty() == file.empty())
        throw Failure(FailureKind::kUsage, "either URI or --file is required",
                      "try: imsctl group add-user sip:team@example.org sip:alice@example.org");
    if (!file.empty())
        return read_members(file, storage);
    std::vector<ims_xdm_member_entry_s> contacts;
    std::transform(uris.begin(), uris.end(), std::back_inserter(contacts), member_with);
    auto *members = storage.make<ims_xdm_member_list_s>();
    members->num_of_contacts = static_cast<std::int32_t>(contacts.size());
    members->contacts = storage.keep(std::move(contacts));
    return members;
}

Action change_members(Arguments &arguments, GroupRequest<const ims_xdm_member_list_s *> request) {
    const auto group = group_place(arguments);
    const auto uris = arguments.some_texts("URI", "a member's URI");
    const auto file =
        arguments.text_or("--file", "a member list as JSON instead; - is standard input", "");
    return [=](Invocation &run) {
        Storage storage;
        request_about<const ims_xdm_member_list_s *>(run, *group, request,
                                                     members_of(*uris, *file, storage));
    };
}

Action prepare_add_user(Arguments &arguments) {
    return change_members(arguments, ims_xdm_add_user_to_shared_group);
}

Action prepare_remove_user(Arguments &arguments) {
    return change_members(arguments, ims_xdm_remove_user_from_shared_group);
}

Action write_rules(Arguments &arguments, GroupRequest<const ims_xdm_group_rule_s *> request) {
    const auto group = group_place(arguments);
    const auto file =
        arguments.text("FILE", "a rule, or a list of rules, as JSON; - is standard input");
    return [=](Invocation &run) {
        Storage storage;
        request_about<const ims_xdm_group_rule_s *>(run, *group, request,
                                                    read_rules(*file, storage));
    };
}

Action prepare_add_rule(Arguments &arguments) {
    return write_rules(arguments, ims_xdm_add_group_rule);
}

Action prepare_modify_rule(Arguments &arguments) {
    return write_rules(arguments, ims_xdm_modify_group_rule);
}

Action prepare_delete_rule(Arguments &arguments) {
    const auto group = group_place(arguments);
    const auto rule = arguments.text("RULE", "the rule's rule_id");
    return [=](Invocation &run) {
        request_about(run, *group, ims_xdm_delete_group_rule, rule->c_str());
    };
}

Action prepare_schema(Arguments &) {
    return [](Invocation &run) { run.output().line(group_schema().dump(2)); };
}

constexpr Verb kGroupVerbs[] = {
    {"group create", "create a group from a document", "group create team.json", prepare_create},
    {"group delete", "delete a group", "group delete sip:team@example.org", prepare_delete},
    {"group show", "show a group's document", "group show sip:team@example.org", prepare_show},
    {"group list", "list the shared groups", "group list", prepare_list},
    {"group lists", "show the lists of groups that you take part in", "group lists", prepare_lists},
    {"group profile", "show a shared user profile", "group profile sip:alice@example.org",
     prepare_profile},
    {"group participants", "show who takes part in a session",
     "group participants sip:team@example.org", prepare_participants},
    {"group add-user", "add members to a group",
     "group add-user sip:team@example.org sip:alice@example.org", prepare_add_user},
    {"group remove-user", "remove members from a group",
     "group remove-user sip:team@example.org sip:alice@example.org", prepare_remove_user},
    {"group rule add", "add rules to a group", "group rule add sip:team@example.org rules.json",
     prepare_add_rule},
    {"group rule modify", "replace rules of a group",
     "group rule modify sip:team@example.org rules.json", prepare_modify_rule},
    {"group rule delete", "delete a rule of a group",
     "group rule delete sip:team@example.org guests", prepare_delete_rule},
    {"group schema", "print the JSON schema of group documents", "group schema", prepare_schema},
};

} // namespace

std::span<const Verb> group_verbs() {
    return kGroupVerbs;
}

} // namespace imsctl
