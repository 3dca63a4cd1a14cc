// SPDX-License-Identifier: Apache-2.0
#include "tests/sim/network.hpp"

namespace sim::test {
namespace {

class CallHold : public NetworkTest {};

TEST_F(CallHold, BothSidesAreToldWhoHoldsAndWhoResumes) {
    const auto ends = connect(0, 1);
    expect_accepted(calls_.hold(0, ends.caller));
    EXPECT_THAT(take(0), ElementsAre("CallHeld (1, true, 0)"));
    EXPECT_THAT(take(1), ElementsAre("CallHeld (1, false, 0)"));
    EXPECT_EQ(state(0, ends.caller), CallState::kHeld);
    EXPECT_EQ(state(1, ends.callee), CallState::kHeldByPeer);
    expect_accepted(calls_.resume(0, ends.caller));
    EXPECT_THAT(take(0), ElementsAre("CallResumed (1, true, false, 0)"));
    EXPECT_THAT(take(1), ElementsAre("CallResumed (1, false, false, 0)"));
    EXPECT_EQ(state(0, ends.caller), CallState::kActive);
    EXPECT_EQ(state(1, ends.callee), CallState::kActive);
}

TEST_F(CallHold, EachSideHoldsForItself) {
    const auto ends = connect(0, 1);
    expect_accepted(calls_.hold(0, ends.caller));
    expect_accepted(calls_.hold(1, ends.callee));
    forget_events();
    expect_accepted(calls_.resume(0, ends.caller));
    EXPECT_THAT(take(0), ElementsAre("CallResumed (1, true, true, 0)"));
    EXPECT_THAT(take(1), ElementsAre("CallResumed (1, false, true, 0)"));
    EXPECT_EQ(state(0, ends.caller), CallState::kHeldByPeer);
    EXPECT_EQ(state(1, ends.callee), CallState::kHeld);
}

TEST_F(CallHold, SwapExchangesTheActiveAndTheHeldCall) {
    const auto first = connect(0, 1);
    expect_accepted(calls_.hold(0, first.caller));
    const auto second = connect(0, 2);
    expect_accepted(calls_.swap(0));
    EXPECT_THAT(take(0), ElementsAre("CallHeld (2, true, 0)", "CallResumed (1, true, false, 0)"));
    EXPECT_THAT(take(1), ElementsAre("CallResumed (1, false, false, 0)"));
    EXPECT_THAT(take(2), ElementsAre("CallHeld (1, false, 0)"));
    EXPECT_EQ(state(0, first.caller), CallState::kActive);
    EXPECT_EQ(state(0, second.caller), CallState::kHeld);
}

TEST_F(CallHold, ResumeWaitsUntilTheLineIsFree) {
    const auto pair = active_and_held(0);
    expect_refused(calls_.resume(0, pair.held), Result::kLineInUse, "is active: swap");
    expect_accepted(calls_.end(0, pair.active));
    dial(0, "+15550207");
    expect_refused(calls_.resume(0, pair.held), Result::kLineInUse, "still being set up");
    expect_accepted(calls_.end(0, 3));
    expect_accepted(calls_.resume(0, pair.held));
}

TEST_F(CallHold, ARingingCallDoesNotKeepAHeldOneFromBeingResumed) {
    const auto first = connect(0, 1);
    expect_accepted(calls_.hold(1, first.callee));
    const auto waiting = ring(2, 1);
    expect_accepted(calls_.resume(1, first.callee));
    expect_accepted(calls_.answer(1, waiting.callee, CallType::kVoice));
    EXPECT_EQ(state(1, first.callee), CallState::kHeld);
}

TEST_F(CallHold, RequestsThatMakeNoSenseAreRefusedAndChangeNothing) {
    expect_refused(calls_.hold(0, 1), Result::kUnknownSession, "no call 1");
    expect_refused(calls_.resume(0, 1), Result::kUnknownSession, "no call 1");
    expect_refused(calls_.swap(0), Result::kWrongState, "there is no active one");
    const auto ends = ring(0, 1);
    expect_refused(calls_.hold(0, ends.caller), Result::kWrongState, "not established yet");
    expect_refused(calls_.hold(1, ends.callee), Result::kWrongState, "not established yet");
    expect_refused(calls_.resume(0, ends.caller), Result::kWrongState, "not established yet");
    expect_accepted(calls_.answer(1, ends.callee, CallType::kVoice));
    expect_refused(calls_.resume(0, ends.caller), Result::kWrongState, "not on hold here");
    expect_refused(calls_.swap(0), Result::kWrongState, "there is no held one");
    expect_accepted(calls_.hold(0, ends.caller));
    forget_events();
    expect_refused(calls_.hold(0, ends.caller), Result::kWrongState, "on hold already");
    // The far end cannot resume what it has not held.
    expect_refused(calls_.resume(1, ends.callee), Result::kWrongState, "not on hold here");
    EXPECT_THAT(take(0), IsEmpty());
    EXPECT_THAT(take(1), IsEmpty());

    const auto pair = active_and_held(2);
    expect_refused(calls_.hold(2, pair.active), Result::kTooMany, "swap or end one");
}

TEST_F(CallHold, NothingIsHeldDuringAHandover) {
    const auto pair = active_and_held(0);
    expect_accepted(radio_.handover_started(0, pair.active));
    expect_refused(calls_.swap(0), Result::kWrongState, "handover");
    expect_accepted(calls_.end(0, pair.held));
    expect_refused(calls_.hold(0, pair.active), Result::kWrongState, "handover");
    const auto waiting = ring(1, 0);
    expect_refused(calls_.answer(0, waiting.callee, CallType::kVoice), Result::kWrongState,
                   "handover");
    expect_accepted(radio_.handover_failed(0, pair.active));
    expect_accepted(calls_.hold(0, pair.active));
}

} // namespace
} // namespace sim::test
