// SPDX-License-Identifier: Apache-2.0
// The keys of group documents and of what belongs to them, in the order in which they are sent.
// Where the service uses another key in what it sends, both stand side by side: {sent, read}.
#pragma once

#include "ims_xdm.h"
#include "wire/record_tree.hpp"
#include "wire/signature.hpp"

namespace ims {

// A list of texts has a dictionary for each text, with this one key.
template <Literal Key>
inline constexpr auto kTextUnder = record_tree({value(Key.text, kElement<char *>)});

template <typename Record>
inline constexpr auto kMediaKeys = record_tree({
    value("audio", IMS_PLACE(Record, audio)),
    value("video", IMS_PLACE(Record, video)),
    value("message", IMS_PLACE(Record, message)),
    value("file_transfer", IMS_PLACE(Record, file_transfer)),
    value("group_advertisement", IMS_PLACE(Record, group_advertisement)),
    value("pager_mode", IMS_PLACE(Record, pager_mode)),
    value("poc_speech", IMS_PLACE(Record, poc_speech)),
});
inline constexpr const auto &kMediaList = kMediaKeys<ims_xdm_media_list_s>;

// The service takes four media in a rule, and sends all.
inline constexpr auto kRuleMedia = record_tree({
    value("audio", IMS_PLACE(ims_xdm_media_list_s, audio)),
    value("video", IMS_PLACE(ims_xdm_media_list_s, video)),
    value("message", IMS_PLACE(ims_xdm_media_list_s, message)),
    value("file_transfer", IMS_PLACE(ims_xdm_media_list_s, file_transfer)),
    value(only_read("group_advertisement"), IMS_PLACE(ims_xdm_media_list_s, group_advertisement)),
    value(only_read("pager_mode"), IMS_PLACE(ims_xdm_media_list_s, pager_mode)),
    value(only_read("poc_speech"), IMS_PLACE(ims_xdm_media_list_s, poc_speech)),
});

inline constexpr auto kMemberStatus = record_tree({
    value("assign", IMS_PLACE(ims_xdm_member_status_s, assign)),
    value("position", IMS_PLACE(ims_xdm_member_status_s, position)),
    value("rank", IMS_PLACE(ims_xdm_member_status_s, rank)),
});

// The service takes the active flag a second time, as "type", and sends a number under that key.
inline constexpr auto kMemberEntry = record_tree({
    value("uri", IMS_PLACE(ims_xdm_member_entry_s, uri)),
    value("disp_name", IMS_PLACE(ims_xdm_member_entry_s, disp_name)),
    value("stt", IMS_PLACE(ims_xdm_member_entry_s, stt)),
    value("active", IMS_PLACE(ims_xdm_member_entry_s, active)),
    value(only_sent("type"), IMS_PLACE(ims_xdm_member_entry_s, active)),
    value(only_read("type"), IMS_PLACE(ims_xdm_member_entry_s, type)),
    value("auto_join", IMS_PLACE(ims_xdm_member_entry_s, auto_join)),
    part("status_v", IMS_PLACE(ims_xdm_member_entry_s, status), kMemberStatus),
});

inline constexpr auto kContactLists = record_tree({
    array("contact_lists_v", IMS_PLACE(ims_xdm_member_list_s, contact_lists),
          IMS_PLACE(ims_xdm_member_list_s, num_of_ct_lists), kTextUnder<"contact_lists">),
    value("num_of_ct_lists", IMS_PLACE(ims_xdm_member_list_s, num_of_ct_lists)),
});
inline constexpr auto kContacts = record_tree({
    array("contacts_v", IMS_PLACE(ims_xdm_member_list_s, contacts),
          IMS_PLACE(ims_xdm_member_list_s, num_of_contacts), kMemberEntry),
    value("num_of_contacts", IMS_PLACE(ims_xdm_member_list_s, num_of_contacts)),
});
inline constexpr auto kExternalReferences = record_tree({
    array({"contact_ref_ct_list", "contact_ref_ct_list_v"},
          IMS_PLACE(ims_xdm_member_list_s, ext_ref),
          IMS_PLACE(ims_xdm_member_list_s, num_of_ct_lists_ref), kTextUnder<"contact_ref_ct_list">),
    value({"num_of_ct_lists_ref", "num_of_ct_lists"},
          IMS_PLACE(ims_xdm_member_list_s, num_of_ct_lists_ref)),
});
inline constexpr auto kEntryReferences = record_tree({
    array({"entry_ref_contacts_v", "contact_ref_contact_v"},
          IMS_PLACE(ims_xdm_member_list_s, entry_ref),
          IMS_PLACE(ims_xdm_member_list_s, num_of_ct_ref), kTextUnder<"contact_ref_contact">),
    value("num_of_ct_ref", IMS_PLACE(ims_xdm_member_list_s, num_of_ct_ref)),
});
inline constexpr auto kMemberList = record_tree({
    group({"contact_lists", "contact_list"}, kContactLists),
    group("contacts", kContacts),
    group({"ext_ref_url", "ext_ref_ct_lists"}, kExternalReferences),
    group({"entry_ref_url", "entry_ref_contacts"}, kEntryReferences),
});

inline constexpr auto kSchedule = record_tree({
    value("start_time", IMS_PLACE(ims_xdm_schedule_s, start_time)),
    value("end_time", IMS_PLACE(ims_xdm_schedule_s, end_time)),
});
inline constexpr auto kSessionPolicy = record_tree({
    value("min_participants", IMS_PLACE(ims_xdm_session_policy_s, min_participants)),
    value("max_duration", IMS_PLACE(ims_xdm_session_policy_s, max_duration)),
    pointer("participants", IMS_PLACE(ims_xdm_session_policy_s, participants), kMemberList),
    chain("schedule", IMS_PLACE(ims_xdm_session_policy_s, schedule), kSchedule),
});

inline constexpr auto kSupportedService = record_tree({
    value("service_enabler", IMS_PLACE(ims_xdm_supported_service_s, service_enabler)),
    single("media_list_v", IMS_PLACE(ims_xdm_supported_service_s, media_list), kMediaList),
});

inline constexpr auto kAgeRestriction = record_tree({
    value("from_age", IMS_PLACE(ims_xdm_age_restriction_s, from_age)),
    value("to_age", IMS_PLACE(ims_xdm_age_restriction_s, to_age)),
});

inline constexpr auto kGroupProperties = record_tree({
    value("display_name", IMS_PLACE(ims_xdm_group_properties_s, display_name)),
    value("subject", IMS_PLACE(ims_xdm_group_properties_s, subject)),
    value("is_searchable", IMS_PLACE(ims_xdm_group_properties_s, is_searchable)),
    value("inv_members", IMS_PLACE(ims_xdm_group_properties_s, inv_members)),
    value("max_participants", IMS_PLACE(ims_xdm_group_properties_s, max_participants)),
    value("as_id", IMS_PLACE(ims_xdm_group_properties_s, as_id)),
    value("area_id", IMS_PLACE(ims_xdm_group_properties_s, area_id)),
    value("auto_grp_advertisements",
          IMS_PLACE(ims_xdm_group_properties_s, auto_grp_advertisements)),
    value("group_qoe", IMS_PLACE(ims_xdm_group_properties_s, group_qoe)),
    pointer({"group_active_policy", "group_session_active_policy"},
            IMS_PLACE(ims_xdm_group_properties_s, group_active_policy), kSessionPolicy),
    chain("supported_services", IMS_PLACE(ims_xdm_group_properties_s, supported_services),
          kSupportedService),
    chain("age_restrictions", IMS_PLACE(ims_xdm_group_properties_s, age_restrictions),
          kAgeRestriction),
});

inline constexpr auto kIdentityEntries = record_tree({
    array("contacts", IMS_PLACE(ims_xdm_identity_entries_s, contacts),
          IMS_PLACE(ims_xdm_identity_entries_s, num_of_contacts), kMemberEntry),
    value("num_of_contacts", IMS_PLACE(ims_xdm_identity_entries_s, num_of_contacts)),
});
inline constexpr auto kListUrl =
    record_tree({value({"contacts", "ref_ct_list_url"}, kElement<char *>)});
inline constexpr auto kIdentityUrls = record_tree({
    array({"contacts_v", "ref_ct_list_url"}, IMS_PLACE(ims_xdm_identity_urls_s, urls),
          IMS_PLACE(ims_xdm_identity_urls_s, num_of_contact_list_url), kListUrl),
    value("num_of_contact_list_url", IMS_PLACE(ims_xdm_identity_urls_s, num_of_contact_list_url)),
});
inline constexpr auto kDomain =
    record_tree({value_by_any_key({"contacts", "domain_id"}, kElement<char *>)});
inline constexpr auto kDomains = record_tree({
    value("num_of_domain_id", IMS_PLACE(ims_xdm_domain_list_s, num_of_domain_id)),
    array({"contacts_v", "domain_id_v"}, IMS_PLACE(ims_xdm_domain_list_s, domains),
          IMS_PLACE(ims_xdm_domain_list_s, num_of_domain_id), kDomain),
});
inline constexpr auto kRuleContacts = record_tree({
    value("num_of_contact_id", IMS_PLACE(ims_xdm_contact_list_s, num_of_contact_id)),
    array({"contacts", "contacts_v"}, IMS_PLACE(ims_xdm_contact_list_s, contacts),
          IMS_PLACE(ims_xdm_contact_list_s, num_of_contact_id), kMemberEntry),
});
inline constexpr auto kIdentityDomains = record_tree({
    pointer("allow_domain_id", IMS_PLACE(ims_xdm_identity_domains_s, allow_domain_id), kDomains),
    pointer("allow_contact_id", IMS_PLACE(ims_xdm_identity_domains_s, allow_contact_id),
            kRuleContacts),
    pointer("except_domain_id", IMS_PLACE(ims_xdm_identity_domains_s, except_domain_id), kDomains),
    pointer("except_contact_id", IMS_PLACE(ims_xdm_identity_domains_s, except_contact_id),
            kRuleContacts),
});
inline constexpr TreeChoice kIdentities[] = {
    {IMS_XDM_IDENTITY_ENTRIES, kIdentityEntries.view()},
    {IMS_XDM_IDENTITY_URLS, kIdentityUrls.view()},
    {IMS_XDM_IDENTITY_DOMAINS, kIdentityDomains.view()},
};

inline constexpr auto kRuleCondition = record_tree({
    choice("rule_identity", IMS_PLACE(ims_xdm_group_rule_s, identity),
           IMS_PLACE(ims_xdm_group_rule_s, rule_identity_type), kIdentities),
    value({"rule_identity_type", "rule_identity_type_v"},
          IMS_PLACE(ims_xdm_group_rule_s, rule_identity_type)),
    pointer("rule_media_list", IMS_PLACE(ims_xdm_group_rule_s, media_list), kRuleMedia),
    value("is_list_member", IMS_PLACE(ims_xdm_group_rule_s, is_list_member)),
});
inline constexpr auto kRuleAction = record_tree({
    value("allow_conf_state", IMS_PLACE(ims_xdm_group_rule_s, allow_conf_state)),
    value("allow_invite_users_dynamically",
          IMS_PLACE(ims_xdm_group_rule_s, allow_invite_users_dynamically)),
    value("join_handling", IMS_PLACE(ims_xdm_group_rule_s, join_handling)),
    value("allow_init_conf", IMS_PLACE(ims_xdm_group_rule_s, allow_init_conf)),
    value("allow_sub_conf", IMS_PLACE(ims_xdm_group_rule_s, allow_sub_conf)),
    value("allow_private_message", IMS_PLACE(ims_xdm_group_rule_s, allow_private_message)),
    value("allow_media_handling", IMS_PLACE(ims_xdm_group_rule_s, allow_media_handling)),
    value("allow_anonymity", IMS_PLACE(ims_xdm_group_rule_s, allow_anonymity)),
    value("block_group_adver_send", IMS_PLACE(ims_xdm_group_rule_s, block_group_adver_send)),
    value("is_key_participant", IMS_PLACE(ims_xdm_group_rule_s, is_key_participant)),
    value("remove_media_handling", IMS_PLACE(ims_xdm_group_rule_s, remove_media_handling)),
    value("allow_expelling", IMS_PLACE(ims_xdm_group_rule_s, allow_expelling)),
    value("allow_hndl_multiple_streams",
          IMS_PLACE(ims_xdm_group_rule_s, allow_hndl_multiple_streams)),
    value("allow_ltd_participating_info",
          IMS_PLACE(ims_xdm_group_rule_s, allow_ltd_participating_info)),
});
inline constexpr auto kGroupRule = record_tree({
    value("rule_id", IMS_PLACE(ims_xdm_group_rule_s, rule_id)),
    group({"rule_condition", "rule_condition_v"}, kRuleCondition),
    group({"rule_action", "rule_action_v"}, kRuleAction),
});

inline constexpr auto kGroupInfo = record_tree({
    value("group_uri", IMS_PLACE(ims_xdm_group_info_s, group_uri)),
    value("channel_id", IMS_PLACE(ims_xdm_group_info_s, channel_id)),
    value("version", IMS_PLACE(ims_xdm_group_info_s, version)),
    pointer("group_properties", IMS_PLACE(ims_xdm_group_info_s, group_properties),
            kGroupProperties),
    pointer("group_member_list", IMS_PLACE(ims_xdm_group_info_s, group_member_list), kMemberList),
    chain("group_rule_set", IMS_PLACE(ims_xdm_group_info_s, group_rule_set), kGroupRule),
});

// Only sent.
inline constexpr auto kSessionService = record_tree({
    value("group_app", IMS_PLACE(ims_xdm_session_service_s, group_app)),
    group("group_media_list", kMediaKeys<ims_xdm_session_service_s>),
});

} // namespace ims
