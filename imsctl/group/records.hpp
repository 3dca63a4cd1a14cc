// SPDX-License-Identifier: Apache-2.0
// The fields of the records of group documents, each listed once: what makes JSON of them, reads
// them from JSON and writes their schema goes over these lists.
//
// A visitor is called with the name of each field and the field; an array comes with its count, and
// what must not be left out comes to required().
#pragma once

#include <ims.h>

namespace imsctl {

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_media_list_s &media) {
    visit("audio", media.audio);
    visit("video", media.video);
    visit("message", media.message);
    visit("file_transfer", media.file_transfer);
    visit("group_advertisement", media.group_advertisement);
    visit("pager_mode", media.pager_mode);
    visit("poc_speech", media.poc_speech);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_member_status_s &status) {
    visit("assign", status.assign);
    visit("position", status.position);
    visit("rank", status.rank);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_member_entry_s &entry) {
    visit.required("uri", entry.uri);
    visit("disp_name", entry.disp_name);
    visit("status", entry.status);
    visit("auto_join", entry.auto_join);
    visit("stt", entry.stt);
    visit("active", entry.active);
    visit("type", entry.type);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_member_list_s &list) {
    visit("contact_lists", list.contact_lists, list.num_of_ct_lists);
    visit("contacts", list.contacts, list.num_of_contacts);
    visit("ext_ref", list.ext_ref, list.num_of_ct_lists_ref);
    visit("entry_ref", list.entry_ref, list.num_of_ct_ref);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_schedule_s &schedule) {
    visit("start_time", schedule.start_time);
    visit("end_time", schedule.end_time);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_session_policy_s &policy) {
    visit("min_participants", policy.min_participants);
    visit("max_duration", policy.max_duration);
    visit("participants", policy.participants);
    visit("schedule", policy.schedule);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_supported_service_s &service) {
    visit("service_enabler", service.service_enabler);
    visit("media_list", service.media_list);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_age_restriction_s &restriction) {
    visit("from_age", restriction.from_age);
    visit("to_age", restriction.to_age);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_group_properties_s &properties) {
    visit("display_name", properties.display_name);
    visit("subject", properties.subject);
    visit("is_searchable", properties.is_searchable);
    visit("inv_members", properties.inv_members);
    visit("max_participants", properties.max_participants);
    visit("as_id", properties.as_id);
    visit("area_id", properties.area_id);
    visit("auto_grp_advertisements", properties.auto_grp_advertisements);
    visit("group_qoe", properties.group_qoe);
    visit("group_active_policy", properties.group_active_policy);
    visit("supported_services", properties.supported_services);
    visit("age_restrictions", properties.age_restrictions);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_identity_entries_s &entries) {
    visit("contacts", entries.contacts, entries.num_of_contacts);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_identity_urls_s &urls) {
    visit("urls", urls.urls, urls.num_of_contact_list_url);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_domain_list_s &list) {
    visit("domains", list.domains, list.num_of_domain_id);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_contact_list_s &list) {
    visit("contacts", list.contacts, list.num_of_contact_id);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_identity_domains_s &domains) {
    visit("allow_domain_id", domains.allow_domain_id);
    visit("allow_contact_id", domains.allow_contact_id);
    visit("except_domain_id", domains.except_domain_id);
    visit("except_contact_id", domains.except_contact_id);
}

// The key that chooses the record of a rule's identity, and so comes before it.
inline constexpr const char *kIdentityType = "rule_identity_type";

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_group_rule_s &rule) {
    visit.required("rule_id", rule.rule_id);
    visit(kIdentityType, rule.rule_identity_type);
    visit.identity("identity", rule.identity, rule.rule_identity_type);
    visit("media_list", rule.media_list);
    visit("is_list_member", rule.is_list_member);
    visit("allow_conf_state", rule.allow_conf_state);
    visit("allow_invite_users_dynamically", rule.allow_invite_users_dynamically);
    visit("join_handling", rule.join_handling);
    visit("allow_init_conf", rule.allow_init_conf);
    visit("allow_sub_conf", rule.allow_sub_conf);
    visit("allow_private_message", rule.allow_private_message);
    visit("allow_media_handling", rule.allow_media_handling);
    visit("allow_anonymity", rule.allow_anonymity);
    visit("block_group_adver_send", rule.block_group_adver_send);
    visit("is_key_participant", rule.is_key_participant);
    visit("remove_media_handling", rule.remove_media_handling);
    visit("allow_expelling", rule.allow_expelling);
    visit("allow_hndl_multiple_streams", rule.allow_hndl_multiple_streams);
    visit("allow_ltd_participating_info", rule.allow_ltd_participating_info);
}

template <class Visitor>
void visit_fields(Visitor &visit, ims_xdm_group_info_s &group) {
    visit.required("group_uri", group.group_uri);
    visit("channel_id", group.channel_id);
    visit("version", group.version);
    visit("group_properties", group.group_properties);
    visit("group_member_list", group.group_member_list);
    visit("group_rule_set", group.group_rule_set);
}

// Calls `use` with a pointer of the identity record's type; false when the type has none.
template <class Use>
bool with_identity_type(std::int32_t type, const Use &use) {
    switch (type) {
    case IMS_XDM_IDENTITY_ENTRIES:
        use(static_cast<ims_xdm_identity_entries_s *>(nullptr));
        return true;
    case IMS_XDM_IDENTITY_URLS:
        use(static_cast<ims_xdm_identity_urls_s *>(nullptr));
        return true;
    case IMS_XDM_IDENTITY_DOMAINS:
        use(static_cast<ims_xdm_identity_domains_s *>(nullptr));
        return true;
    default:
        return false;
    }
}

// Records that are linked by `next` are a list in JSON.
template <class Record>
concept Linked = requires(Record record) {
    record.next = &record;
};

} // namespace imsctl
