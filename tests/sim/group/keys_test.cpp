// SPDX-License-Identifier: Apache-2.0
// Where everything stands in both forms of a document.
#include "sim/group/reader.hpp"
#include "sim/group/writer.hpp"

#include "tests/sim/group/samples.hpp"

#include <algorithm>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace sim::test {
namespace {

using testing::HasSubstr;
using enum GroupForm;

using Path = std::vector<std::string>;

const GroupValue *value_at(const GroupDictionary &dictionary, std::string_view key) {
    const auto found = std::ranges::find(dictionary, key, &GroupEntry::key);
    return found == dictionary.end() ? nullptr : &found->value;
}

// The keys of the dictionary to which this path leads; of a list, its first one.
std::string keys_at(const GroupDictionary &whole, const Path &path) {
    const GroupDictionary *dictionary = &whole;
    for (const auto &step : path) {
        const auto *value = value_at(*dictionary, step);
        if (!value)
            return "nothing at " + step;
        const auto *list = std::get_if<GroupDictionaries>(&value->content);
        dictionary = list ? &list->front() : &std::get<GroupDictionary>(value->content);
    }
    std::string keys;
    for (const auto &entry : *dictionary)
        keys += (keys.empty() ? "" : " ") + entry.key;
    return keys;
}

TEST(GroupKeys, KeysStandWhereTheWireHasThemInBothForms) {
    const Path members = {"group_member_list"};
    const Path properties = {"group_properties"};
    struct Place {
        Path written;
        const char *keys;
        Path read;
        const char *read_keys; // null: the same
    };
    const Place places[] = {
        {{},
         "group_uri channel_id version group_properties group_member_list group_rule_set",
         {},
         nullptr},
        {properties,
         "display_name subject is_searchable inv_members max_participants as_id area_id "
         "auto_grp_advertisements group_qoe group_active_policy supported_services "
         "age_restrictions",
         properties,
         "display_name subject is_searchable inv_members max_participants as_id area_id "
         "auto_grp_advertisements group_qoe group_session_active_policy supported_services "
         "age_restrictions"},
        {{"group_properties", "group_active_policy"},
         "min_participants max_duration participants schedule",
         {"group_properties", "group_session_active_policy"},
         nullptr},
        {{"group_properties", "group_active_policy", "schedule"},
         "start_time end_time",
         {"group_properties", "group_session_active_policy", "schedule"},
         nullptr},
        {{"group_properties", "supported_services"},
         "service_enabler media_list_v",
         {"group_properties", "supported_services"},
         nullptr},
        {{"group_properties", "supported_services", "media_list_v"},
         "audio video message file_transfer group_advertisement pager_mode poc_speech",
         {"group_properties", "supported_services", "media_list_v"},
         nullptr},
        {{"group_properties", "age_restrictions"},
         "from_age to_age",
         {"group_properties", "age_restrictions"},
         nullptr},
        {members, "contact_lists contacts ext_ref_url entry_ref_url", members,
         "contact_list contacts ext_ref_ct_lists entry_ref_contacts"},
        {{"group_member_list", "contact_lists"},
         "contact_lists_v num_of_ct_lists",
         {"group_member_list", "contact_list"},
         nullptr},
        {{"group_member_list", "contact_lists", "contact_lists_v"},
         "contact_lists",
         {"group_member_list", "contact_list", "contact_lists_v"},
         nullptr},
        {{"group_member_list", "contacts"},
         "contacts_v num_of_contacts",
         {"group_member_list", "contacts"},
         nullptr},
        {{"group_member_list", "contacts", "contacts_v"},
         "uri disp_name stt active type auto_join status_v",
         {"group_member_list", "contacts", "contacts_v"},
         nullptr},
        {{"group_member_list", "contacts", "contacts_v", "status_v"},
         "assign position rank",
         {"group_member_list", "contacts", "contacts_v", "status_v"},
         nullptr},
        {{"group_member_list", "ext_ref_url"},
         "contact_ref_ct_list num_of_ct_lists_ref",
         {"group_member_list", "ext_ref_ct_lists"},
         "contact_ref_ct_list_v num_of_ct_lists"},
        {{"group_member_list", "ext_ref_url", "contact_ref_ct_list"},
         "contact_ref_ct_list",
         {"group_member_list", "ext_ref_ct_lists", "contact_ref_ct_list_v"},
         nullptr},
        {{"group_member_list", "entry_ref_url"},
         "entry_ref_contacts_v num_of_ct_ref",
         {"group_member_list", "entry_ref_contacts"},
         "contact_ref_contact_v num_of_ct_ref"},
        {{"group_member_list", "entry_ref_url", "entry_ref_contacts_v"},
         "contact_ref_contact",
         {"group_member_list", "entry_ref_contacts", "contact_ref_contact_v"},
         nullptr},
        {{"group_rule_set"},
         "rule_id rule_condition rule_action",
         {"group_rule_set"},
         "rule_id rule_condition_v rule_action_v"},
        {{"group_rule_set", "rule_condition"},
         "rule_identity rule_identity_type rule_media_list is_list_member",
         {"group_rule_set", "rule_condition_v"},
         "rule_identity rule_identity_type_v rule_media_list is_list_member"},
        // A rule is written with four of the seven media, and read with all.
        {{"group_rule_set", "rule_condition", "rule_media_list"},
         "audio video message file_transfer",
         {"group_rule_set", "rule_condition_v", "rule_media_list"},
         "audio video message file_transfer group_advertisement pager_mode poc_speech"},
        {{"group_rule_set", "rule_condition", "rule_identity"},
         "contacts num_of_contacts",
         {"group_rule_set", "rule_condition_v", "rule_identity"},
         nullptr},
        {{"group_rule_set", "rule_action"},
         "allow_conf_state allow_invite_users_dynamically join_handling allow_init_conf "
         "allow_sub_conf allow_private_message allow_media_handling allow_anonymity "
         "block_group_adver_send is_key_participant remove_media_handling allow_expelling "
         "allow_hndl_multiple_streams allow_ltd_participating_info",
         {"group_rule_set", "rule_action_v"},
         nullptr},
    };
    const auto written = write_record(sample_group(), kWritten);
    const auto read = write_record(sample_group(), kRead);
    for (const auto &place : places) {
        EXPECT_EQ(keys_at(written, place.written), place.keys);
        EXPECT_EQ(keys_at(read, place.read), place.read_keys ? place.read_keys : place.keys);
    }
}

TEST(GroupKeys, IdentitiesOfListsAndDomainsHaveOtherKeysWhenRead) {
    const auto rules = sample_rules();
    const auto identity_keys = [&](std::size_t rule, GroupForm form, const Path &below = {}) {
        const bool written = form == kWritten;
        Path path = {written ? "rule_condition" : "rule_condition_v", "rule_identity"};
        path.insert(path.end(), below.begin(), below.end());
        return keys_at(write_record(rules[rule], form), path);
    };
    EXPECT_EQ(identity_keys(1, kWritten), "contacts_v num_of_contact_list_url");
    EXPECT_EQ(identity_keys(1, kWritten, {"contacts_v"}), "contacts");
    EXPECT_EQ(identity_keys(1, kRead), "ref_ct_list_url num_of_contact_list_url");
    EXPECT_EQ(identity_keys(1, kRead, {"ref_ct_list_url"}), "ref_ct_list_url");
    constexpr const char *kParts =
        "allow_domain_id allow_contact_id except_domain_id except_contact_id";
    EXPECT_EQ(identity_keys(2, kWritten), kParts);
    // The part that is not set is left out.
    EXPECT_EQ(identity_keys(2, kRead), "allow_domain_id except_domain_id except_contact_id");
    EXPECT_EQ(identity_keys(2, kWritten, {"allow_contact_id"}), "");
    EXPECT_EQ(identity_keys(2, kWritten, {"allow_domain_id"}), "num_of_domain_id contacts_v");
    EXPECT_EQ(identity_keys(2, kWritten, {"allow_domain_id", "contacts_v"}), "contacts");
    EXPECT_EQ(identity_keys(2, kRead, {"allow_domain_id"}), "num_of_domain_id domain_id_v");
    EXPECT_EQ(identity_keys(2, kRead, {"allow_domain_id", "domain_id_v"}), "domain_id");
    EXPECT_EQ(identity_keys(2, kWritten, {"except_contact_id"}), "num_of_contact_id contacts");
    EXPECT_EQ(identity_keys(2, kRead, {"except_contact_id"}), "num_of_contact_id contacts_v");
    EXPECT_EQ(identity_keys(3, kWritten), "");
    EXPECT_EQ(identity_keys(3, kRead), "nothing at rule_identity");
}

TEST(GroupKeys, TheTypeOfAMemberIsWrittenAsAFlag) {
    const auto type_of = [](const GroupMember &member, GroupForm form) {
        return value_at(write_record(member, form), "type")->content;
    };
    const GroupMember member{.uri = "sip:a@example.org", .type = 5};
    EXPECT_EQ(std::get<bool>(type_of(member, kWritten)), true);
    EXPECT_EQ(std::get<std::int64_t>(type_of(member, kRead)), 5);
    const auto read = [](GroupForm form, GroupValue type) {
        return read_record<GroupMember>({{"uri", {"x"}}, {"type", std::move(type)}}, form);
    };
    EXPECT_EQ(read(kWritten, {true})->type, 1);
    EXPECT_EQ(read(kWritten, {false})->type, 0);
    EXPECT_THAT(read(kWritten, {std::int64_t{1}}).refusal().reason,
                HasSubstr("type is \"b\" here, and \"x\" came"));
}

} // namespace
} // namespace sim::test
