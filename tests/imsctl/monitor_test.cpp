// SPDX-License-Identifier: Apache-2.0
// Every event, in both forms, and every way for the monitor to end.
#include "tests/imsctl/program.hpp"
#include "tests/support/private_bus.hpp"
#include "tests/support/scripted_peer.hpp"

#include <algorithm>
#include <csignal>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <optional>

namespace test {
namespace {

using testing::HasSubstr;

constexpr const char *kCallInterface = "org.kelvo.ims.Call";
constexpr const char *kRegistrationInterface = "org.kelvo.ims.Registration";

struct MonitoredRow {
    const char *name;
    int id;
    const char *signal;
    const char *type;
    const char *body;
    const char *json; // without event, id, slot and time
    const char *text;
    const char *interface = kCallInterface;
};

void PrintTo(const MonitoredRow &row, std::ostream *out) {
    *out << row.name;
}

const MonitoredRow kMonitoredEvents[] = {
    {"reg-registration-status", 0x101, "RegistrationStatus", "(buuiii)",
     "(true, 1, 5, 0, 200, 3600)",
     R"({"registered":true,"value_1":1,"value_2":5,"value_3":0,"value_4":200,"value_5":3600})",
     "registered=true value_1=1 value_2=5 value_3=0 value_4=200 value_5=3600: "
     "registered over LTE for voice, short messages",
     kRegistrationInterface},
    {"reg-emergency-registration-status", 0x102, "EmergencyRegistrationStatus", "(bui)",
     "(false, 4294967295, 2)", R"({"registered":false,"value_1":4294967295,"value_2":2})",
     "registered=false value_1=4294967295 value_2=2: "
     "not registered for emergency calls: flight mode",
     kRegistrationInterface},
    {"call-incoming-ind", 0x201, "CallIncomingInd", "(isisssssb)",
     "(1, 'tel:+1', 2, 'a', 'b', 'c', 'd', 'e', true)",
     R"({"session_id":1,"number":"tel:+1","call_type":2,"text_1":"a","text_2":"b","text_3":"c",
         "text_4":"d","text_5":"e","flag_1":true})",
     R"(session_id=1 number="tel:+1" call_type=2 text_1="a" text_2="b" text_3="c" text_4="d" )"
     R"(text_5="e" flag_1=true)"},
    {"call-in-progress", 0x202, "CallInProgress", "(i)", "(1,)", R"({"session_id":1})",
     "session_id=1"},
    {"call-alerting", 0x203, "CallAlerting", "(i)", "(2,)", R"({"session_id":2})", "session_id=2"},
    {"call-busy", 0x204, "CallBusy", "(i)", "(3,)", R"({"session_id":3})", "session_id=3"},
    {"call-established", 0x205, "CallEstablished", "(iibsb)", "(1, 2, true, 'x\\ny', false)",
     R"({"session_id":1,"call_type":2,"flag_1":true,"text_1":"x\ny","flag_2":false})",
     R"(session_id=1 call_type=2 flag_1=true text_1="x\ny" flag_2=false)"},
    {"call-held", 0x206, "CallHeld", "(ibi)", "(1, true, -2)",
     R"({"session_id":1,"flag_1":true,"value_1":-2})", "session_id=1 flag_1=true value_1=-2"},
    {"call-resumed", 0x207, "CallResumed", "(ibbi)", "(1, false, true, 4)",
     R"({"session_id":1,"flag_1":false,"flag_2":true,"value_1":4})",
     "session_id=1 flag_1=false flag_2=true value_1=4"},
    {"call-forwarded", 0x208, "CallForwarded", "(i)", "(4,)", R"({"session_id":4})",
     "session_id=4"},
    {"call-ended", 0x209, "CallEnded", "(ii)", "(3, 16)", R"({"session_id":3,"reason":16})",
     "session_id=3 reason=16"},
    {"call-switched", 0x20a, "CallSwitched", "(ii)", "(3, 1)", R"({"session_id":3,"call_type":1})",
     "session_id=3 call_type=1"},
    {"call-change-request", 0x20b, "CallChangeRequest", "(iis)", "(3, 1, '/w==')",
     R"({"session_id":3,"call_type":1,"data":"/w=="})", R"(session_id=3 call_type=1 data="\xff")"},
    {"call-conf-notify-received", 0x20c, "CallConfNotifyReceived", "(ivivi)",
     "(3, <[1, 2]>, 2, <['a', 'b', 'c']>, 3)",
     R"({"session_id":3,"values":[1,2],"texts":["a","b","c"]})",
     R"(session_id=3 values=[1,2] texts=["a","b","c"])"},
    {"call-early-media-start", 0x20d, "CallEarlyMediaStart", "(is)", "(3, 'tone')",
     R"({"session_id":3,"text_1":"tone"})", R"(session_id=3 text_1="tone")"},
    {"call-stop-alert-tone", 0x20e, "CallStopAlertTone", "(i)", "(5,)", R"({"session_id":5})",
     "session_id=5"},
    {"call-error", 0x20f, "CallError", "(iis)", "(3, 503, 'no \\u001b[2J')",
     R"({"session_id":3,"error_code":503,"text_1":"no \u001b[2J"})",
     R"(session_id=3 error_code=503 text_1="no \x1b[2J")"},
    {"call-conference-call-established", 0x210, "CallConfernceCallEstablished", "(ii)", "(3, 4)",
     R"({"session_id":3,"value_1":4})", "session_id=3 value_1=4"},
    {"call-conference-call-participant-added", 0x211, "CallConfernceCallParticipantAdded", "(ii)",
     "(3, 5)", R"({"session_id":3,"value_1":5})", "session_id=3 value_1=5"},
    {"call-conference-call-participant-removed", 0x212, "CallConfernceCallParticipantRemoved",
     "(ii)", "(3, 6)", R"({"session_id":3,"value_1":6})", "session_id=3 value_1=6"},
    {"call-ussd-indication", 0x213, "CallUssdIndication", "(iiis)", "(1, 2, 3, 'aGVsbG8=')",
     R"({"value_1":1,"value_2":2,"value_3":3,"data":"aGVsbG8="})",
     R"(value_1=1 value_2=2 value_3=3 data="hello")"},
    {"call-dtmf-event", 0x223, "CallDtmfEvent", "(y)", "(35,)", R"({"tone":35})", "tone='#'"},
    {"sms-incoming-sms", 0x301, "IncomingSms", "(isii)",
     "(99, 'BAiRUVUQEAAAE0CQgFEDAAPotAI=', 3, -1)",
     R"({"tpdu":"BAiRUVUQEAAAE0CQgFEDAAPotAI=","member_3":3,"member_4":-1})",
     "tpdu=0408915155101000001340908051030003e8b402 member_3=3 member_4=-1: "
     R"(message from +15550101: "hi\n")",
     kSmsInterface},
    {"sms-send-sms-ack", 0x302, "SendSmsAck", "(iiisii)", "(1, -2, 3, 'AcMAE0CQgFEDAA==', 99, 4)",
     R"({"member_1":1,"member_2":-2,"member_3":3,"tpdu":"AcMAE0CQgFEDAA==","member_6":4})",
     "member_1=1 member_2=-2 member_3=3 tpdu=01c30013409080510300 member_6=4: "
     "refused by the service centre: invalid address (cause 195)",
     kSmsInterface},
    {"sms-delivery-report-ack", 0x303, "DeliveryReportAck", "(ii)", "(1, -2)",
     R"({"member_1":1,"member_2":-2})", "member_1=1 member_2=-2", kSmsInterface},
    {"login-state", 0x501, "LoginState", "(iuii)", "(-7, 4294967295, 0, 1)",
     R"({"value_1":-7,"value_2":4294967295,"value_3":0})",
     "value_1=-7 value_2=4294967295 value_3=0: -7", "org.kelvo.ims.Login"},
};

// With 0 for every digit.
std::string shape(std::string text) {
    std::replace_if(
        text.begin(), text.end(), [](char letter) { return letter >= '0' && letter <= '9'; }, '0');
    return text;
}

class Monitor : public ::testing::Test {
  protected:
    Process &start(const std::vector<std::string> &words) {
        std::vector<std::string> all = {"monitor"};
        all.insert(all.end(), words.begin(), words.end());
        process_.emplace(imsctl_command(all), strict_environment());
        process_->wait_for_error("monitoring slot");
        return *process_;
    }

    void emit(const MonitoredRow &row) {
        peer_.emit_signal(kSlotPath, row.interface, row.signal, parse(row.type, row.body));
    }
    void emit_ended(int session_id, const char *path = kSlotPath) {
        peer_.emit_signal(path, kCallInterface, "CallEnded",
                          Variant(g_variant_ref_sink(g_variant_new("(ii)", session_id, 0))));
    }

    std::optional<PrivateBus> bus_{std::in_place};
    ScriptedPeer peer_{bus_->address()};
    std::optional<Process> process_;
};

class MonitoredEvent : public Monitor, public ::testing::WithParamInterface<MonitoredRow> {};

TEST_P(MonitoredEvent, IsOneLineForPeople) {
    const MonitoredRow &row = GetParam();
    Process &monitor = start({"--count", "1"});
    emit(row);
    EXPECT_EQ(monitor.wait(), 0);
    const std::string &line = monitor.output();
    ASSERT_GT(line.size(), 13u);
    EXPECT_EQ(shape(line.substr(0, 13)), "00:00:00.000 ");
    EXPECT_EQ(line.substr(13), row.name + std::string(" ") + row.text + "\n");
    EXPECT_EQ(monitor.error(), "monitoring slot 0\n");
}

TEST_P(MonitoredEvent, IsOneJsonObjectForPrograms) {
    const MonitoredRow &row = GetParam();
    Process &monitor = start({row.name, "--json", "--count", "1"});
    emit(row);
    EXPECT_EQ(monitor.wait(), 0);
    const auto lines = json_lines(monitor.output());
    ASSERT_EQ(lines.size(), 1u);
    Json object = lines.front();
    EXPECT_EQ(shape(object["time"]), "0000-00-00T00:00:00.000000Z");
    object.erase("time");
    Json expected = {{"event", row.name}, {"id", row.id}, {"slot", 0}};
    expected.update(Json::parse(row.json));
    EXPECT_EQ(object.dump(), expected.dump());
}

INSTANTIATE_TEST_SUITE_P(All, MonitoredEvent, ::testing::ValuesIn(kMonitoredEvents),
                         [](const ::testing::TestParamInfo<MonitoredRow> &row) {
                             return std::string(row.param.signal);
                         });

TEST_F(Monitor, ShowsAllEventsInTheirOrder) {
    Process &monitor = start({"--json", "--count", std::to_string(std::size(kMonitoredEvents))});
    for (const MonitoredRow &row : kMonitoredEvents)
        emit(row);
    EXPECT_EQ(monitor.wait(), 0);
    const auto lines = json_lines(monitor.output());
    ASSERT_EQ(lines.size(), std::size(kMonitoredEvents));
    for (std::size_t i = 0; i < lines.size(); ++i)
        EXPECT_EQ(lines[i]["event"], kMonitoredEvents[i].name);
}

TEST_F(Monitor, ShowsEachEventAtOnce) {
    Process &monitor = start({});
    emit_ended(1);
    monitor.wait_for_output("call-ended session_id=1 reason=0\n");
    emit_ended(2);
    monitor.wait_for_output("call-ended session_id=2 reason=0\n");
    monitor.send_signal(SIGINT);
    EXPECT_EQ(monitor.wait(), 0);
}

TEST_F(Monitor, ShowsOnlyTheEventsThatWereNamed) {
    Process &monitor = start({"call-busy", "call-held", "--json", "--count", "2"});
    for (const MonitoredRow &row : kMonitoredEvents)
        emit(row);
    EXPECT_EQ(monitor.wait(), 0);
    const auto lines = json_lines(monitor.output());
    ASSERT_EQ(lines.size(), 2u);
    EXPECT_EQ(lines[0]["event"], "call-busy");
    EXPECT_EQ(lines[1]["event"], "call-held");
}

TEST_F(Monitor, ShowsTheEventsOfAModuleAndTakesAnEventBehindIt) {
    Process &monitor = start({"--module", "call", "call-ended", "--count", "1"});
    emit_ended(1);
    EXPECT_EQ(monitor.wait(), 0);
    EXPECT_THAT(monitor.output(), HasSubstr("call-ended session_id=1"));
}

TEST_F(Monitor, WatchesTheSlotThatWasAskedFor) {
    Process &monitor = start({"--slot", "1", "--json", "--count", "1"});
    EXPECT_EQ(monitor.error(), "monitoring slot 1\n");
    emit_ended(1);
    emit_ended(2, "/org/kelvo/ims/sub1");
    EXPECT_EQ(monitor.wait(), 0);
    const auto lines = json_lines(monitor.output());
    ASSERT_EQ(lines.size(), 1u);
    EXPECT_EQ(lines[0]["session_id"], 2);
    EXPECT_EQ(lines[0]["slot"], 1);
}

TEST_F(Monitor, IsReadyAlsoWhenTheServiceDoesNotAnswer) {
    peer_.on("org.kelvo.ims.Call.IsInEpdgCall", Silence{});
    Process &monitor = start({"--count", "1"});
    // The answer that nobody waits for any more does no harm.
    peer_.answer(peer_.calls_to("org.kelvo.ims.Call.IsInEpdgCall").at(0).number,
                 reply("(ib)", "(0, true)"));
    emit_ended(1);
    EXPECT_EQ(monitor.wait(), 0);
}

TEST_F(Monitor, EndsWithTheTimeThatWasGiven) {
    Process &monitor = start({"--for", "0.1"});
    EXPECT_EQ(monitor.wait(), 0);
    EXPECT_EQ(monitor.output(), "");
}

class EndingSignal : public Monitor, public ::testing::WithParamInterface<int> {};

TEST_P(EndingSignal, EndsTheMonitorWithStatusZero) {
    Process &monitor = start({"--json"});
    emit_ended(1);
    monitor.wait_for_output("}\n");
    monitor.send_signal(GetParam());
    EXPECT_EQ(monitor.wait(), 0);
    EXPECT_EQ(json_lines(monitor.output()).size(), 1u);
    EXPECT_EQ(monitor.error(), "monitoring slot 0\n");
}

INSTANTIATE_TEST_SUITE_P(All, EndingSignal, ::testing::Values(SIGINT, SIGTERM, SIGHUP));

TEST(MonitorWithoutService, Fails) {
    const PrivateBus bus;
    const Outcome outcome = run_imsctl({"monitor"});
    EXPECT_EQ(outcome.status, 1);
    EXPECT_THAT(outcome.error, HasSubstr("imsctl: monitor: no IMS service for slot 0"));
}

TEST_F(Monitor, FailsWhenTheBusBreaks) {
    Process &monitor = start({"--json"});
    bus_.reset();
    EXPECT_EQ(monitor.wait(), 1);
    const auto lines = json_lines(monitor.output());
    ASSERT_EQ(lines.size(), 1u);
    EXPECT_EQ(lines[0]["error"]["kind"], "unreachable");
    EXPECT_THAT(monitor.error(), HasSubstr("the connection to the system bus broke"));
}

} // namespace
} // namespace test
