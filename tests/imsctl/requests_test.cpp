// SPDX-License-Identifier: Apache-2.0
// Every verb against a scripted service: what it sends, and what it shows of the reply.
#include "private_bus.hpp"
#include "program.hpp"
#include "scripted_peer.hpp"

#include <algorithm>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace test {
namespace {

struct VerbRow {
    std::vector<std::string> words;
    const char *method;
    const char *sent_type; // "" for no parameters
    const char *sent;
    const char *reply_type;
    const char *reply;
    const char *json; // without the verb
    const char *text;
};

void PrintTo(const VerbRow &row, std::ostream *out) {
    for (const auto &word : row.words)
        *out << word << ' ';
}

// The application id is 42.
const VerbRow kRows[] = {
    {{"dial", "+15550101"},
     "MakeCall",
     "(isissss)",
     "(42, '+15550101', 0, '', '', '', '')",
     "(ii)",
     "(0, 7)",
     R"({"session_id":7})",
     "session_id=7"},
    {{"dial", "tel:1", "--type", "video", "--text-1", "a", "--text-2=b", "--text-3", "c",
      "--text-4", "d"},
     "MakeCall",
     "(isissss)",
     "(42, 'tel:1', 1, 'a', 'b', 'c', 'd')",
     "(ii)",
     "(0, 8)",
     R"({"session_id":8})",
     "session_id=8"},
    {{"dial", "1", "--type", "9"},
     "MakeCall",
     "(isissss)",
     "(42, '1', 9, '', '', '', '')",
     "(ii)",
     "(0, 9)",
     R"({"session_id":9})",
     "session_id=9"},
    {{"ussd", "*100#"}, "SendUssd", "(iiis)", "(42, 1, 0, '*100#')", "(i)", "(0,)", "{}", "ok"},
    {{"ussd", "1", "--type", "reply", "--value", "15"},
     "SendUssd",
     "(iiis)",
     "(42, 2, 15, '1')",
     "(i)",
     "(0,)",
     "{}",
     "ok"},
    {{"ussd", "--type", "cancel"},
     "SendUssd",
     "(iiis)",
     "(42, 3, 0, '')",
     "(i)",
     "(0,)",
     "{}",
     "ok"},
    {{"answer", "3"},
     "AnswerCall",
     "(iiii)",
     "(42, 3, 0, 0)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"answer", "3", "--type", "video", "--value", "2"},
     "AnswerCall",
     "(iiii)",
     "(42, 3, 1, 2)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"end", "3", "--reason", "-1", "--value", "5"},
     "EndCall",
     "(iiii)",
     "(42, 3, -1, 5)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"reject", "3", "--reason", "busy"},
     "RejectCall",
     "(iii)",
     "(42, 3, 1)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"hold", "3"},
     "HoldCall",
     "(ii)",
     "(42, 3)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"hold", "--session", "3"},
     "HoldCall",
     "(ii)",
     "(42, 3)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"resume", "3"},
     "ResumeCall",
     "(ii)",
     "(42, 3)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"swap"}, "SwapCall", "(i)", "(42,)", "(i)", "(0,)", "{}", "ok"},
    {{"upgrade", "3"},
     "UpgradeCall",
     "(iii)",
     "(42, 3, 1)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"downgrade", "3"},
     "DowngradeCall",
     "(iii)",
     "(42, 3, 0)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"change", "3", "--type", "video"},
     "ChangeCall",
     "(iii)",
     "(42, 3, 1)",
     "(iis)",
     "(0, 4, 'later')",
     R"({"session_id":3,"value_1":4,"text_1":"later"})",
     R"(session_id=3 value_1=4 text_1="later")"},
    {{"accept-change", "3"},
     "AcceptChangeRequest",
     "(ii)",
     "(42, 3)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"reject-change", "3"},
     "RejectChangeRequest",
     "(ii)",
     "(42, 3)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"dtmf", "12#", "--session", "3"},
     "SendDtmf",
     "(iis)",
     "(42, 3, '12#')",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"dtmf", "--start", "5", "--session", "3"},
     "StartDtmf",
     "(iiy)",
     "(42, 3, 53)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"dtmf", "--stop", "--session", "3"},
     "StopDtmf",
     "(ii)",
     "(42, 3)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"record", "start", "--file", "a.wav", "--session", "3"},
     "VoiceRecord",
     "(iiis)",
     "(42, 3, 1, 'a.wav')",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"tty", "send", "hello", "--session", "3"},
     "SendTtyData",
     "(iis)",
     "(42, 3, 'aGVsbG8=')",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"tty", "mode", "set", "full"}, "SetTtyMode", "(ii)", "(42, 1)", "(i)", "(0,)", "{}", "ok"},
    {{"tty", "mode", "get"},
     "GetTtyMode",
     "",
     "",
     "(iiis)",
     "(0, 1, 2, 'AP9h')",
     R"({"value_1":1,"value_2":2,"data":"AP9h"})",
     R"(value_1=1 value_2=2 data="\x00\xffa")"},
    {{"mute", "status", "3"},
     "IsMuted",
     "(ii)",
     "(42, 3)",
     "(ib)",
     "(0, true)",
     R"({"session_id":3,"muted":true})",
     "session_id=3 muted=true"},
    {{"mute", "toggle", "3"},
     "ToggleMute",
     "(ii)",
     "(42, 3)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"speaker", "on", "--session", "3"},
     "SetSpeakerMode",
     "(iii)",
     "(42, 3, 1)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"volume", "set", "6", "--session", "3"},
     "SetVolume",
     "(iii)",
     "(42, 3, 6)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"volume", "max", "3"},
     "GetMaxVolume",
     "(ii)",
     "(42, 3)",
     "(ii)",
     "(0, 10)",
     R"({"session_id":3,"max_volume":10})",
     "session_id=3 max_volume=10"},
    {{"conference", "add-user", "+1", "--type", "video", "--session", "3"},
     "AddUserForConferenceCall",
     "(iisi)",
     "(42, 3, '+1', 1)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"srvcc", "started", "3"},
     "IndicateSrvccHoStarted",
     "(ii)",
     "(42, 3)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"srvcc", "failed", "3"},
     "IndicateSrvccHoFailed",
     "(ii)",
     "(42, 3)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"auto-response", "answer", "--delay", "4"},
     "SetAutoResponse",
     "(iii)",
     "(42, 1, 4)",
     "(i)",
     "(0,)",
     "{}",
     "ok"},
    {{"emergency-pdn", "set", "rmnet1", "192.0.2.1", "192.0.2.2", "--local", "192.0.2.7"},
     "SetEmergencyPdnInfo",
     "(isivs)",
     "(42, 'rmnet1', 2, <['192.0.2.1', '192.0.2.2']>, '192.0.2.7')",
     "(i)",
     "(0,)",
     "{}",
     "ok"},
    {{"emergency-pdn", "register"}, "RegisterEmergencyPdn", "", "", "(i)", "(0,)", "{}", "ok"},
    {{"emergency-pdn", "deregister"}, "DeregisterEmergencyPdn", "", "", "(i)", "(0,)", "{}", "ok"},
    {{"conference", "nway", "start", "1", "2", "--type", "1"},
     "StartNwayConferenceCall",
     "(iiii)",
     "(42, 1, 2, 1)",
     "(ii)",
     "(0, 5)",
     R"({"session_id":5})",
     "session_id=5"},
    {{"conference", "merge"},
     "MergeCalls",
     "(i)",
     "(42,)",
     "(ii)",
     "(0, 5)",
     R"({"session_id":5})",
     "session_id=5"},
    {{"conference", "nway", "add", "4", "--session", "3"},
     "AddParticipantToNwayConferenceCall",
     "(iii)",
     "(42, 3, 4)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"conference", "nway", "remove", "4", "--session", "3"},
     "RemoveParticipantFromNwayConferenceCall",
     "(iii)",
     "(42, 3, 4)",
     "(i)",
     "(0,)",
     R"({"session_id":3})",
     "session_id=3"},
    {{"epdg", "status"},
     "IsInEpdgCall",
     "(i)",
     "(42,)",
     "(ib)",
     "(0, true)",
     R"({"in_epdg_call":true})",
     "in_epdg_call=true"},
    {{"epdg", "audio-path", "epdg"},
     "ChangeEpdgAudioPath",
     "(ii)",
     "(42, 1)",
     "(i)",
     "(0,)",
     "{}",
     "ok"},
    {{"ssac", "on", "--voice-factor", "50", "--voice-time", "16", "--video-factor", "25",
      "--video-time", "8"},
     "UpdateSsacInfo",
     "(iiiiii)",
     "(42, 1, 50, 16, 25, 8)",
     "(i)",
     "(0,)",
     "{}",
     "ok"},
    {{"conference", "start", "+1", "+2", "--type", "video"},
     "StartConference",
     "(iiv)",
     "(1, 2, <['+1', '+2']>)",
     "(ii)",
     "(0, 7)",
     R"({"session_id":7})",
     "session_id=7"},
    {{"conference", "modify", "remove", "+1", "+2", "--session", "3"},
     "ModifyParticipantsInConference",
     "(iiiv)",
     "(3, 2, 2, <['+1', '+2']>)",
     "(ii)",
     "(0, -4)",
     R"({"session_id":3,"value_1":-4})",
     "session_id=3 value_1=-4"},
};

