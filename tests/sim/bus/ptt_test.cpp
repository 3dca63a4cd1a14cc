// SPDX-License-Identifier: Apache-2.0
// Push-to-talk from end to end: three applications on three slots.
#include "tests/sim/bus/bus_client.hpp"

#include <filesystem>
#include <fmt/format.h>

namespace sim::test {
namespace {

using testing::HasSubstr;
using testing::StartsWith;

// The four zeros that ask for what is usual.
constexpr const char *kNone = "<[0, 0, 0, 0]>";
constexpr const char *kTo1 =
    "<[{'uri_type': <int64 0>, 'uri': <'+15550101'>, 'is_group_uri': <false>}]>";
constexpr const char *kNobody = "<@a{sv} {}>";

class BusPtt : public Served {
  protected:
    BusPtt() : Served({"--speed", "0", "--slots", "3"}) {
        client_->wait_for(2, "RegistrationStatus");
        for (int slot = 0; slot < 3; ++slot) {
            clients_.push_back(another());
            clients_.back()->register_application(slot);
        }
    }

    Reply call(int slot, const char *method, const std::string &arguments) {
        return at(slot).call(slot, kPoc, method, arguments);
    }
    std::string ask(int slot, const char *method, const std::string &arguments) {
        const auto reply = call(slot, method, arguments);
        return reply.error.empty() ? reply.body : reply.error + ": " + reply.text;
    }
    Client &at(int slot) { return *clients_[static_cast<std::size_t>(slot)]; }
    std::string hear(int slot, const std::string &member) {
        return at(slot).wait_for(slot, member);
    }

    static std::string call_to(const std::string &called, int type) {
        return fmt::format("(false, false, false, '{}', {}, 'Zoe', {}, {}, 0)", called, type, kNone,
                           kNone);
    }
    static std::string answer(int session) {
        return fmt::format("(false, false, {}, 0, {}, {})", session, kNone, kNone);
    }
    static std::string floor(int session, int patience = 0) {
        return fmt::format("({}, {}, 0, {}, '')", session, kNone, patience);
    }
    // Session 1 of all slots.
    void connect_all() {
        ASSERT_EQ(ask(0, "PocMakeCall", call_to("sip:all@groups.invalid", 1)), "(0, 1)");
        for (const int slot : {1, 2}) {
            hear(slot, "PocCallIncomingInd");
            ASSERT_EQ(ask(slot, "PocAnswerCall", answer(1)), "(0,)");
        }
        for (const int slot : {0, 1, 2})
            hear(slot, "PocCallFloorIdle");
    }
    void expect_refused(int slot, const char *method, const std::string &arguments,
                        const std::string &reply, const std::string &why) {
        EXPECT_EQ(ask(slot, method, arguments), reply) << method << arguments;
        EXPECT_THAT(program_->read_errors("refused"), HasSubstr(why)) << method << arguments;
    }

