// SPDX-License-Identifier: Apache-2.0
// What the shell is offered.
#include "tests/imsctl/in_process.hpp"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sstream>

namespace imsctl {
namespace {

using testing::Contains;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::SizeIs;

std::vector<std::string> completed(const std::vector<std::string> &words) {
    std::vector<std::string> all = {"__complete"};
    all.insert(all.end(), words.begin(), words.end());
    const Outcome outcome = run_words(all);
    EXPECT_EQ(outcome.status, 0);
    EXPECT_EQ(outcome.error, "");
    return split(outcome.output);
}

TEST(Completion, OffersVerbs) {
    EXPECT_THAT(completed({""}),
                ElementsAre("call", "registration", "flight-mode", "login", "logout", "login-state",
                            "sms", "ss", "settings", "network-environment", "profile", "ptt",
                            "group", "vt", "monitor", "completion"));
    EXPECT_THAT(completed({"c"}), ElementsAre("call", "completion"));
    EXPECT_THAT(completed({"call", "re"}),
                ElementsAre("reject", "resume", "reject-change", "record"));
    EXPECT_THAT(completed({"call", "tty", "mode", ""}), ElementsAre("get", "set"));
    EXPECT_THAT(completed({"ss", "waiting", ""}), ElementsAre("get", "set"));
    EXPECT_THAT(completed({"--slot", "1", "--json", "login"}), ElementsAre("login", "login-state"));
    EXPECT_THAT(completed({}), IsEmpty());
}

TEST(Completion, OffersOptions) {
    EXPECT_THAT(completed({"sms", "send", "--re"}), ElementsAre("--reference", "--report"));
    EXPECT_THAT(completed({"--slot", "1", "call", "dial", "--t"}),
                ElementsAre("--text-1", "--text-2", "--text-3", "--text-4", "--timeout", "--type"));
    EXPECT_THAT(completed({"monitor", "--mod"}), ElementsAre("--module"));
}

TEST(Completion, OffersTheValuesOfOptions) {
    EXPECT_THAT(completed({"call", "dial", "--type", ""}),
                ElementsAre("voice", "video", "emergency"));
    EXPECT_THAT(completed({"call", "dial", "+15550101", "--type", "vi"}), ElementsAre("video"));
    // bash takes "--type=vi" apart.
    EXPECT_THAT(completed({"call", "dial", "--type", "="}), SizeIs(3));
    EXPECT_THAT(completed({"call", "dial", "--type", "=", "vi"}), ElementsAre("video"));
    EXPECT_THAT(completed({"monitor", "--module", ""}),
                ElementsAre("reg", "call", "sms", "poc", "login"));
    EXPECT_THAT(completed({"--slot", ""}), IsEmpty());
    EXPECT_THAT(completed({"call", "dial", "--text-1", ""}), IsEmpty());
}

TEST(Completion, OffersTheValuesOfArguments) {
    EXPECT_THAT(completed({"ss", "forwarding", "set", "no"}),
                ElementsAre("no-reply", "not-reachable"));
    EXPECT_THAT(completed({"ss", "forwarding", "set", "busy", ""}), ElementsAre("off", "on"));
    EXPECT_THAT(completed({"ss", "forwarding", "set", "--class", "voice", "busy", ""}),
                ElementsAre("off", "on"));
    EXPECT_THAT(completed({"ss", "forwarding", "set", "busy", "on", ""}), IsEmpty());
    EXPECT_THAT(completed({"completion", ""}), ElementsAre("bash"));
    EXPECT_THAT(completed({"call", "dial", ""}), IsEmpty());
}

TEST(Completion, OffersEvents) {
    EXPECT_THAT(
        completed({"monitor", "call-e"}),
        ElementsAre("call-established", "call-ended", "call-early-media-start", "call-error"));
    EXPECT_THAT(completed({"monitor", "call-ended", "sms-"}),
                ElementsAre("sms-incoming-sms", "sms-send-sms-ack", "sms-delivery-report-ack"));
}

TEST(Completion, OffersKeys) {
    EXPECT_THAT(completed({"settings", "get", "default", "poc_r"}),
                ElementsAre("poc_ringing_timer"));
    EXPECT_THAT(completed({"settings", "get", "default", "pip", "poc_r"}),
                ElementsAre("poc_ringing_timer"));
    EXPECT_THAT(completed({"profile", "show", "1", "mtu"}), ElementsAre("mtuSize"));
    // The set's own name is for the service to know.
    EXPECT_THAT(completed({"settings", "get", "i"}), IsEmpty());
}

TEST(Completion, OffersKeysToAssignTo) {
    EXPECT_THAT(completed({"settings", "set", "default", "poc_r"}),
                ElementsAre("poc_ringing_timer="));
    EXPECT_THAT(completed({"settings", "add", "new", "id=3", "poc_r"}),
                ElementsAre("poc_ringing_timer="));
    EXPECT_THAT(completed({"profile", "set", "1", "port"}), ElementsAre("port="));
    EXPECT_THAT(completed({"profile", "add", "new", "--from", "1", "port"}), ElementsAre("port="));
    // Those that take no value are left out.
    EXPECT_THAT(completed({"settings", "set", "default", "audio_port_e"}),
                ElementsAre("audio_port_end_B2BPTT=", "audio_port_end_MCPTT="));
    EXPECT_THAT(completed({"settings", "set", "default", ""}), SizeIs(332));
    // Behind the "=" stands a value, not a key.
    EXPECT_THAT(completed({"settings", "set", "default", "id", "="}), IsEmpty());
    EXPECT_THAT(completed({"settings", "set", "default", "id", "=", "p"}), IsEmpty());
    EXPECT_THAT(completed({"settings", "set", "default", "id", "=", "3", "pip"}), Contains("pip="));
}

TEST(Completion, HasAScriptThatAsksTheProgram) {
    const Outcome outcome = run_line("completion bash");
    EXPECT_EQ(outcome.status, 0);
    EXPECT_THAT(outcome.output, HasSubstr("__complete"));
    EXPECT_THAT(outcome.output, HasSubstr("complete -o default -F _imsctl imsctl\n"));
}

} // namespace
} // namespace imsctl
