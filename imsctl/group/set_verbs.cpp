// SPDX-License-Identifier: Apache-2.0
// The properties of a group, one at a time.
#include "imsctl/group/document.hpp"
#include "imsctl/group/module.hpp"
#include "imsctl/group/requests.hpp"
#include "imsctl/output/failure.hpp"

#include <algorithm>
#include <fmt/format.h>

namespace imsctl {
namespace {

Action set_text(Arguments &arguments, const char *place, const char *help,
                GroupRequest<const char *> request) {
    const auto group = group_place(arguments);
    const auto text = arguments.text(place, help);
    return [=](Invocation &run) { request_about(run, *group, request, text->c_str()); };
}

Action set_flag(Arguments &arguments, const char *help, GroupRequest<bool> request) {
    const auto group = group_place(arguments);
    const auto flag = arguments.choice("SWITCH", help, kSwitch);
    return [=](Invocation &run) { request_about(run, *group, request, *flag != 0); };
}

Action set_number(Arguments &arguments, const char *help, GroupRequest<std::int32_t> request) {
    const auto group = group_place(arguments);
    const auto number = arguments.number("NUMBER", help);
    return [=](Invocation &run) { request_about(run, *group, request, *number); };
}

Action prepare_display_name(Arguments &arguments) {
    return set_text(arguments, "NAME", "the display name", ims_xdm_modify_group_display_name);
}

Action prepare_subject(Arguments &arguments) {
    return set_text(arguments, "TEXT", "the subject", ims_xdm_modify_group_subject);
}

Action prepare_searchable(Arguments &arguments) {
    return set_flag(arguments, "whether a search finds the group", ims_xdm_modify_group_searchable);
}

Action prepare_invite_members(Arguments &arguments) {
    return set_flag(arguments, "whether the members are invited",
                    ims_xdm_modify_group_invite_members);
}

Action prepare_auto_advertisements(Arguments &arguments) {
    return set_flag(arguments, "whether the group advertises itself",
                    ims_xdm_modify_group_auto_advertisements);
}

Action prepare_max_participants(Arguments &arguments) {
    return set_number(arguments, "the most participants of a session",
                      ims_xdm_modify_group_max_participants);
}

Action prepare_qoe(Arguments &arguments) {
    return set_number(arguments, "the quality of experience, as the service defines it",
                      ims_xdm_modify_group_qoe);
}

Action prepare_policy(Arguments &arguments) {
    const auto group = group_place(arguments);
    const auto file = arguments.text("FILE", "a session policy as JSON; - is standard input");
    return [=](Invocation &run) {
        Storage storage;
        request_about<const ims_xdm_session_policy_s *>(
            run, *group, ims_xdm_modify_group_session_active_policy, read_policy(*file, storage));
    };
}

struct Medium {
    const char *name;
    bool ims_xdm_session_service_s::*flag;
};

constexpr Medium kMedia[] = {
    {"audio", &ims_xdm_session_service_s::audio},
    {"video", &ims_xdm_session_service_s::video},
    {"message", &ims_xdm_session_service_s::message},
    {"file_transfer", &ims_xdm_session_service_s::file_transfer},
    {"group_advertisement", &ims_xdm_session_service_s::group_advertisement},
    {"pager_mode", &ims_xdm_session_service_s::pager_mode},
    {"poc_speech", &ims_xdm_session_service_s::poc_speech},
};

std::vector<std::string> medium_names() {
    std::vector<std::string> names;
    for (const Medium &medium : kMedia)
        names.emplace_back(medium.name);
    return names;
}

Action prepare_service(Arguments &arguments) {
    const auto group = group_place(arguments);
    const auto application =
        arguments.number("APPLICATION", "which service, as the service defines it");
    const auto names =
        arguments.some_names("MEDIUM", "a medium that it has: audio, video, ...", medium_names());
    return [=](Invocation &run) {
        ims_xdm_session_service_s service{};
        service.group_app = *application;
        for (const Medium &medium : kMedia)
            service.*medium.flag =
                std::find(names->begin(), names->end(), medium.name) != names->end();
        request_about<const ims_xdm_session_service_s *>(
            run, *group, ims_xdm_modify_group_session_service_list, &service);
    };
}

// "6..14", "65..", "..5"
ims_xdm_age_restriction_s *age_range(const std::string &text, Storage &storage) {
    const auto dots = text.find("..");
    if (dots == std::string::npos)
        throw Failure(
            FailureKind::kUsage,
            fmt::format("RANGE: {} is not a range such as 6..14, 65.. or ..5", quote(text)));
    const auto part = [&](const std::string &age) {
        return age.empty() ? nullptr : storage.keep(age);
    };
    auto *range = storage.make<ims_xdm_age_restriction_s>();
    range->from_age = part(text.substr(0, dots));
    range->to_age = part(text.substr(dots + 2));
    return range;
}

Action prepare_age_restrictions(Arguments &arguments) {
    const auto group = group_place(arguments);
    const auto ranges = arguments.texts("RANGE", "ages as 6..14, 65.. or ..5");
    return [=](Invocation &run) {
        Storage storage;
        ims_xdm_age_restriction_s *first = nullptr;
        for (ims_xdm_age_restriction_s **next = &first; const std::string &text : *ranges) {
            *next = age_range(text, storage);
            next = &(*next)->next;
        }
        request_about<const ims_xdm_age_restriction_s *>(
            run, *group, ims_xdm_modify_group_age_restriction, first);
    };
}

Action prepare_member(Arguments &arguments) {
    const auto group = group_place(arguments);
    const auto uri = arguments.text("URI", "the member's URI");
    const auto name = arguments.text_or("--name", "the display name", "");
    const auto type = arguments.number("--type", "the type, as the service defines it", 0);
    const auto is_active = arguments.flag("--active", "set the active flag");
    const auto is_stt = arguments.flag("--stt", "set the stt flag");
    const auto is_auto_join = arguments.flag("--auto-join", "set the auto_join flag");
    const auto assign = arguments.text_or("--assign", "the assignment", "");
    const auto position = arguments.text_or("--position", "the position", "");
    const auto rank = arguments.text_or("--rank", "the rank", "");
    return [=](Invocation &run) {
        const auto or_none = [](std::string &text) { return text.empty() ? nullptr : text.data(); };
        ims_xdm_member_entry_s member{};
        put_uri(member.uri, *uri, "URI");
        member.disp_name = or_none(*name);
        member.status = {or_none(*assign), or_none(*position), or_none(*rank)};
        member.auto_join = *is_auto_join;
        member.stt = *is_stt;
        member.active = *is_active;
        member.type = *type;
        const ims_xdm_group_attributes_s attributes{group->c_str(), &member};
        run.request({{"group_uri", *group}, {"uri", *uri}},
                    with_record(ims_xdm_modify_group_attributes, attributes));
    };
}

Action prepare_default(Arguments &arguments) {
    const auto list = arguments.text("LIST", "the group list's name");
    const auto group = group_place(arguments);
    const auto flag = arguments.choice("SWITCH", "whether it is the list's default", kSwitch);
    return [=](Invocation &run) {
        const ims_xdm_default_group_s default_group{list->c_str(), group->c_str(), *flag != 0};
        run.request({{"group_list_name", *list}, {"group_uri", *group}},
                    with_record(ims_xdm_modify_default_group, default_group));
    };
}

constexpr Verb kGroupSetVerbs[] = {
    {"group set display-name", "set a group's display name",
     "group set display-name sip:team@example.org Team", prepare_display_name},
    {"group set subject", "set a group's subject", "group set subject sip:team@example.org Lunch",
     prepare_subject},
    {"group set searchable", "let a search find a group, or not",
     "group set searchable sip:team@example.org on", prepare_searchable},
    {"group set invite-members", "have the members of a group invited, or not",
     "group set invite-members sip:team@example.org on", prepare_invite_members},
    {"group set auto-advertisements", "let a group advertise itself, or not",
     "group set auto-advertisements sip:team@example.org off", prepare_auto_advertisements},
    {"group set max-participants", "limit the participants of a group's sessions",
     "group set max-participants sip:team@example.org 20", prepare_max_participants},
    {"group set qoe", "set a group's quality of experience", "group set qoe sip:team@example.org 2",
     prepare_qoe},
    {"group set policy", "set a group's session policy",
     "group set policy sip:team@example.org policy.json", prepare_policy},
    {"group set service", "set a service of a group's sessions",
     "group set service sip:team@example.org 1 audio poc_speech", prepare_service},
    {"group set age-restrictions", "set a group's restrictions of age",
     "group set age-restrictions sip:team@example.org 6..14 65..", prepare_age_restrictions},
    {"group set member", "set what one member of a group is",
     "group set member sip:team@example.org sip:alice@example.org --active", prepare_member},
    {"group set default", "set or clear the default group of a list",
     "group set default work sip:team@example.org on", prepare_default},
};

} // namespace

std::span<const Verb> group_set_verbs() {
    return kGroupSetVerbs;
}

} // namespace imsctl
