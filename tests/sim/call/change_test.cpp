// SPDX-License-Identifier: Apache-2.0
#include "tests/sim/network.hpp"

namespace sim::test {
namespace {

class CallChange : public NetworkTest {};

constexpr const char *kAsked = "CallChangeRequest (1, 1, 'YXVkaW8sdmlkZW8=')";

TEST_F(CallChange, AnUpgradeIsAskedForAndSwitchesBothWhenAccepted) {
    const auto ends = connect(0, 1);
    expect_accepted(changes_.upgrade(0, ends.caller, CallType::kVideo));
    EXPECT_THAT(take(0), IsEmpty());
    EXPECT_THAT(take(1), ElementsAre(kAsked));
    expect_accepted(changes_.accept(1, ends.callee));
    EXPECT_THAT(take(0), ElementsAre("CallSwitched (1, 1)"));
    EXPECT_THAT(take(1), ElementsAre("CallSwitched (1, 1)"));
    EXPECT_EQ(calls_.list(0).front().type, CallType::kVideo);
    EXPECT_EQ(calls_.list(1).front().type, CallType::kVideo);
    advance(1min);
    EXPECT_THAT(take(0), IsEmpty());
}

TEST_F(CallChange, TheAskerIsToldOfARejection) {
    const auto ends = connect(0, 1);
    expect_accepted(changes_.upgrade(0, ends.caller, CallType::kVideo));
    forget_events();
    expect_accepted(changes_.reject(1, ends.callee));
    EXPECT_THAT(take(0), ElementsAre("CallError (1, 488, 'the change request was rejected')"));
    EXPECT_THAT(take(1), IsEmpty());
    EXPECT_EQ(calls_.list(0).front().type, CallType::kVoice);
    // Another attempt is free to follow.
    expect_accepted(changes_.upgrade(0, ends.caller, CallType::kVideo));
}

TEST_F(CallChange, ARequestThatNobodyAnswersLapses) {
    const auto ends = connect(0, 1);
    expect_accepted(changes_.upgrade(0, ends.caller, CallType::kVideo));
    forget_events();
    advance(15s);
    EXPECT_THAT(take(0), ElementsAre("CallError (1, 408, 'the change request was not answered')"));
    expect_refused(changes_.accept(1, ends.callee), Result::kWrongState, "has asked for no change");
}

TEST_F(CallChange, NobodyIsAskedForADowngrade) {
    const auto ends = connect(0, 1, CallType::kVideo);
    expect_accepted(changes_.downgrade(1, ends.callee, CallType::kVoice));
    EXPECT_THAT(take(0), ElementsAre("CallSwitched (1, 0)"));
    EXPECT_THAT(take(1), ElementsAre("CallSwitched (1, 0)"));
}

TEST_F(CallChange, ChangeGoesBothWays) {
    const auto ends = connect(0, 1);
    const auto up = changes_.change(0, ends.caller, CallType::kVideo);
    ASSERT_TRUE(up);
    EXPECT_TRUE(up->pending);
    EXPECT_EQ(up->in_force, CallType::kVoice);
    expect_accepted(changes_.accept(1, ends.callee));
    forget_events();
    const auto down = changes_.change(0, ends.caller, CallType::kVoice);
    ASSERT_TRUE(down);
    EXPECT_FALSE(down->pending);
    EXPECT_EQ(down->in_force, CallType::kVoice);
    EXPECT_THAT(take(1), ElementsAre("CallSwitched (1, 0)"));
}

TEST_F(CallChange, PartiesOfTheNetworkAgree) {
    const int id = connect_party(0);
    expect_accepted(changes_.upgrade(0, id, CallType::kVideo));
    advance(499ms);
    EXPECT_THAT(take(0), IsEmpty());
    advance(1ms);
    EXPECT_THAT(take(0), ElementsAre("CallSwitched (1, 1)"));
}

TEST_F(CallChange, ARequestEndsWithItsCall) {
    const auto ends = connect(0, 1);
    expect_accepted(changes_.upgrade(0, ends.caller, CallType::kVideo));
    expect_accepted(calls_.end(0, ends.caller));
    forget_events();
    advance(1min);
    EXPECT_THAT(take(0), IsEmpty());
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST_F(CallChange, RequestsThatMakeNoSenseAreRefusedAndChangeNothing) {
    expect_refused(changes_.upgrade(0, 1, CallType::kVideo), Result::kUnknownSession, "no call 1");
    expect_refused(changes_.change(0, 1, CallType::kVideo), Result::kUnknownSession, "no call 1");
    expect_refused(changes_.accept(0, 1), Result::kUnknownSession, "no call 1");
    expect_refused(changes_.reject(0, 1), Result::kUnknownSession, "no call 1");
    const auto ends = ring(0, 1);
    expect_refused(changes_.upgrade(0, ends.caller, CallType::kVideo), Result::kWrongState,
                   "not established yet");
    expect_accepted(calls_.answer(1, ends.callee, CallType::kVoice));
    forget_events();
    expect_refused(changes_.upgrade(0, ends.caller, CallType::kVoice), Result::kInvalidArgument,
                   "not 0");
    expect_refused(changes_.downgrade(0, ends.caller, CallType::kVideo), Result::kInvalidArgument,
                   "not 1");
    expect_refused(changes_.downgrade(0, ends.caller, CallType::kVoice), Result::kWrongState,
                   "of type 0 already");
    expect_refused(changes_.change(0, ends.caller, CallType{9}), Result::kInvalidArgument, "not 9");
    expect_refused(changes_.accept(1, ends.callee), Result::kWrongState, "has asked for no change");
    expect_refused(changes_.reject(1, ends.callee), Result::kWrongState, "has asked for no change");

    expect_accepted(changes_.upgrade(0, ends.caller, CallType::kVideo));
    forget_events();
    // The asker cannot answer itself, and one question at a time is enough.
    expect_refused(changes_.accept(0, ends.caller), Result::kWrongState, "has asked for no change");
    expect_refused(changes_.upgrade(0, ends.caller, CallType::kVideo), Result::kWrongState,
                   "without an answer");
    expect_refused(changes_.upgrade(1, ends.callee, CallType::kVideo), Result::kWrongState,
                   "without an answer");
    expect_accepted(changes_.reject(1, ends.callee));
    forget_events();

    expect_accepted(radio_.handover_started(0, ends.caller));
    expect_refused(changes_.upgrade(0, ends.caller, CallType::kVideo), Result::kWrongState,
                   "handover");
    expect_accepted(radio_.handover_failed(0, ends.caller));
    expect_accepted(calls_.hold(0, ends.caller));
    forget_events();
    expect_refused(changes_.upgrade(0, ends.caller, CallType::kVideo), Result::kWrongState,
                   "is on hold");
    expect_refused(changes_.upgrade(1, ends.callee, CallType::kVideo), Result::kWrongState,
                   "has call 1 on hold");
    EXPECT_THAT(take(0), IsEmpty());
    EXPECT_THAT(take(1), IsEmpty());
}

} // namespace
} // namespace sim::test
