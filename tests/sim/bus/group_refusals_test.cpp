// SPDX-License-Identifier: Apache-2.0
// What is refused to those who ask for group documents.
#include "tests/sim/bus/group_bus.hpp"

#include <csignal>

namespace sim::test {
namespace {

using testing::HasSubstr;

TEST_F(XdmBus, RefusalsAreLoggedWithTheirReasonAndChangeNothing) {
    struct Refused {
        const char *method;
        const char *arguments;
        const char *reply;
        const char *why;
    };
    constexpr Refused kRefused[] = {
        {"XdmCreateGroup", "(@a{sv} {},)", "(10,)", "\"group_uri\" is missing or empty"},
        {"XdmCreateGroup", "({'group_uri': <1>},)", "(10,)",
         "group_uri is \"s\" here, and \"i\" came"},
        {"XdmCreateGroup", "({'group_uri': <'a'>, 'version': <int64 1>},)", "(10,)",
         "version is \"s\" here, and \"x\" came"},
        {"XdmCreateGroup",
         "({'group_uri': <'a'>, 'group_member_list': <{'contacts': <{'contacts_v': <@aa{sv} []>, "
         "'num_of_contacts': <int64 3>}>}>},)",
         "(10,)", "group_member_list.contacts.num_of_contacts says 3, and 0 came"},
        // The keys of answers are no keys of requests.
        {"XdmCreateGroup", "({'group_uri': <'a'>, 'group_member_list': <{'contact_list': <1>}>},)",
         "(10,)", "group_member_list.contact_list is no key here"},
        {"XdmCreateGroup", "({'group_uri': <'a'>, 'group_rule_set': <@av []>},)", "(10,)",
         "group_rule_set is \"aa{sv}\" here, and \"av\" came"},
        {"XdmCreateGroup", "({'group_uri': <'a'>, 'group_rule_set': <[{'rule_id': <<<7>>>}]>},)",
         "(10,)", "group_rule_set[0].rule_id is \"s\" here, and \"i\" came"},
        {"XdmDeleteGroup", "('a',)", "(19,)", "there is no group \"a\""},
        {"XdmFetchSharedGroup", "('', '')", "(10, {})", "neither a group nor a channel"},
        {"XdmFetchSharedGroup", "('sip:crew@example.org', 'x')", "(19, {})", "the channel \"x\""},
        {"XdmModifyGroupSubject", "('a', 'b')", "(19,)", "there is no group \"a\""},
        {"XdmModifyGroupQoe", "('', 1)", "(19,)", "there is no group \"\""},
        {"XdmAddUserToSharedGroup", "('sip:crew@example.org', @a{sv} {})", "(10,)",
         "nobody is named"},
        {"XdmAddUserToSharedGroup",
         "('sip:crew@example.org', {'contact_lists': <{'contact_lists_v': <[{'contact_lists': "
         "<'friends'>}]>, 'num_of_ct_lists': <int64 1>}>})",
         "(20,)", "the contact list \"friends\" already"},
        {"XdmRemoveUserFromSharedGroup",
         "('sip:crew@example.org', {'contact_lists': <{'contact_lists_v': <[{'contact_lists': "
         "<'x'>}]>, 'num_of_ct_lists': <int64 1>}>})",
         "(19,)", "no contact list \"x\""},
        {"XdmAddGroupRule", "('sip:crew@example.org', @aa{sv} [])", "(10,)", "no rule came"},
        {"XdmModifyGroupRule", "('sip:crew@example.org', [{'rule_id': <'x'>}])", "(19,)",
         "no rule \"x\""},
        {"XdmDeleteGroupRule", "('sip:crew@example.org', 'x')", "(19,)", "no rule \"x\""},
        {"XdmModifyGroupSessionActivePolicy",
         "('sip:crew@example.org', {'min_participants': <'2'>})", "(10,)",
         "min_participants is \"x\" here, and \"s\" came"},
        {"XdmModifyGroupSessionServiceList", "('sip:crew@example.org', {'media': <true>})", "(10,)",
         "media is no key here"},
        {"XdmModifyGroupAgeRestriction", "('sip:crew@example.org', [{'from_age': <18>}])", "(10,)",
         "[0].from_age is \"s\" here, and \"i\" came"},
        {"XdmModifyGroupAttributes",
         "('sip:crew@example.org', 'x', '', true, true, 1, true, @a{sv} {})", "(19,)",
         "no member \"x\""},
        {"XdmModifyGroupAttributes",
         "('sip:crew@example.org', 'tel:+15550100', '', true, true, 1, true, {'rank': <1>})",
         "(10,)", "rank is \"s\" here"},
        {"XdmModifyDefaultGroup", "('', 'sip:crew@example.org', true)", "(10,)",
         "no group list is named"},
        {"XdmModifyDefaultGroup", "('a', 'b', true)", "(19,)", "there is no group \"b\""},
        {"XdmGetParticipantInfo", "('sip:crew@example.org',)", "(12, {})",
         "no push-to-talk session \"sip:crew@example.org\""},
    };
    ASSERT_EQ(create(sample_group()), "(0,)");
    program_->read_errors("XdmCreateGroup");
    const auto kept = content_of(directory_.file("groups.json"));
    for (const auto &refused : kRefused) {
        EXPECT_EQ(call(refused.method, refused.arguments).body, refused.reply) << refused.why;
        EXPECT_THAT(program_->read_errors(refused.method), HasSubstr(refused.why));
    }
    EXPECT_EQ(call("XdmCreateGroup", "('a',)").error, "org.freedesktop.DBus.Error.InvalidArgs");
    EXPECT_EQ(call("XdmAddGroupRule", "('a', @a{sv} {})").error,
              "org.freedesktop.DBus.Error.InvalidArgs");
    EXPECT_EQ(fetch(), answer_of(sample_group()));
    EXPECT_EQ(content_of(directory_.file("groups.json")), kept);
}

TEST_F(XdmBus, DeepAndLargeDocumentsAreHandled) {
    std::string deep = "<int64 1>";
    for (int i = 0; i < 20; ++i)
        deep = "<{'k': " + deep + "}>";
    EXPECT_EQ(call("XdmCreateGroup", "({'group_uri': <'a'>, 'k': " + deep + "},)").body, "(10,)");
    EXPECT_THAT(program_->read_errors("XdmCreateGroup"), HasSubstr("nested deeper than"));
    constexpr int kMembers = 5'000;
    GroupDocument large{.uri = "sip:large@x", .members = GroupMembers()};
    for (int i = 0; i < kMembers; ++i)
        large.members->contacts.push_back(sample_member(fmt::format("sip:{}@example.org", i)));
    EXPECT_EQ(create(large), "(0,)");
    EXPECT_EQ(fetch("sip:large@x"), answer_of(large));
}

TEST_F(XdmBus, NothingIsReachedInFlightMode) {
    ASSERT_EQ(create(sample_group()), "(0,)");
    ASSERT_EQ(client_->call(0, kRegistration, "EnableFlightMode").body, "(0,)");
    EXPECT_EQ(fetch(), "(13, {})");
    EXPECT_EQ(edit("XdmModifyGroupQoe", "1"), "(13,)");
    EXPECT_EQ(fetch(kCrew, 1), answer_of(sample_group()));
}

TEST_F(XdmBus, WhatCannotBeKeptIsRefused) {
    std::filesystem::create_directory(directory_.file("groups.json.new"));
    EXPECT_EQ(create(sample_group()), "(17,)");
    EXPECT_THAT(program_->read_errors("XdmCreateGroup"), HasSubstr("cannot be kept"));
    EXPECT_EQ(fetch(), "(19, {})");
}

TEST_F(XdmBus, ADamagedFileKeepsTheProgramFromStarting) {
    ASSERT_EQ(create(sample_group()), "(0,)");
    program_->send_signal(SIGTERM);
    program_->wait();
    const auto path = directory_.file("groups.json");
    const auto whole = content_of(path);
    const auto half = whole.substr(0, whole.size() / 2);
    put_content(path, half);
    Program serving(arguments());
    EXPECT_THAT(serving.read_errors(), HasSubstr("cannot use " + path));
    EXPECT_EQ(serving.wait(), 1);
    EXPECT_EQ(content_of(path), half);
}

} // namespace
} // namespace sim::test
