// SPDX-License-Identifier: Apache-2.0
// Where each field of the records of group documents is, as in layout.cpp.
#include "ims.h"

#include <cstddef>

static_assert(sizeof(ims_xdm_media_list_s) == 7);
static_assert(offsetof(ims_xdm_media_list_s, audio) == 0);
static_assert(offsetof(ims_xdm_media_list_s, video) == 1);
static_assert(offsetof(ims_xdm_media_list_s, message) == 2);
static_assert(offsetof(ims_xdm_media_list_s, file_transfer) == 3);
static_assert(offsetof(ims_xdm_media_list_s, group_advertisement) == 4);
static_assert(offsetof(ims_xdm_media_list_s, pager_mode) == 5);
static_assert(offsetof(ims_xdm_media_list_s, poc_speech) == 6);

static_assert(sizeof(ims_xdm_member_status_s) == 24);
static_assert(offsetof(ims_xdm_member_status_s, assign) == 0);
static_assert(offsetof(ims_xdm_member_status_s, position) == 8);
static_assert(offsetof(ims_xdm_member_status_s, rank) == 16);

static_assert(sizeof(ims_xdm_member_entry_s) == 1584);
static_assert(offsetof(ims_xdm_member_entry_s, uri) == 0);
static_assert(offsetof(ims_xdm_member_entry_s, disp_name) == 1544);
static_assert(offsetof(ims_xdm_member_entry_s, status) == 1552);
static_assert(offsetof(ims_xdm_member_entry_s, auto_join) == 1576);
static_assert(offsetof(ims_xdm_member_entry_s, stt) == 1577);
static_assert(offsetof(ims_xdm_member_entry_s, active) == 1578);
static_assert(offsetof(ims_xdm_member_entry_s, type) == 1580);

static_assert(sizeof(ims_xdm_member_list_s) == 64);
static_assert(offsetof(ims_xdm_member_list_s, contact_lists) == 0);
static_assert(offsetof(ims_xdm_member_list_s, num_of_ct_lists) == 8);
static_assert(offsetof(ims_xdm_member_list_s, contacts) == 16);
static_assert(offsetof(ims_xdm_member_list_s, num_of_contacts) == 24);
static_assert(offsetof(ims_xdm_member_list_s, ext_ref) == 32);
static_assert(offsetof(ims_xdm_member_list_s, num_of_ct_lists_ref) == 40);
static_assert(offsetof(ims_xdm_member_list_s, entry_ref) == 48);
static_assert(offsetof(ims_xdm_member_list_s, num_of_ct_ref) == 56);

static_assert(sizeof(ims_xdm_schedule_s) == 24);
static_assert(offsetof(ims_xdm_schedule_s, start_time) == 0);
static_assert(offsetof(ims_xdm_schedule_s, end_time) == 8);
static_assert(offsetof(ims_xdm_schedule_s, next) == 16);

static_assert(sizeof(ims_xdm_session_policy_s) == 24);
static_assert(offsetof(ims_xdm_session_policy_s, min_participants) == 0);
static_assert(offsetof(ims_xdm_session_policy_s, max_duration) == 4);
static_assert(offsetof(ims_xdm_session_policy_s, participants) == 8);
static_assert(offsetof(ims_xdm_session_policy_s, schedule) == 16);

static_assert(sizeof(ims_xdm_supported_service_s) == 24);
static_assert(offsetof(ims_xdm_supported_service_s, service_enabler) == 0);
static_assert(offsetof(ims_xdm_supported_service_s, media_list) == 8);
static_assert(offsetof(ims_xdm_supported_service_s, next) == 16);

static_assert(sizeof(ims_xdm_age_restriction_s) == 24);
static_assert(offsetof(ims_xdm_age_restriction_s, from_age) == 0);
static_assert(offsetof(ims_xdm_age_restriction_s, to_age) == 8);
static_assert(offsetof(ims_xdm_age_restriction_s, next) == 16);

static_assert(sizeof(ims_xdm_group_properties_s) == 416);
static_assert(offsetof(ims_xdm_group_properties_s, display_name) == 0);
static_assert(offsetof(ims_xdm_group_properties_s, subject) == 101);
static_assert(offsetof(ims_xdm_group_properties_s, is_searchable) == 358);
static_assert(offsetof(ims_xdm_group_properties_s, inv_members) == 359);
static_assert(offsetof(ims_xdm_group_properties_s, max_participants) == 360);
static_assert(offsetof(ims_xdm_group_properties_s, as_id) == 368);
static_assert(offsetof(ims_xdm_group_properties_s, area_id) == 376);
static_assert(offsetof(ims_xdm_group_properties_s, auto_grp_advertisements) == 384);
static_assert(offsetof(ims_xdm_group_properties_s, group_qoe) == 388);
static_assert(offsetof(ims_xdm_group_properties_s, group_active_policy) == 392);
static_assert(offsetof(ims_xdm_group_properties_s, supported_services) == 400);
static_assert(offsetof(ims_xdm_group_properties_s, age_restrictions) == 408);

