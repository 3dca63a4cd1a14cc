// SPDX-License-Identifier: Apache-2.0
// Push-to-talk from end to end: three applications on three slots, the library, a bus and the
// stand-in service.
#include "tests/imsctl/sized_file.hpp"
#include "tests/imsctl/with_stand_in.hpp"

#include <csignal>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace test {
namespace {

using testing::HasSubstr;

class PttStandIn : public WithStandIn {
  protected:
    PttStandIn() : WithStandIn(3) {}

    static std::string in_slot(int slot, const std::string &line) {
        return "--slot " + std::to_string(slot) + " " + line;
    }
    static Outcome run(int slot, const std::string &line) {
        return WithStandIn::run(in_slot(slot, line));
    }
    static void expect_ok(int slot, const std::string &line) {
        WithStandIn::expect_ok(in_slot(slot, line));
    }

    // One that is watching already.
    struct Application : Watcher {
        explicit Application(int slot, const std::string &words = "ptt watch")
            : Watcher(in_slot(slot, words)) {}
    };
};

// All three in one group call, which slot 0 places.
class PttGroupCall : public PttStandIn {
  protected:
    PttGroupCall() {
        EXPECT_EQ(run(0, "ptt call sip:all@groups.invalid --type group").output, "session_id=1\n");
        for (int slot = 1; slot < 3; ++slot) {
            applications_[slot].wait_for_output("session 1: group call from ");
            expect_ok(slot, "ptt answer 1");
        }
        for (Application &application : applications_)
            application.wait_for_output("group call with ");
    }