constexpr const char *kCallInterface = "org.kelvo.ims.Call.";

std::vector<std::string> call_words(std::vector<std::string> words) {
    words.insert(words.begin(), "call");
    return words;
}

// "call tty mode get" of the words that follow "call".
std::string verb_of(const VerbRow &row) {
    static const std::vector<std::string> kGroups = {
        "tty", "mode", "mute", "volume", "conference", "nway", "emergency-pdn", "srvcc", "epdg"};
    std::string verb = "call";
    for (const std::string &word : row.words) {
        verb += ' ' + word;
        if (std::find(kGroups.begin(), kGroups.end(), word) == kGroups.end())
            break;
    }
    return verb;
}

class Verbs : public ::testing::TestWithParam<VerbRow> {
  protected:
    Outcome run(std::vector<std::string> words) {
        const VerbRow &row = GetParam();
        peer_.on(kCallInterface + std::string(row.method), reply(row.reply_type, row.reply));
        return run_imsctl(std::move(words));
    }

    PrivateBus bus_;
    ScriptedPeer peer_{bus_.address()};
};

TEST_P(Verbs, SendsItsRequestOnceAndShowsTheReply) {
    const VerbRow &row = GetParam();
    const Outcome outcome = run(call_words(row.words));
    EXPECT_EQ(outcome.status, 0);
    EXPECT_EQ(outcome.output, row.text + std::string("\n"));
    EXPECT_EQ(outcome.error, "");

    const auto calls = peer_.calls_to(kCallInterface + std::string(row.method));
    ASSERT_EQ(calls.size(), 1u);
    EXPECT_EQ(calls[0].path, "/org/kelvo/ims/sub0");
    if (row.sent_type[0] == '\0')
        EXPECT_EQ(calls[0].signature, "");
    else
        EXPECT_EQ(to_text(calls[0].body.get()), to_text(parse(row.sent_type, row.sent).get()));
    // Registering, and nothing besides.
    EXPECT_EQ(peer_.calls().size(), 2u);
}