static_assert(sizeof(ims_xdm_identity_entries_s) == 16);
static_assert(offsetof(ims_xdm_identity_entries_s, contacts) == 0);
static_assert(offsetof(ims_xdm_identity_entries_s, num_of_contacts) == 8);

static_assert(sizeof(ims_xdm_identity_urls_s) == 16);
static_assert(offsetof(ims_xdm_identity_urls_s, urls) == 0);
static_assert(offsetof(ims_xdm_identity_urls_s, num_of_contact_list_url) == 8);

static_assert(sizeof(ims_xdm_domain_list_s) == 16);
static_assert(offsetof(ims_xdm_domain_list_s, domains) == 0);
static_assert(offsetof(ims_xdm_domain_list_s, num_of_domain_id) == 8);

static_assert(sizeof(ims_xdm_contact_list_s) == 16);
static_assert(offsetof(ims_xdm_contact_list_s, contacts) == 0);
static_assert(offsetof(ims_xdm_contact_list_s, num_of_contact_id) == 8);

static_assert(sizeof(ims_xdm_identity_domains_s) == 32);
static_assert(offsetof(ims_xdm_identity_domains_s, allow_domain_id) == 0);
static_assert(offsetof(ims_xdm_identity_domains_s, allow_contact_id) == 8);
static_assert(offsetof(ims_xdm_identity_domains_s, except_domain_id) == 16);
static_assert(offsetof(ims_xdm_identity_domains_s, except_contact_id) == 24);

static_assert(sizeof(ims_xdm_group_rule_s) == 152);
static_assert(offsetof(ims_xdm_group_rule_s, rule_id) == 0);
static_assert(offsetof(ims_xdm_group_rule_s, identity) == 104);
static_assert(offsetof(ims_xdm_group_rule_s, rule_identity_type) == 112);
static_assert(offsetof(ims_xdm_group_rule_s, media_list) == 120);
static_assert(offsetof(ims_xdm_group_rule_s, is_list_member) == 128);
static_assert(offsetof(ims_xdm_group_rule_s, allow_conf_state) == 129);
static_assert(offsetof(ims_xdm_group_rule_s, allow_invite_users_dynamically) == 130);
static_assert(offsetof(ims_xdm_group_rule_s, join_handling) == 131);
static_assert(offsetof(ims_xdm_group_rule_s, allow_init_conf) == 132);
static_assert(offsetof(ims_xdm_group_rule_s, allow_sub_conf) == 133);
static_assert(offsetof(ims_xdm_group_rule_s, allow_private_message) == 134);
static_assert(offsetof(ims_xdm_group_rule_s, allow_media_handling) == 135);
static_assert(offsetof(ims_xdm_group_rule_s, allow_anonymity) == 136);
static_assert(offsetof(ims_xdm_group_rule_s, block_group_adver_send) == 137);
static_assert(offsetof(ims_xdm_group_rule_s, is_key_participant) == 138);
static_assert(offsetof(ims_xdm_group_rule_s, remove_media_handling) == 139);
static_assert(offsetof(ims_xdm_group_rule_s, allow_expelling) == 140);
static_assert(offsetof(ims_xdm_group_rule_s, allow_hndl_multiple_streams) == 141);
static_assert(offsetof(ims_xdm_group_rule_s, allow_ltd_participating_info) == 142);
static_assert(offsetof(ims_xdm_group_rule_s, next) == 144);

static_assert(sizeof(ims_xdm_group_info_s) == 176);
static_assert(offsetof(ims_xdm_group_info_s, group_uri) == 0);
static_assert(offsetof(ims_xdm_group_info_s, channel_id) == 136);
static_assert(offsetof(ims_xdm_group_info_s, version) == 144);
static_assert(offsetof(ims_xdm_group_info_s, group_properties) == 152);
static_assert(offsetof(ims_xdm_group_info_s, group_member_list) == 160);
static_assert(offsetof(ims_xdm_group_info_s, group_rule_set) == 168);

