// SPDX-License-Identifier: Apache-2.0
// Group documents are created, edited and read.
#include "tests/sim/bus/group_bus.hpp"

#include <csignal>

namespace sim::test {
namespace {

TEST_F(XdmBus, AGroupIsCreatedReadOnEverySlotAndDeleted) {
    EXPECT_EQ(fetch(), "(19, {})");
    EXPECT_EQ(create(sample_group()), "(0,)");
    EXPECT_EQ(fetch(), answer_of(sample_group()));
    EXPECT_EQ(fetch(kCrew, 1), answer_of(sample_group()));
    EXPECT_EQ(call("XdmFetchSharedGroup", "('', 'channel 5')").body, answer_of(sample_group()));
    EXPECT_EQ(create(sample_group()), "(20,)");
    EXPECT_EQ(call("XdmDeleteGroup", "('sip:crew@example.org',)", 1).body, "(0,)");
    EXPECT_EQ(fetch(), "(19, {})");
}

TEST_F(XdmBus, ASmallDocumentGoesRoundTheWireAsItIsSpelled) {
    EXPECT_EQ(call("XdmCreateGroup",
                   "({'group_uri': <'sip:g@x'>, 'group_properties': <@a{sv} {}>, "
                   "'group_member_list': <{'contacts': <{'contacts_v': <[{'uri': <'tel:1'>, "
                   "'stt': <false>, 'active': <true>, 'type': <true>, 'auto_join': <false>, "
                   "'status_v': <@a{sv} {}>}]>, 'num_of_contacts': <int64 1>}>}>, "
                   "'group_rule_set': <@aa{sv} []>},)")
                  .body,
              "(0,)");
    EXPECT_EQ(fetch("sip:g@x"),
              "(0, {'group_uri': <'sip:g@x'>, "
              "'group_member_list': <{"
              "'contact_list': <{'contact_lists_v': <@aa{sv} []>, 'num_of_ct_lists': <int64 0>}>, "
              "'contacts': <{'contacts_v': <[{'uri': <'tel:1'>, 'stt': <false>, 'active': <true>, "
              "'type': <int64 1>, 'auto_join': <false>, 'status_v': <@a{sv} {}>}]>, "
              "'num_of_contacts': <int64 1>}>, "
              "'ext_ref_ct_lists': <{'contact_ref_ct_list_v': <@aa{sv} []>, "
              "'num_of_ct_lists': <int64 0>}>, "
              "'entry_ref_contacts': <{'contact_ref_contact_v': <@aa{sv} []>, "
              "'num_of_ct_ref': <int64 0>}>}>, 'group_rule_set': <@aa{sv} []>})");
}

TEST_F(XdmBus, EveryPartOfADocumentIsEdited) {
    auto group = sample_group();
    auto &properties = *group.properties;
    ASSERT_EQ(create(group), "(0,)");
    const auto written = [](const auto &record) { return text_of(record, GroupForm::kWritten); };
    const auto after = [&](const char *method, const std::string &argument) {
        EXPECT_EQ(edit(method, argument), "(0,)") << method;
        EXPECT_EQ(fetch(), answer_of(group)) << method;
    };
    properties.display_name = "Day crew";
    after("XdmModifyGroupDisplayName", "'Day crew'");
    properties.subject = "";
    after("XdmModifyGroupSubject", "''");
    properties.is_searchable = false;
    after("XdmModifyGroupSearchable", "false");
    properties.inv_members = true;
    after("XdmModifyGroupInviteMembers", "true");
    properties.max_participants = 99;
    after("XdmModifyGroupMaxParticipants", "99");
    properties.auto_grp_advertisements = false;
    after("XdmModifyGroupAutoAdvertisements", "false");
    properties.group_qoe = 4;
    after("XdmModifyGroupQoe", "4");
    properties.active_policy = SessionPolicy{.max_duration = 60};
    after("XdmModifyGroupSessionActivePolicy", written(*properties.active_policy));
    properties.supported_services[1].media = GroupMedia{.pager_mode = true};
    after("XdmModifyGroupSessionServiceList",
          written(SessionService{2, GroupMedia{.pager_mode = true}}));
    properties.age_restrictions = {{"6", "9"}};
    after("XdmModifyGroupAgeRestriction", "[" + written(AgeRestriction{"6", "9"}) + "]");
    const GroupMembers added{.contact_lists = {"colleagues"}, .contacts = {sample_member("tel:2")}};
    group.members->contact_lists.push_back("colleagues");
    group.members->contacts.push_back(sample_member("tel:2"));
    after("XdmAddUserToSharedGroup", written(added));
    const GroupMembers removed{.contacts = {{.uri = "sip:bob@example.org"}}};
    group.members->contacts.erase(group.members->contacts.begin() + 1);
    after("XdmRemoveUserFromSharedGroup", written(removed));
    group.rules.push_back({.id = "new"});
    after("XdmAddGroupRule", "[" + written(group.rules.back()) + "]");
    group.rules.back().is_list_member = true;
    after("XdmModifyGroupRule", "[" + written(group.rules.back()) + "]");
    group.rules.pop_back();
    after("XdmDeleteGroupRule", "'new'");
    // Here the type of a member travels as it is.
    group.members->contacts[0] = {"tel:+15550100", {}, true, false, 5, true, {{}, "south", {}}};
    EXPECT_EQ(call("XdmModifyGroupAttributes", "('sip:crew@example.org', 'tel:+15550100', '', "
                                               "true, false, 5, true, {'position': <'south'>})")
                  .body,
              "(0,)");
    EXPECT_EQ(fetch(), answer_of(group));
    restart(SIGKILL);
    EXPECT_EQ(fetch(), answer_of(group));
}

TEST_F(XdmBus, AllGroupsAreFetchedWithTheirCount) {
    EXPECT_EQ(call("XdmFetchAllSharedGroups", "('',)").body,
              "(0, {'version': <'0'>, 'groups_v': <@aa{sv} []>, 'count': <int64 0>})");
    const GroupDocument small{.uri = "sip:b@x"};
    ASSERT_EQ(create(sample_group()), "(0,)");
    ASSERT_EQ(create(small), "(0,)");
    const auto child = [](const GroupDocument &group) {
        return "{'group_info': <" + text_of(group, GroupForm::kRead) + ">}";
    };
    EXPECT_EQ(call("XdmFetchAllSharedGroups", "('',)").body,
              fmt::format("(0, {{'version': <'2'>, 'groups_v': <[{}, {}]>, 'count': <int64 2>}})",
                          child(sample_group()), child(small)));
    EXPECT_EQ(call("XdmFetchAllSharedGroups", "('sip:bob@example.org',)").body,
              fmt::format("(0, {{'version': <'2'>, 'groups_v': <[{}]>, 'count': <int64 1>}})",
                          child(sample_group())));
}

TEST_F(XdmBus, ParticipantGroupsAreThoseOfTheSlotsUser) {
    ASSERT_EQ(create({.uri = "sip:b@x",
                      .channel_id = "4",
                      .properties = GroupProperties{.display_name = "B", .subject = "news"},
                      .members =
                          GroupMembers{.contacts = {{.uri = "tel:+15550101", .auto_join = true}}}}),
              "(0,)");
    EXPECT_EQ(call("XdmModifyDefaultGroup", "('mine', 'sip:b@x', true)", 1).body, "(0,)");
    const std::string expected =
        "(0, {'version': <'2'>, 'participant_groups_v': <{'num_of_group_lists': <int64 1>, "
        "'group_list_info_v': <[{'group_list_name': <'mine'>, 'num_of_groups': <int64 1>, "
        "'display_name': <'mine'>, 'group_entries_v': <[{'group_list_entry_uri_v': <{'uri_type': "
        "<int64 1>, 'uri': <'sip:b@x'>, 'disp_name': <'B'>, 'is_group_uri': <true>}>, "
        "'entry_uri_usages_v': <{'num_of_common_uri_usages': <int64 1>, 'poc_usage': <'true'>, "
        "'im_usage': <'false'>, 'common_uri_usage_v': <[{'pc_id': <'4'>, 'grp_adv_v': <{'note': "
        "<'news'>, 'grp_v': <{'type': <int64 0>, 'display_name': <'B'>, 'supported_services_v': "
        "<@aa{sv} []>, 'group_uri': <'sip:b@x'>}>}>}]>}>, 'is_default_group': <true>, "
        "'is_start_up': <true>}]>}]>}>})";
    EXPECT_EQ(call("XdmFetchAllParticipantGroups", "('',)", 1).body, expected);
    EXPECT_EQ(call("XdmFetchAllParticipantGroups", "('+15550101',)", 0).body, expected);
    EXPECT_EQ(call("XdmFetchAllParticipantGroups", "('',)", 0).body,
              "(0, {'version': <'2'>, 'participant_groups_v': <{'num_of_group_lists': <int64 0>, "
              "'group_list_info_v': <@aa{sv} []>}>})");
    restart(SIGTERM);
    EXPECT_EQ(call("XdmFetchAllParticipantGroups", "('',)", 1).body, expected);
}

TEST_F(XdmBus, EverySlotHasAProfile) {
    const auto own = call("XdmFetchSharedUserProfile", "('',)").body;
    EXPECT_EQ(own,
              "(0, {'user_uri': <'tel:+15550100'>, 'display_name': <'Example user 0'>, "
              "'birth_day': <'1990-01-01'>, 'gender': <'unspecified'>, 'free_text': <'The user of "
              "slot 0'>, 'qoe': <int64 0>, 'status': <'available'>, 'dispatcher_id': "
              "<'dispatcher@ims.example.org'>, 'client_type': <'handset'>, 'comm_info_v': "
              "<[{'comm_info': <'tel:+15550100'>}, {'comm_info': "
              "<'mailto:user0@ims.example.org'>}]>, 'name_v': <{'given_name': <'Example'>, "
              "'family_name': <'User 0'>, 'middle_name': <''>, 'name_suffix': <''>, "
              "'name_prefix': <''>}>, 'address_v': <{'country': <'Exampleland'>, 'region': "
              "<'North'>, 'locality': <'Exampleton'>, 'area': <'Centre'>, 'street_name': <'Main "
              "Street'>, 'street_number': <'1'>, 'postal_code': <'12345'>}>, 'company_info_v': "
              "<{'assign': <'field team'>, 'position': <'technician'>, 'rank': <'3'>}>, "
              "'hobbies_v': <[{'hobby': <'radio'>}, {'hobby': <'cycling'>}]>, "
              "'favourite_link_v': <[{'link': <'https://www.example.org/'>}]>})");
    EXPECT_EQ(call("XdmFetchSharedUserProfile", "('tel:15550100',)", 1).body, own);
    EXPECT_EQ(call("XdmFetchSharedUserProfile", "('tel:+15550177',)").body, "(19, {})");
}

} // namespace
} // namespace sim::test
