// SPDX-License-Identifier: Apache-2.0
#include "tests/library/xdm/comparison.hpp"

#include "tests/library/xdm/answered.hpp"

#include <gtest/gtest.h>

#include <cstring>

namespace test {
namespace {

// The record that a missing one comes back as.
template <typename Record>
const Record &or_empty(const Record *record) {
    static const Record empty{};
    return record ? *record : empty;
}

void expect_same(const ims_xdm_member_entry_s &sent, const ims_xdm_member_entry_s &received) {
    EXPECT_STREQ(sent.uri, received.uri);
    EXPECT_STREQ(sent.disp_name, received.disp_name);
    EXPECT_STREQ(sent.status.assign, received.status.assign);
    EXPECT_STREQ(sent.status.position, received.status.position);
    EXPECT_STREQ(sent.status.rank, received.status.rank);
    EXPECT_EQ(sent.auto_join, received.auto_join);
    EXPECT_EQ(sent.stt, received.stt);
    EXPECT_EQ(sent.active, received.active);
    EXPECT_EQ(received.type, kAnsweredType);
}

void expect_same(const char *sent, const char *received) {
    EXPECT_STREQ(sent, received);
}

// The count comes back as it was sent; the elements only when there were as many.
template <typename Element>
void expect_same(const Element *sent, std::int32_t sent_count, const Element *received,
                 std::int32_t received_count) {
    EXPECT_EQ(sent_count, received_count);
    if (sent == nullptr || sent_count < 1) {
        EXPECT_EQ(received, nullptr);
        return;
    }
    ASSERT_NE(received, nullptr);
    for (std::int32_t at = 0; at < sent_count; ++at)
        expect_same(sent[at], received[at]);
}

void expect_same(const ims_xdm_member_list_s &sent, const ims_xdm_member_list_s &received) {
    expect_same(sent.contact_lists, sent.num_of_ct_lists, received.contact_lists,
                received.num_of_ct_lists);
    expect_same(sent.contacts, sent.num_of_contacts, received.contacts, received.num_of_contacts);
    expect_same(sent.ext_ref, sent.num_of_ct_lists_ref, received.ext_ref,
                received.num_of_ct_lists_ref);
    expect_same(sent.entry_ref, sent.num_of_ct_ref, received.entry_ref, received.num_of_ct_ref);
}

void expect_same(const ims_xdm_schedule_s &sent, const ims_xdm_schedule_s &received) {
    EXPECT_STREQ(sent.start_time, received.start_time);
    EXPECT_STREQ(sent.end_time, received.end_time);
}

void expect_same(const ims_xdm_age_restriction_s &sent, const ims_xdm_age_restriction_s &received) {
    EXPECT_STREQ(sent.from_age, received.from_age);
    EXPECT_STREQ(sent.to_age, received.to_age);
}

void expect_same(const ims_xdm_supported_service_s &sent,
                 const ims_xdm_supported_service_s &received) {
    EXPECT_EQ(sent.service_enabler, received.service_enabler);
    ASSERT_EQ(sent.media_list == nullptr, received.media_list == nullptr);
    if (sent.media_list) {
        EXPECT_EQ(std::memcmp(sent.media_list, received.media_list, sizeof *sent.media_list), 0);
    }
}

void expect_same(const ims_xdm_group_rule_s &sent, const ims_xdm_group_rule_s &received);

// Both chains have the same length, and their links are the same.
template <typename Link>
void expect_same_chain(const Link *sent, const Link *received) {
    for (; sent != nullptr && received != nullptr; sent = sent->next, received = received->next)
        expect_same(*sent, *received);
    EXPECT_EQ(sent, nullptr);
    EXPECT_EQ(received, nullptr);
}

void expect_same(const ims_xdm_session_policy_s &sent, const ims_xdm_session_policy_s &received) {
    EXPECT_EQ(sent.min_participants, received.min_participants);
    EXPECT_EQ(sent.max_duration, received.max_duration);
    expect_same(or_empty(sent.participants), or_empty(received.participants));
    expect_same_chain(sent.schedule, received.schedule);
}

void expect_same(const ims_xdm_group_properties_s &sent,
                 const ims_xdm_group_properties_s &received) {
    EXPECT_STREQ(sent.display_name, received.display_name);
    EXPECT_STREQ(sent.subject, received.subject);
    EXPECT_EQ(sent.is_searchable, received.is_searchable);
    EXPECT_EQ(sent.inv_members, received.inv_members);
    EXPECT_EQ(sent.max_participants, received.max_participants);
    EXPECT_STREQ(sent.as_id, received.as_id);
    EXPECT_STREQ(sent.area_id, received.area_id);
    EXPECT_EQ(sent.auto_grp_advertisements, received.auto_grp_advertisements);
    EXPECT_EQ(sent.group_qoe, received.group_qoe);
    expect_same(or_empty(sent.group_active_policy), or_empty(received.group_active_policy));
    expect_same_chain(sent.supported_services, received.supported_services);
    expect_same_chain(sent.age_restrictions, received.age_restrictions);
}

void expect_same(const ims_xdm_identity_domains_s &sent,
                 const ims_xdm_identity_domains_s &received) {
    const auto expect_same_domains = [](const auto *one, const auto *other) {
        expect_same(or_empty(one).domains, or_empty(one).num_of_domain_id, or_empty(other).domains,
                    or_empty(other).num_of_domain_id);
    };
    const auto expect_same_contacts = [](const auto *one, const auto *other) {
        expect_same(or_empty(one).contacts, or_empty(one).num_of_contact_id,
                    or_empty(other).contacts, or_empty(other).num_of_contact_id);
    };
    expect_same_domains(sent.allow_domain_id, received.allow_domain_id);
    expect_same_contacts(sent.allow_contact_id, received.allow_contact_id);
    expect_same_domains(sent.except_domain_id, received.except_domain_id);
    expect_same_contacts(sent.except_contact_id, received.except_contact_id);
}

template <typename Identity>
const Identity &identity_of(const ims_xdm_group_rule_s &rule) {
    return or_empty(rule.identity ? static_cast<const Identity *>(*rule.identity) : nullptr);
}

void expect_same_identity(const ims_xdm_group_rule_s &sent, const ims_xdm_group_rule_s &received) {
    switch (sent.rule_identity_type) {
    case IMS_XDM_IDENTITY_ENTRIES: {
        const auto &one = identity_of<ims_xdm_identity_entries_s>(sent);
        const auto &other = identity_of<ims_xdm_identity_entries_s>(received);
        expect_same(one.contacts, one.num_of_contacts, other.contacts, other.num_of_contacts);
        break;
    }
    case IMS_XDM_IDENTITY_URLS: {
        const auto &one = identity_of<ims_xdm_identity_urls_s>(sent);
        const auto &other = identity_of<ims_xdm_identity_urls_s>(received);
        expect_same(one.urls, one.num_of_contact_list_url, other.urls,
                    other.num_of_contact_list_url);
        break;
    }
    case IMS_XDM_IDENTITY_DOMAINS:
        expect_same(identity_of<ims_xdm_identity_domains_s>(sent),
                    identity_of<ims_xdm_identity_domains_s>(received));
        break;
    default:
        EXPECT_EQ(received.identity, nullptr);
    }
}

void expect_same(const ims_xdm_group_rule_s &sent, const ims_xdm_group_rule_s &received) {
    EXPECT_STREQ(sent.rule_id, received.rule_id);
    EXPECT_EQ(sent.rule_identity_type, received.rule_identity_type);
    expect_same_identity(sent, received);
    const ims_xdm_media_list_s &media = or_empty(sent.media_list);
    const ims_xdm_media_list_s four{media.audio, media.video, media.message, media.file_transfer,
                                    false,       false,       false};
    EXPECT_EQ(std::memcmp(&four, &or_empty(received.media_list), sizeof four), 0);
    const auto flags = [](const ims_xdm_group_rule_s &rule) {
        return std::string(reinterpret_cast<const char *>(&rule.is_list_member),
                           reinterpret_cast<const char *>(&rule.allow_ltd_participating_info) + 1);
    };
    EXPECT_EQ(flags(sent), flags(received));
}

} // namespace

void expect_same_document(const ims_xdm_group_info_s &sent, const ims_xdm_group_info_s &received) {
    EXPECT_STREQ(sent.group_uri, received.group_uri);
    EXPECT_STREQ(sent.channel_id, received.channel_id);
    EXPECT_STREQ(sent.version, received.version);
    if (sent.group_properties)
        expect_same(*sent.group_properties, or_empty(received.group_properties));
    expect_same(or_empty(sent.group_member_list), or_empty(received.group_member_list));
    expect_same_chain(sent.group_rule_set, received.group_rule_set);
}

} // namespace test