static_assert(sizeof(ims_xdm_session_service_s) == 12);
static_assert(offsetof(ims_xdm_session_service_s, group_app) == 0);
static_assert(offsetof(ims_xdm_session_service_s, audio) == 4);
static_assert(offsetof(ims_xdm_session_service_s, video) == 5);
static_assert(offsetof(ims_xdm_session_service_s, message) == 6);
static_assert(offsetof(ims_xdm_session_service_s, file_transfer) == 7);
static_assert(offsetof(ims_xdm_session_service_s, group_advertisement) == 8);
static_assert(offsetof(ims_xdm_session_service_s, pager_mode) == 9);
static_assert(offsetof(ims_xdm_session_service_s, poc_speech) == 10);

static_assert(sizeof(ims_xdm_group_attributes_s) == 16);
static_assert(offsetof(ims_xdm_group_attributes_s, group_uri) == 0);
static_assert(offsetof(ims_xdm_group_attributes_s, member) == 8);

static_assert(sizeof(ims_xdm_default_group_s) == 24);
static_assert(offsetof(ims_xdm_default_group_s, group_list_name) == 0);
static_assert(offsetof(ims_xdm_default_group_s, group_uri) == 8);
static_assert(offsetof(ims_xdm_default_group_s, is_default_group) == 16);

static_assert(sizeof(ims_xdm_shared_group_list_s) == 24);
static_assert(offsetof(ims_xdm_shared_group_list_s, version) == 0);
static_assert(offsetof(ims_xdm_shared_group_list_s, groups) == 8);
static_assert(offsetof(ims_xdm_shared_group_list_s, count) == 16);

static_assert(sizeof(ims_xdm_adv_group_s) == 32);
static_assert(offsetof(ims_xdm_adv_group_s, type) == 0);
static_assert(offsetof(ims_xdm_adv_group_s, display_name) == 8);
static_assert(offsetof(ims_xdm_adv_group_s, supported_services) == 16);
static_assert(offsetof(ims_xdm_adv_group_s, group_uri) == 24);

static_assert(sizeof(ims_xdm_grp_adv_s) == 40);
static_assert(offsetof(ims_xdm_grp_adv_s, note) == 0);
static_assert(offsetof(ims_xdm_grp_adv_s, grp) == 8);

static_assert(sizeof(ims_xdm_common_uri_usage_s) == 48);
static_assert(offsetof(ims_xdm_common_uri_usage_s, pc_id) == 0);
static_assert(offsetof(ims_xdm_common_uri_usage_s, grp_adv) == 8);

static_assert(sizeof(ims_xdm_uri_usages_s) == 32);
static_assert(offsetof(ims_xdm_uri_usages_s, num_of_common_uri_usages) == 0);
static_assert(offsetof(ims_xdm_uri_usages_s, poc_usage) == 8);
static_assert(offsetof(ims_xdm_uri_usages_s, im_usage) == 16);
static_assert(offsetof(ims_xdm_uri_usages_s, common_uri_usage) == 24);

static_assert(sizeof(ims_xdm_entry_uri_s) == 1560);
static_assert(offsetof(ims_xdm_entry_uri_s, uri_type) == 0);
static_assert(offsetof(ims_xdm_entry_uri_s, uri) == 4);
static_assert(offsetof(ims_xdm_entry_uri_s, disp_name) == 1544);
static_assert(offsetof(ims_xdm_entry_uri_s, is_group_uri) == 1552);

static_assert(sizeof(ims_xdm_group_entry_s) == 1600);
static_assert(offsetof(ims_xdm_group_entry_s, group_list_entry_uri) == 0);
static_assert(offsetof(ims_xdm_group_entry_s, entry_uri_usages) == 1560);
static_assert(offsetof(ims_xdm_group_entry_s, is_default_group) == 1592);
static_assert(offsetof(ims_xdm_group_entry_s, is_start_up) == 1593);

static_assert(sizeof(ims_xdm_group_list_s) == 152);
static_assert(offsetof(ims_xdm_group_list_s, group_list_name) == 0);
static_assert(offsetof(ims_xdm_group_list_s, num_of_groups) == 132);
static_assert(offsetof(ims_xdm_group_list_s, display_name) == 136);
static_assert(offsetof(ims_xdm_group_list_s, group_entries) == 144);

static_assert(sizeof(ims_xdm_participant_groups_s) == 24);
static_assert(offsetof(ims_xdm_participant_groups_s, version) == 0);
static_assert(offsetof(ims_xdm_participant_groups_s, num_of_group_lists) == 8);
static_assert(offsetof(ims_xdm_participant_groups_s, group_list_info) == 16);

