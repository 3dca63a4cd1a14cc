// SPDX-License-Identifier: Apache-2.0
// The fields of what the service tells beside group documents, as in group_records.hpp.
#pragma once

#include "imsctl/group/records.hpp"

namespace imsctl {

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_adv_group_s &group) {
    visit("type", group.type);
    visit("display_name", group.display_name);
    visit("supported_services", group.supported_services);
    visit("group_uri", group.group_uri);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_grp_adv_s &advertisement) {
    visit("note", advertisement.note);
    visit("grp", advertisement.grp);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_common_uri_usage_s &usage) {
    visit("pc_id", usage.pc_id);
    visit("grp_adv", usage.grp_adv);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_uri_usages_s &usages) {
    visit("poc_usage", usages.poc_usage);
    visit("im_usage", usages.im_usage);
    visit("common_uri_usage", usages.common_uri_usage, usages.num_of_common_uri_usages);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_entry_uri_s &uri) {
    visit("uri_type", uri.uri_type);
    visit("uri", uri.uri);
    visit("disp_name", uri.disp_name);
    visit("is_group_uri", uri.is_group_uri);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_group_entry_s &entry) {
    visit("group_list_entry_uri", entry.group_list_entry_uri);
    visit("entry_uri_usages", entry.entry_uri_usages);
    visit("is_default_group", entry.is_default_group);
    visit("is_start_up", entry.is_start_up);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_group_list_s &list) {
    visit("group_list_name", list.group_list_name);
    visit("display_name", list.display_name);
    visit("group_entries", list.group_entries, list.num_of_groups);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_participant_groups_s &groups) {
    visit("version", groups.version);
    visit("group_list_info", groups.group_list_info, groups.num_of_group_lists);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_person_name_s &name) {
    visit("given_name", name.given_name);
    visit("family_name", name.family_name);
    visit("middle_name", name.middle_name);
    visit("name_suffix", name.name_suffix);
    visit("name_prefix", name.name_prefix);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_address_s &address) {
    visit("country", address.country);
    visit("region", address.region);
    visit("locality", address.locality);
    visit("area", address.area);
    visit("street_name", address.street_name);
    visit("street_number", address.street_number);
    visit("postal_code", address.postal_code);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_user_profile_s &profile) {
    visit("user_uri", profile.user_uri);
    visit("display_name", profile.display_name);
    visit("birth_day", profile.birth_day);
    visit("gender", profile.gender);
    visit("free_text", profile.free_text);
    visit("qoe", profile.qoe);
    visit("status", profile.status);
    visit("dispatcher_id", profile.dispatcher_id);
    visit("client_type", profile.client_type);
    visit("comm_info", profile.comm_info, profile.num_of_comm_info);
    visit("name", profile.name);
    visit("address", profile.address);
    visit("company_info", profile.company_info);
    visit("hobbies", profile.hobbies, profile.num_of_hobbies);
    visit("favourite_link", profile.favourite_link, profile.num_of_favourite_links);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_conf_participant_s &participant) {
    visit("contact_list_entry", participant.contact_list_entry);
    visit("user_state", participant.user_state);
    visit("media_info", participant.media_info);
    visit("user_qoe", participant.user_qoe);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_participant_info_s &info) {
    visit("list_service_uri", info.list_service_uri);
    visit("session_uri", info.session_uri);
    visit("disp_name", info.disp_name);
    visit("session_type", info.session_type);
    visit("media_list", info.media_list);
    visit("qoe", info.qoe);
    visit("area_id", info.area_id);
    visit("seu_id", info.seu_id);
    visit("flow_id", info.flow_id);
    visit("inviting_user", info.inviting_user);
    visit("is_emergency_flag", info.is_emergency_flag);
    visit("is_one_many_one_flag", info.is_one_many_one_flag);
    visit("expiry_time", info.expiry_time);
    visit("is_full_duplex", info.is_full_duplex);
    visit("conf_participant_entry", info.conf_participant_entry, info.num_of_conf_participants);
}

} // namespace imsctl
