// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/group/answers.hpp"
#include "sim/group/fields.hpp"

// The keys of what is only ever answered.
namespace sim {

void describe(auto &form, const SharedGroup &shared) {
    form.record("group_info", *shared.document);
}

void describe(auto &form, const SharedGroups &shared) {
    form.text("version", shared.version);
    form.list("groups_v", shared.groups);
    form.count("count", shared.groups);
}

void describe(auto &form, const GroupUri &uri) {
    form.number("uri_type", uri.uri_type);
    form.text("uri", uri.uri);
    form.text("disp_name", uri.disp_name);
    form.flag("is_group_uri", uri.is_group_uri);
}

void describe(auto &form, const GroupAdvertisement &advertisement) {
    form.text("note", advertisement.note);
    form.part("grp_v", [&](auto &group) {
        group.number("type", advertisement.type);
        group.text("display_name", advertisement.display_name);
        group.list("supported_services_v", advertisement.supported_services);
        group.text("group_uri", advertisement.group_uri);
    });
}

void describe(auto &form, const GroupUsage &usage) {
    form.text("pc_id", usage.pc_id);
    form.record("grp_adv_v", usage.advertisement);
}

void describe(auto &form, const GroupListEntry &entry) {
    form.record("group_list_entry_uri_v", entry.uri);
    form.part("entry_uri_usages_v", [&](auto &usages) {
        usages.count("num_of_common_uri_usages", entry.usages);
        usages.text("poc_usage", entry.poc_usage);
        usages.text("im_usage", entry.im_usage);
        usages.list("common_uri_usage_v", entry.usages);
    });
    form.flag("is_default_group", entry.is_default_group);
    form.flag("is_start_up", entry.is_start_up);
}

void describe(auto &form, const GroupList &list) {
    form.text("group_list_name", list.name);
    form.count("num_of_groups", list.entries);
    form.text("display_name", list.display_name);
    form.list("group_entries_v", list.entries);
}

void describe(auto &form, const ParticipantGroups &groups) {
    form.text("version", groups.version);
    form.part("participant_groups_v", [&](auto &lists) {
        lists.count("num_of_group_lists", groups.lists);
        lists.list("group_list_info_v", groups.lists);
    });
}

void describe(auto &form, const UserProfile::Name &name) {
    form.text("given_name", name.given_name);
    form.text("family_name", name.family_name);
    form.text("middle_name", name.middle_name);
    form.text("name_suffix", name.name_suffix);
    form.text("name_prefix", name.name_prefix);
}

void describe(auto &form, const UserProfile::Address &address) {
    form.text("country", address.country);
    form.text("region", address.region);
    form.text("locality", address.locality);
    form.text("area", address.area);
    form.text("street_name", address.street_name);
    form.text("street_number", address.street_number);
    form.text("postal_code", address.postal_code);
}

void describe(auto &form, const UserProfile &profile) {
    form.text("user_uri", profile.user_uri);
    form.text("display_name", profile.display_name);
    form.text("birth_day", profile.birth_day);
    form.text("gender", profile.gender);
    form.text("free_text", profile.free_text);
    form.number("qoe", profile.qoe);
    form.text("status", profile.status);
    form.text("dispatcher_id", profile.dispatcher_id);
    form.text("client_type", profile.client_type);
    form.texts("comm_info_v", "comm_info", profile.comm_info);
    form.record("name_v", profile.name);
    form.record("address_v", profile.address);
    form.record("company_info_v", profile.company);
    form.texts("hobbies_v", "hobby", profile.hobbies);
    form.texts("favourite_link_v", "link", profile.favourite_links);
}

void describe(auto &form, const SessionParticipant &participant) {
    form.record("contact_list_entry_v", participant.member);
    form.number("user_state", participant.user_state);
    form.record("media_info_v", participant.media);
    form.number("user_qoe", participant.user_qoe);
}

void describe(auto &form, const ParticipantInfo &session) {
    form.text("list_service_uri", session.list_service_uri);
    form.text("session_uri", session.session_uri);
    form.text("disp_name", session.disp_name);
    form.number("session_type", session.session_type);
    form.record("media_list_v", session.media);
    form.number("qoe", session.qoe);
    form.text("area_id", session.area_id);
    form.text("seu_id", session.seu_id);
    form.text("flow_id", session.flow_id);
    form.text("inviting_user", session.inviting_user);
    form.flag("is_emergency_flag", session.is_emergency);
    form.flag("is_one_many_one_flag", session.is_one_many_one);
    form.text("expiry_time", session.expiry_time);
    form.flag("is_full_duplex", session.is_full_duplex);
    form.list("conf_participant_entry_v", session.participants);
}

} // namespace sim