static_assert(sizeof(ims_xdm_person_name_s) == 40);
static_assert(offsetof(ims_xdm_person_name_s, given_name) == 0);
static_assert(offsetof(ims_xdm_person_name_s, family_name) == 8);
static_assert(offsetof(ims_xdm_person_name_s, middle_name) == 16);
static_assert(offsetof(ims_xdm_person_name_s, name_suffix) == 24);
static_assert(offsetof(ims_xdm_person_name_s, name_prefix) == 32);

static_assert(sizeof(ims_xdm_address_s) == 56);
static_assert(offsetof(ims_xdm_address_s, country) == 0);
static_assert(offsetof(ims_xdm_address_s, region) == 8);
static_assert(offsetof(ims_xdm_address_s, locality) == 16);
static_assert(offsetof(ims_xdm_address_s, area) == 24);
static_assert(offsetof(ims_xdm_address_s, street_name) == 32);
static_assert(offsetof(ims_xdm_address_s, street_number) == 40);
static_assert(offsetof(ims_xdm_address_s, postal_code) == 48);

static_assert(sizeof(ims_xdm_user_profile_s) == 240);
static_assert(offsetof(ims_xdm_user_profile_s, user_uri) == 0);
static_assert(offsetof(ims_xdm_user_profile_s, display_name) == 8);
static_assert(offsetof(ims_xdm_user_profile_s, birth_day) == 16);
static_assert(offsetof(ims_xdm_user_profile_s, gender) == 24);
static_assert(offsetof(ims_xdm_user_profile_s, free_text) == 32);
static_assert(offsetof(ims_xdm_user_profile_s, qoe) == 40);
static_assert(offsetof(ims_xdm_user_profile_s, status) == 48);
static_assert(offsetof(ims_xdm_user_profile_s, dispatcher_id) == 56);
static_assert(offsetof(ims_xdm_user_profile_s, client_type) == 64);
static_assert(offsetof(ims_xdm_user_profile_s, comm_info) == 72);
static_assert(offsetof(ims_xdm_user_profile_s, num_of_comm_info) == 80);
static_assert(offsetof(ims_xdm_user_profile_s, name) == 88);
static_assert(offsetof(ims_xdm_user_profile_s, address) == 128);
static_assert(offsetof(ims_xdm_user_profile_s, company_info) == 184);
static_assert(offsetof(ims_xdm_user_profile_s, hobbies) == 208);
static_assert(offsetof(ims_xdm_user_profile_s, num_of_hobbies) == 216);
static_assert(offsetof(ims_xdm_user_profile_s, favourite_link) == 224);
static_assert(offsetof(ims_xdm_user_profile_s, num_of_favourite_links) == 232);

static_assert(sizeof(ims_xdm_conf_participant_s) == 1608);
static_assert(offsetof(ims_xdm_conf_participant_s, contact_list_entry) == 0);
static_assert(offsetof(ims_xdm_conf_participant_s, user_state) == 1584);
static_assert(offsetof(ims_xdm_conf_participant_s, media_info) == 1592);
static_assert(offsetof(ims_xdm_conf_participant_s, user_qoe) == 1600);

static_assert(sizeof(ims_xdm_participant_info_s) == 120);
static_assert(offsetof(ims_xdm_participant_info_s, list_service_uri) == 0);
static_assert(offsetof(ims_xdm_participant_info_s, session_uri) == 8);
static_assert(offsetof(ims_xdm_participant_info_s, disp_name) == 16);
static_assert(offsetof(ims_xdm_participant_info_s, session_type) == 24);
static_assert(offsetof(ims_xdm_participant_info_s, media_list) == 32);
static_assert(offsetof(ims_xdm_participant_info_s, qoe) == 40);
static_assert(offsetof(ims_xdm_participant_info_s, area_id) == 48);
static_assert(offsetof(ims_xdm_participant_info_s, seu_id) == 56);
static_assert(offsetof(ims_xdm_participant_info_s, flow_id) == 64);
static_assert(offsetof(ims_xdm_participant_info_s, inviting_user) == 72);
static_assert(offsetof(ims_xdm_participant_info_s, is_emergency_flag) == 80);
static_assert(offsetof(ims_xdm_participant_info_s, is_one_many_one_flag) == 81);
static_assert(offsetof(ims_xdm_participant_info_s, expiry_time) == 88);
static_assert(offsetof(ims_xdm_participant_info_s, is_full_duplex) == 96);
static_assert(offsetof(ims_xdm_participant_info_s, conf_participant_entry) == 104);
static_assert(offsetof(ims_xdm_participant_info_s, num_of_conf_participants) == 112);