    Application applications_[3]{Application(0), Application(1), Application(2)};
};

TEST_F(PttGroupCall, GivesTheFloorToOneAndThenToTheOther) {
    expect_ok(1, "ptt floor request 1 --name Bea");
    applications_[1].wait_for_output("session 1: the floor is yours for 30 s\n");
    applications_[0].wait_for_output("\"Bea\" (tel:+15550101) has the floor\n");
    expect_ok(2, "ptt floor request 1 --name Cem");
    applications_[2].wait_for_output("session 1: waiting at position 1, \"Bea\" (tel:+15550101)");
    EXPECT_THAT(run(2, "ptt floor status 1").output, HasSubstr("1        waiting  3"));
    expect_ok(1, "ptt floor release 1");
    applications_[2].wait_for_output("session 1: the floor is yours for 30 s\n");
    applications_[0].wait_for_output("\"Cem\" (tel:+15550102) has the floor\n");
    expect_ok(2, "ptt floor release 1");
    EXPECT_THAT(run(0, "ptt floor status 1").output, HasSubstr("1        idle     3"));
    expect_ok(0, "ptt end 1 --scope all");
    for (Application &application : applications_)
        application.wait_for_output("session 1: ended ");
}

// Whichever comes first: one has it, the other waits at position 1 until it is given back.
TEST_F(PttGroupCall, DecidesBetweenTwoWhoAskAtOnce) {
    Application talkers[] = {Application(1, "ptt talk 1 --json --name Speaker"),
                             Application(2, "ptt talk 1 --json --name Speaker")};
    applications_[0].wait_for_output("session 1: \"Speaker\" (tel:+1555010");
    const bool is_first =
        applications_[0].output().find("\"Speaker\" (tel:+15550101)") != std::string::npos;
    const int winner = is_first ? 0 : 1;
    Application &speaker = talkers[winner];
    Application &waiting = talkers[1 - winner];
    speaker.wait_for_output("poc-call-floor-granted");
    waiting.wait_for_output("poc-call-floor-queue-position");
    EXPECT_THAT(waiting.output(), Not(HasSubstr("poc-call-floor-granted")));
    for (const Json &line : json_lines(waiting.output()))
        if (line["event"] == "poc-call-floor-queue-position") {
            EXPECT_EQ(line["value_4"], 1);
        }
    speaker.send_signal(SIGTERM);
    EXPECT_EQ(speaker.wait(), 0) << speaker.both();
    waiting.wait_for_output("poc-call-floor-granted");
    waiting.send_signal(SIGTERM);
    EXPECT_EQ(waiting.wait(), 0) << waiting.both();
    EXPECT_THAT(run(0, "ptt floor status 1").output, HasSubstr("1        idle     3"));
}

TEST_F(PttGroupCall, CarriesOtherMediaRecordingsAndMessages) {
    expect_ok(0, "ptt modify 1 --media voice,video,messages,files --reference 5");
    for (int slot = 1; slot < 3; ++slot) {
        applications_[slot].wait_for_output("a party asks for voice, video, messages, files\n");
        expect_ok(slot, slot == 1 ? "ptt modify 1 --accept" : "ptt modify 1 --reject");
    }
    applications_[0].wait_for_output("session 1: changed, voice, video, messages, files\n");
    expect_ok(0, "ptt crisis 1");
    applications_[2].wait_for_output("session 1: a crisis call from now on\n");

    EXPECT_THAT(run(0, "ptt record start 1").output, HasSubstr("record_state=1"));
    expect_ok(0, "ptt record pause 1");
    expect_ok(0, "ptt record resume 1");
    expect_ok(0, "ptt record cancel 1");

    expect_ok(0, "ptt message send Hello --session 1 --notices both");
    applications_[1].wait_for_output("message 1 from tel:+15550100: \"Hello\"\n");
    expect_ok(1, "ptt message notify 1 read");
    applications_[0].wait_for_output("message 1: read by tel:+15550101\n");
    expect_ok(0, "ptt keep-alive 0");
}

TEST_F(PttStandIn, CarriesAFileOfOneMebibyteWithProgress) {
    constexpr int kSize = 1 << 20;
    const SizedFile file(kSize);
    Application sender(0, "ptt watch --json");
    Application receiver(1, "ptt watch --json");
    expect_ok(0, "ptt file send " + file.name() + " --to +15550101 --id t-1");
    receiver.wait_for_output("poc-incoming-file-transfer");
    EXPECT_EQ(run(1, "ptt file accept t-1").output,
              "value_1=1 value_2=" + std::to_string(kSize) + "\n");
    for (Application *end : {&sender, &receiver}) {
        end->wait_for_output("poc-file-transfer-terminated");
        end->send_signal(SIGTERM);
        EXPECT_EQ(end->wait(), 0);
        int bytes = 0;
        int steps = 0;
        for (const Json &line : json_lines(end->output())) {
            if (line["event"] == "poc-file-transfer-progress") {
                EXPECT_GT(line["value_2"], bytes);
                bytes = line["value_2"];
                EXPECT_EQ(line["value_3"], kSize);
                ++steps;
            }
            if (line["event"] == "poc-file-transfer-terminated") {
                EXPECT_EQ(line["value_2"], 0); // complete
            }
        }
        EXPECT_EQ(bytes, kSize);
        EXPECT_GT(steps, 1);
    }
    const Json offer = json_lines(receiver.output()).front();
    EXPECT_EQ(offer["attributes"]["file_size"], kSize);
    EXPECT_EQ(offer["attributes"]["content_type"], "image/png");
    EXPECT_EQ(offer["peer_1"]["uri"], "tel:+15550100");
}

TEST_F(PttStandIn, MakesGroupsAsTheyAreNeeded) {
    Application host(0);
    Application guest(1);
    EXPECT_EQ(run(0, "ptt adhoc +15550101 --subject lunch").output, "session_id=1\n");
    guest.wait_for_output("\"lunch\"\n");
    guest.wait_for_output("session 1: ad hoc call from ");
    expect_ok(1, "ptt answer 1");
    host.wait_for_output("session 1: ad hoc call with ");
    Application late(2);
    expect_ok(0, "ptt adhoc +15550102 --add-to 1");
    late.wait_for_output("session 1: ad hoc call from ");
    expect_ok(2, "ptt reject 1 --reason busy");
    expect_ok(0, "ptt adhoc +15550101 --remove-from 1");
    guest.wait_for_output("session 1: removed\n");
}

TEST_F(PttStandIn, CarriesCallsOnChannels) {
    Application listener(1);
    expect_ok(0, "ptt channel 5");
    expect_ok(1, "ptt channel 5 --mode listen");
    EXPECT_EQ(run(0, "ptt call --type channel").output, "session_id=1\n");
    listener.wait_for_output("session 1: channel call with ");
    // It only listens.
    const Outcome talk = run(1, "ptt talk 1 --json");
    EXPECT_EQ(talk.status, 1);
    EXPECT_EQ(json_lines(talk.output).back()["error"]["kind"], "floor") << talk.output;
}

TEST_F(PttStandIn, RefusesWhatMakesNoSense) {
    for (const char *line : {"ptt answer 9", "ptt end 9", "ptt floor request 9", "ptt crisis 9",
                             "ptt modify 9 --media voice", "ptt record start 9"}) {
        const Outcome outcome = run(0, line + std::string(" --json"));
        EXPECT_EQ(outcome.status, 1) << line;
        EXPECT_EQ(outcome.json()["error"]["result"], 12) << line;
    }
}

} // namespace
} // namespace test
