// SPDX-License-Identifier: Apache-2.0
// The push-to-talk verbs against a scripted service: what each sends, and what it shows of the
// reply.
#include "tests/imsctl/sized_file.hpp"
#include "tests/imsctl/verb_checks.hpp"

#include <gmock/gmock.h>
#include <set>

namespace test {
namespace {

using testing::HasSubstr;

#define ONE_USER                                                                                   \
    "{'uri_gv': <<{'uri_type': <int64 0>, 'uri': <'+15550101'>, 'is_group_uri': <false>}>>, "      \
    "'is_anonymous': <false>, 'participant_state': <int64 0>, 'uri_usage_type': <int64 0>}"
#define ONE_ANONYMOUS_USER                                                                         \
    "{'uri_gv': <<{'uri_type': <int64 1>, 'uri': <'sip:b@x'>, 'is_group_uri': <false>}>>, "        \
    "'is_anonymous': <true>, 'participant_state': <int64 0>, 'uri_usage_type': <int64 0>}"
#define NO_SETS "<[0, 0, 0, 0]>, <[0, 0, 0, 0]>"

constexpr const char *kSession = R"({"session_id":1})";
constexpr const char *kTwoValues = R"({"value_1":5,"value_2":6})";
constexpr const char *kThreeValues = R"({"value_1":5,"value_2":6,"value_3":7})";

// No application id anywhere.
const VerbRow kPttVerbs[] = {
    {"ptt call +15550101", 2, "Poc.PocMakeCall", "(bbbsisvvi)",
     "(false, false, false, '+15550101', 0, '', " NO_SETS ", 0)", "(ii)", "(0, 7)", "(77, 0)",
     R"({"session_id":7})", "session_id=7"},
    {"ptt call sip:all@x --type group --crisis --automatic --floor --name Ann --media voice,files "
     "--priority 6 --no-wait --talk-time 20 --answer-time 9",
     2, "Poc.PocMakeCall", "(bbbsisvvi)",
     "(true, true, true, 'sip:all@x', 1, 'Ann', <[1, 0, 0, 1]>, <[6, 1, 20, 0]>, 9)", "(ii)",
     "(0, 7)", "(77, 0)", R"({"session_id":7})", "session_id=7"},
    {"ptt call --type channel --media 1,-2,3,4", 2, "Poc.PocMakeCall", "(bbbsisvvi)",
     "(false, false, false, '', 3, '', <[1, -2, 3, 4]>, <[0, 0, 0, 0]>, 0)", "(ii)", "(0, 7)",
     "(77, 0)", R"({"session_id":7})", "session_id=7"},
    {"ptt adhoc +15550101 --subject lunch --name Ann", 2, "Poc.PocMakeAdHocConfCall",
     "(vbvssbibivi)",
     "(<[0, 0, 0, 0]>, false, <[0, 0, 0, 0]>, 'lunch', 'Ann', false, 1, false, 0, <[" ONE_USER
     "]>, 0)",
     "(ii)", "(0, 7)", "(77, 0)", R"({"session_id":7})", "session_id=7"},
    {"ptt adhoc sip:b@x --add-to 1 --automatic --answer-time 5 --anonymous", 2,
     "Poc.PocAddUsersToAdHocConfCall", "(iiiviv)",
     "(1, 1, 1, <[" ONE_ANONYMOUS_USER "]>, 5, <@a{sv} {}>)", "(i)", "(0,)", "(77,)", kSession,
     "session_id=1"},
    {"ptt adhoc +15550101 --remove-from 1", 2, "Poc.PocRemoveUsersFromAdHocConfCall", "(iiiviv)",
     "(1, 1, 0, <[" ONE_USER "]>, 0, <@a{sv} {}>)", "(i)", "(0,)", "(77,)", kSession,
     "session_id=1"},
    {"ptt crisis 1", 2, "Poc.PocCallConvertToCrisisCall", "(i)", "(1,)", "(i)", "(0,)", "(77,)",
     kSession, "session_id=1"},
    {"ptt answer 1", 2, "Poc.PocAnswerCall", "(bbiivv)", "(false, false, 1, 0, " NO_SETS ")", "(i)",
     "(0,)", "(77,)", kSession, "session_id=1"},
    {"ptt answer 1 --media voice --priority 0", 2, "Poc.PocAnswerCall", "(bbiivv)",
     "(true, true, 1, 0, <[1, 0, 0, 0]>, <[0, 0, 0, 0]>)", "(i)", "(0,)", "(77,)", kSession,
     "session_id=1"},
    {"ptt reject 1 --reason busy", 2, "Poc.PocRejectCall", "(ii)", "(1, 1)", "(i)", "(0,)", "(77,)",
     kSession, "session_id=1"},
    {"ptt end 1 --scope all", 2, "Poc.PocEndCall", "(ii)", "(1, 1)", "(i)", "(0,)", "(77,)",
     kSession, "session_id=1"},
    {"ptt modify 1 --media voice,video --reference 4", 2, "Poc.PocModifyCall", "(bbiivv)",
     "(true, false, 1, 4, <[1, 1, 0, 0]>, <[0, 0, 0, 0]>)", "(i)", "(0,)", "(77,)", kSession,
     "session_id=1"},
    {"ptt modify 1 --accept", 2, "Poc.PocAcceptModifyCall", "(bbiivv)",
     "(false, false, 1, 0, " NO_SETS ")", "(i)", "(0,)", "(77,)", kSession, "session_id=1"},
    {"ptt modify 1 --reject", 2, "Poc.PocRejectModifyCall", "(i)", "(1,)", "(i)", "(0,)", "(77,)",
     kSession, "session_id=1"},
    {"ptt channel 5 --mode listen", 2, "Poc.PocSetChannel", "(ii)", "(5, 1)", "(i)", "(0,)",
     "(77,)", R"({"channel":5})", "channel=5"},
    {"ptt keep-alive 30", 2, "Poc.PocSendKeepAlive", "(i)", "(30,)", "(i)", "(0,)", "(77,)", "{}",
     "ok"},
    {"ptt floor request 1 --priority 3 --patience 9 --name Ann --media voice", 3,
     "Poc.PocRequestFloor", "(iviis)", "(1, <[1, 0, 0, 0]>, 3, 9, 'Ann')", "(i)", "(0,)", "(77,)",
     kSession, "session_id=1"},
    {"ptt floor release 1", 3, "Poc.PocReleaseFloor", "(iv)", "(1, <[0, 0, 0, 0]>)", "(i)", "(0,)",
     "(77,)", kSession, "session_id=1"},
    {"ptt floor status", 3, "Poc.PocRequestFloorStatus", "(v)", "(<[-1, -1, -1, -1]>,)",
     "(iaa{sv})", "(0, [])", "(77, [])", R"({"sessions":[]})", "no sessions"},
    {"ptt floor status 1 2", 3, "Poc.PocRequestFloorStatus", "(v)", "(<[1, 2, -1, -1]>,)",
     "(iaa{sv})",
     "(0, [{'session_id': <int64 1>, 'status': <int64 2>, 'participant_count': <int64 3>, "
     "'floor_taken_uri': <'tel:+1\\u001b'>}, {'session_id': <int64 2>}])",
     "(77, [{'session_id': <int64 1>}])",
     R"({"sessions":[{"session_id":1,"status":2,"participant_count":3,)"
     R"("floor_taken_uri":"tel:+1\u001b"},)"
     R"({"session_id":2,"status":0,"participant_count":0,"floor_taken_uri":null}]})",
     "SESSION  FLOOR    PARTICIPANTS  SPEAKER\n"
     "1        taken    3             tel:+1\\x1b\n"
     "2        idle     0             -"},
    {"ptt message send Hello --to +15550101 --group sip:all@x --id m1 --notices both "
     "--lifetime 8 --reference 9",
     3, "Poc.PocSendMsg", "(isvissivi)",
     "(0, 'm1', <[{'uri_type': <int64 0>, 'uri': <'+15550101'>, 'is_group_uri': <false>}, "
     "{'uri_type': <int64 1>, 'uri': <'sip:all@x'>, 'is_group_uri': <true>}]>, 3, 'text/plain', "
     "'Hello', 8, <@a{sv} {}>, 9)",
     "(iiii)", "(0, 5, 6, 7)", "(77, 0, 0, 0)", kThreeValues, "value_1=5 value_2=6 value_3=7"},
    {"ptt message send Hello --session 1 --type text/x", 3, "Poc.PocSendMsg", "(isvissivi)",
     "(1, '', <@aa{sv} []>, 0, 'text/x', 'Hello', 0, <@a{sv} {}>, 0)", "(iiii)", "(0, 5, 6, 7)",
     "(77, 0, 0, 0)", kThreeValues, "value_1=5 value_2=6 value_3=7"},
    {"ptt message notify 4 read --id m1 --from sip:a@x --text t", 3, "Poc.PocSendReceivedMsgNoti",
     "(isvvsi)",
     "(4, 'm1', <{'uri_type': <int64 1>, 'uri': <'sip:a@x'>, 'is_group_uri': <false>}>, "
     "<@aa{sv} []>, 't', 2)",
     "(iiii)", "(0, 5, 6, 7)", "(77, 0, 0, 0)", kThreeValues, "value_1=5 value_2=6 value_3=7"},
    {"ptt file accept t-1 --session 2", 3, "Poc.PocAcceptFileTransfer", "(is)", "(2, 't-1')",
     "(iii)", "(0, 5, 6)", "(77, 0, 0)", kTwoValues, "value_1=5 value_2=6"},
    // The service spells it so.
    {"ptt file reject t-1", 3, "Poc.PocARejectFileTransfer", "(is)", "(0, 't-1')", "(iii)",
     "(0, 5, 6)", "(77, 0, 0)", kTwoValues, "value_1=5 value_2=6"},
    {"ptt file cancel 4", 3, "Poc.PocCancelFileTransfer", "(i)", "(4,)", "(iii)", "(0, 5, 6)",
     "(77, 0, 0)", kTwoValues, "value_1=5 value_2=6"},
    {"ptt record start 1 --source others --longest 60 --file /tmp/a", 3,
     "Poc.PocStartCallRecording", "(iiis)", "(1, 2, 60, '/tmp/a')", "(ia{sv})",
     "(0, {'session_id': <int64 1>, 'record_state': <int64 1>})", "(77, {})",
     R"({"session_id":1,"record_state":1,"record_error":0,"record_file_path":null})",
     "session_id=1 record_state=1 record_error=0 record_file_path=-"},
    {"ptt record pause 1", 3, "Poc.PocPauseCallRecording", "(i)", "(1,)", "(i)", "(0,)", "(77,)",
     kSession, "session_id=1"},
    {"ptt record resume 1", 3, "Poc.PocResumeCallRecording", "(i)", "(1,)", "(i)", "(0,)", "(77,)",
     kSession, "session_id=1"},
    {"ptt record stop 1", 3, "Poc.PocStopCallRecording", "(i)", "(1,)", "(i)", "(0,)", "(77,)",
     kSession, "session_id=1"},
    {"ptt record cancel 1", 3, "Poc.PocCancelCallRecording", "(i)", "(1,)", "(i)", "(0,)", "(77,)",
     kSession, "session_id=1"},
};

INSTANTIATE_TEST_SUITE_P(Ptt, ServiceVerbs, ::testing::ValuesIn(kPttVerbs), verb_name);

TEST_F(WithService, PttFileSendTellsWhatTheFileIs) {
    answer("Poc.PocTransferFile", "(iii)", "(0, 5, 6)");
    const SizedFile file(5);
    const std::string name = file.name().substr(file.name().rfind('/') + 1);
    const Outcome outcome = run_imsctl(split("ptt file send " + file.name() + " --to +15550101"));
    EXPECT_EQ(outcome.output, "value_1=5 value_2=6\n") << outcome.error;
    EXPECT_EQ(run_imsctl(split("ptt file send " + file.name() +
                               " --group sip:all@x --session 3 --id t-1 --description a "
                               "--type text/x --file-type b --push --start 1 --end 2 --json"))
                  .output,
              R"({"verb":"ptt file send","value_1":5,"value_2":6})"
              "\n");
    const auto calls = calls_to("Poc.PocTransferFile");
    ASSERT_EQ(calls.size(), 2u);
    const auto expect_sent = [](const Call &call, const std::string &sent) {
        EXPECT_EQ(to_text(call.body.get()), to_text(parse("(ivvv)", sent).get()));
    };
    expect_sent(calls[0],
                "(0, <[{'uri_type': <int64 0>, 'uri': <'+15550101'>, 'is_group_uri': <false>}]>, "
                "<{'file_name': <'" +
                    name +
                    "'>, 'file_size': <int64 5>, 'push': <false>, 'start': <int64 0>, 'end': "
                    "<int64 0>, 'content_type': <'image/png'>}>, <@a{sv} {}>)");
    expect_sent(calls[1],
                "(3, <[{'uri_type': <int64 1>, 'uri': <'sip:all@x'>, 'is_group_uri': <true>}]>, "
                "<{'file_name': <'" +
                    name +
                    "'>, 'file_description': <'a'>, 'file_size': <int64 5>, 'push': <true>, "
                    "'start': <int64 1>, 'end': <int64 2>, 'transfer_id': <'t-1'>, "
                    "'content_type': <'text/x'>, 'file_type': <'b'>}>, <@a{sv} {}>)");
}

TEST(PttVerbTable, ReachesEveryRequest) {
    std::set<std::string_view> methods = {"Poc.PocTransferFile"}; // above
    for (const VerbRow &row : kPttVerbs)
        methods.insert(row.method);
    EXPECT_EQ(methods.size(), 27u);
}

struct Mistake {
    const char *line;
    int status;
    const char *message;
};

constexpr Mistake kMistakes[] = {
    {"ptt adhoc", 2, "imsctl: ptt adhoc: USER"},
    {"ptt adhoc +1 --add-to 1 --remove-from 2", 2, "--add-to and --remove-from exclude each other"},
    {"ptt adhoc +1 --add-to 0", 2, "\"0\" is not a whole number from 1 to"},
    {"ptt adhoc +1 --remove-from 0", 2, "\"0\" is not a whole number from 1 to"},
    {"ptt adhoc +1 --add-to 1 --subject a", 2, "--subject has no effect with --add-to"},
    {"ptt adhoc +1 --remove-from 1 --subject a", 2, "--subject has no effect with --remove-from"},
    {"ptt adhoc +1 --add-to 1 --crisis", 2, "--crisis has no effect with --add-to"},
    {"ptt adhoc +1 --remove-from 1 --crisis", 2, "--crisis has no effect with --remove-from"},
    {"ptt adhoc +1 --add-to 1 --floor", 2, "--floor has no effect with --add-to"},
    {"ptt adhoc +1 --remove-from 1 --floor", 2, "--floor has no effect with --remove-from"},
    {"ptt adhoc +1 --add-to 1 --name Ann", 2, "--name has no effect with --add-to"},
    {"ptt adhoc +1 --remove-from 1 --name Ann", 2, "--name has no effect with --remove-from"},
    {"ptt adhoc +1 --add-to 1 --media voice", 2, "--media has no effect with --add-to"},
    {"ptt adhoc +1 --remove-from 1 --media voice", 2, "--media has no effect with --remove-from"},
    {"ptt adhoc +1 --add-to 1 --priority 0", 2, "--priority has no effect with --add-to"},
    {"ptt adhoc +1 --remove-from 1 --priority 0", 2, "--priority has no effect with --remove-from"},
    {"ptt adhoc +1 --add-to 1 --no-wait", 2, "--no-wait has no effect with --add-to"},
    {"ptt adhoc +1 --remove-from 1 --no-wait", 2, "--no-wait has no effect with --remove-from"},
    {"ptt adhoc +1 --add-to 1 --talk-time 0", 2, "--talk-time has no effect with --add-to"},
    {"ptt adhoc +1 --remove-from 1 --talk-time 0", 2,
     "--talk-time has no effect with --remove-from"},
    {"ptt adhoc +1 --remove-from 1 --automatic", 2, "--automatic has no effect with --remove-from"},
    {"ptt adhoc +1 --remove-from 1 --answer-time 0", 2,
     "--answer-time has no effect with --remove-from"},
    {"ptt modify 1 --reject --media voice", 2, "--media has no effect with --reject"},
    {"ptt modify 1 --reject --priority 0", 2, "--priority has no effect with --reject"},
    {"ptt modify 1 --reject --no-wait", 2, "--no-wait has no effect with --reject"},
    {"ptt modify 1 --reject --talk-time 0", 2, "--talk-time has no effect with --reject"},
    {"ptt modify 1 --reject --reference 1", 2, "--reference has no effect with --reject"},
    {"ptt modify 1", 2, "nothing is to change\ntry: imsctl ptt modify 1 --media voice,video"},
    {"ptt modify 1 --accept --reject", 2, "--accept and --reject exclude each other"},
    {"ptt answer one", 2, "\"one\" is not a whole number of 32 bits"},
    {"ptt answer 1 --media voice,smell", 2,
     "\"voice,smell\" is neither some of voice, video, messages, files nor four numbers"},
    {"ptt answer 1 --media 1,2,3", 2, "\"1,2,3\" is neither some of"},
    {"ptt answer 1 --priority 8", 2, "\"8\" is not a whole number from 0 to 7"},
    {"ptt floor status 1 x", 2, "\"x\" is not a whole number of 32 bits"},
    {"ptt file send /nonexistent/file", 1, "cannot read \"/nonexistent/file\": No such file"},
    {"ptt file send /tmp", 1, "cannot read \"/tmp\""},
    {"ptt talk 1 --key", 1, "standard input is no terminal"},
};

TEST_F(WithService, PttVerbsSayWhatIsWrongAndSendNothing) {
    for (const auto &[line, status, message] : kMistakes) {
        const Outcome outcome = run_imsctl(split(line));
        EXPECT_EQ(outcome.status, status) << line;
        EXPECT_THAT(outcome.error, HasSubstr(message)) << line;
    }
    for (const Call &call : peer_.calls())
        EXPECT_NE(call.interface, "org.kelvo.ims.Poc") << call.member;
}

} // namespace
} // namespace test
