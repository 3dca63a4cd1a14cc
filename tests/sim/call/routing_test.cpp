// SPDX-License-Identifier: Apache-2.0
// How call waiting, forwarding and barring act on calls.
#include "tests/sim/network.hpp"

namespace sim::test {
namespace {

using enum ForwardCondition;

class CallRouting : public NetworkTest {
  protected:
    void forward(int slot, ForwardCondition condition, const std::string &number,
                 ServiceClass service = ServiceClass::kBoth, int time = 0) {
        expect_accepted(services_.set_forwarding(slot, {service, 1, condition, time,
                                                        static_cast<std::int32_t>(number.size()),
                                                        UriType::kNumber, number}));
    }
    void bar(int slot, BarringType type, ServiceClass service = ServiceClass::kBoth) {
        expect_accepted(services_.set_barring(slot, {service, 1, type}, "0000"));
    }
    Answer<int> call(int slot, const std::string &number, CallType type = CallType::kVoice) {
        return calls_.make_call(slot, {number, type, {}});
    }
};

TEST_F(CallRouting, UnconditionalForwardingMovesTheCall) {
    forward(1, kUnconditional, "+15550102");
    dial(0, "+15550101");
    advance(700ms);
    EXPECT_THAT(take(0), ElementsAre("CallInProgress (1,)", "CallForwarded (1,)"));
    advance(500ms);
    EXPECT_THAT(take(0), ElementsAre("CallAlerting (1,)"));
    EXPECT_THAT(take(1), IsEmpty());
    // The one that rings sees who was called.
    EXPECT_THAT(take(2), ElementsAre("CallIncomingInd (1, 'tel:+15550100', 0, 'tel:+15550101', '', "
                                     "'', '', '', false)"));
    expect_accepted(calls_.answer(2, 1, CallType::kVoice));
    EXPECT_THAT(take(0), ElementsAre("CallEstablished (1, 0, true, 'tel:+15550102', false)"));
    expect_accepted(calls_.end(0, 1));
    EXPECT_EQ(take(2).back(), "CallEnded (1, 1)");
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST_F(CallRouting, TheNewNumberBehavesAsItAlwaysDoes) {
    forward(1, kUnconditional, "+15550200");
    dial(0, "+15550101");
    advance(5s);
    EXPECT_THAT(take(0), ElementsAre("CallInProgress (1,)", "CallForwarded (1,)", "CallBusy (1,)",
                                     "CallEnded (1, 2)"));
    forward(1, kUnconditional, "+15559999");
    dial(0, "+15550101");
    advance(5s);
    EXPECT_THAT(take(0),
                ElementsAre("CallInProgress (2,)", "CallForwarded (2,)", "CallAlerting (2,)",
                            "CallEstablished (2, 0, true, 'tel:+15559999', false)"));
    // Back to the one who calls.
    forward(2, kUnconditional, "+15550103");
    dial(3, "+15550102");
    advance(5s);
    EXPECT_THAT(take(3), ElementsAre("CallInProgress (1,)", "CallForwarded (1,)", "CallBusy (1,)",
                                     "CallEnded (1, 2)"));
}

TEST_F(CallRouting, ForwardingIsForItsClassAlone) {
    forward(1, kUnconditional, "+15559999", ServiceClass::kVideo);
    dial(0, "+15550101");
    advance(700ms);
    EXPECT_THAT(take(0), ElementsAre("CallInProgress (1,)", "CallAlerting (1,)"));
    expect_accepted(calls_.end(0, 1));
    forget_events();
    dial(0, "+15550101", CallType::kVideo);
    advance(700ms);
    EXPECT_THAT(take(0), ElementsAre("CallInProgress (2,)", "CallForwarded (2,)"));
}

TEST_F(CallRouting, ForwardingChainsAndDoesNotGoRoundForEver) {
    forward(1, kUnconditional, "+15550102");
    forward(2, kUnconditional, "+15550103");
    dial(0, "+15550101");
    advance(5s);
    EXPECT_THAT(take(0), ElementsAre("CallInProgress (1,)", "CallForwarded (1,)",
                                     "CallForwarded (1,)", "CallAlerting (1,)"));
    expect_accepted(calls_.end(0, 1));
    forget_events();
    forward(3, kUnconditional, "+15550101");
    dial(0, "+15550101");
    advance(10s);
    EXPECT_THAT(take(0),
                ElementsAre("CallInProgress (2,)", "CallForwarded (2,)", "CallForwarded (2,)",
                            "CallForwarded (2,)", "CallForwarded (2,)", "CallForwarded (2,)",
                            "CallError (2, 482, 'the call was forwarded too often')",
                            "CallEnded (2, 6)"));
}

TEST_F(CallRouting, WhatIsBusyIsForwardedOnBusy) {
    forward(1, kBusy, "+15550102");
    dial(1, "+15550207");
    dial(0, "+15550101");
    advance(1200ms);
    EXPECT_THAT(take(0),
                ElementsAre("CallInProgress (1,)", "CallForwarded (1,)", "CallAlerting (1,)"));
}

TEST_F(CallRouting, ACallRejectedAsBusyIsForwardedToo) {
    forward(1, kBusy, "+15550102");
    const auto ends = ring(0, 1);
    forget_events();
    expect_accepted(calls_.reject(1, ends.callee, RejectReason::kBusy));
    EXPECT_THAT(take(1), ElementsAre("CallEnded (1, 2)"));
    EXPECT_THAT(take(0), ElementsAre("CallForwarded (1,)"));
    advance(500ms);
    EXPECT_THAT(take(0), ElementsAre("CallAlerting (1,)"));
    expect_accepted(calls_.reject(2, 1, RejectReason::kDecline));
    EXPECT_THAT(take(0), ElementsAre("CallEnded (1, 3)"));
}

TEST_F(CallRouting, ACallThatIsDeclinedIsNot) {
    forward(1, kAllConditional, "+15550102");
    const auto ends = ring(0, 1);
    forget_events();
    expect_accepted(calls_.reject(1, ends.callee, RejectReason::kDecline));
    EXPECT_THAT(take(0), ElementsAre("CallEnded (1, 3)"));
}

TEST_F(CallRouting, ACallThatNobodyAnswersIsForwardedAfterItsTime) {
    forward(1, kNoReply, "+15559999", ServiceClass::kVoice, 10);
    ring(0, 1);
    forget_events();
    advance(9999ms);
    EXPECT_THAT(take(0), IsEmpty());
    advance(1ms);
    EXPECT_THAT(take(1), ElementsAre("CallEnded (1, 5)"));
    EXPECT_THAT(take(0), ElementsAre("CallForwarded (1,)"));
    advance(5s);
    EXPECT_THAT(take(0), ElementsAre("CallAlerting (1,)",
                                     "CallEstablished (1, 0, true, 'tel:+15559999', false)"));
}

TEST_F(CallRouting, AnAnsweredCallIsNotForwarded) {
    forward(1, kNoReply, "+15559999", ServiceClass::kVoice, 10);
    connect(0, 1);
    advance(1h);
    EXPECT_THAT(take(0), IsEmpty());
    EXPECT_EQ(state(0, 1), CallState::kActive);
}

TEST_F(CallRouting, ForwardingSetWhileItRingsActsWhenTheRingingEnds) {
    ring(0, 1);
    forward(1, kNoReply, "+15559999", ServiceClass::kVoice, 10);
    forget_events();
    advance(60s);
    EXPECT_EQ(take(0).front(), "CallForwarded (1,)");
}

TEST_F(CallRouting, WhatCannotBeReachedIsForwardedOnThat) {
    forward(1, kNotReachable, "+15550102");
    lose(1);
    dial(0, "+15550101");
    advance(1200ms);
    EXPECT_THAT(take(0),
                ElementsAre("CallInProgress (1,)", "CallForwarded (1,)", "CallAlerting (1,)"));
    come_back(1);
    expect_accepted(calls_.end(0, 1));
    forget_events();
    dial(0, "+15550101");
    advance(700ms);
    EXPECT_THAT(take(0), ElementsAre("CallInProgress (2,)", "CallAlerting (2,)"));
}

TEST_F(CallRouting, APartyThatCallsBackIsNotForwarded) {
    forward(0, kUnconditional, "+15550102");
    expect_refused(calls_.call_from_network(0, "+15559999", CallType::kVoice), Result::kWrongState,
                   "go to +15550102");
    EXPECT_THAT(take(2), IsEmpty());
}

TEST_F(CallRouting, AForwardedParticipantIsFoundUnderBothNumbers) {
    forward(1, kUnconditional, "+15550102");
    const auto conference =
        calls_.start_conference(0, CallType::kVoice, {"+15550101", "+15559999"});
    ASSERT_TRUE(conference);
    advance(5s);
    expect_accepted(calls_.answer(2, 1, CallType::kVoice));
    expect_accepted(
        calls_.modify_conference(0, *conference, ConferenceChange::kRemove, {"+15550102"}));
    EXPECT_THAT(calls_.list(2), IsEmpty());
    EXPECT_EQ(calls_.list(0).size(), 2u);
}

TEST_F(CallRouting, OutgoingCallsAreBarredByClass) {
    bar(0, BarringType::kAllOutgoing, ServiceClass::kVideo);
    expect_refused(call(0, "+15550101", CallType::kVideo), Result::kBarred,
                   "outgoing video calls of slot 0 are barred");
    EXPECT_THAT(calls_.list(0), IsEmpty());
    EXPECT_TRUE(call(0, "+15550101"));
    EXPECT_TRUE(call(1, "+15550102", CallType::kVideo));
}

TEST_F(CallRouting, EmergencyCallsAreNeverBarred) {
    bar(0, BarringType::kAllOutgoing);
    bar(0, BarringType::kAllIncoming);
    expect_refused(call(0, "+15550101"), Result::kBarred, "barred");
    EXPECT_TRUE(call(0, "112"));
}

TEST_F(CallRouting, InternationalIsWhatHasAnotherCountry) {
    for (const auto type : {BarringType::kInternational, BarringType::kInternationalExceptHome}) {
        bar(0, type);
        for (const auto *number : {"+447700900123", "+35312345678", "+8613800000000"})
            expect_refused(call(0, number), Result::kBarred, "international voice calls of slot 0");
        for (const auto *number : {"+15559999", "15559999", "447700900123"}) {
            const auto id = call(0, number);
            ASSERT_TRUE(id) << number;
            expect_accepted(calls_.end(0, *id));
        }
        expect_accepted(services_.set_barring(0, {ServiceClass::kBoth, 0, type}, "0000"));
        const auto id = call(0, "+447700900123");
        ASSERT_TRUE(id);
        expect_accepted(calls_.end(0, *id));
    }
}

TEST_F(CallRouting, EveryParticipantMustBeAllowed) {
    bar(0, BarringType::kInternational);
    expect_refused(calls_.start_conference(0, CallType::kVoice, {"+15550101", "+447700900123"}),
                   Result::kBarred, "international");
    EXPECT_THAT(calls_.list(0), IsEmpty());
    const auto conference = calls_.start_conference(0, CallType::kVoice, {"+15550101"});
    ASSERT_TRUE(conference);
    expect_refused(calls_.invite(0, *conference, "+447700900123", CallType::kVoice),
                   Result::kBarred, "international");
    expect_refused(calls_.modify_conference(0, *conference, ConferenceChange::kAdd,
                                            {"+15559999", "+447700900123"}),
                   Result::kBarred, "international");
}

TEST_F(CallRouting, IncomingCallsAreBarredBeforeTheyAreForwarded) {
    bar(1, BarringType::kAllIncoming);
    forward(1, kAll, "+15550102");
    dial(0, "+15550101");
    advance(5s);
    EXPECT_THAT(take(0), ElementsAre("CallInProgress (1,)",
                                     "CallError (1, 403, 'incoming calls are barred there')",
                                     "CallEnded (1, 3)"));
    EXPECT_THAT(take(1), IsEmpty());
    expect_refused(calls_.call_from_network(1, "+15559999", CallType::kVoice), Result::kBarred,
                   "incoming calls of slot 1 are barred");
    // It may call all the same.
    EXPECT_TRUE(call(1, "+15559999"));
}

TEST_F(CallRouting, NobodyRoams) {
    bar(1, BarringType::kIncomingWhenRoaming);
    ring(0, 1);
}

TEST_F(CallRouting, WithoutCallWaitingASecondCallFindsTheLineBusy) {
    connect_party(1);
    expect_accepted(services_.set_waiting(1, {ServiceClass::kVoice, 0}));
    dial(0, "+15550101");
    advance(700ms);
    EXPECT_THAT(take(0), ElementsAre("CallInProgress (1,)", "CallBusy (1,)", "CallEnded (1, 2)"));
    EXPECT_THAT(take(1), IsEmpty());
    expect_refused(calls_.call_from_network(1, "+15559999", CallType::kVoice), Result::kLineInUse,
                   "call waiting is off");
    // A video call may still wait.
    dial(0, "+15550101", CallType::kVideo);
    advance(700ms);
    EXPECT_THAT(take(1), ElementsAre(testing::EndsWith("true)")));
    EXPECT_EQ(state(1, 2), CallState::kWaiting);
}

TEST_F(CallRouting, WithCallWaitingItRings) {
    connect_party(1);
    ring(0, 1);
    EXPECT_EQ(state(1, 2), CallState::kWaiting);
}

TEST_F(CallRouting, WithoutCallWaitingAFirstCallRings) {
    expect_accepted(services_.set_waiting(1, {ServiceClass::kBoth, 0}));
    ring(0, 1);
}

} // namespace
} // namespace sim::test
