// SPDX-License-Identifier: Apache-2.0
// The keys of what the service answers beside single group documents: only read.
#pragma once

#include "xdm_records.hpp"

namespace ims {

inline constexpr auto kSharedGroup = record_tree({
    pointer("group_info", kElement<ims_xdm_group_info_s *>, kGroupInfo),
});
inline constexpr auto kSharedGroups = record_tree({
    value("version", IMS_PLACE(ims_xdm_shared_group_list_s, version)),
    array("groups_v", IMS_PLACE(ims_xdm_shared_group_list_s, groups),
          IMS_PLACE(ims_xdm_shared_group_list_s, count), kSharedGroup),
    value("count", IMS_PLACE(ims_xdm_shared_group_list_s, count)),
});

inline constexpr auto kAdvertisedGroup = record_tree({
    value("type", IMS_PLACE(ims_xdm_adv_group_s, type)),
    value("display_name", IMS_PLACE(ims_xdm_adv_group_s, display_name)),
    chain("supported_services_v", IMS_PLACE(ims_xdm_adv_group_s, supported_services),
          kSupportedService),
    value("group_uri", IMS_PLACE(ims_xdm_adv_group_s, group_uri)),
});
inline constexpr auto kAdvertisement = record_tree({
    value("note", IMS_PLACE(ims_xdm_grp_adv_s, note)),
    part("grp_v", IMS_PLACE(ims_xdm_grp_adv_s, grp), kAdvertisedGroup),
});
inline constexpr auto kCommonUriUsage = record_tree({
    value("pc_id", IMS_PLACE(ims_xdm_common_uri_usage_s, pc_id)),
    part("grp_adv_v", IMS_PLACE(ims_xdm_common_uri_usage_s, grp_adv), kAdvertisement),
});
inline constexpr auto kUriUsages = record_tree({
    value("num_of_common_uri_usages", IMS_PLACE(ims_xdm_uri_usages_s, num_of_common_uri_usages)),
    value("poc_usage", IMS_PLACE(ims_xdm_uri_usages_s, poc_usage)),
    value("im_usage", IMS_PLACE(ims_xdm_uri_usages_s, im_usage)),
    array("common_uri_usage_v", IMS_PLACE(ims_xdm_uri_usages_s, common_uri_usage),
          IMS_PLACE(ims_xdm_uri_usages_s, num_of_common_uri_usages), kCommonUriUsage),
});
inline constexpr auto kEntryUri = record_tree({
    value("uri_type", IMS_PLACE(ims_xdm_entry_uri_s, uri_type)),
    value("uri", IMS_PLACE(ims_xdm_entry_uri_s, uri)),
    value("disp_name", IMS_PLACE(ims_xdm_entry_uri_s, disp_name)),
    value("is_group_uri", IMS_PLACE(ims_xdm_entry_uri_s, is_group_uri)),
});
inline constexpr auto kGroupEntry = record_tree({
    part("group_list_entry_uri_v", IMS_PLACE(ims_xdm_group_entry_s, group_list_entry_uri),
         kEntryUri),
    part("entry_uri_usages_v", IMS_PLACE(ims_xdm_group_entry_s, entry_uri_usages), kUriUsages),
    value("is_default_group", IMS_PLACE(ims_xdm_group_entry_s, is_default_group)),
    value("is_start_up", IMS_PLACE(ims_xdm_group_entry_s, is_start_up)),
});
inline constexpr auto kGroupList = record_tree({
    value("group_list_name", IMS_PLACE(ims_xdm_group_list_s, group_list_name)),
    value("num_of_groups", IMS_PLACE(ims_xdm_group_list_s, num_of_groups)),
    value("display_name", IMS_PLACE(ims_xdm_group_list_s, display_name)),
    array("group_entries_v", IMS_PLACE(ims_xdm_group_list_s, group_entries),
          IMS_PLACE(ims_xdm_group_list_s, num_of_groups), kGroupEntry),
});
inline constexpr auto kGroupLists = record_tree({
    value("num_of_group_lists", IMS_PLACE(ims_xdm_participant_groups_s, num_of_group_lists)),
    array("group_list_info_v", IMS_PLACE(ims_xdm_participant_groups_s, group_list_info),
          IMS_PLACE(ims_xdm_participant_groups_s, num_of_group_lists), kGroupList),
});
inline constexpr auto kParticipantGroups = record_tree({
    value("version", IMS_PLACE(ims_xdm_participant_groups_s, version)),
    group("participant_groups_v", kGroupLists),
});

inline constexpr auto kPersonName = record_tree({
    value("given_name", IMS_PLACE(ims_xdm_person_name_s, given_name)),
    value("family_name", IMS_PLACE(ims_xdm_person_name_s, family_name)),
    value("middle_name", IMS_PLACE(ims_xdm_person_name_s, middle_name)),
    value("name_suffix", IMS_PLACE(ims_xdm_person_name_s, name_suffix)),
    value("name_prefix", IMS_PLACE(ims_xdm_person_name_s, name_prefix)),
});
inline constexpr auto kAddress = record_tree({
    value("country", IMS_PLACE(ims_xdm_address_s, country)),
    value("region", IMS_PLACE(ims_xdm_address_s, region)),
    value("locality", IMS_PLACE(ims_xdm_address_s, locality)),
    value("area", IMS_PLACE(ims_xdm_address_s, area)),
    value("street_name", IMS_PLACE(ims_xdm_address_s, street_name)),
    value("street_number", IMS_PLACE(ims_xdm_address_s, street_number)),
    value("postal_code", IMS_PLACE(ims_xdm_address_s, postal_code)),
});
inline constexpr auto kUserProfile = record_tree({
    value("user_uri", IMS_PLACE(ims_xdm_user_profile_s, user_uri)),
    value("display_name", IMS_PLACE(ims_xdm_user_profile_s, display_name)),
    value("birth_day", IMS_PLACE(ims_xdm_user_profile_s, birth_day)),
    value("gender", IMS_PLACE(ims_xdm_user_profile_s, gender)),
    value("free_text", IMS_PLACE(ims_xdm_user_profile_s, free_text)),
    value("qoe", IMS_PLACE(ims_xdm_user_profile_s, qoe)),
    value("status", IMS_PLACE(ims_xdm_user_profile_s, status)),
    value("dispatcher_id", IMS_PLACE(ims_xdm_user_profile_s, dispatcher_id)),
    value("client_type", IMS_PLACE(ims_xdm_user_profile_s, client_type)),
    sized_array("comm_info_v", IMS_PLACE(ims_xdm_user_profile_s, comm_info),
                IMS_PLACE(ims_xdm_user_profile_s, num_of_comm_info), kTextUnder<"comm_info">),
    part("name_v", IMS_PLACE(ims_xdm_user_profile_s, name), kPersonName),
    part("address_v", IMS_PLACE(ims_xdm_user_profile_s, address), kAddress),
    part("company_info_v", IMS_PLACE(ims_xdm_user_profile_s, company_info), kMemberStatus),
    sized_array("hobbies_v", IMS_PLACE(ims_xdm_user_profile_s, hobbies),
                IMS_PLACE(ims_xdm_user_profile_s, num_of_hobbies), kTextUnder<"hobby">),
    sized_array("favourite_link_v", IMS_PLACE(ims_xdm_user_profile_s, favourite_link),
                IMS_PLACE(ims_xdm_user_profile_s, num_of_favourite_links), kTextUnder<"link">),
});

inline constexpr auto kParticipant = record_tree({
    part("contact_list_entry_v", IMS_PLACE(ims_xdm_conf_participant_s, contact_list_entry),
         kMemberEntry),
    value("user_state", IMS_PLACE(ims_xdm_conf_participant_s, user_state)),
    pointer("media_info_v", IMS_PLACE(ims_xdm_conf_participant_s, media_info), kMediaList),
    value("user_qoe", IMS_PLACE(ims_xdm_conf_participant_s, user_qoe)),
});
inline constexpr auto kParticipantInfo = record_tree({
    value("list_service_uri", IMS_PLACE(ims_xdm_participant_info_s, list_service_uri)),
    value("session_uri", IMS_PLACE(ims_xdm_participant_info_s, session_uri)),
    value("disp_name", IMS_PLACE(ims_xdm_participant_info_s, disp_name)),
    value("session_type", IMS_PLACE(ims_xdm_participant_info_s, session_type)),
    pointer("media_list_v", IMS_PLACE(ims_xdm_participant_info_s, media_list), kMediaList),
    value("qoe", IMS_PLACE(ims_xdm_participant_info_s, qoe)),
    value("area_id", IMS_PLACE(ims_xdm_participant_info_s, area_id)),
    value("seu_id", IMS_PLACE(ims_xdm_participant_info_s, seu_id)),
    value("flow_id", IMS_PLACE(ims_xdm_participant_info_s, flow_id)),
    value("inviting_user", IMS_PLACE(ims_xdm_participant_info_s, inviting_user)),
    value("is_emergency_flag", IMS_PLACE(ims_xdm_participant_info_s, is_emergency_flag)),
    value("is_one_many_one_flag", IMS_PLACE(ims_xdm_participant_info_s, is_one_many_one_flag)),
    value("expiry_time", IMS_PLACE(ims_xdm_participant_info_s, expiry_time)),
    value("is_full_duplex", IMS_PLACE(ims_xdm_participant_info_s, is_full_duplex)),
    sized_array("conf_participant_entry_v",
                IMS_PLACE(ims_xdm_participant_info_s, conf_participant_entry),
                IMS_PLACE(ims_xdm_participant_info_s, num_of_conf_participants), kParticipant),
});

} // namespace ims
