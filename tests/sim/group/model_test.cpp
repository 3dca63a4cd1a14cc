// SPDX-License-Identifier: Apache-2.0
#include "tests/sim/group/fixture.hpp"

namespace sim::test {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::Optional;

using Groups = GroupModelTest;

TEST_F(Groups, AreCreatedFoundAndRemoved) {
    EXPECT_EQ(crew(), sample_group());
    EXPECT_EQ(kept_, model_.state());
    ASSERT_TRUE(model_.create({.uri = "sip:b@example.org", .channel_id = "channel 6"}));
    EXPECT_EQ((*model_.find("", "channel 6"))->uri, "sip:b@example.org");
    EXPECT_EQ((*model_.find(kCrew, "channel 5"))->uri, kCrew);
    EXPECT_EQ(model_.find("", "").code(), Result::kInvalidArgument);
    for (const auto &[uri, channel] :
         {std::pair("sip:no@example.org", ""), {kCrew, "channel 6"}, {"", "channel 7"}})
        EXPECT_EQ(model_.find(uri, channel).code(), Result::kUnknownRecord);
    ASSERT_TRUE(model_.remove(kCrew));
    EXPECT_EQ(model_.find(kCrew, "").code(), Result::kUnknownRecord);
    EXPECT_EQ(kept_.groups.size(), 1U);
    expect_refused([&] { return model_.remove(kCrew); }, Result::kUnknownRecord, "no group");
}

TEST_F(Groups, ThatContradictThemselvesAreRefused) {
    struct Contradiction {
        const char *why;
        std::function<void(GroupDocument &)> make;
    };
    const auto twice = [](auto &list) { list.insert(list.end(), list.front()); };
    const Contradiction contradictions[] = {
        {"\"group_uri\" is missing or empty", [](auto &group) { group.uri.clear(); }},
        {"the member \"tel:+15550100\" comes twice",
         [&](auto &group) { twice(group.members->contacts); }},
        {"a member has no name", [](auto &group) { group.members->contacts[1].uri.clear(); }},
        {"the contact list \"friends\" comes twice",
         [&](auto &group) { twice(group.members->contact_lists); }},
        {"the external contact list \"http",
         [&](auto &group) { twice(group.members->external_lists); }},
        {"the entry reference \"http",
         [&](auto &group) { twice(group.members->entry_references); }},
        {"the member \"tel:+15550100\" comes twice",
         [&](auto &group) { twice(group.properties->active_policy->participants->contacts); }},
        {"the service 1 comes twice",
         [&](auto &group) { twice(group.properties->supported_services); }},
        {"a rule has no name", [](auto &group) { group.rules[1].id.clear(); }},
        {"the rule \"entries\" comes twice", [&](auto &group) { twice(group.rules); }},
        {"in the rule \"entries\" the member \"sip:carol@example.org\" comes twice",
         [&](auto &group) { twice(std::get<RuleContacts>(group.rules[0].identity).contacts); }},
        {"in the rule \"lists\" the contact list",
         [&](auto &group) { twice(std::get<RuleContactLists>(group.rules[1].identity).urls); }},
        {"in the rule \"domains\" the domain \"example.org\" comes twice",
         [&](auto &group) {
             twice(std::get<RuleDomains>(group.rules[2].identity).allowed_domains->names);
         }},
        {"in the rule \"domains\" a member has no name",
         [&](auto &group) {
             auto &except = std::get<RuleDomains>(group.rules[2].identity).except_contacts;
             except->members[0].uri.clear();
         }},
    };
    for (const auto &[why, make] : contradictions) {
        auto group = sample_group("sip:new@example.org");
        make(group);
        expect_refused([&] { return model_.create(group); }, Result::kInvalidArgument, why);
    }
    expect_refused([&] { return model_.create(sample_group()); }, Result::kDuplicate,
                   "there is a group \"sip:crew@example.org\" already");
}

TEST_F(Groups, MembersComeAndGo) {
    const GroupMembers added{{"colleagues"}, {sample_member("tel:+15550101")}, {"x"}, {"y"}};
    ASSERT_TRUE(edit(add_members, added));
    auto expected = sample_members();
    expected.contact_lists.push_back("colleagues");
    expected.contacts.push_back(sample_member("tel:+15550101"));
    expected.external_lists.push_back("x");
    expected.entry_references.push_back("y");
    EXPECT_EQ(crew().members, expected);
    // Only the uri counts.
    ASSERT_TRUE(edit(remove_members,
                     GroupMembers{{"colleagues"}, {{.uri = "tel:+15550101"}}, {"x"}, {"y"}}));
    EXPECT_EQ(crew().members, sample_members());
    ASSERT_TRUE(model_.create({.uri = "sip:b@example.org"}));
    ASSERT_TRUE(model_.edit("sip:b@example.org",
                            [&](GroupDocument &group) { return add_members(group, added); }));
    EXPECT_EQ((*model_.find("sip:b@example.org", ""))->members, added);
}

TEST_F(Groups, MembersAreAddedAndRemovedOnceAndAllOrNone) {
    const auto contact = [](const char *uri) { return GroupMember{.uri = uri}; };
    expect_edit_refused(add_members, GroupMembers{}, Result::kInvalidArgument, "nobody is named");
    expect_edit_refused(remove_members, GroupMembers{}, Result::kInvalidArgument,
                        "nobody is named");
    expect_edit_refused(add_members, {.contacts = {contact("sip:new@x"), contact(kAnn)}},
                        Result::kDuplicate, "the group has the member \"tel:+15550100\" already");
    expect_edit_refused(add_members, {.contacts = {contact("sip:new@x"), contact("sip:new@x")}},
                        Result::kDuplicate, "sip:new@x");
    expect_edit_refused(add_members, {.contacts = {contact("")}}, Result::kInvalidArgument,
                        "a member has no name");
    expect_edit_refused(
        add_members,
        {.contact_lists = {"new"}, .entry_references = {"http://xcap.example.org/entries/2"}},
        Result::kDuplicate, "the entry reference");
    expect_edit_refused(remove_members, {.contacts = {contact(kAnn), contact("sip:no@x")}},
                        Result::kUnknownRecord, "the group has no member \"sip:no@x\"");
    expect_edit_refused(remove_members, {.contact_lists = {"friends"}, .external_lists = {"no"}},
                        Result::kUnknownRecord, "the group has no external contact list \"no\"");
}

TEST_F(Groups, AContactIsReplaced) {
    const GroupMember changed{.uri = kAnn, .type = 5};
    ASSERT_TRUE(edit(replace_contact, changed));
    EXPECT_EQ(crew().members->contacts[0], changed);
    EXPECT_EQ(crew().members->contacts.size(), 2U);
    expect_edit_refused(replace_contact, {.uri = "sip:no@x"}, Result::kUnknownRecord,
                        "no member \"sip:no@x\"");
}

TEST_F(Groups, RulesAreAddedReplacedAndDeleted) {
    const std::vector<GroupRule> rules = {{.id = "new", .identity_type = 9}};
    ASSERT_TRUE(edit(add_rules, rules));
    EXPECT_EQ(crew().rules.back(), rules[0]);
    const std::vector<GroupRule> changed = {{.id = "lists", .is_list_member = true},
                                            {.id = "new", .identity_type = 0}};
    ASSERT_TRUE(edit(replace_rules, changed));
    EXPECT_EQ(crew().rules[1], changed[0]);
    EXPECT_EQ(crew().rules[4], changed[1]);
    ASSERT_TRUE(edit(delete_rule, std::string("lists")));
    EXPECT_EQ(crew().rules.size(), 4U);
    expect_edit_refused(delete_rule, std::string("lists"), Result::kUnknownRecord,
                        "no rule \"lists\"");
    expect_edit_refused(add_rules, rules, Result::kDuplicate, "the rule \"new\" already");
    expect_edit_refused(add_rules, {}, Result::kInvalidArgument, "no rule came");
    expect_edit_refused(add_rules, {{}}, Result::kInvalidArgument, "a rule has no name");
    expect_edit_refused(replace_rules, {}, Result::kInvalidArgument, "no rule came");
    expect_edit_refused(replace_rules, {rules[0], rules[0]}, Result::kInvalidArgument, "twice");
    expect_edit_refused(replace_rules, {{.id = "entries"}, {.id = "lists"}}, Result::kUnknownRecord,
                        "no rule \"lists\"");
}

TEST_F(Groups, PropertiesAreSetAndMadeWhenThereAreNone) {
    ASSERT_TRUE(edit(set_service, SessionService{2, GroupMedia{.video = true}}));
    ASSERT_TRUE(edit(set_service, SessionService{3, std::nullopt}));
    EXPECT_THAT(crew().properties->supported_services,
                ElementsAre(sample_properties().supported_services[0],
                            SupportedService{2, GroupMedia{.video = true}},
                            SupportedService{3, {}}));
    ASSERT_TRUE(edit(set_age_restrictions, std::vector<AgeRestriction>{{"6", "9"}}));
    EXPECT_THAT(crew().properties->age_restrictions, ElementsAre(AgeRestriction{"6", "9"}));
    ASSERT_TRUE(model_.create({.uri = "sip:b@example.org"}));
    ASSERT_TRUE(model_.edit("sip:b@example.org", [](GroupDocument &group) {
        return set_active_policy(group, sample_policy());
    }));
    GroupProperties expected;
    expected.active_policy = sample_policy();
    EXPECT_EQ((*model_.find("sip:b@example.org", ""))->properties, expected);
}

TEST_F(Groups, WhatCannotBeKeptIsRefusedAndForgotten) {
    problem_ = "the disk is full";
    const auto before = model_.state();
    const auto status = model_.remove(kCrew);
    EXPECT_EQ(status.code(), Result::kFailed);
    EXPECT_THAT(status.refusal().reason, HasSubstr("cannot be kept: the disk is full"));
    EXPECT_EQ(model_.state(), before);
}

TEST_F(Groups, AreNeitherTooManyNorTooLarge) {
    GroupDocument large{.uri = "sip:large@example.org", .properties = GroupProperties{}};
    large.properties->subject.assign(GroupModel::kLargestState, 'x');
    expect_refused([&] { return model_.create(large); }, Result::kTooMany, "larger than");
    GroupState full;
    for (std::size_t i = 0; i < GroupModel::kMostGroups; ++i)
        full.groups.push_back({.uri = fmt::format("sip:{}@example.org", i)});
    model_.restore(full);
    expect_refused([&] { return model_.create(sample_group()); }, Result::kTooMany,
                   "1000 groups already");
}

TEST_F(Groups, OfAUserAreThoseWithItAsAMember) {
    ASSERT_TRUE(model_.create({.uri = "sip:b@example.org"}));
    const auto uris = [&](const char *user) {
        std::vector<std::string> found;
        for (const auto &shared : model_.shared_groups(user).groups)
            found.push_back(shared.document->uri);
        return found;
    };
    EXPECT_THAT(uris(""), ElementsAre(kCrew, "sip:b@example.org"));
    // A user is known by its telephone number however that is written.
    for (const auto *ann : {kAnn, "+1 555 0100", "sip:15550100@elsewhere.example.org"})
        EXPECT_THAT(uris(ann), ElementsAre(kCrew)) << ann;
    EXPECT_THAT(uris("sip:bob@example.org"), ElementsAre(kCrew));
    EXPECT_THAT(uris("tel:+15550101"), ElementsAre());
    EXPECT_EQ(model_.shared_groups("").version, std::to_string(model_.state().revision));
}

TEST_F(Groups, ParticipantsAreTheContacts) {
    EXPECT_THAT(model_.participants_of(kCrew), Optional(ElementsAre(kAnn, "sip:bob@example.org")));
    ASSERT_TRUE(model_.create({.uri = "sip:b@example.org"}));
    EXPECT_THAT(model_.participants_of("sip:b@example.org"), Optional(ElementsAre()));
    EXPECT_EQ(model_.participants_of("sip:no@example.org"), std::nullopt);
}

} // namespace
} // namespace sim::test
