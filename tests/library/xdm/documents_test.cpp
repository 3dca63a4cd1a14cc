// SPDX-License-Identifier: Apache-2.0
// What the rows do not show: documents that lack parts, counts that lie, texts that do not fit.
#include "tests/library/xdm/sample.hpp"
#include "tests/support/expectations.hpp"
#include "tests/support/with_peer.hpp"

#include <cstring>

namespace test {
namespace {

class Documents : public WithPeer {
  protected:
    void SetUp() override {
        WithPeer::SetUp();
        for (const char *method : {"XdmCreateGroup", "XdmAddUserToSharedGroup", "XdmAddGroupRule",
                                   "XdmModifyGroupAttributes", "XdmModifyDefaultGroup",
                                   "XdmModifyGroupSessionActivePolicy", "XdmFetchSharedGroup"})
            peer().on(std::string{"org.kelvo.ims.Xdm."} + method, reply("(i)", "(0,)"));
    }

    // The parameters of the one request that the call makes.
    template <typename Call>
    std::string sent(const Call &call) {
        ResponseRecorder recorder;
        EXPECT_EQ(call(ResponseRecorder::callback, &recorder), IMS_ERROR_NONE);
        pump_until([&] { return recorder.count() > 0; }, "the callback");
        const std::vector<test::Call> calls = requests();
        return calls.empty() ? "" : to_text(calls.back().body.get());
    }
    std::string created(const ims_xdm_group_info_s &group) {
        return sent([&](ims_response_cb callback, void *user_data) {
            return ims_xdm_create_group(handle_, &group, callback, user_data);
        });
    }
    std::string added(const ims_xdm_member_list_s &members) {
        return sent([&](ims_response_cb callback, void *user_data) {
            return ims_xdm_add_user_to_shared_group(handle_, "g", &members, callback, user_data);
        });
    }
    std::string added(const ims_xdm_group_rule_s &rule) {
        return sent([&](ims_response_cb callback, void *user_data) {
            return ims_xdm_add_group_rule(handle_, "g", &rule, callback, user_data);
        });
    }
};

bool contains(const std::string &whole, const std::string &part) {
    return whole.find(part) != std::string::npos;
}

// These lines and no others, each as function and message.
void expect_lines(const std::vector<std::pair<std::string, std::string>> &expected) {
    std::vector<std::pair<std::string, std::string>> written;
    for (const LogLine &line : take_log()) {
        EXPECT_EQ(line.file, "ims_xdm.cpp");
        EXPECT_EQ(line.priority, 6);
        written.emplace_back(line.function, line.message);
    }
    EXPECT_EQ(written, expected);
}

TEST_F(Documents, AreSentWithoutTheirPartsAndSaySo) {
    ims_xdm_group_info_s group{};
    EXPECT_EQ(created(group),
              "(a{sv}) ({'group_uri': <''>, 'group_properties': <@a{sv} {}>, "
              "'group_member_list': <@a{sv} {}>, 'group_rule_set': <@aa{sv} []>},)");
    expect_lines({{"__create_group_properties_variant", "group_properties is NULL"},
                  {"__create_group_member_info_variant", "participants is NULL"}});
}

TEST_F(Documents, OfPropertiesAloneHaveEachOfTheirKeysButTheMissingTexts) {
    ims_xdm_group_properties_s properties{};
    ims_xdm_group_info_s group{};
    group.group_properties = &properties;
    EXPECT_TRUE(contains(
        created(group),
        "'group_properties': <{'display_name': <''>, 'subject': <''>, 'is_searchable': <false>, "
        "'inv_members': <false>, 'max_participants': <int64 0>, "
        "'auto_grp_advertisements': <false>, 'group_qoe': <int64 0>, "
        "'group_active_policy': <@a{sv} {}>, 'supported_services': <@aa{sv} []>, "
        "'age_restrictions': <@aa{sv} []>}>"));
    expect_lines({{"__create_supported_services_variant", "supported_services is NULL"},
                  {"__create_group_member_info_variant", "participants is NULL"}});
}

TEST_F(Documents, SendAPolicyWithoutParticipantsAsAnEmptyListAndSayNothing) {
    const ims_xdm_session_policy_s policy{};
    EXPECT_EQ(sent([&](ims_response_cb callback, void *user_data) {
                  return ims_xdm_modify_group_session_active_policy(handle_, "g", &policy, callback,
                                                                    user_data);
              }),
              "(sa{sv}) ('g', {'min_participants': <int64 0>, 'max_duration': <int64 0>, "
              "'participants': <@a{sv} {}>, 'schedule': <@aa{sv} []>})");
    EXPECT_TRUE(take_log().empty());
}

TEST_F(Documents, SendNoMembersWhenTheCountIsNotPositive) {
    for (const int count : {0, -1, G_MININT32}) {
        ims_xdm_member_list_s members = kMembers;
        members.num_of_contacts = count;
        EXPECT_TRUE(contains(added(members), "'contacts_v': <@aa{sv} []>, 'num_of_contacts': "
                                             "<int64 " +
                                                 std::to_string(count) + ">"));
    }
}

TEST_F(Documents, SendNoMembersWhenThereAreNoneWhateverTheCountSays) {
    ims_xdm_member_list_s members = kMembers;
    members.contacts = nullptr;
    members.num_of_contacts = 3;
    members.ext_ref = nullptr;
    members.num_of_ct_lists_ref = 4;
    const std::string tuple = added(members);
    EXPECT_TRUE(contains(tuple, "'contacts_v': <@aa{sv} []>, 'num_of_contacts': <int64 3>"));
    EXPECT_TRUE(
        contains(tuple, "'contact_ref_ct_list': <@aa{sv} []>, 'num_of_ct_lists_ref': <int64 4>"));
}

TEST_F(Documents, SendTheActiveFlagUnderTypeWhateverTheTypeIs) {
    ims_xdm_member_entry_s entry{};
    entry.type = 5;
    ims_xdm_member_list_s members{};
    members.contacts = &entry;
    members.num_of_contacts = 1;
    EXPECT_TRUE(contains(added(members), "'active': <false>, 'type': <false>"));
    entry.type = 0;
    entry.active = true;
    EXPECT_TRUE(contains(added(members), "'active': <true>, 'type': <true>"));
}

TEST_F(Documents, SendFourOfARulesMedia) {
    ims_xdm_media_list_s media{true, true, true, true, true, true, true};
    ims_xdm_group_rule_s rule{};
    rule.media_list = &media;
    const std::string tuple = added(rule);
    EXPECT_TRUE(contains(tuple, "'rule_media_list': <{'audio': <true>, 'video': <true>, "
                                "'message': <true>, 'file_transfer': <true>}>"));
    EXPECT_FALSE(contains(tuple, "pager_mode"));
}

TEST_F(Documents, SendNoIdentityForATypeThatHasNone) {
    ims_xdm_member_entry_s entry = kAlice;
    ims_xdm_identity_entries_s entries{&entry, 1};
    void *cell = &entries;
    ims_xdm_group_rule_s rule{};
    rule.identity = &cell;
    for (const int type : {0, 3, 5, -1}) {
        rule.rule_identity_type = type;
        EXPECT_TRUE(contains(added(rule), "'rule_identity': <@a{sv} {}>, 'rule_identity_type': "
                                          "<int64 " +
                                              std::to_string(type) + ">"));
    }
}

TEST_F(Documents, SendNoIdentityWhereThereIsNone) {
    void *cell = nullptr;
    ims_xdm_group_rule_s rule{};
    for (const int type : {1, 2, 4}) {
        rule.rule_identity_type = type;
        for (void **identity : {static_cast<void **>(nullptr), &cell}) {
            rule.identity = identity;
            EXPECT_TRUE(contains(added(rule), "'rule_identity': <@a{sv} {}>"));
        }
    }
}

TEST_F(Documents, SendNoMoreOfABufferThanIsInIt) {
    ims_xdm_group_info_s group{};
    std::memset(group.group_uri, 'u', sizeof group.group_uri);
    EXPECT_TRUE(contains(created(group), "'group_uri': <'" + std::string(128, 'u') + "'>"));
    EXPECT_EQ(sent([&](ims_response_cb callback, void *user_data) {
                  return ims_xdm_fetch_shared_group(handle_, &group, callback, user_data);
              }),
              "(ss) ('" + std::string(128, 'u') + "', '')"); // a NULL channel is an empty text
}

TEST_F(Documents, SendAttributesWithoutANameAndWithoutAGroup) {
    const ims_xdm_member_entry_s nobody{};
    const ims_xdm_group_attributes_s attributes{nullptr, &nobody};
    EXPECT_EQ(sent([&](ims_response_cb callback, void *user_data) {
                  return ims_xdm_modify_group_attributes(handle_, &attributes, callback, user_data);
              }),
              "(sssbbiba{sv}) ('', '', '', false, false, 0, false, @a{sv} {})");
    const ims_xdm_default_group_s none{};
    EXPECT_EQ(sent([&](ims_response_cb callback, void *user_data) {
                  return ims_xdm_modify_default_group(handle_, &none, callback, user_data);
              }),
              "(ssb) ('', '', false)");
}

// The one refusal that is not logged.
TEST_F(Documents, AreNotSentForAttributesWithoutAMember) {
    const ims_xdm_group_attributes_s attributes{"g", nullptr};
    ResponseRecorder &recorder = lasting_recorder();
    EXPECT_EQ(ims_xdm_modify_group_attributes(handle_, &attributes, ResponseRecorder::callback,
                                              &recorder),
              IMS_ERROR_INVALID_PARAMETER);
    EXPECT_TRUE(take_log().empty());
    EXPECT_TRUE(requests().empty());
    EXPECT_EQ(recorder.count(), 0U);
}

} // namespace
} // namespace test
