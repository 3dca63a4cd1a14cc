// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/group/records.hpp"
#include "sim/group/tree.hpp"

#include <concepts>
#include <span>
#include <type_traits>

// Where everything stands in a document: keys in wire order. One description serves `GroupReader`
// and `GroupWriter`, and both forms of a document.
namespace sim {

template <typename T, typename Record>
concept Like = std::same_as<std::remove_const_t<T>, Record>;

namespace fields {

struct MediaFlag {
    const char *key;
    bool GroupMedia::*flag;
};

inline constexpr MediaFlag kMedia[] = {
    {"audio", &GroupMedia::audio},
    {"video", &GroupMedia::video},
    {"message", &GroupMedia::message},
    {"file_transfer", &GroupMedia::file_transfer},
    {"group_advertisement", &GroupMedia::group_advertisement},
    {"pager_mode", &GroupMedia::pager_mode},
    {"poc_speech", &GroupMedia::poc_speech},
};
// A rule is written with the first of them alone.
inline constexpr std::size_t kWrittenRuleMedia = 4;

inline constexpr const char *kActions[GroupRule::kActions] = {
    "allow_conf_state",
    "allow_invite_users_dynamically",
    "join_handling",
    "allow_init_conf",
    "allow_sub_conf",
    "allow_private_message",
    "allow_media_handling",
    "allow_anonymity",
    "block_group_adver_send",
    "is_key_participant",
    "remove_media_handling",
    "allow_expelling",
    "allow_hndl_multiple_streams",
    "allow_ltd_participating_info",
};

} // namespace fields

void describe(auto &form, Like<GroupMedia> auto &media) {
    for (const auto &[key, flag] : fields::kMedia)
        form.flag(key, media.*flag);
}

void describe(auto &form, Like<RuleMedia> auto &media) {
    const bool whole = form.form() == GroupForm::kRead;
    const auto count = whole ? std::size(fields::kMedia) : fields::kWrittenRuleMedia;
    for (const auto &[key, flag] : std::span(fields::kMedia).first(count))
        form.flag(key, media.flags.*flag);
}

void describe(auto &form, Like<MemberStatus> auto &status) {
    form.text("assign", status.assign);
    form.text("position", status.position);
    form.text("rank", status.rank);
}

void describe(auto &form, Like<GroupMember> auto &member) {
    form.text("uri", member.uri);
    form.text("disp_name", member.disp_name);
    form.flag("stt", member.stt);
    form.flag("active", member.active);
    form.member_type("type", member.type);
    form.flag("auto_join", member.auto_join);
    form.record("status_v", member.status);
}

void describe(auto &form, Like<GroupMembers> auto &members) {
    form.part({"contact_lists", "contact_list"}, [&](auto &part) {
        part.texts("contact_lists_v", "contact_lists", members.contact_lists);
        part.count("num_of_ct_lists", members.contact_lists);
    });
    form.part("contacts", [&](auto &part) {
        part.list("contacts_v", members.contacts);
        part.count("num_of_contacts", members.contacts);
    });
    form.part({"ext_ref_url", "ext_ref_ct_lists"}, [&](auto &part) {
        part.texts({"contact_ref_ct_list", "contact_ref_ct_list_v"}, "contact_ref_ct_list",
                   members.external_lists);
        part.count({"num_of_ct_lists_ref", "num_of_ct_lists"}, members.external_lists);
    });
    form.part({"entry_ref_url", "entry_ref_contacts"}, [&](auto &part) {
        part.texts({"entry_ref_contacts_v", "contact_ref_contact_v"}, "contact_ref_contact",
                   members.entry_references);
        part.count("num_of_ct_ref", members.entry_references);
    });
}

void describe(auto &form, Like<GroupSchedule> auto &schedule) {
    form.text("start_time", schedule.start_time);
    form.text("end_time", schedule.end_time);
}

void describe(auto &form, Like<SessionPolicy> auto &policy) {
    form.number("min_participants", policy.min_participants);
    form.number("max_duration", policy.max_duration);
    form.record("participants", policy.participants);
    form.list("schedule", policy.schedule);
}

void describe(auto &form, Like<SupportedService> auto &service) {
    form.number("service_enabler", service.service_enabler);
    form.at_most_one("media_list_v", service.media);
}

void describe(auto &form, Like<SessionService> auto &service) {
    form.number("group_app", service.application);
    form.record("group_media_list", service.media);
}

void describe(auto &form, Like<AgeRestriction> auto &restriction) {
    form.text("from_age", restriction.from_age);
    form.text("to_age", restriction.to_age);
}

void describe(auto &form, Like<GroupProperties> auto &properties) {
    form.text("display_name", properties.display_name);
    form.text("subject", properties.subject);
    form.flag("is_searchable", properties.is_searchable);
    form.flag("inv_members", properties.inv_members);
    form.number("max_participants", properties.max_participants);
    form.text("as_id", properties.as_id);
    form.text("area_id", properties.area_id);
    form.flag("auto_grp_advertisements", properties.auto_grp_advertisements);
    form.number("group_qoe", properties.group_qoe);
    form.record({"group_active_policy", "group_session_active_policy"}, properties.active_policy);
    form.list("supported_services", properties.supported_services);
    form.list("age_restrictions", properties.age_restrictions);
}

void describe(auto &form, Like<RuleContacts> auto &identity) {
    form.list("contacts", identity.contacts);
    form.count("num_of_contacts", identity.contacts);
}

void describe(auto &form, Like<RuleContactLists> auto &identity) {
    form.texts({"contacts_v", "ref_ct_list_url"}, {"contacts", "ref_ct_list_url"}, identity.urls);
    form.count("num_of_contact_list_url", identity.urls);
}

void describe(auto &form, Like<DomainNames> auto &domains) {
    form.count("num_of_domain_id", domains.names);
    form.texts({"contacts_v", "domain_id_v"}, {"contacts", "domain_id"}, domains.names);
}

void describe(auto &form, Like<DomainContacts> auto &contacts) {
    form.count("num_of_contact_id", contacts.members);
    form.list({"contacts", "contacts_v"}, contacts.members);
}

void describe(auto &form, Like<RuleDomains> auto &identity) {
    form.record("allow_domain_id", identity.allowed_domains);
    form.record("allow_contact_id", identity.allowed_contacts);
    form.record("except_domain_id", identity.except_domains);
    form.record("except_contact_id", identity.except_contacts);
}

void describe(auto &form, Like<GroupRule> auto &rule) {
    form.text("rule_id", rule.id);
    form.part({"rule_condition", "rule_condition_v"}, [&](auto &condition) {
        constexpr GroupKey kType{"rule_identity_type", "rule_identity_type_v"};
        // Wherever the type stands, it says what the identity is.
        if constexpr (std::remove_cvref_t<decltype(condition)>::kReads)
            condition.number(kType, rule.identity_type);
        condition.identity("rule_identity", rule.identity_type, rule.identity);
        condition.number(kType, rule.identity_type);
        condition.record("rule_media_list", rule.media);
        condition.flag("is_list_member", rule.is_list_member);
    });
    form.part({"rule_action", "rule_action_v"}, [&](auto &action) {
        for (std::size_t i = 0; i < GroupRule::kActions; ++i)
            action.flag(fields::kActions[i], rule.actions[i]);
    });
}

void describe(auto &form, Like<GroupDocument> auto &group) {
    form.text("group_uri", group.uri);
    form.text("channel_id", group.channel_id);
    form.text("version", group.version);
    form.record("group_properties", group.properties);
    form.record("group_member_list", group.members);
    form.list("group_rule_set", group.rules);
}

} // namespace sim
