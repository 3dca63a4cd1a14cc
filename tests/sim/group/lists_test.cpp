// SPDX-License-Identifier: Apache-2.0
// The lists in which a user finds its groups.
#include "tests/sim/group/fixture.hpp"

namespace sim::test {
namespace {

using testing::ElementsAre;

class GroupListsTest : public GroupModelTest {
  protected:
    void SetUp() override {
        GroupModelTest::SetUp();
        for (const auto *uri : {"sip:b@x", "sip:c@x"})
            ASSERT_TRUE(
                model_.create({.uri = uri, .members = GroupMembers{.contacts = {{.uri = kAnn}}}}));
        ASSERT_TRUE(model_.create({.uri = "sip:others@x"}));
    }
    // "list: group group*", the default groups with a star.
    std::vector<std::string> lists(const char *user = kAnn) {
        std::vector<std::string> told;
        for (const auto &list : model_.participant_groups(user).lists) {
            auto &text = told.emplace_back(list.name + ":");
            for (const auto &entry : list.entries)
                text += " " + entry.uri.uri + (entry.is_default_group ? "*" : "");
        }
        return told;
    }
    void set(const char *list, const char *uri, bool is_default) {
        const auto status = model_.set_default(kAnn, list, uri, is_default);
        EXPECT_TRUE(status) << status.refusal().reason;
    }
};

using GroupLists = GroupListsTest;

TEST_F(GroupLists, HoldEveryGroupOfTheUser) {
    EXPECT_THAT(lists(), ElementsAre("default: sip:crew@example.org sip:b@x sip:c@x"));
    EXPECT_THAT(lists("sip:bob@example.org"), ElementsAre("default: sip:crew@example.org"));
    EXPECT_THAT(lists("sip:nobody@x"), ElementsAre());
    const auto groups = model_.participant_groups(kAnn);
    EXPECT_EQ(groups.version, std::to_string(model_.state().revision));
    const auto &entry = groups.lists[0].entries[0];
    EXPECT_EQ(entry.uri.uri_type, 1);
    EXPECT_EQ(entry.uri.disp_name, "Crew");
    EXPECT_TRUE(entry.uri.is_group_uri);
    EXPECT_TRUE(entry.is_start_up); // the member joins by itself
    EXPECT_EQ(entry.poc_usage, "true");
    EXPECT_EQ(entry.im_usage, "false");
    ASSERT_EQ(entry.usages.size(), 1U);
    EXPECT_EQ(entry.usages[0].pc_id, "channel 5");
    EXPECT_EQ(entry.usages[0].advertisement.note, "Night shift");
    EXPECT_EQ(entry.usages[0].advertisement.supported_services,
              sample_properties().supported_services);
    EXPECT_FALSE(groups.lists[0].entries[1].is_start_up);
    ASSERT_TRUE(edit(set_service, SessionService{9, GroupMedia{.pager_mode = true}}));
    EXPECT_EQ(model_.participant_groups(kAnn).lists[0].entries[0].im_usage, "true");
}

TEST_F(GroupLists, HaveOneDefaultGroupEach) {
    set("default", kCrew, true);
    EXPECT_THAT(lists(), ElementsAre("default: sip:crew@example.org* sip:b@x sip:c@x"));
    set("default", "sip:b@x", true);
    EXPECT_THAT(lists(), ElementsAre("default: sip:crew@example.org sip:b@x* sip:c@x"));
    set("mine", "sip:b@x", true);
    set("mine", "sip:c@x", false);
    set("default", kCrew, true);
    EXPECT_THAT(lists(), ElementsAre("default: sip:crew@example.org*", "mine: sip:b@x* sip:c@x"));
    set("mine", "sip:b@x", false);
    EXPECT_THAT(lists(), ElementsAre("default: sip:crew@example.org*", "mine: sip:b@x sip:c@x"));
    EXPECT_THAT(lists("sip:bob@example.org"), ElementsAre("default: sip:crew@example.org"));
}

TEST_F(GroupLists, ForgetGroupsThatTheUserHasLeft) {
    set("mine", kCrew, true);
    set("mine", "sip:b@x", false);
    ASSERT_TRUE(edit(remove_members, GroupMembers{.contacts = {{.uri = kAnn}}}));
    ASSERT_TRUE(edit(add_members, GroupMembers{.contacts = {{.uri = kAnn}}}));
    EXPECT_THAT(lists(), ElementsAre("default: sip:crew@example.org sip:c@x", "mine: sip:b@x"));
    ASSERT_TRUE(model_.remove("sip:b@x"));
    EXPECT_TRUE(model_.state().placements.empty());
    EXPECT_EQ(find_contradiction(model_.state()), std::nullopt);
}

TEST_F(GroupLists, TakeOnlyGroupsOfTheirUser) {
    const auto set_default = [&](const char *list, const char *uri) {
        return [=, this] { return model_.set_default(kAnn, list, uri, true); };
    };
    expect_refused(set_default("", kCrew), Result::kInvalidArgument, "no group list is named");
    expect_refused(set_default("a", "sip:no@x"), Result::kUnknownRecord, "no group \"sip:no@x\"");
    expect_refused(set_default("a", "sip:others@x"), Result::kUnknownRecord,
                   "tel:+15550100 is no member of the group \"sip:others@x\"");
}

} // namespace
} // namespace sim::test
