// SPDX-License-Identifier: Apache-2.0
// What imsctl says, and how it exits, when something is in the way.
#include "tests/imsctl/program.hpp"
#include "tests/support/private_bus.hpp"
#include "tests/support/scripted_peer.hpp"

#include <csignal>
#include <cstdlib>
#include <fstream>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <optional>

namespace test {
namespace {

using testing::HasSubstr;

constexpr const char *kHoldCall = "org.kelvo.ims.Call.HoldCall";
constexpr const char *kMakeCall = "org.kelvo.ims.Call.MakeCall";
constexpr const char *kCallListInfo = "org.kelvo.ims.Call.CallListInfo";

std::string kind_of(const Outcome &outcome) {
    return outcome.json()["error"]["kind"];
}

class Failures : public ::testing::Test {
  protected:
    // Both forms: the object for programs and the sentence for people.
    void expect_failure(const std::vector<std::string> &words, const std::string &kind,
                        const std::string &sentence, const Environment &more = {}) {
        const Outcome for_people = run_imsctl(words, more);
        EXPECT_EQ(for_people.status, 1);
        EXPECT_EQ(for_people.output, "");
        EXPECT_THAT(for_people.error, HasSubstr("imsctl: call "));
        EXPECT_THAT(for_people.error, HasSubstr(sentence));

        auto with_json = words;
        with_json.push_back("--json");
        const Outcome for_programs = run_imsctl(with_json, more);
        EXPECT_EQ(for_programs.status, 1);
        EXPECT_EQ(kind_of(for_programs), kind);
        EXPECT_THAT(std::string(for_programs.json()["error"]["message"]), HasSubstr(sentence));
        EXPECT_THAT(for_programs.error, HasSubstr(sentence));
    }

