// SPDX-License-Identifier: Apache-2.0
// The verbs about groups against a scripted service: what each sends, and what it shows.
#include "tests/imsctl/group/documents.hpp"
#include "tests/imsctl/program.hpp"
#include "tests/imsctl/temporary_file.hpp"
#include "tests/support/private_bus.hpp"
#include "tests/support/scripted_peer.hpp"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace test {
namespace {

using testing::HasSubstr;

struct GroupVerbRow {
    const char *line;
    std::size_t verb_words; // how many of the words are the verb
    const char *method;
    const char *sent_type;
    const char *sent;
    const char *json = R"({"group_uri":"sip:g"})"; // without the verb
    const char *text = "group_uri=\"sip:g\"";
};

void PrintTo(const GroupVerbRow &row, std::ostream *out) {
    *out << row.line;
}

constexpr const char *kNoMembers =
    "'ext_ref_url': <{'contact_ref_ct_list': <@aa{sv} []>, 'num_of_ct_lists_ref': <int64 0>}>, "
    "'entry_ref_url': <{'entry_ref_contacts_v': <@aa{sv} []>, 'num_of_ct_ref': <int64 0>}>";

std::string two_members() {
    const auto member = [](const char *uri) {
        return std::string{"{'uri': <'"} + uri +
               "'>, 'stt': <false>, 'active': <false>, 'type': <false>, 'auto_join': <false>, "
               "'status_v': <@a{sv} {}>}";
    };
    return "('sip:g', {'contact_lists': <{'contact_lists_v': <@aa{sv} []>, "
           "'num_of_ct_lists': <int64 0>}>, 'contacts': <{'contacts_v': <[" +
           member("sip:a") + ", " + member("sip:b") + "]>, 'num_of_contacts': <int64 2>}>, " +
           kNoMembers + "})";
}

const std::string kTwoMembers = two_members();

const GroupVerbRow kGroupVerbs[] = {
    {"group delete sip:g", 2, "DeleteGroup", "(s)", "('sip:g',)"},
    {"group add-user sip:g sip:a sip:b", 2, "AddUserToSharedGroup", "(sa{sv})",
     kTwoMembers.c_str()},
    {"group remove-user sip:g sip:a sip:b", 2, "RemoveUserFromSharedGroup", "(sa{sv})",
     kTwoMembers.c_str()},
    {"group rule delete sip:g guests", 3, "DeleteGroupRule", "(ss)", "('sip:g', 'guests')"},
    {"group set display-name sip:g Team", 3, "ModifyGroupDisplayName", "(ss)", "('sip:g', 'Team')"},
    {"group set subject sip:g Lunch", 3, "ModifyGroupSubject", "(ss)", "('sip:g', 'Lunch')"},
    {"group set searchable sip:g on", 3, "ModifyGroupSearchable", "(sb)", "('sip:g', true)"},
    {"group set invite-members sip:g off", 3, "ModifyGroupInviteMembers", "(sb)",
     "('sip:g', false)"},
    {"group set auto-advertisements sip:g on", 3, "ModifyGroupAutoAdvertisements", "(sb)",
     "('sip:g', true)"},
    {"group set max-participants sip:g 20", 3, "ModifyGroupMaxParticipants", "(si)",
     "('sip:g', 20)"},
    {"group set qoe sip:g -2", 3, "ModifyGroupQoe", "(si)", "('sip:g', -2)"},
    {"group set service sip:g 7 audio poc_speech", 3, "ModifyGroupSessionServiceList", "(sa{sv})",
     "('sip:g', {'group_app': <int64 7>, 'group_media_list': <{'audio': <true>, "
     "'video': <false>, 'message': <false>, 'file_transfer': <false>, "
     "'group_advertisement': <false>, 'pager_mode': <false>, 'poc_speech': <true>}>})"},
    {"group set age-restrictions sip:g 6..14 65.. ..3", 3, "ModifyGroupAgeRestriction", "(saa{sv})",
     "('sip:g', [{'from_age': <'6'>, 'to_age': <'14'>}, {'from_age': <'65'>}, "
     "{'to_age': <'3'>}])"},
    {"group set member sip:g sip:a --name A --type 5 --active --position lead", 3,
     "ModifyGroupAttributes", "(sssbbiba{sv})",
     "('sip:g', 'sip:a', 'A', false, true, 5, false, {'position': <'lead'>})",
     R"({"group_uri":"sip:g","uri":"sip:a"})", "group_uri=\"sip:g\" uri=\"sip:a\""},
    {"group set default work sip:g on", 3, "ModifyDefaultGroup", "(ssb)", "('work', 'sip:g', true)",
     R"({"group_list_name":"work","group_uri":"sip:g"})",
     "group_list_name=\"work\" group_uri=\"sip:g\""},
};

class WithGroups : public ::testing::Test {
  protected:
    void answer(const std::string &method, const std::string &type, const std::string &text) {
        peer_.on("org.kelvo.ims.Xdm.Xdm" + method, reply(type, text));
    }
    // What the one call to a method carried.
    std::string sent(const std::string &method) const {
        const auto calls = peer_.calls_to("org.kelvo.ims.Xdm.Xdm" + method);
        return calls.size() == 1 ? to_text(calls[0].body.get()) : "not one call";
    }

