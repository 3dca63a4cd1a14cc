// SPDX-License-Identifier: Apache-2.0
// From end to end: imsctl, the library, a bus and the stand-in service.
#include "tests/imsctl/with_stand_in.hpp"

#include <csignal>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace test {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;

class StandIn : public WithStandIn {
  protected:
    // A call from slot 0 to slot 1 that both sides follow.
    void connect_slots() {
        Process ring(imsctl_command(split("--slot 1 monitor call-incoming-ind --count 1")),
                     strict_environment());
        ring.wait_for_error("monitoring slot 1");
        Process dial(imsctl_command(split("call dial +15550101 --wait")), strict_environment());
        ASSERT_EQ(ring.wait(), 0) << ring.both();
        ASSERT_EQ(run_imsctl(split("--slot 1 call answer")).output, "session_id=1\n");
        ASSERT_EQ(dial.wait(), 0) << dial.both();
        EXPECT_THAT(dial.output(), HasSubstr("call-in-progress session_id=1"));
        EXPECT_THAT(dial.output(), HasSubstr("call 1 is established\n"));
    }

    static Json calls(int slot) {
        return run_imsctl({"call", "list", "--json", "--slot", std::to_string(slot)})
            .json()["calls"];
    }
};

TEST_F(StandIn, CarriesACallFromSlotToSlot) {
    connect_slots();
    EXPECT_EQ(calls(0)[0]["bmocall"], true);
    EXPECT_EQ(calls(1)[0]["bmocall"], false);

    Process listener(imsctl_command(split("--slot 1 monitor --json --count 6")),
                     strict_environment());
    listener.wait_for_error("monitoring");
    EXPECT_EQ(run_imsctl(split("call hold")).status, 0);
    EXPECT_EQ(run_imsctl(split("call resume")).status, 0);
    EXPECT_EQ(run_imsctl(split("call dtmf 1#2")).status, 0);
    EXPECT_EQ(run_imsctl(split("call end")).status, 0);
    EXPECT_EQ(listener.wait(), 0);
    std::vector<std::string> events;
    for (const Json &line : json_lines(listener.output()))
        events.push_back(line["event"]);
    EXPECT_THAT(events, ElementsAre("call-held", "call-resumed", "call-dtmf-event",
                                    "call-dtmf-event", "call-dtmf-event", "call-ended"));
    EXPECT_EQ(run_imsctl(split("call list")).output, "no calls\n");
    EXPECT_TRUE(calls(1).empty());
}

TEST_F(StandIn, TellsTheCallerWhyThereIsNoCall) {
    const Outcome busy = run_imsctl(split("call dial +15550200 --wait"));
    EXPECT_EQ(busy.status, 1);
    EXPECT_THAT(busy.error, HasSubstr("call 1 ended (reason 2): the number is busy"));
    const Outcome nobody = run_imsctl(split("call dial +15550211 --wait"));
    EXPECT_EQ(nobody.status, 1);
    EXPECT_THAT(nobody.error, HasSubstr("call 2 ended (reason 6): error 404, \"nobody"));
    const Outcome declined = run_imsctl(split("call dial +15550206 --wait --json"));
    EXPECT_EQ(declined.status, 1);
    EXPECT_EQ(declined.json()["error"]["kind"], "call-ended");
    EXPECT_THAT(declined.error, HasSubstr(": declined"));
}

TEST_F(StandIn, GivesTheEventsOfACallThatWasFollowed) {
    const Json object = run_imsctl(split("call dial +15550150 --wait --json")).json();
    EXPECT_EQ(object["session_id"], 1);
    EXPECT_EQ(object["outcome"], "established");
    std::vector<std::string> events;
    for (const Json &event : object["events"])
        events.push_back(event["event"]);
    EXPECT_THAT(events, ElementsAre("call-in-progress", "call-alerting", "call-established"));
}