TEST_P(Verbs, ShowsTheReplyAsOneJsonObject) {
    const VerbRow &row = GetParam();
    std::vector<std::string> words = call_words(row.words);
    words.push_back("--json");
    const Outcome outcome = run(words);
    EXPECT_EQ(outcome.status, 0);
    EXPECT_EQ(outcome.error, "");
    Json expected = {{"verb", verb_of(row)}};
    expected.update(Json::parse(row.json));
    EXPECT_EQ(outcome.json().dump(), expected.dump());
}

TEST_P(Verbs, FailsWithTheServicesOwnResult) {
    const VerbRow &row = GetParam();
    peer_.on(kCallInterface + std::string(row.method),
             reply(row.reply_type, "(77" + std::string(row.reply + 2)));
    const Outcome outcome = run_imsctl([&] {
        auto words = call_words(row.words);
        words.push_back("--json");
        return words;
    }());
    EXPECT_EQ(outcome.status, 1);
    EXPECT_EQ(outcome.json()["error"]["kind"], "service");
    EXPECT_EQ(outcome.json()["error"]["result"], 77);
    EXPECT_THAT(outcome.error, testing::HasSubstr("the service answered with result 77"));
}

INSTANTIATE_TEST_SUITE_P(All, Verbs, ::testing::ValuesIn(kRows),
                         [](const ::testing::TestParamInfo<VerbRow> &row) {
                             return row.param.method + std::to_string(row.index);
                         });

TEST(VerbTable, ReachesEveryRequest) {
    std::vector<std::string> methods;
    for (const VerbRow &row : kRows)
        methods.emplace_back(row.method);
    std::sort(methods.begin(), methods.end());
    methods.erase(std::unique(methods.begin(), methods.end()), methods.end());
    EXPECT_EQ(methods.size(), 41u);
}

} // namespace
} // namespace test