    std::optional<PrivateBus> bus_{std::in_place};
};

class FailuresOfTheService : public Failures {
  protected:
    ScriptedPeer peer_{bus_->address()};
};

TEST_F(Failures, NoBus) {
    expect_failure({"call", "list"}, "unreachable", "no IMS service for slot 0",
                   {{"DBUS_SYSTEM_BUS_ADDRESS", "unix:path=/nonexistent/bus"}});
}

TEST_F(Failures, NoService) {
    expect_failure({"call", "hold", "1"}, "unreachable", "no IMS service for slot 0");
}

TEST_F(FailuresOfTheService, FeatureOff) {
    std::string path = "/tmp/imsctl-test-XXXXXX";
    const int descriptor = mkstemp(path.data());
    ASSERT_GE(descriptor, 0);
    close(descriptor);
    std::ofstream(path) << "[features]\nkelvo.org/feature/network.telephony.ims=false\n";
    expect_failure({"call", "list"}, "not-supported", "the IMS feature is switched off",
                   {{"KELVO_IMS_FEATURE_FILE", path}});
    std::remove(path.c_str());
}

TEST_F(FailuresOfTheService, RegistrationDenied) {
    peer_.on(kRegisterApplication, failure(error_name::kAccessDenied));
    expect_failure({"call", "list"}, "refused", "this user may not use the IMS service");
}

TEST_F(FailuresOfTheService, RegistrationFailed) {
    peer_.on(kRegisterApplication, reply("(ii)", "(5, 42)"));
    expect_failure({"call", "list", "--slot", "3"}, "unreachable", "no IMS service for slot 3");
}

TEST_F(FailuresOfTheService, RequestDenied) {
    peer_.on(kHoldCall, failure(error_name::kAccessDenied));
    expect_failure({"call", "hold", "1"}, "refused", "this user may not make this request");
}

TEST_F(FailuresOfTheService, QueryDenied) {
    peer_.on(kCallListInfo, failure(error_name::kAccessDenied));
    expect_failure({"call", "list"}, "refused", "this user may not use the IMS service");
}

TEST_F(FailuresOfTheService, RequestFailedOnTheWay) {
    expect_failure({"call", "hold", "1"}, "unreachable", "did not answer properly");
}

TEST_F(FailuresOfTheService, QueryFailed) {
    peer_.on(kCallListInfo, reply("(iuaa{sv})", "(4, 0, [])"));
    expect_failure({"call", "list"}, "unreachable", "reported a failure");
}

TEST_F(FailuresOfTheService, RequestNotAnsweredInTime) {
    peer_.on(kHoldCall, Silence{});
    expect_failure({"call", "hold", "1", "--timeout", "0.2"}, "timeout",
                   "no answer from the service within 0.2 s");
}

TEST_F(FailuresOfTheService, QueryNotAnsweredInTime) {
    peer_.on(kCallListInfo, Silence{});
    expect_failure({"call", "list", "--timeout", "0.2"}, "timeout",
                   "no answer from the service within 0.2 s");
}

TEST_F(FailuresOfTheService, RegistrationNotAnsweredInTime) {
    peer_.on(kRegisterApplication, Silence{});
    expect_failure({"call", "list", "--timeout", "0.2"}, "timeout",
                   "no answer from the service within 0.2 s");
}

TEST_F(FailuresOfTheService, TextThatIsNotUtf8) {
    expect_failure({"call", "dial", "\xff"}, "invalid", "is every text valid UTF-8?");
}

TEST_F(FailuresOfTheService, NoCallsToChooseFrom) {
    peer_.on(kCallListInfo, reply("(iuaa{sv})", "(0, 0, [])"));
    expect_failure({"call", "hold"}, "session", "there are no calls");
}

TEST_F(FailuresOfTheService, WaitEndsAtItsLimitAndLeavesTheCall) {
    peer_.on(kMakeCall, reply("(ii)", "(0, 7)"));
    const Outcome outcome =
        run_imsctl({"call", "dial", "1", "--wait", "--timeout", "0.3", "--json"});
    EXPECT_EQ(outcome.status, 1);
    EXPECT_EQ(kind_of(outcome), "timeout");
    EXPECT_EQ(outcome.json()["error"]["session_id"], 7);
    EXPECT_THAT(outcome.error, HasSubstr("try: imsctl call end 7"));
    EXPECT_TRUE(peer_.calls_to("org.kelvo.ims.Call.EndCall").empty());
}

TEST_F(FailuresOfTheService, BusBreaksWhileARequestIsUnderWay) {
    peer_.on(kHoldCall, Silence{});
    Process hold(imsctl_command({"call", "hold", "1", "--json"}), strict_environment());
    peer_.wait_for_calls(kHoldCall, 1);
    bus_.reset();
    EXPECT_EQ(hold.wait(), 1) << hold.both();
    EXPECT_EQ(Json::parse(hold.output())["error"]["kind"], "unreachable");
}

TEST_F(FailuresOfTheService, BusBreaksWhileACallIsFollowed) {
    peer_.on(kMakeCall, reply("(ii)", "(0, 7)"));
    Process dial(imsctl_command({"call", "dial", "1", "--wait"}), strict_environment());
    peer_.wait_for_calls(kMakeCall, 1);
    peer_.emit_signal("/org/kelvo/ims/sub0", "org.kelvo.ims.Call", "CallAlerting",
                      parse("(i)", "(7,)"));
    dial.wait_for_output("call-alerting");
    bus_.reset();
    EXPECT_EQ(dial.wait(), 1) << dial.both();
    EXPECT_THAT(dial.error(), HasSubstr("the connection to the system bus broke"));
}

TEST_F(FailuresOfTheService, TerminationByOthersEndsARequestAsUsual) {
    peer_.on(kHoldCall, Silence{});
    Process hold(imsctl_command({"call", "hold", "1"}), strict_environment());
    peer_.wait_for_calls(kHoldCall, 1);
    hold.send_signal(SIGTERM);
    EXPECT_EQ(hold.wait(), 128 + SIGTERM) << hold.both();
    EXPECT_EQ(hold.error(), "");
}

TEST_F(FailuresOfTheService, WaitToldOfTheEndBeforeTheReply) {
    // Other sessions do not matter, nor does it that the events come first.
    const auto emit = [this](int session_id, int reason) {
        peer_.emit_signal("/org/kelvo/ims/sub0", "org.kelvo.ims.Call", "CallEnded",
                          Variant(g_variant_ref_sink(g_variant_new("(ii)", session_id, reason))));
    };
    peer_.on(kMakeCall, [&](const Call &) {
        emit(3, 1);
        emit(7, 4);
        return reply("(ii)", "(0, 7)");
    });
    const Outcome outcome = run_imsctl({"call", "dial", "1", "--wait", "--json"});
    EXPECT_EQ(outcome.status, 1);
    EXPECT_EQ(kind_of(outcome), "call-ended");
    EXPECT_EQ(outcome.json()["error"]["session_id"], 7);
    EXPECT_EQ(outcome.json()["error"]["reason"], 4);
    EXPECT_THAT(outcome.error, HasSubstr("call 7 ended (reason 4): no answer"));
}

} // namespace
} // namespace test