TEST_F(StandIn, RefusesWhatMakesNoSense) {
    const Outcome outcome = run_imsctl(split("call hold 7 --json"));
    EXPECT_EQ(outcome.status, 1);
    EXPECT_EQ(outcome.json()["error"]["kind"], "service");
    EXPECT_THAT(outcome.error, HasSubstr("the service answered with result 12\n"
                                         "what ims-sim means by 12: there is no such session;"));
    EXPECT_EQ(run_imsctl(split("--slot 7 call list")).status, 1);
}

TEST_F(StandIn, ActsOnEveryKindOfVerb) {
    ASSERT_EQ(run_imsctl(split("call dial +15550150 --wait")).status, 0);
    const struct {
        const char *words;
        const char *output;
    } steps[] = {
        {"call mute toggle", "session_id=1\n"},
        {"call mute status", "session_id=1 muted=true\n"},
        {"call volume max", "session_id=1 max_volume=10\n"},
        {"call volume set 10", "session_id=1\n"},
        {"call speaker on", "session_id=1\n"},
        {"call record start --file a.wav", "session_id=1\n"},
        {"call record stop", "session_id=1\n"},
        {"call dtmf --start 5", "session_id=1\n"},
        {"call dtmf --stop", "session_id=1\n"},
        {"call tty mode set full", "ok\n"},
        {"call tty send hello", "session_id=1\n"},
        {"call tty mode get", "value_1=1 value_2=5 data=\"hello\"\n"},
        {"call epdg audio-path epdg", "ok\n"},
        {"call epdg status", "in_epdg_call=true\n"},
        {"call srvcc started", "session_id=1\n"},
        {"call srvcc failed", "session_id=1\n"},
        {"call ssac on --voice-factor 50 --voice-time 16", "ok\n"},
        {"call ssac off", "ok\n"},
        {"call auto-response busy", "ok\n"},
        {"call emergency-pdn set rmnet1 192.0.2.1 --local 192.0.2.7", "ok\n"},
        {"call emergency-pdn register", "ok\n"},
        {"call emergency-pdn deregister", "ok\n"},
        {"call ussd *100#", "ok\n"},
        {"call hold", "session_id=1\n"},
    };
    for (const auto &step : steps) {
        const Outcome outcome = run_imsctl(split(step.words));
        EXPECT_EQ(outcome.output, step.output) << step.words << '\n' << outcome.error;
        EXPECT_EQ(outcome.status, 0) << step.words;
    }
    ASSERT_EQ(run_imsctl(split("call dial +15550151 --wait")).status, 0);
    EXPECT_EQ(run_imsctl(split("call swap")).output, "ok\n");
    EXPECT_EQ(run_imsctl(split("call conference merge")).output, "session_id=3\n");
    EXPECT_EQ(run_imsctl(split("call conference add-user +15550152 --session 3")).status, 0);
    EXPECT_EQ(run_imsctl(split("call conference nway remove 1 --session 3")).status, 0);
    EXPECT_EQ(run_imsctl(split("call conference modify remove +15550151 --session 3")).status, 0);
    EXPECT_EQ(run_imsctl(split("call end 3")).status, 0);
}

TEST(RunByTheStandIn, FindsTheBusThatIsMadeForIt) {
    Process process({program("ims-sim"), "run", "--", program("imsctl"), "call", "list", "--json"},
                    strict_environment());
    EXPECT_EQ(process.wait(), 0) << process.both();
    EXPECT_EQ(Json::parse(process.output()), Json::parse(R"({"verb":"call list","calls":[]})"));
}

TEST(RunByTheStandIn, PassesOnTheExitStatus) {
    Process failed({program("ims-sim"), "run", "--", program("imsctl"), "call", "end", "1"},
                   strict_environment());
    EXPECT_EQ(failed.wait(), 1) << failed.both();
    Process misused({program("ims-sim"), "run", "--", program("imsctl"), "call", "dail"},
                    strict_environment());
    EXPECT_EQ(misused.wait(), 2) << misused.both();
}

} // namespace
} // namespace test
