// SPDX-License-Identifier: Apache-2.0
// The call list, shown and used to find out which session is meant.
#include "tests/imsctl/program.hpp"
#include "tests/support/private_bus.hpp"
#include "tests/support/scripted_peer.hpp"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace test {
namespace {

class CallList : public ::testing::Test {
  protected:
    void answer_with(const std::string &calls) {
        peer_.on("org.kelvo.ims.Call.CallListInfo", reply("(iuaa{sv})", calls));
    }

    PrivateBus bus_;
    ScriptedPeer peer_{bus_.address()};
};

constexpr const char *kTwoCalls =
    "(0, 2, [{'session_id': <1>, 'peer_uri': <'tel:+15550101'>, 'call_type': <0>, "
    "'bmocall': <true>, 'call_state': <5>, 'bconfcall': <false>}, "
    "{'session_id': <2>, 'peer_uri': <'tel:\\u001b[1m'>, 'call_type': <9>, "
    "'bmocall': <false>, 'call_state': <6>, 'bconfcall': <true>}])";

TEST_F(CallList, IsATableForPeople) {
    answer_with(kTwoCalls);
    const Outcome outcome = run_imsctl({"call", "list"});
    EXPECT_EQ(outcome.status, 0);
    EXPECT_EQ(outcome.output,
              "SESSION  PEER           TYPE       STATE         DIRECTION  CONFERENCE\n"
              "1        tel:+15550101  voice      active        outgoing   no\n"
              "2        tel:\\x1b[1m    9          held          incoming   yes\n");
}

TEST_F(CallList, IsAnArrayForPrograms) {
    answer_with(kTwoCalls);
    const Outcome outcome = run_imsctl({"call", "list", "--json"});
    EXPECT_EQ(outcome.status, 0);
    EXPECT_EQ(outcome.json(), Json::parse(R"({"verb":"call list","calls":[
        {"session_id":1,"peer_uri":"tel:+15550101","call_type":0,"bmocall":true,"call_state":5,
         "bconfcall":false},
        {"session_id":2,"peer_uri":"tel:\u001b[1m","call_type":9,"bmocall":false,"call_state":6,
         "bconfcall":true}]})"));
}

TEST_F(CallList, DecidesWhichSessionIsMeant) {
    answer_with(kTwoCalls);
    peer_.on("org.kelvo.ims.Call.HoldCall", reply("(i)", "(0,)"));
    peer_.on("org.kelvo.ims.Call.ResumeCall", reply("(i)", "(0,)"));
    EXPECT_EQ(run_imsctl({"call", "hold"}).output, "session_id=1\n");
    EXPECT_EQ(run_imsctl({"call", "resume"}).output, "session_id=2\n");
}

TEST_F(CallList, NamesTheSessionsWhenItDoesNotDecide) {
    answer_with(kTwoCalls);
    const Outcome none = run_imsctl({"call", "answer"});
    EXPECT_EQ(none.status, 1);
    EXPECT_EQ(none.error, "imsctl: call answer: there are no calls that ring here; all calls: "
                          "1 (tel:+15550101, active), 2 (tel:\\x1b[1m, held, conference)\n");
    const Outcome two = run_imsctl({"call", "end", "--json"});
    EXPECT_EQ(two.status, 1);
    EXPECT_EQ(two.json()["error"]["kind"], "session");
    EXPECT_THAT(two.error, testing::HasSubstr("there are 2 calls: 1 ("));
}

} // namespace
} // namespace test
