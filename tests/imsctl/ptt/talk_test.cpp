// SPDX-License-Identifier: Apache-2.0
// imsctl ptt talk against a scripted service.
#include "tests/imsctl/program.hpp"
#include "tests/support/private_bus.hpp"
#include "tests/support/scripted_peer.hpp"

#include <csignal>
#include <fcntl.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <optional>
#include <termios.h>
#include <unistd.h>

namespace test {
namespace {

using testing::HasSubstr;

constexpr const char *kRequest = "org.kelvo.ims.Poc.PocRequestFloor";
constexpr const char *kRelease = "org.kelvo.ims.Poc.PocReleaseFloor";

class PttTalk : public ::testing::Test {
  protected:
    PttTalk() {
        peer_.on(kRequest, reply("(i)", "(0,)"));
        peer_.on(kRelease, reply("(i)", "(0,)"));
    }

    Process &talk(const std::string &words) {
        process_.emplace(imsctl_command(split("ptt talk 1 " + words)), strict_environment());
        process_->wait_for_error("talking in session 1 of slot 0\n");
        return *process_;
    }

    // In a shell in which "imsctl" is the program.
    void talk_in_shell(std::string script) {
        const std::string name = "imsctl";
        script.replace(script.find(name), name.size(), "\"" + program("imsctl") + "\"");
        process_.emplace(std::vector<std::string>{"sh", "-c", script}, strict_environment());
        process_->wait_for_error("talking in session 1 of slot 0\n");
    }

    // About a session, with a cause.
    void emit_floor(const char *member, int session, int cause = 0) {
        peer_.emit_signal("/org/kelvo/ims/sub0", "org.kelvo.ims.Poc", member,
                          parse("(ivisisiiis)", "(" + std::to_string(session) +
                                                    ", <[1, 0, 0, 0]>, 0, 'tel:+1', 2, 'Ann', 1, "
                                                    "30, " +
                                                    std::to_string(cause) + ", '')"));
    }

    std::size_t calls(const char *method) const { return peer_.calls_to(method).size(); }

