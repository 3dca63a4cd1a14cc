// SPDX-License-Identifier: Apache-2.0
// Every verb of calls against a scripted service: what it sends, and what it shows of the reply.
#include "tests/imsctl/verb_checks.hpp"

#include <set>

namespace test {
namespace {

// The application id is 42.
const VerbRow kCallVerbs[] = {
    {"call dial +15550101", 2, "Call.MakeCall", "(isissss)", "(42, '+15550101', 0, '', '', '', '')",
     "(ii)", "(0, 7)", "(77, 7)", R"({"session_id":7})", "session_id=7"},
    {"call dial tel:1 --type video --text-1 a --text-2=b --text-3 c --text-4 d", 2, "Call.MakeCall",
     "(isissss)", "(42, 'tel:1', 1, 'a', 'b', 'c', 'd')", "(ii)", "(0, 8)", "(77, 8)",
     R"({"session_id":8})", "session_id=8"},
    {"call dial 1 --type 9", 2, "Call.MakeCall", "(isissss)", "(42, '1', 9, '', '', '', '')",
     "(ii)", "(0, 9)", "(77, 9)", R"({"session_id":9})", "session_id=9"},
    {"call ussd *100#", 2, "Call.SendUssd", "(iiis)", "(42, 1, 0, '*100#')", "(i)", "(0,)", "(77,)",
     "{}", "ok"},
    {"call ussd 1 --type reply --value 15", 2, "Call.SendUssd", "(iiis)", "(42, 2, 15, '1')", "(i)",
     "(0,)", "(77,)", "{}", "ok"},
    {"call ussd --type cancel", 2, "Call.SendUssd", "(iiis)", "(42, 3, 0, '')", "(i)", "(0,)",
     "(77,)", "{}", "ok"},
    {"call answer 3", 2, "Call.AnswerCall", "(iiii)", "(42, 3, 0, 0)", "(i)", "(0,)", "(77,)",
     R"({"session_id":3})", "session_id=3"},
    {"call answer 3 --type video --value 2", 2, "Call.AnswerCall", "(iiii)", "(42, 3, 1, 2)", "(i)",
     "(0,)", "(77,)", R"({"session_id":3})", "session_id=3"},
    {"call end 3 --reason -1 --value 5", 2, "Call.EndCall", "(iiii)", "(42, 3, -1, 5)", "(i)",
     "(0,)", "(77,)", R"({"session_id":3})", "session_id=3"},
    {"call reject 3 --reason busy", 2, "Call.RejectCall", "(iii)", "(42, 3, 1)", "(i)", "(0,)",
     "(77,)", R"({"session_id":3})", "session_id=3"},
    {"call hold 3", 2, "Call.HoldCall", "(ii)", "(42, 3)", "(i)", "(0,)", "(77,)",
     R"({"session_id":3})", "session_id=3"},
    {"call hold --session 3", 2, "Call.HoldCall", "(ii)", "(42, 3)", "(i)", "(0,)", "(77,)",
     R"({"session_id":3})", "session_id=3"},
    {"call resume 3", 2, "Call.ResumeCall", "(ii)", "(42, 3)", "(i)", "(0,)", "(77,)",
     R"({"session_id":3})", "session_id=3"},
    {"call swap", 2, "Call.SwapCall", "(i)", "(42,)", "(i)", "(0,)", "(77,)", "{}", "ok"},
    {"call upgrade 3", 2, "Call.UpgradeCall", "(iii)", "(42, 3, 1)", "(i)", "(0,)", "(77,)",
     R"({"session_id":3})", "session_id=3"},
    {"call downgrade 3", 2, "Call.DowngradeCall", "(iii)", "(42, 3, 0)", "(i)", "(0,)", "(77,)",
     R"({"session_id":3})", "session_id=3"},
    {"call change 3 --type video", 2, "Call.ChangeCall", "(iii)", "(42, 3, 1)", "(iis)",
     "(0, 4, 'later')", "(77, 4, 'later')", R"({"session_id":3,"value_1":4,"text_1":"later"})",
     R"(session_id=3 value_1=4 text_1="later")"},
    {"call accept-change 3", 2, "Call.AcceptChangeRequest", "(ii)", "(42, 3)", "(i)", "(0,)",
     "(77,)", R"({"session_id":3})", "session_id=3"},
    {"call reject-change 3", 2, "Call.RejectChangeRequest", "(ii)", "(42, 3)", "(i)", "(0,)",
     "(77,)", R"({"session_id":3})", "session_id=3"},
    {"call dtmf 12# --session 3", 2, "Call.SendDtmf", "(iis)", "(42, 3, '12#')", "(i)", "(0,)",
     "(77,)", R"({"session_id":3})", "session_id=3"},
    {"call dtmf --start 5 --session 3", 2, "Call.StartDtmf", "(iiy)", "(42, 3, 53)", "(i)", "(0,)",
     "(77,)", R"({"session_id":3})", "session_id=3"},
    {"call dtmf --stop --session 3", 2, "Call.StopDtmf", "(ii)", "(42, 3)", "(i)", "(0,)", "(77,)",
     R"({"session_id":3})", "session_id=3"},
    {"call record start --file a.wav --session 3", 2, "Call.VoiceRecord", "(iiis)",
     "(42, 3, 1, 'a.wav')", "(i)", "(0,)", "(77,)", R"({"session_id":3})", "session_id=3"},
    {"call tty send hello --session 3", 3, "Call.SendTtyData", "(iis)", "(42, 3, 'aGVsbG8=')",
     "(i)", "(0,)", "(77,)", R"({"session_id":3})", "session_id=3"},
    {"call tty mode set full", 4, "Call.SetTtyMode", "(ii)", "(42, 1)", "(i)", "(0,)", "(77,)",
     "{}", "ok"},
    {"call tty mode get", 4, "Call.GetTtyMode", "", "", "(iiis)", "(0, 1, 2, 'AP9h')",
     "(77, 1, 2, 'AP9h')", R"({"value_1":1,"value_2":2,"data":"AP9h"})",
     R"(value_1=1 value_2=2 data="\x00\xffa")"},
    {"call mute status 3", 3, "Call.IsMuted", "(ii)", "(42, 3)", "(ib)", "(0, true)", "(77, true)",
     R"({"session_id":3,"muted":true})", "session_id=3 muted=true"},
    {"call mute toggle 3", 3, "Call.ToggleMute", "(ii)", "(42, 3)", "(i)", "(0,)", "(77,)",
     R"({"session_id":3})", "session_id=3"},
    {"call speaker on --session 3", 2, "Call.SetSpeakerMode", "(iii)", "(42, 3, 1)", "(i)", "(0,)",
     "(77,)", R"({"session_id":3})", "session_id=3"},
    {"call volume set 6 --session 3", 3, "Call.SetVolume", "(iii)", "(42, 3, 6)", "(i)", "(0,)",
     "(77,)", R"({"session_id":3})", "session_id=3"},
    {"call volume max 3", 3, "Call.GetMaxVolume", "(ii)", "(42, 3)", "(ii)", "(0, 10)", "(77, 10)",
     R"({"session_id":3,"max_volume":10})", "session_id=3 max_volume=10"},
    {"call conference add-user +1 --type video --session 3", 3, "Call.AddUserForConferenceCall",
     "(iisi)", "(42, 3, '+1', 1)", "(i)", "(0,)", "(77,)", R"({"session_id":3})", "session_id=3"},
    {"call srvcc started 3", 3, "Call.IndicateSrvccHoStarted", "(ii)", "(42, 3)", "(i)", "(0,)",
     "(77,)", R"({"session_id":3})", "session_id=3"},
    {"call srvcc failed 3", 3, "Call.IndicateSrvccHoFailed", "(ii)", "(42, 3)", "(i)", "(0,)",
     "(77,)", R"({"session_id":3})", "session_id=3"},
    {"call auto-response answer --delay 4", 2, "Call.SetAutoResponse", "(iii)", "(42, 1, 4)", "(i)",
     "(0,)", "(77,)", "{}", "ok"},
    {"call emergency-pdn set rmnet1 192.0.2.1 192.0.2.2 --local 192.0.2.7", 3,
     "Call.SetEmergencyPdnInfo", "(isivs)",
     "(42, 'rmnet1', 2, <['192.0.2.1', '192.0.2.2']>, '192.0.2.7')", "(i)", "(0,)", "(77,)", "{}",
     "ok"},
    {"call emergency-pdn register", 3, "Call.RegisterEmergencyPdn", "", "", "(i)", "(0,)", "(77,)",
     "{}", "ok"},
    {"call emergency-pdn deregister", 3, "Call.DeregisterEmergencyPdn", "", "", "(i)", "(0,)",
     "(77,)", "{}", "ok"},
    {"call conference nway start 1 2 --type 1", 4, "Call.StartNwayConferenceCall", "(iiii)",
     "(42, 1, 2, 1)", "(ii)", "(0, 5)", "(77, 5)", R"({"session_id":5})", "session_id=5"},
    {"call conference merge", 3, "Call.MergeCalls", "(i)", "(42,)", "(ii)", "(0, 5)", "(77, 5)",
     R"({"session_id":5})", "session_id=5"},
    {"call conference nway add 4 --session 3", 4, "Call.AddParticipantToNwayConferenceCall",
     "(iii)", "(42, 3, 4)", "(i)", "(0,)", "(77,)", R"({"session_id":3})", "session_id=3"},
    {"call conference nway remove 4 --session 3", 4, "Call.RemoveParticipantFromNwayConferenceCall",
     "(iii)", "(42, 3, 4)", "(i)", "(0,)", "(77,)", R"({"session_id":3})", "session_id=3"},
    {"call epdg status", 3, "Call.IsInEpdgCall", "(i)", "(42,)", "(ib)", "(0, true)", "(77, true)",
     R"({"in_epdg_call":true})", "in_epdg_call=true"},
    {"call epdg audio-path epdg", 3, "Call.ChangeEpdgAudioPath", "(ii)", "(42, 1)", "(i)", "(0,)",
     "(77,)", "{}", "ok"},
    {"call ssac on --voice-factor 50 --voice-time 16 --video-factor 25 --video-time 8", 2,
     "Call.UpdateSsacInfo", "(iiiiii)", "(42, 1, 50, 16, 25, 8)", "(i)", "(0,)", "(77,)", "{}",
     "ok"},
    {"call conference start +1 +2 --type video", 3, "Call.StartConference", "(iiv)",
     "(1, 2, <['+1', '+2']>)", "(ii)", "(0, 7)", "(77, 7)", R"({"session_id":7})", "session_id=7"},
    {"call conference modify remove +1 +2 --session 3", 3, "Call.ModifyParticipantsInConference",
     "(iiiv)", "(3, 2, 2, <['+1', '+2']>)", "(ii)", "(0, -4)", "(77, -4)",
     R"({"session_id":3,"value_1":-4})", "session_id=3 value_1=-4"},
};

INSTANTIATE_TEST_SUITE_P(Call, ServiceVerbs, ::testing::ValuesIn(kCallVerbs), verb_name);

TEST(CallVerbs, ReachEveryRequest) {
    std::set<std::string> methods;
    for (const VerbRow &row : kCallVerbs)
        methods.insert(row.method);
    EXPECT_EQ(methods.size(), 41u);
}

} // namespace
} // namespace test