    std::vector<std::unique_ptr<Client>> clients_;
};

TEST_F(BusPtt, ThreeSlotsInAGroupCallAndTwoAskForTheFloorAtOnce) {
    connect_all();
    EXPECT_EQ(ask(0, "PocRequestFloor", floor(1)), "(0,)");
    EXPECT_EQ(ask(1, "PocRequestFloor", floor(1)), "(0,)");
    EXPECT_THAT(hear(0, "PocCallFloorGranted"),
                StartsWith("(1, <[1, 0, 0, 0]>, 0, 'tel:+15550100', 3, 'Zoe', 0, 30, 0"));
    EXPECT_THAT(hear(1, "PocCallFloorQueuePosition"),
                StartsWith("(1, <[1, 0, 0, 0]>, 0, 'tel:+15550100', 3, 'Zoe', 1, 0, 0"));
    EXPECT_THAT(hear(2, "PocCallFloorTaken"), HasSubstr("'tel:+15550100'"));
    EXPECT_EQ(ask(1, "PocRequestFloorStatus", "(<[1, -1, -1, -1]>,)"),
              "(0, [{'session_id': <int64 1>, 'status': <int64 3>, 'participant_count': <int64 3>, "
              "'floor_taken_uri': <'tel:+15550100'>}])");
    EXPECT_EQ(ask(0, "PocReleaseFloor", fmt::format("(1, {})", kNone)), "(0,)");
    EXPECT_THAT(hear(1, "PocCallFloorGranted"), HasSubstr("'tel:+15550101', 3, '', 0, 30, 0"));
    EXPECT_THAT(hear(0, "PocCallFloorTaken"), HasSubstr("'tel:+15550101'"));
    EXPECT_THAT(hear(2, "PocCallFloorTaken"), HasSubstr("'tel:+15550101'"));
    // Top priority interrupts, a short patience ends.
    EXPECT_EQ(ask(2, "PocRequestFloor", fmt::format("(1, {}, 7, 0, 'Boss')", kNone)), "(0,)");
    EXPECT_THAT(hear(1, "PocCallFloorCanceled"), HasSubstr(", 4, 'interrupted"));
    EXPECT_THAT(hear(0, "PocCallFloorTaken"), HasSubstr("'Boss'"));
    EXPECT_EQ(ask(1, "PocRequestFloor", floor(1, 1)), "(0,)");
    EXPECT_THAT(hear(1, "PocCallFloorRequestTimeout"), HasSubstr(", 7, 'waited too long')"));
    EXPECT_EQ(
        ask(1, "PocModifyCall", fmt::format("(false, true, 1, 5, {}, <[0, 1, 0, 0]>)", kNone)),
        "(0,)");
    EXPECT_EQ(hear(1, "PocCallModifyStatus"),
              "(true, false, true, 1, 5, <[1, 0, 1, 1]>, <[0, 1, 0, 0]>)");
    EXPECT_EQ(ask(1, "PocRequestFloor", floor(1)), "(0,)");
    EXPECT_THAT(hear(1, "PocCallFloorRejected"), HasSubstr(", 1, 'somebody else speaks')"));

    EXPECT_EQ(ask(0, "PocCallConvertToCrisisCall", "(1,)"), "(0,)");
    EXPECT_EQ(hear(2, "PocCallCrisisCallInitiated"), "(1,)");
    EXPECT_EQ(ask(0, "PocEndCall", "(1, 1)"), "(0,)");
    EXPECT_EQ(hear(0, "PocCallEnded"), "(1, 0)");
    EXPECT_EQ(hear(1, "PocCallEnded"), "(1, 1)");
    EXPECT_EQ(hear(2, "PocCallEnded"), "(1, 1)");
}

TEST_F(BusPtt, AGroupDocumentIsAGroupToCallAndToAskAbout) {
    EXPECT_EQ(at(0)
                  .call(0, kXdm, "XdmCreateGroup",
                        "({'group_uri': <'sip:crew@example.org'>, 'group_member_list': "
                        "<{'contacts': <{'contacts_v': <[{'uri': <'tel:+15550100'>}, "
                        "{'uri': <'tel:+15550101'>}, {'uri': <'tel:+15550102'>}]>, "
                        "'num_of_contacts': <int64 3>}>}>},)")
                  .body,
              "(0,)");
    const auto participants = [this](int slot, const char *of) {
        return at(slot).call(slot, kXdm, "XdmGetParticipantInfo", of).body;
    };
    EXPECT_EQ(participants(0, "('sip:crew@example.org',)"), "(12, {})");
    EXPECT_EQ(ask(0, "PocMakeCall", call_to("sip:crew@example.org", 1)), "(0, 1)");
    hear(1, "PocCallIncomingInd");
    EXPECT_EQ(ask(1, "PocAnswerCall", answer(1)), "(0,)");
    hear(0, "PocCallEstablished");
    for (const char *name : {"('sip:crew@example.org',)", "('sip:1@sessions.invalid',)"}) {
        const std::string told = participants(0, name);
        EXPECT_THAT(told, HasSubstr("'list_service_uri': <'sip:crew@example.org'>"));
        EXPECT_THAT(told, HasSubstr("'session_type': <int64 1>"));
        EXPECT_THAT(told, HasSubstr("'inviting_user': <'tel:+15550100'>"));
        const auto state_of = [&told](const std::string &uri) {
            const auto at = told.find("'user_state': <int64 ", told.find("{'uri': <'" + uri));
            return told.substr(at, sizeof "'user_state': <int64 0");
        };
        EXPECT_EQ(state_of("tel:+15550101"), "'user_state': <int64 1>") << told;
        EXPECT_EQ(state_of("tel:+15550102"), "'user_state': <int64 0>") << told;
    }
    // Who is only being asked does not take part yet.
    EXPECT_EQ(participants(2, "('sip:crew@example.org',)"), "(12, {})");
}

TEST_F(BusPtt, OneToOne) {
    EXPECT_EQ(ask(0, "PocMakeCall", call_to("tel:+15550101", 0)), "(0, 1)");
    EXPECT_EQ(at(0).next_signal(), "sub0 PocCallInProgress (1,)");
    EXPECT_EQ(hear(1, "PocCallIncomingInd"),
              "(false, false, false, false, 'tel:+15550100', 'Zoe', 'tel:+15550101', '', '', '', "
              "1, 0, <[1, 0, 1, 1]>, <[0, 0, 0, 0]>)");
    EXPECT_EQ(hear(0, "PocCallAlerting"), "(1,)");
    EXPECT_EQ(ask(1, "PocRejectCall", "(1, 1)"), "(0,)");
    EXPECT_EQ(hear(0, "PocCallEnded"), "(1, 2)");
    EXPECT_EQ(ask(0, "PocMakeCall", call_to("tel:+15550101", 0)), "(0, 2)");
    hear(1, "PocCallIncomingInd");
    EXPECT_EQ(ask(1, "PocAnswerCall", answer(2)), "(0,)");
    EXPECT_EQ(hear(0, "PocCallEstablished"),
              "(2, 0, true, 'tel:+15550101', false, <[1, 0, 1, 1]>, false, <[0, 0, 0, 0]>, "
              "<{'uri_type': <int64 0>, 'uri': <'tel:+15550101'>, 'is_group_uri': <false>}>)");
    EXPECT_EQ(
        ask(0, "PocModifyCall", fmt::format("(true, false, 2, 8, <[1, 1, 0, 0]>, {})", kNone)),
        "(0,)");
    EXPECT_EQ(hear(1, "PocCallModifyRequest"),
              "(true, false, 2, 8, <[1, 1, 0, 0]>, <[0, 0, 0, 0]>)");
    EXPECT_EQ(ask(1, "PocAcceptModifyCall", answer(2)), "(0,)");
    EXPECT_EQ(hear(0, "PocCallModifyStatus"),
              "(true, true, false, 2, 8, <[1, 1, 0, 0]>, <[0, 0, 0, 0]>)");
    EXPECT_EQ(
        ask(1, "PocModifyCall", fmt::format("(true, false, 2, 8, <[1, 0, 0, 0]>, {})", kNone)),
        "(0,)");
    hear(0, "PocCallModifyRequest");
    EXPECT_EQ(ask(0, "PocRejectModifyCall", "(2,)"), "(0,)");
    EXPECT_THAT(hear(1, "PocCallModifyStatus"), StartsWith("(true, true"));
    EXPECT_THAT(hear(1, "PocCallModifyStatus"), StartsWith("(false, true"));
    EXPECT_EQ(ask(0, "PocSendKeepAlive", "(1,)"), "(0,)");
    EXPECT_EQ(hear(0, "PocCallEnded"), "(2, 10)");
}

TEST_F(BusPtt, AnAdHocGroup) {
    const auto user = [](const char *number, int layers) {
        return fmt::format("{{'uri_gv': <{}{{'uri_type': <int64 0>, 'uri': <'{}'>, 'is_group_uri': "
                           "<false>}}{}>, 'is_anonymous': <false>, 'participant_state': <int64 0>, "
                           "'uri_usage_type': <int64 0>}}",
                           layers == 2 ? "<" : "", number, layers == 2 ? ">" : "");
    };
    const auto make = [&](const std::string &users, int count) {
        return fmt::format("({0}, false, {0}, 'Night shift', 'Zoe', true, {1}, false, 0, {2}, 0)",
                           kNone, count, users);
    };
    // A service unwraps however many layers there are.
    EXPECT_EQ(ask(0, "PocMakeAdHocConfCall", make("<[" + user("+15550101", 2) + "]>", 1)),
              "(0, 1)");
    EXPECT_THAT(hear(1, "PocGroupAdvertisement"), StartsWith("(1, {'subject': <'Night shift'>"));
    EXPECT_THAT(hear(1, "PocCallIncomingInd"), StartsWith("(false, true, false, true,"));
    hear(0, "PocCallEstablished");
    EXPECT_EQ(hear(0, "PocGroupConfParticipantInfo"), "(1, 'tel:+15550101', 'alerting')");
    EXPECT_EQ(hear(0, "PocGroupConfParticipantInfo"), "(1, 'tel:+15550101', 'connected')");
    EXPECT_EQ(ask(0, "PocAddUsersToAdHocConfCall",
                  "(1, 1, 1, <<[" + user("+15550102", 1) +
                      "]>>, 0, <{'content_type': <'text/plain'>, 'content': <'Hi'>}>)"),
              "(0,)");
    EXPECT_THAT(hear(2, "PocGroupAdvertisement"),
                HasSubstr("{'content_byte': <'SGk='>, 'content_type': <'text/plain'>}"));
    hear(2, "PocCallEstablished");
    EXPECT_EQ(ask(0, "PocRemoveUsersFromAdHocConfCall",
                  "(1, 1, 0, <[" + user("+15550102", 2) + "]>, 0, <@a{sv} {}>)"),
              "(0,)");
    EXPECT_EQ(hear(2, "PocCallEnded"), "(1, 8)");

    const auto refused = [&](const std::string &users, int count, const char *why) {
        expect_refused(0, "PocMakeAdHocConfCall", make(users, count), "(10, 0)", why);
    };
    const auto one = user("+15550101", 2);
    refused("<[" + one + "]>", 2, "the count says 2, and 1 users came");
    refused("<[" + one + "]>", 0, "the count says 0, and 1 users came");
    refused("<@aa{sv} []>", 0, "the count says 0, and 0 users came");
    refused("<@aa{sv} []>", -1, "the count says -1");
    refused("<'bob'>", 1, "a user list is \"aa{sv}\", not \"s\"");
    refused("<[{'uri_gv': <7>}]>", 1, "a peer is \"a{sv}\", not \"i\"");
    refused("<[{'uri_gv': <<{'uri': <7>}>>}]>", 1, "uri is \"s\", not \"i\"");
    refused("<[{'uri_gv': <<{'uri_type': <7>}>>}]>", 1, "uri_type is \"x\", not \"i\"");
    refused("<[{'uri_gv': <<{'uri_type': <int64 7>}>>}]>", 1, "a uri_type is 0 (tel) or 1 (sip)");
    refused("<[{'uri_gv': <<{'uri_type': <int64 4294967296>}>>}]>", 1, "does not fit in 32 bits");
    refused("<[{'is_anonymous': <int64 1>}]>", 1, "is_anonymous is \"b\", not \"x\"");
    refused("<[{'colour': <1>}]>", 1, "a user has no key \"colour\"");
    refused("<[@a{sv} {}]>", 1, "has no digits");
    expect_refused(0, "PocAddUsersToAdHocConfCall",
                   "(1, 1, 1, <[" + one + "]>, 0, <{'content': <1>}>)", "(10,)",
                   "content is \"s\", not \"i\"");
    expect_refused(0, "PocAddUsersToAdHocConfCall", "(1, 1, 2, <[" + one + "]>, 0, <@a{sv} {}>)",
                   "(10,)", "not 2");
    expect_refused(0, "PocRemoveUsersFromAdHocConfCall", "(1, 1, 0, <[" + one + "]>, 0, <'x'>)",
                   "(10,)", "a content is \"a{sv}\"");
}

TEST_F(BusPtt, AChannel) {
    for (const int slot : {0, 1})
        EXPECT_EQ(ask(slot, "PocSetChannel", "(3, 0)"), "(0,)");
    EXPECT_EQ(ask(0, "PocMakeCall", call_to("", 3)), "(0, 1)");
    EXPECT_THAT(hear(1, "PocCallEstablished"),
                HasSubstr("<'sip:channel-3@groups.invalid'>, 'display_name': <'Channel 3'>"));
    EXPECT_EQ(ask(2, "PocSetChannel", "(3, 1)"), "(0,)");
    hear(2, "PocCallEstablished");
    EXPECT_EQ(ask(2, "PocRequestFloor", floor(1)), "(0,)");
    EXPECT_THAT(hear(2, "PocCallFloorRejected"), HasSubstr(", 3, 'this participant listens"));
}

TEST_F(BusPtt, Recording) {
    connect_all();
    const auto reply = call(0, "PocStartCallRecording", "(1, 0, 0, '')");
    ASSERT_EQ(reply.type, "(ia{sv})") << reply.error;
    EXPECT_THAT(reply.body, StartsWith("(0, {'session_id': <int64 1>, 'record_state': <int64 1>, "
                                       "'record_error': <int64 0>, 'record_file_path': <'"));
    const auto path = reply.body.substr(reply.body.rfind("<'") + 2);
    const auto file = path.substr(0, path.find('\''));
    EXPECT_TRUE(std::filesystem::exists(file)) << file;
    expect_refused(0, "PocStartCallRecording", "(1, 0, 0, '')", "(13, {})", "recorded already");
    EXPECT_EQ(ask(0, "PocPauseCallRecording", "(1,)"), "(0,)");
    EXPECT_EQ(ask(0, "PocResumeCallRecording", "(1,)"), "(0,)");
    EXPECT_EQ(ask(0, "PocStopCallRecording", "(1,)"), "(0,)");
    EXPECT_TRUE(std::filesystem::remove(file));
    EXPECT_EQ(ask(0, "PocCancelCallRecording", "(1,)"), "(13,)");
}

TEST_F(BusPtt, MessagesAndTheirNotices) {
    EXPECT_EQ(
        ask(0, "PocSendMsg", fmt::format("(0, 'm1', {}, 3, '', 'Hello', 0, {}, 7)", kTo1, kNobody)),
        "(0, 1, 0, 1)");
    EXPECT_THAT(hear(1, "PocIncomingMsgInfo"), HasSubstr("'m1', 3, 'text/plain', 'Hello', "));
    EXPECT_EQ(ask(1, "PocSendReceivedMsgNoti",
                  fmt::format("(1, 'm1', {}, <[{{'uri': <'sip:x@y'>}}, {{}}]>, '', 2)", kNobody)),
              "(0, 1, 2, 1)");
    EXPECT_THAT(hear(0, "PocMsgNotification"), HasSubstr("'m1', 2, 0, "));
    const auto refused = [&](const std::string &targets, const std::string &originator,
                             const char *why) {
        expect_refused(0, "PocSendMsg",
                       fmt::format("(0, '', {}, 0, '', '', 0, {}, 0)", targets, originator),
                       "(10, 0, 0, 0)", why);
    };
    refused("<'x'>", kNobody, "a list of targets is \"aa{sv}\"");
    refused("<@aa{sv} []>", kNobody, "nobody");
    refused(kTo1, "<1>", "a peer is \"a{sv}\", not \"i\"");
    expect_refused(1, "PocSendReceivedMsgNoti",
                   fmt::format("(1, '', {}, <[{{'uri': <1>}}]>, '', 1)", kNobody), "(10, 0, 0, 0)",
                   "uri is \"s\"");
}

TEST_F(BusPtt, AFileOfAMebibyteCrosses) {
    const std::string attributes = "<{'file_name': <'map.png'>, 'file_size': <int64 1048576>, "
                                   "'push': <true>, 'start': <int64 0>, 'end': <int64 0>, "
                                   "'transfer_id': <'t1'>}>";
    const auto transfer = fmt::format("(0, {}, {}, {})", kTo1, attributes, kNobody);
    EXPECT_EQ(ask(0, "PocTransferFile", transfer), "(0, 1, 1)");
    EXPECT_THAT(
        hear(1, "PocIncomingFileTransfer"),
        HasSubstr("'file_name': <'map.png'>, 'file_size': <int64 1048576>, 'push': <true>"));
    EXPECT_EQ(ask(1, "PocAcceptFileTransfer", "(0, 't1')"), "(0, 1, 1048576)");
    for (int part = 1; part <= 8; ++part) {
        EXPECT_EQ(hear(0, "PocFileTransferProgress"),
                  fmt::format("(1, {}, 1048576, 1)", part * 131072));
        EXPECT_EQ(hear(1, "PocFileTransferProgress"),
                  fmt::format("(1, {}, 1048576, 0)", part * 131072));
    }
    EXPECT_EQ(hear(0, "PocFileTransferTerminated"), "(1, 0, 1)");
    EXPECT_EQ(hear(1, "PocFileTransferTerminated"), "(1, 0, 0)");
    EXPECT_EQ(ask(0, "PocTransferFile", transfer), "(0, 2, 1)");
    hear(1, "PocIncomingFileTransfer");
    EXPECT_EQ(ask(1, "PocARejectFileTransfer", "(0, 't1')"), "(0, 2, 1048576)");
    EXPECT_EQ(hear(0, "PocFileTransferTerminated"), "(2, 1, 1)");
    EXPECT_EQ(ask(0, "PocTransferFile", transfer), "(0, 3, 1)");
    EXPECT_EQ(ask(0, "PocCancelFileTransfer", "(3,)"), "(0, 3, 1)");
    EXPECT_EQ(hear(0, "PocFileTransferTerminated"), "(3, 2, 1)");
    expect_refused(0, "PocTransferFile", fmt::format("(0, {}, {}, {})", kTo1, kNobody, kNobody),
                   "(10, 0, 0)", "name no file");
    expect_refused(0, "PocTransferFile", fmt::format("(0, {}, <1>, {})", kTo1, kNobody),
                   "(10, 0, 0)", "file attributes is \"a{sv}\"");
}

TEST_F(BusPtt, SetsThatAreNone) {
    const auto make = [](const std::string &media, const std::string &terms) {
        return fmt::format("(false, false, false, '+15550101', 0, '', {}, {}, 0)", media, terms);
    };
    for (const auto &[media, why] : {std::pair{"<[1, 0, 0]>", "four integers, and 3 came"},
                                     {"<@ai []>", "and 0 came"},
                                     {"<[1, 0, 0, 0, 0]>", "and 5 came"},
                                     {"<'x'>", "\"ai\", not \"s\""},
                                     {"<[int64 1]>", "\"ai\", not \"ax\""}}) {
        expect_refused(0, "PocMakeCall", make(media, kNone), "(10, 0)", why);
        expect_refused(0, "PocMakeCall", make(kNone, media), "(10, 0)", why);
        expect_refused(0, "PocAnswerCall",
                       fmt::format("(false, false, 1, 0, {}, {})", kNone, media), "(10,)", why);
        expect_refused(0, "PocRequestFloor", fmt::format("(1, {}, 0, 0, '')", media), "(10,)", why);
        expect_refused(0, "PocReleaseFloor", fmt::format("(1, {})", media), "(10,)", why);
    }
    expect_refused(0, "PocRequestFloorStatus", "(<'x'>,)", "(10, [])", "not \"s\"");
    expect_refused(0, "PocRequestFloorStatus", "(<[9]>,)", "(12, [])", "session 9");
    EXPECT_EQ(ask(0, "PocRequestFloorStatus", "(<[-1, -1, -1, -1]>,)"), "(0, [])");
    // Further layers do no harm.
    EXPECT_EQ(ask(0, "PocMakeCall", make("<<<[1, 0, 0, 0]>>>", "<<[0, 0, 0, 0]>>")), "(0, 1)");
}

} // namespace
} // namespace sim::test
