// SPDX-License-Identifier: Apache-2.0
// Registration, login, delivery reports and supplementary services against a scripted service: what
// each verb sends, and what it shows of the reply.
#include "tests/imsctl/verb_checks.hpp"

#include <gmock/gmock.h>

namespace test {
namespace {

constexpr const char *kWaitingList = "(0, 2, [{'ss_class': <1>, 'ss_status': <1>}, "
                                     "{'ss_class': <2>, 'ss_status': <0>}])";
constexpr const char *kForwardingList =
    "(0, 1, [{'ss_class': <2>, 'ss_status': <1>, 'cf_type': <2>, 'no_reply_time': <20>, "
    "'cf_uri_length': <13>, 'cf_uri_type': <0>, 'cf_uri': <'tel:+1\\u001b[1m'>}])";
constexpr const char *kBarringList =
    "(0, 1, [{'ss_class': <9>, 'ss_status': <0>, 'cb_type': <3>}])";

// The application id is 42.
const VerbRow kServiceVerbs[] = {
    {"flight-mode", 1, "Registration.EnableFlightMode", "", "", "(i)", "(0,)", "(77,)", "{}", "ok"},
    {"login alice secret", 1, "Login.Login", "(ssii)", "('alice', 'secret', 0, 42)", "(i)", "(0,)",
     "(77,)", "{}", "ok"},
    {"login bob pass --kind push-to-talk", 1, "Login.Login", "(ssii)", "('bob', 'pass', 1, 42)",
     "(i)", "(0,)", "(77,)", "{}", "ok"},
    {"logout", 1, "Login.Logout", "(i)", "(42,)", "(i)", "(0,)", "(77,)", "{}", "ok"},
    {"sms report", 2, "Sms.SendDeliverReport", "(iisii)", "(42, 0, 'AAA=', 2, 0)", "(iiii)",
     "(0, 1, 2, 3)", "(77, 0, 0, 0)", "{}", "ok"},
    {"sms report 7 --failure memory-exceeded", 2, "Sms.SendDeliverReport", "(iisii)",
     "(42, 22, 'ANMA', 3, 7)", "(iiii)", "(0, 1, 2, 3)", "(77, 0, 0, 0)", "{}", "ok"},
    {"sms report 7 --failure 128", 2, "Sms.SendDeliverReport", "(iisii)", "(42, 111, 'AIAA', 3, 7)",
     "(iiii)", "(0, 1, 2, 3)", "(77, 0, 0, 0)", "{}", "ok"},
    {"sms report --failure sim-full --code 5", 2, "Sms.SendDeliverReport", "(iisii)",
     "(42, 5, 'ANAA', 3, 0)", "(iiii)", "(0, 1, 2, 3)", "(77, 0, 0, 0)", "{}", "ok"},
    {"ss waiting set off", 3, "Ss.SetCallWaiting", "(iii)", "(42, 3, 0)", "(i)", "(0,)", "(77,)",
     "{}", "ok"},
    {"ss waiting set on --class video", 3, "Ss.SetCallWaiting", "(iii)", "(42, 2, 1)", "(i)",
     "(0,)", "(77,)", "{}", "ok"},
    {"ss waiting set 7 --class 16", 3, "Ss.SetCallWaiting", "(iii)", "(42, 16, 7)", "(i)", "(0,)",
     "(77,)", "{}", "ok"},
    {"ss waiting get", 3, "Ss.GetCallWaiting", "(ii)", "(42, 3)", "(iuaa{sv})", kWaitingList,
     "(77, 0, [])", R"({"entries":[{"ss_class":1,"ss_status":1},{"ss_class":2,"ss_status":0}]})",
     "CLASS  STATUS\nvoice  on\nvideo  off"},
    {"ss waiting get --class voice", 3, "Ss.GetCallWaiting", "(ii)", "(42, 1)", "(iuaa{sv})",
     "(0, 0, [])", "(77, 0, [])", R"({"entries":[]})", "the service lists nothing",
     "Waiting status list count is NOT valid - Count: [0]"},
    {"ss forwarding set busy on --to +15550101", 3, "Ss.SetCallForwarding", "(iiiiiiis)",
     "(42, 3, 1, 1, 0, 9, 0, '+15550101')", "(i)", "(0,)", "(77,)", "{}", "ok"},
    {"ss forwarding set no-reply on --to sip:a@b --after 15 --class voice", 3,
     "Ss.SetCallForwarding", "(iiiiiiis)", "(42, 1, 1, 2, 15, 7, 1, 'sip:a@b')", "(i)", "(0,)",
     "(77,)", "{}", "ok"},
    {"ss forwarding set all off", 3, "Ss.SetCallForwarding", "(iiiiiiis)",
     "(42, 3, 0, 4, 0, 0, 0, '')", "(i)", "(0,)", "(77,)", "{}", "ok"},
    {"ss forwarding get", 3, "Ss.GetCallForwarding", "(iii)", "(42, 3, 4)", "(iuaa{sv})",
     kForwardingList, "(77, 0, [])",
     R"({"entries":[{"ss_class":2,"ss_status":1,"cf_type":2,"no_reply_time":20,)"
     R"("cf_uri_length":13,"cf_uri_type":0,"cf_uri":"tel:+1\u001b[1m"}]})",
     "CLASS  STATUS  CONDITION  SECONDS  TARGET\n"
     "video  on      no-reply   20       tel:+1\\x1b[1m"},
    {"ss forwarding get not-reachable --class 0", 3, "Ss.GetCallForwarding", "(iii)", "(42, 0, 3)",
     "(iuaa{sv})", "(0, 1, [{'ss_class': <1>}])", "(77, 0, [])",
     R"({"entries":[{"ss_class":1,"ss_status":0,"cf_type":0,"no_reply_time":0,)"
     R"("cf_uri_length":0,"cf_uri_type":0,"cf_uri":null}]})",
     "CLASS  STATUS  CONDITION      SECONDS  TARGET\n"
     "voice  off     unconditional  0        -"},
    {"ss barring set incoming on --password 0000", 3, "Ss.SetCallBarring", "(iiiis)",
     "(42, 3, 1, 3, '0000')", "(i)", "(0,)", "(77,)", "{}", "ok"},
    {"ss barring set all off --password 1234 --class voice", 3, "Ss.SetCallBarring", "(iiiis)",
     "(42, 1, 0, 5, '1234')", "(i)", "(0,)", "(77,)", "{}", "ok"},
    {"ss barring get", 3, "Ss.GetCallBarring", "(iii)", "(42, 3, 5)", "(iuaa{sv})", kBarringList,
     "(77, 0, [])", R"({"entries":[{"ss_class":9,"ss_status":0,"cb_type":3}]})",
     "CLASS  STATUS  CALLS\n9      off     incoming"},
    {"ss barring get outgoing-international --class video", 3, "Ss.GetCallBarring", "(iii)",
     "(42, 2, 1)", "(iuaa{sv})", kBarringList, "(77, 0, [])",
     R"({"entries":[{"ss_class":9,"ss_status":0,"cb_type":3}]})",
     "CLASS  STATUS  CALLS\n9      off     incoming"},
};

INSTANTIATE_TEST_SUITE_P(All, ServiceVerbs, ::testing::ValuesIn(kServiceVerbs), verb_name);

constexpr const char *kGetRegistrationInfo = "Registration.GetRegistrationInfo";
constexpr const char *kGetLoginState = "Login.GetLoginState";

TEST_F(WithService, ShowsTheRegistration) {
    answer(kGetRegistrationInfo, "(buuiiii)", "(true, 1, 4294967295, 0, 200, -3600, 0)");
    const Outcome for_people = run_imsctl({"registration", "show"});
    EXPECT_EQ(for_people.status, 0) << for_people.error;
    EXPECT_EQ(for_people.output,
              "registered=true value_1=1 value_2=4294967295 value_3=0 value_4=200 value_5=-3600: "
              "registered over LTE for voice, video, short messages, USSD, 4294967280\n");
    EXPECT_EQ(run_imsctl({"registration", "show", "--json"}).output,
              R"({"verb":"registration show","registered":true,"value_1":1,"value_2":4294967295,)"
              R"("value_3":0,"value_4":200,"value_5":-3600})"
              "\n");
    EXPECT_EQ(calls_to(kGetRegistrationInfo).at(0).signature, "");
}

TEST_F(WithService, ShowsTheLoginStateOfAKind) {
    answer(kGetLoginState, "(iiui)", "(0, 2, 4294967295, -1)");
    const Outcome for_people = run_imsctl({"login-state"});
    EXPECT_EQ(for_people.status, 0) << for_people.error;
    EXPECT_EQ(for_people.output, "value_1=2 value_2=4294967295 value_3=-1: logged in\n");
    EXPECT_EQ(run_imsctl({"login-state", "--kind", "7", "--json"}).output,
              R"({"verb":"login-state","value_1":2,"value_2":4294967295,"value_3":-1})"
              "\n");
    const auto calls = calls_to(kGetLoginState);
    ASSERT_EQ(calls.size(), 2u);
    EXPECT_EQ(to_text(calls[0].body.get()), to_text(parse("(ii)", "(0, 42)").get()));
    EXPECT_EQ(to_text(calls[1].body.get()), to_text(parse("(ii)", "(7, 42)").get()));
}

TEST_F(WithService, FailsWhenAQueryDoes) {
    answer(kGetRegistrationInfo, "(buuiiii)", "(true, 1, 2, 3, 4, 5, 6)");
    answer(kGetLoginState, "(iiui)", "(5, 0, 0, 0)");
    for (const char *line : {"registration show --json", "login-state --json"}) {
        const Outcome outcome = run_imsctl(split(line));
        EXPECT_EQ(outcome.status, 1) << line;
        EXPECT_EQ(outcome.json()["error"]["kind"], "unreachable") << line;
    }
}

TEST_F(WithService, EndsAQueryWithTheTimeThatWasGiven) {
    peer_.on("org.kelvo.ims." + std::string(kGetRegistrationInfo), Silence{});
    const Outcome outcome = run_imsctl(split("registration show --timeout 0.2 --json"));
    EXPECT_EQ(outcome.status, 1);
    EXPECT_EQ(outcome.json()["error"]["kind"], "timeout");
}

TEST_F(WithService, RegistersASecondTimeWithoutParameters) {
    peer_.on(kRegisterApplication, [](const Call &call) {
        return call.signature.empty() ? reply("(ii)", "(0, 9)") : reply("(ii)", "(0, 42)");
    });
    const Outcome for_people = run_imsctl({"registration", "register"});
    EXPECT_EQ(for_people.output, "application_id=9\n") << for_people.error;
    const Outcome for_programs = run_imsctl({"registration", "register", "--json"});
    EXPECT_EQ(for_programs.output, R"({"verb":"registration register","application_id":9})"
                                   "\n");
    EXPECT_EQ(peer_.calls_to(kRegisterApplication).size(), 4u);
}

TEST_F(WithService, TellsWhenRegisteringAgainIsRefused) {
    peer_.on(kRegisterApplication, [](const Call &call) {
        return call.signature.empty() ? reply("(ii)", "(77, 0)") : reply("(ii)", "(0, 42)");
    });
    const Outcome outcome = run_imsctl({"registration", "register", "--json"});
    EXPECT_EQ(outcome.status, 1);
    EXPECT_EQ(outcome.json()["error"]["result"], 77);
}

TEST_F(WithService, WatchesTheRegistrationAlone) {
    Process watch(imsctl_command(split("registration watch --count 2 --json")),
                  strict_environment());
    watch.wait_for_error("watching the registration of slot 0\n");
    const auto emit = [&](const char *interface, const char *member, const Variant &body) {
        peer_.emit_signal("/org/kelvo/ims/sub0", interface, member, body);
    };
    emit("org.kelvo.ims.Login", "LoginState", parse("(iuii)", "(1, 1, 0, 0)"));
    emit("org.kelvo.ims.Registration", "EmergencyRegistrationStatus",
         parse("(bui)", "(true, 1, 0)"));
    emit("org.kelvo.ims.Registration", "RegistrationStatus",
         parse("(buuiii)", "(false, 0, 0, 2, 0, 0)"));
    EXPECT_EQ(watch.wait(), 0) << watch.both();
    const auto lines = json_lines(watch.output());
    ASSERT_EQ(lines.size(), 2u);
    EXPECT_EQ(lines[0]["event"], "reg-emergency-registration-status");
    EXPECT_EQ(lines[1]["registered"], false);
}

} // namespace
} // namespace test