    PrivateBus bus_;
    ScriptedPeer peer_{bus_.address()};
};

class GroupVerbs : public WithGroups, public ::testing::WithParamInterface<GroupVerbRow> {};

TEST_P(GroupVerbs, SendTheirRequestOnceAndShowTheReply) {
    const GroupVerbRow &row = GetParam();
    answer(row.method, "(i)", "(0,)");
    const Outcome outcome = run_imsctl(split(row.line));
    EXPECT_EQ(outcome.status, 0) << outcome.error;
    EXPECT_EQ(outcome.output, row.text + std::string("\n"));
    EXPECT_EQ(sent(row.method), to_text(parse(row.sent_type, row.sent).get()));
    EXPECT_EQ(peer_.calls().size(), 2u); // registering, and nothing besides
}

TEST_P(GroupVerbs, ShowTheReplyAsOneJsonObjectAndARefusalAsAFailure) {
    const GroupVerbRow &row = GetParam();
    answer(row.method, "(i)", "(0,)");
    const auto words = split(row.line + std::string(" --json"));
    std::string verb = words[0];
    for (std::size_t at = 1; at < row.verb_words; ++at)
        verb += ' ' + words[at];
    Json expected = {{"verb", verb}};
    expected.update(Json::parse(row.json));
    EXPECT_EQ(run_imsctl(words).json().dump(), expected.dump());

    answer(row.method, "(i)", "(77,)");
    const Outcome refused = run_imsctl(words);
    EXPECT_EQ(refused.status, 1);
    EXPECT_EQ(refused.json()["error"]["result"], 77);
}

INSTANTIATE_TEST_SUITE_P(Rows, GroupVerbs, ::testing::ValuesIn(kGroupVerbs));

class GroupFiles : public WithGroups {};

TEST_F(GroupFiles, AreCreatedAsTheyAre) {
    answer("CreateGroup", "(i)", "(0,)");
    const TemporaryFile file(kGroupJson);
    const Outcome outcome = run_imsctl({"group", "create", file.name()});
    EXPECT_EQ(outcome.status, 0) << outcome.error;
    EXPECT_EQ(outcome.output, "group_uri=\"sip:team@example.org\"\n");
    EXPECT_EQ(sent("CreateGroup"), to_text(parse("(a{sv})", kGroupSent).get()));
}

TEST_F(GroupFiles, AreWhatShowPrints) {
    answer("FetchSharedGroup", "(ia{sv})", "(0, " + kGroupAnswered + ")");
    const Outcome shown =
        run_imsctl({"--json", "group", "show", "sip:team@example.org", "--channel", "9"});
    EXPECT_EQ(shown.status, 0) << shown.error;
    EXPECT_EQ(sent("FetchSharedGroup"), "(ss) ('sip:team@example.org', '9')");
    Json document = Json::parse(kGroupJson);
    Json expected = {{"verb", "group show"}};
    expected.update(document);
    EXPECT_EQ(shown.json().dump(), expected.dump());

    answer("CreateGroup", "(i)", "(0,)");
    const TemporaryFile file(shown.output);
    EXPECT_EQ(run_imsctl({"group", "create", file.name()}).status, 0);
    EXPECT_EQ(sent("CreateGroup"), to_text(parse("(a{sv})", kGroupSent).get()));
}

TEST_F(GroupFiles, AreShownToPeopleAsAnOutline) {
    answer("FetchSharedGroup", "(ia{sv})",
           "(0, {'group_uri': <'sip:g'>, 'version': <'1\\u001b[1m'>, 'group_properties': "
           "<{'display_name': <'Team'>}>, 'group_member_list': <{'contacts': "
           "<{'num_of_contacts': <int64 2>, 'contacts_v': <[{'uri': <'sip:a'>, 'status_v': "
           "<{'rank': <'1'>}>}, {'uri': <'sip:b'>}]>}>}>})");
    const Outcome shown = run_imsctl({"group", "show", "sip:g"});
    EXPECT_EQ(shown.output,
              "group_uri=\"sip:g\" version=\"1\\x1b[1m\"\n"
              "group_properties:\n"
              "  display_name=\"Team\" subject=\"\" is_searchable=false inv_members=false "
              "max_participants=0 auto_grp_advertisements=false group_qoe=0\n"
              "group_member_list:\n"
              "  contacts:\n"
              "    - uri=\"sip:a\" auto_join=false stt=false active=false type=0\n"
              "      status:\n"
              "        rank=\"1\"\n"
              "    - uri=\"sip:b\" auto_join=false stt=false active=false type=0\n")
        << shown.error;
}

TEST_F(GroupFiles, OfRulesAndMembersAndPoliciesAreSent) {
    answer("AddGroupRule", "(i)", "(0,)");
    answer("ModifyGroupRule", "(i)", "(0,)");
    const TemporaryFile one(R"({"rule_id":"one","allow_anonymity":true})");
    EXPECT_EQ(run_imsctl({"group", "rule", "add", "sip:g", one.name()}).status, 0);
    EXPECT_THAT(sent("AddGroupRule"), HasSubstr("'rule_id': <'one'>"));
    const TemporaryFile two(R"([{"rule_id":"one"},{"rule_id":"two"}])");
    EXPECT_EQ(run_imsctl({"group", "rule", "modify", "sip:g", two.name()}).status, 0);
    EXPECT_THAT(sent("ModifyGroupRule"), HasSubstr("'rule_id': <'two'>"));

    answer("AddUserToSharedGroup", "(i)", "(0,)");
    const TemporaryFile members(R"({"contact_lists":["friends"]})");
    EXPECT_EQ(run_imsctl({"group", "add-user", "sip:g", "--file", members.name()}).status, 0);
    EXPECT_THAT(sent("AddUserToSharedGroup"), HasSubstr("<[{'contact_lists': <'friends'>}]>"));

    answer("ModifyGroupSessionActivePolicy", "(i)", "(0,)");
    const TemporaryFile policy(R"({"max_duration":60,"schedule":[{"start_time":"8"}]})");
    EXPECT_EQ(run_imsctl({"group", "set", "policy", "sip:g", policy.name()}).status, 0);
    EXPECT_THAT(sent("ModifyGroupSessionActivePolicy"), HasSubstr("'max_duration': <int64 60>"));
}

TEST_F(GroupFiles, ThatAreWrongAreNotSent) {
    const TemporaryFile file(R"({"group_url":"sip:g"})");
    const Outcome outcome = run_imsctl({"--json", "group", "create", file.name()});
    EXPECT_EQ(outcome.status, 1);
    EXPECT_EQ(outcome.json()["error"]["kind"], "input");
    EXPECT_EQ(outcome.json()["error"]["problems"].size(), 2u);
    EXPECT_TRUE(peer_.calls().empty());
}

TEST_F(WithGroups, ListsGroups) {
    answer("FetchAllSharedGroups", "(ia{sv})",
           "(0, {'version': <'3'>, 'count': <int64 2>, 'groups_v': <[{'group_info': <" +
               kGroupAnswered + ">}, {}]>})");
    EXPECT_EQ(run_imsctl({"group", "list"}).output,
              "sip:team@example.org display_name=\"Team\" members=1\n- no document\n");
    const Json list = run_imsctl({"--json", "group", "list"}).json();
    EXPECT_EQ(list["count"], 2);
    EXPECT_EQ(list["groups"][0].dump(), Json::parse(kGroupJson).dump());
    EXPECT_TRUE(list["groups"][1].is_null());
    answer("FetchAllSharedGroups", "(ia{sv})", "(0, {'count': <int64 0>})");
    EXPECT_EQ(run_imsctl({"group", "list", "all"}).output, "no groups\n");
}

TEST_F(WithGroups, ShowsWhatTheServiceTells) {
    answer("FetchAllParticipantGroups", "(ia{sv})",
           "(0, {'version': <'4'>, 'participant_groups_v': <{'num_of_group_lists': <int64 1>, "
           "'group_list_info_v': <[{'group_list_name': <'work'>}]>}>})");
    EXPECT_EQ(run_imsctl({"group", "lists"}).output,
              "version=\"4\"\ngroup_list_info:\n  - group_list_name=\"work\"\n");
    answer("FetchSharedUserProfile", "(ia{sv})",
           "(0, {'user_uri': <'sip:a'>, 'hobbies_v': <[{'hobby': <'chess'>}]>})");
    const Json profile = run_imsctl({"--json", "group", "profile", "sip:a"}).json();
    EXPECT_EQ(profile["user_uri"], "sip:a");
    EXPECT_EQ(profile["hobbies"].dump(), R"(["chess"])");
    EXPECT_EQ(sent("FetchSharedUserProfile"), "(s) ('sip:a',)");
    answer("GetParticipantInfo", "(ia{sv})",
           "(0, {'session_uri': <'sip:s'>, 'conf_participant_entry_v': "
           "<[{'contact_list_entry_v': <{'uri': <'sip:a'>}>, 'user_state': <int64 2>}]>})");
    const Json info = run_imsctl({"--json", "group", "participants", "sip:g"}).json();
    EXPECT_EQ(info["conf_participant_entry"][0]["contact_list_entry"]["uri"], "sip:a");
    EXPECT_EQ(info["conf_participant_entry"][0]["user_state"], 2);
    EXPECT_EQ(sent("GetParticipantInfo"), "(s) ('sip:g',)");
}

TEST_F(WithGroups, RefusesWrongUsage) {
    for (const char *line :
         {"group add-user sip:g", "group add-user sip:g sip:a --file x",
          "group set service sip:g 1 radio", "group set age-restrictions sip:g 6-14",
          "group set searchable sip:g maybe"}) {
        EXPECT_EQ(run_imsctl(split(line)).status, 2) << line;
    }
    EXPECT_EQ(run_imsctl({"group", "show", std::string(129, 'u')}).status, 2);
    EXPECT_TRUE(peer_.calls().empty());
}

} // namespace
} // namespace test