    PrivateBus bus_;
    ScriptedPeer peer_{bus_.address()};
    std::optional<Process> process_;
};

TEST_F(PttTalk, HasTheFloorWhileItLastsAndShowsWhoHasIt) {
    Process &process = talk("--priority 3 --name Ann");
    const auto asked = peer_.wait_for_calls(kRequest, 1);
    EXPECT_EQ(to_text(asked[0].body.get()),
              to_text(parse("(iviis)", "(1, <[0, 0, 0, 0]>, 3, 0, 'Ann')").get()));
    emit_floor("PocCallFloorQueuePosition", 1);
    emit_floor("PocCallFloorTaken", 2); // of another session
    emit_floor("PocCallFloorGranted", 1);
    process.wait_for_output("the floor is yours for 30 s\n");
    EXPECT_EQ(calls(kRelease), 0u);
    process.send_signal(SIGINT);
    EXPECT_EQ(process.wait(), 0) << process.both();
    EXPECT_THAT(process.output(), HasSubstr("session 1: waiting at position 1, \"Ann\" (tel:+1)"));
    EXPECT_THAT(process.output(), Not(HasSubstr("session 2")));
    ASSERT_EQ(calls(kRelease), 1u);
    EXPECT_EQ(to_text(peer_.calls_to(kRelease)[0].body.get()),
              to_text(parse("(iv)", "(1, <[0, 0, 0, 0]>)").get()));
}

TEST_F(PttTalk, EndsWithItsTimeAndWaitsForTheAnswerToTheRelease) {
    Process &process = talk("--for 0.2 --json");
    EXPECT_EQ(process.wait(), 0) << process.both();
    EXPECT_EQ(calls(kRequest), 1u);
    EXPECT_EQ(calls(kRelease), 1u);
}

TEST_F(PttTalk, FailsWhenTheFloorIsNotToBeHad) {
    for (const char *member :
         {"PocCallFloorRejected", "PocCallFloorCanceled", "PocCallFloorRequestTimeout"}) {
        Process &process = talk("--json");
        peer_.wait_for_calls(kRequest, 1);
        emit_floor(member, 1, 2);
        EXPECT_EQ(process.wait(), 1) << process.both();
        const auto lines = json_lines(process.output());
        ASSERT_EQ(lines.size(), 2u);
        EXPECT_EQ(lines[1]["error"]["kind"], "floor");
        EXPECT_EQ(lines[1]["error"]["session_id"], 1);
        EXPECT_EQ(lines[1]["error"]["cause"], 2);
        EXPECT_THAT(process.error(), HasSubstr("session 1: no floor, the queue is full"));
    }
    EXPECT_EQ(calls(kRelease), 0u);
}

TEST_F(PttTalk, FailsWhenTheCallEnds) {
    Process &process = talk("--json");
    peer_.wait_for_calls(kRequest, 1);
    peer_.emit_signal("/org/kelvo/ims/sub0", "org.kelvo.ims.Poc", "PocCallEnded",
                      parse("(ii)", "(1, 9)"));
    EXPECT_EQ(process.wait(), 1);
    EXPECT_EQ(json_lines(process.output()).back()["error"]["kind"], "call-ended");
    EXPECT_EQ(calls(kRelease), 0u);
}

TEST_F(PttTalk, FailsWhenTheRequestIsRefused) {
    peer_.on(kRequest, reply("(i)", "(13,)"));
    Process &process = talk("--json");
    EXPECT_EQ(process.wait(), 1);
    EXPECT_EQ(json_lines(process.output()).back()["error"]["result"], 13);
    EXPECT_THAT(process.error(), HasSubstr("the floor request: the service answered"));
    EXPECT_EQ(calls(kRelease), 0u);
}

TEST_F(PttTalk, GivesTheFloorBackWhenNobodyTakesItsOutput) {
    for (const char *reader : {"| head -1", "| :", ">/dev/full"}) {
        const std::size_t before = calls(kRequest);
        talk_in_shell("{ imsctl ptt talk 1; echo status=$? >&2; } " + std::string(reader));
        peer_.wait_for_calls(kRequest, before + 1);
        emit_floor("PocCallFloorGranted", 1);
        EXPECT_EQ(process_->wait(), 0) << reader;
        EXPECT_THAT(process_->error(), testing::EndsWith("status=1\n")) << reader;
        EXPECT_EQ(calls(kRelease), before + 1) << reader;
    }
}

TEST_F(PttTalk, EndsOnEachSignalThatAsksForIt) {
    for (const int number : {SIGINT, SIGTERM, SIGHUP}) {
        const std::size_t before = calls(kRequest);
        Process &process = talk("");
        peer_.wait_for_calls(kRequest, before + 1);
        process.send_signal(number);
        EXPECT_EQ(process.wait(), 0) << number << process.both();
        EXPECT_EQ(calls(kRelease), before + 1) << number;
    }
}

TEST_F(PttTalk, DoesNotWaitForAnybodyWhenTheBusIsGone) {
    Process &process = talk("--json");
    peer_.wait_for_calls(kRequest, 1);
    bus_.stop();
    EXPECT_EQ(process.wait(), 1);
    EXPECT_EQ(json_lines(process.output()).back()["error"]["kind"], "unreachable");
    EXPECT_EQ(calls(kRelease), 0u);
}

TEST_F(PttTalk, GivesBackWhatItMayHaveGotWithoutAnAnswer) {
    peer_.on(kRequest, failure(error_name::kNoReply));
    EXPECT_EQ(talk("").wait(), 1) << process_->both();
    EXPECT_THAT(process_->error(), HasSubstr("the floor request: "));
    EXPECT_EQ(calls(kRelease), 1u);
}

TEST_F(PttTalk, GoesOnWhenAHangUpIsIgnored) {
    talk_in_shell("trap '' HUP; exec imsctl ptt talk 1");
    peer_.wait_for_calls(kRequest, 1);
    process_->send_signal(SIGHUP);
    emit_floor("PocCallFloorGranted", 1);
    process_->wait_for_output("the floor is yours for 30 s\n");
    process_->send_signal(SIGINT);
    EXPECT_EQ(process_->wait(), 0) << process_->both();
}

// A terminal of the test's own, whose keys it presses.
class Terminal {
  public:
    Terminal() : descriptor_(posix_openpt(O_RDWR | O_NOCTTY)) {
        if (descriptor_ < 0 || grantpt(descriptor_) != 0 || unlockpt(descriptor_) != 0)
            throw std::runtime_error("no terminal");
    }
    ~Terminal() { close(descriptor_); }
    Terminal(const Terminal &) = delete;
    Terminal &operator=(const Terminal &) = delete;

