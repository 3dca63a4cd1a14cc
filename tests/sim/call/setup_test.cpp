// SPDX-License-Identifier: Apache-2.0
// Placing, answering, rejecting and ending calls.
#include "tests/sim/network.hpp"

namespace sim::test {
namespace {

class CallSetup : public NetworkTest {};

TEST_F(CallSetup, ACallToTheNetworkIsAcceptedRingsAndIsAnswered) {
    EXPECT_EQ(dial(0, "+15559999"), 1);
    EXPECT_EQ(state(0, 1), CallState::kDialing);
    EXPECT_THAT(take(0), IsEmpty());
    advance(200ms);
    EXPECT_THAT(take(0), ElementsAre("CallInProgress (1,)"));
    advance(500ms);
    EXPECT_THAT(take(0), ElementsAre("CallAlerting (1,)"));
    EXPECT_EQ(state(0, 1), CallState::kAlerting);
    advance(1999ms);
    EXPECT_THAT(take(0), IsEmpty());
    advance(1ms);
    EXPECT_THAT(take(0), ElementsAre("CallEstablished (1, 0, true, 'tel:+15559999', false)"));
    EXPECT_EQ(state(0, 1), CallState::kActive);
    expect_accepted(calls_.end(0, 1));
    EXPECT_THAT(take(0), ElementsAre("CallEnded (1, 0)"));
    EXPECT_THAT(calls_.list(0), IsEmpty());
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST_F(CallSetup, ACallToAnotherSlotRingsThereAndBothAreToldOfTheAnswer) {
    const auto id =
        calls_.make_call(0, {"tel:+15550101", CallType::kVideo, {"two", "three", "four", "five"}});
    ASSERT_TRUE(id);
    advance(700ms);
    EXPECT_THAT(take(0), ElementsAre("CallInProgress (1,)", "CallAlerting (1,)"));
    EXPECT_THAT(take(1), ElementsAre("CallIncomingInd (1, 'tel:+15550100', 1, 'tel:+15550101', "
                                     "'two', 'three', 'four', 'five', false)"));
    EXPECT_EQ(state(1, 1), CallState::kIncoming);
    advance(30s);
    expect_accepted(calls_.answer(1, 1, CallType::kVideo));
    EXPECT_THAT(take(0), ElementsAre("CallEstablished (1, 1, true, 'tel:+15550101', false)"));
    EXPECT_THAT(take(1), ElementsAre("CallEstablished (1, 1, false, 'tel:+15550100', false)"));
    // Answered calls do not time out.
    advance(1h);
    EXPECT_EQ(state(0, 1), CallState::kActive);
    EXPECT_EQ(state(1, 1), CallState::kActive);
}

TEST_F(CallSetup, TheListSaysWhatIsKnownOfEachCall) {
    const auto ends = connect(0, 1, CallType::kVideo);
    EXPECT_THAT(calls_.list(0), ElementsAre(CallInfo{ends.caller, "tel:+15550101", CallType::kVideo,
                                                     true, CallState::kActive, false}));
    EXPECT_THAT(calls_.list(1), ElementsAre(CallInfo{ends.callee, "tel:+15550100", CallType::kVideo,
                                                     false, CallState::kActive, false}));
    EXPECT_THAT(calls_.list(2), IsEmpty());
}

TEST_F(CallSetup, EitherSideEndsTheCallForBoth) {
    auto ends = connect(0, 1);
    expect_accepted(calls_.end(0, ends.caller));
    EXPECT_THAT(take(0), ElementsAre("CallEnded (1, 0)"));
    EXPECT_THAT(take(1), ElementsAre("CallEnded (1, 1)"));
    ends = connect(0, 1);
    EXPECT_EQ(ends.caller, 2);
    expect_accepted(calls_.end(1, ends.callee));
    EXPECT_THAT(take(0), ElementsAre("CallEnded (2, 1)"));
    EXPECT_THAT(take(1), ElementsAre("CallEnded (2, 0)"));
    EXPECT_THAT(calls_.list(0), IsEmpty());
    EXPECT_THAT(calls_.list(1), IsEmpty());
}

TEST_F(CallSetup, TheCallerMayGiveUpAtEveryMoment) {
    dial(0, "+15550101");
    expect_accepted(calls_.end(0, 1));
    advance(5s);
    EXPECT_THAT(take(0), ElementsAre("CallEnded (1, 0)"));
    EXPECT_THAT(take(1), IsEmpty());

    const auto ends = ring(0, 1);
    forget_events();
    expect_accepted(calls_.end(0, ends.caller));
    EXPECT_THAT(take(0), ElementsAre("CallEnded (2, 0)"));
    EXPECT_THAT(take(1), ElementsAre("CallEnded (1, 1)"));
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST_F(CallSetup, ACallThatNobodyAnswersEndsAfterTheRingTime) {
    ring(0, 1);
    forget_events();
    advance(59s);
    EXPECT_THAT(take(0), IsEmpty());
    advance(1s);
    EXPECT_THAT(take(0), ElementsAre("CallEnded (1, 4)"));
    EXPECT_THAT(take(1), ElementsAre("CallEnded (1, 5)"));
}

TEST_F(CallSetup, ADeclinedCallEndsAndABusyOneSaysSo) {
    auto ends = ring(0, 1);
    forget_events();
    expect_accepted(calls_.reject(1, ends.callee, RejectReason::kDecline));
    EXPECT_THAT(take(0), ElementsAre("CallEnded (1, 3)"));
    EXPECT_THAT(take(1), ElementsAre("CallEnded (1, 3)"));
    ends = ring(0, 1);
    forget_events();
    expect_accepted(calls_.reject(1, ends.callee, RejectReason::kBusy));
    EXPECT_THAT(take(0), ElementsAre("CallBusy (2,)", "CallEnded (2, 2)"));
    EXPECT_THAT(take(1), ElementsAre("CallEnded (2, 2)"));
}

TEST_F(CallSetup, TheOwnNumberIsBusy) {
    dial(0, "+15550100");
    advance(1s);
    EXPECT_THAT(take(0), ElementsAre("CallInProgress (1,)", "CallBusy (1,)", "CallEnded (1, 2)"));
}

TEST_F(CallSetup, ASlotThatIsSettingUpACallIsBusy) {
    dial(1, "+15550207");
    dial(0, "+15550101");
    advance(1s);
    EXPECT_THAT(take(0), ElementsAre("CallInProgress (1,)", "CallBusy (1,)", "CallEnded (1, 2)"));
}

TEST_F(CallSetup, ASecondCallWaitsWhileOneIsActive) {
    connect(0, 1);
    const auto second = ring(2, 1);
    EXPECT_THAT(take(1), ElementsAre("CallIncomingInd (2, 'tel:+15550102', 0, 'tel:+15550101', "
                                     "'', '', '', '', true)"));
    EXPECT_EQ(state(1, second.callee), CallState::kWaiting);
    // A third one finds the line busy.
    dial(3, "+15550101");
    advance(1s);
    EXPECT_THAT(take(3), ElementsAre("CallInProgress (1,)", "CallBusy (1,)", "CallEnded (1, 2)"));
    // Answering the waiting call puts the active one on hold.
    forget_events();
    expect_accepted(calls_.answer(1, second.callee, CallType::kVoice));
    EXPECT_THAT(take(1), ElementsAre("CallHeld (1, true, 0)",
                                     "CallEstablished (2, 0, false, 'tel:+15550102', false)"));
    EXPECT_THAT(take(0), ElementsAre("CallHeld (1, false, 0)"));
    EXPECT_THAT(take(2), ElementsAre("CallEstablished (1, 0, true, 'tel:+15550101', false)"));
    EXPECT_EQ(state(0, 1), CallState::kHeldByPeer);
}

TEST_F(CallSetup, AWaitingCallRingsOnWhenTheActiveOneEnds) {
    const auto first = connect(0, 1);
    const auto second = ring(2, 1);
    expect_accepted(calls_.end(1, first.callee));
    EXPECT_EQ(state(1, second.callee), CallState::kIncoming);
    expect_accepted(calls_.answer(1, second.callee, CallType::kVoice));
}

TEST_F(CallSetup, AWaitingCallBesideTwoOthersIsNotAnswered) {
    active_and_held(1);
    const auto waiting = ring(0, 1);
    expect_refused(calls_.answer(1, waiting.callee, CallType::kVoice), Result::kTooMany,
                   "end one of them first");
    EXPECT_EQ(state(1, waiting.callee), CallState::kWaiting);
}

TEST_F(CallSetup, AVideoCallMayBeAnsweredWithVoice) {
    auto ends = ring(0, 1, CallType::kVideo);
    expect_refused(calls_.answer(1, ends.callee, CallType::kEmergency), Result::kInvalidArgument,
                   "can be answered as that or as voice");
    forget_events();
    expect_accepted(calls_.answer(1, ends.callee, CallType::kVoice));
    EXPECT_THAT(take(0), ElementsAre("CallEstablished (1, 0, true, 'tel:+15550101', false)"));
    expect_accepted(calls_.end(0, ends.caller));
    ends = ring(0, 1, CallType::kVoice);
    expect_refused(calls_.answer(1, ends.callee, CallType::kVideo), Result::kInvalidArgument,
                   "not as 1");
}

TEST_F(CallSetup, RequestsThatMakeNoSenseAreRefusedAndChangeNothing) {
    expect_refused(calls_.make_call(0, {"alice", CallType::kVoice, {}}), Result::kInvalidArgument,
                   "is no number");
    expect_refused(calls_.make_call(0, {"+15559999", CallType{7}, {}}), Result::kInvalidArgument,
                   "not 7");
    expect_refused(calls_.make_call(0, {"+15559999", CallType::kEmergency, {}}),
                   Result::kInvalidArgument, "no emergency number");
    expect_refused(calls_.end(0, 9), Result::kUnknownSession, "there is no call");
    expect_refused(calls_.answer(0, 9, CallType::kVoice), Result::kUnknownSession, "no call 9");
    expect_refused(calls_.reject(0, 9, RejectReason::kDecline), Result::kUnknownSession,
                   "no call 9");

    const auto ends = ring(0, 1);
    forget_events();
    expect_refused(calls_.make_call(0, {"+15559999", CallType::kVoice, {}}), Result::kLineInUse,
                   "call 1 is still being set up");
    expect_refused(calls_.make_call(1, {"+15559999", CallType::kVoice, {}}), Result::kLineInUse,
                   "still being set up");
    expect_refused(calls_.answer(0, ends.caller, CallType::kVoice), Result::kWrongState,
                   "does not ring here");
    expect_refused(calls_.reject(0, ends.caller, RejectReason::kDecline), Result::kWrongState,
                   "does not ring here");
    expect_refused(calls_.reject(1, ends.callee, RejectReason{5}), Result::kInvalidArgument,
                   "not 5");
    expect_refused(calls_.end(1, ends.callee), Result::kWrongState, "reject it");
    expect_refused(calls_.end(1, 9), Result::kUnknownSession, "the calls are 1");

    expect_accepted(calls_.answer(1, ends.callee, CallType::kVoice));
    forget_events();
    expect_refused(calls_.answer(1, ends.callee, CallType::kVoice), Result::kWrongState,
                   "does not ring here");
    expect_refused(calls_.reject(1, ends.callee, RejectReason::kDecline), Result::kWrongState,
                   "does not ring here");
    expect_refused(calls_.make_call(0, {"+15559999", CallType::kVoice, {}}), Result::kLineInUse,
                   "hold or end it first");
    EXPECT_THAT(take(0), IsEmpty());
    EXPECT_THAT(take(1), IsEmpty());
}

TEST_F(CallSetup, ASecondCallMayBePlacedBesideAHeldOne) {
    const int first = connect_party(0);
    expect_accepted(calls_.hold(0, first));
    const int second = connect_party(0, "+15558888");
    EXPECT_EQ(state(0, first), CallState::kHeld);
    EXPECT_EQ(state(0, second), CallState::kActive);
}

TEST_F(CallSetup, EmergencyCallsAreAnsweredAtOnceAndGetTheLine) {
    const auto pair = active_and_held(0);
    const int id = dial(0, "112");
    EXPECT_THAT(take(0), ElementsAre("CallEnded (1, 0)", "CallHeld (2, true, 0)"));
    EXPECT_EQ(state(0, pair.active), CallState::kHeld);
    advance(0ms);
    EXPECT_THAT(take(0), ElementsAre("CallInProgress (3,)", "CallAlerting (3,)",
                                     "CallEstablished (3, 2, true, 'tel:112', false)"));
    expect_refused(calls_.make_call(0, {"911", CallType::kEmergency, {}}), Result::kLineInUse,
                   "is an emergency call");
    expect_refused(calls_.hold(0, id), Result::kWrongState, "is an emergency call");
    expect_refused(calls_.swap(0), Result::kWrongState, "is an emergency call");
    expect_refused(changes_.upgrade(0, id, CallType::kVideo), Result::kWrongState, "emergency");
    expect_refused(calls_.merge(0), Result::kWrongState, "is an emergency call");
}

TEST_F(CallSetup, AnEmergencyCallEndsWhatIsBeingSetUp) {
    const auto ends = ring(0, 1);
    forget_events();
    dial(1, "911", CallType::kEmergency);
    EXPECT_THAT(take(0), ElementsAre("CallEnded (1, 1)"));
    EXPECT_THAT(take(1), ElementsAre("CallEnded (1, 0)"));
    EXPECT_EQ(ends.callee, 1);
    advance(0ms);
    EXPECT_EQ(state(1, 2), CallState::kActive);
}

TEST_F(CallSetup, TheServiceAnswersOrTurnsAwayByItself) {
    expect_accepted(calls_.set_auto_response(1, AutoResponse::kAnswer, 3));
    ring(0, 1);
    forget_events();
    advance(2999ms);
    EXPECT_EQ(state(1, 1), CallState::kIncoming);
    advance(1ms);
    EXPECT_THAT(take(1), ElementsAre("CallEstablished (1, 0, false, 'tel:+15550100', false)"));
    // A call that waits is left to the user.
    const auto waiting = ring(2, 1);
    advance(10s);
    EXPECT_EQ(state(1, waiting.callee), CallState::kWaiting);
    expect_accepted(calls_.reject(1, waiting.callee, RejectReason::kDecline));
    expect_accepted(calls_.end(0, 1));

    expect_accepted(calls_.set_auto_response(1, AutoResponse::kDecline, 0));
    dial(0, "+15550101");
    forget_events();
    advance(1s);
    EXPECT_THAT(take(0),
                ElementsAre("CallInProgress (2,)", "CallAlerting (2,)", "CallEnded (2, 3)"));

    expect_accepted(calls_.set_auto_response(1, AutoResponse::kBusy, 0));
    dial(0, "+15550101");
    advance(1s);
    EXPECT_THAT(take(0), ElementsAre("CallInProgress (3,)", "CallAlerting (3,)", "CallBusy (3,)",
                                     "CallEnded (3, 2)"));

    expect_accepted(calls_.set_auto_response(1, AutoResponse::kOff, 0));
    ring(0, 1);
    advance(30s);
    EXPECT_EQ(calls_.list(1).size(), 1U);
}

TEST_F(CallSetup, SwitchingTheAutoResponseOffSavesACallThatRings) {
    expect_accepted(calls_.set_auto_response(1, AutoResponse::kDecline, 3));
    const auto ends = ring(0, 1);
    expect_accepted(calls_.set_auto_response(1, AutoResponse::kOff, 0));
    advance(10s);
    EXPECT_EQ(state(1, ends.callee), CallState::kIncoming);
}

TEST_F(CallSetup, AutoResponseHasItsLimits) {
    expect_refused(calls_.set_auto_response(0, AutoResponse{4}, 0), Result::kInvalidArgument,
                   "not 4");
    expect_refused(calls_.set_auto_response(0, AutoResponse{-1}, 0), Result::kInvalidArgument,
                   "not -1");
    expect_refused(calls_.set_auto_response(0, AutoResponse::kAnswer, -1), Result::kInvalidArgument,
                   "0 to 60");
    expect_refused(calls_.set_auto_response(0, AutoResponse::kAnswer, 61), Result::kInvalidArgument,
                   "0 to 60");
}

TEST_F(CallSetup, ACallFromTheNetworkGivesUpAfterHalfAMinute) {
    const auto id = calls_.call_from_network(0, "+15557777", CallType::kVoice);
    ASSERT_TRUE(id);
    EXPECT_THAT(take(0), ElementsAre("CallIncomingInd (1, 'tel:+15557777', 0, 'tel:+15550100', "
                                     "'', '', '', '', false)"));
    expect_refused(calls_.call_from_network(0, "+15557777", CallType::kVoice), Result::kLineInUse,
                   "still being set up");
    advance(30s);
    EXPECT_THAT(take(0), ElementsAre("CallEnded (1, 5)"));
    ASSERT_TRUE(calls_.call_from_network(0, "+15557777", CallType::kVoice));
    expect_accepted(calls_.answer(0, 2, CallType::kVoice));
    advance(1min);
    EXPECT_EQ(state(0, 2), CallState::kActive);
}

} // namespace
} // namespace sim::test