    std::string name() const { return ptsname(descriptor_); }
    void press(char key) const { ASSERT_EQ(write(descriptor_, &key, 1), 1); }
    bool echoes() const {
        termios state{};
        return tcgetattr(descriptor_, &state) == 0 && (state.c_lflag & ECHO) != 0;
    }

  private:
    int descriptor_;
};

class PttTalkByKey : public PttTalk {
  protected:
    PttTalkByKey() {
        talk_in_shell("exec imsctl ptt talk 1 --key <" + terminal_.name());
        process_->wait_for_error("hold a key to talk, q ends\n");
    }

    Terminal terminal_;
};

TEST_F(PttTalkByKey, HasTheFloorWhileAKeyIsHeld) {
    EXPECT_EQ(calls(kRequest), 0u);
    terminal_.press(' ');
    peer_.wait_for_calls(kRequest, 1);
    terminal_.press(' '); // repeats itself
    peer_.wait_for_calls(kRelease, 1);
    EXPECT_EQ(calls(kRequest), 1u);

    terminal_.press('x');
    peer_.wait_for_calls(kRequest, 2);
    emit_floor("PocCallFloorRejected", 1, 1); // one may press it again
    process_->wait_for_output("no floor, taken\n");
    terminal_.press('q');
    EXPECT_EQ(process_->wait(), 0) << process_->both();
    // The second press was still held.
    EXPECT_EQ(calls(kRelease), 2u);
}

TEST_F(PttTalkByKey, GivesBackWhateverTheServiceSaidOfAnEarlierRequest) {
    terminal_.press(' ');
    peer_.wait_for_calls(kRelease, 1);
    terminal_.press(' ');
    peer_.wait_for_calls(kRequest, 2);
    emit_floor("PocCallFloorCanceled", 1, 3); // the first request
    emit_floor("PocCallFloorGranted", 1);     // the second
    process_->wait_for_output("the floor is yours for 30 s\n");
    peer_.wait_for_calls(kRelease, 2);
    terminal_.press('q');
    EXPECT_EQ(process_->wait(), 0) << process_->both();
    EXPECT_EQ(calls(kRelease), 2u);
}

TEST_F(PttTalkByKey, SaysNothingOfAReleaseThatComesTooLate) {
    peer_.on(kRelease, reply("(i)", "(13,)"));
    terminal_.press(' ');
    peer_.wait_for_calls(kRelease, 1);
    terminal_.press('q');
    EXPECT_EQ(process_->wait(), 0) << process_->both();
    EXPECT_THAT(process_->error(), testing::EndsWith("q ends\n"));
}

TEST_F(PttTalkByKey, GivesFloorAndTerminalBackWhenTheTerminalHangsUp) {
    EXPECT_FALSE(terminal_.echoes());
    terminal_.press(' ');
    peer_.wait_for_calls(kRequest, 1);
    process_->send_signal(SIGHUP);
    EXPECT_EQ(process_->wait(), 0) << process_->both();
    EXPECT_EQ(calls(kRelease), 1u);
    EXPECT_TRUE(terminal_.echoes());
}

} // namespace
} // namespace test
