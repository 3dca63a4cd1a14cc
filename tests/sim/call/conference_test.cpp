// SPDX-License-Identifier: Apache-2.0
#include "tests/sim/network.hpp"

namespace sim::test {
namespace {

class CallConference : public NetworkTest {
  protected:
    // Slot 0 has slots 1 and 2 in conference 3, as its calls 1 and 2.
    int confer() {
        const auto first = connect(0, 1);
        expect_accepted(calls_.hold(0, first.caller));
        connect(0, 2);
        const auto id = calls_.merge(0);
        EXPECT_TRUE(static_cast<bool>(id)) << id.refusal().reason;
        forget_events();
        return id ? *id : 0;
    }
};

TEST_F(CallConference, AMergeMakesOneOfTheActiveAndTheHeldCall) {
    const auto first = connect(0, 1);
    expect_accepted(calls_.hold(0, first.caller));
    connect(0, 2);
    const auto id = calls_.merge(0);
    ASSERT_TRUE(id);
    EXPECT_EQ(*id, 3);
    EXPECT_THAT(take(0), ElementsAre("CallConfernceCallEstablished (3, 0)",
                                     "CallConfernceCallParticipantAdded (3, 2)",
                                     "CallResumed (1, true, false, 0)",
                                     "CallConfernceCallParticipantAdded (3, 1)",
                                     "CallConfNotifyReceived (3, <[3, 3]>, 2, "
                                     "<['tel:+15550101', 'tel:+15550102']>, 2)"));
    EXPECT_THAT(take(1), ElementsAre("CallResumed (1, false, false, 0)"));
    EXPECT_THAT(take(2), IsEmpty());
    EXPECT_THAT(
        calls_.list(0),
        ElementsAre(CallInfo{1, "tel:+15550101", CallType::kVoice, true, CallState::kActive, true},
                    CallInfo{2, "tel:+15550102", CallType::kVoice, true, CallState::kActive, true},
                    CallInfo{3, "sip:conference-3@slot0.invalid", CallType::kVoice, true,
                             CallState::kActive, true}));
}

TEST_F(CallConference, AMergeOfVideoCallsIsAVideoConference) {
    const auto first = connect(0, 1, CallType::kVideo);
    expect_accepted(calls_.hold(0, first.caller));
    connect(0, 2, CallType::kVideo);
    const auto id = calls_.merge(0);
    ASSERT_TRUE(id);
    EXPECT_EQ(calls_.list(0).back().type, CallType::kVideo);
}

TEST_F(CallConference, AMergeWithAConferenceAddsToIt) {
    const int conference = confer();
    expect_accepted(calls_.hold(0, conference));
    const auto third = connect(0, 3);
    const auto id = calls_.merge(0);
    ASSERT_TRUE(id);
    EXPECT_EQ(*id, conference);
    EXPECT_THAT(take(0),
                ElementsAre("CallResumed (3, true, false, 0)",
                            "CallConfernceCallParticipantAdded (3, 4)",
                            "CallConfNotifyReceived (3, <[3, 3, 3]>, 3, <['tel:+15550101', "
                            "'tel:+15550102', 'tel:+15550103']>, 3)"));
    EXPECT_EQ(state(0, third.caller), CallState::kActive);
    EXPECT_EQ(state(1, 1), CallState::kActive);
}

TEST_F(CallConference, HoldingAConferenceHoldsEveryParticipant) {
    const int conference = confer();
    expect_accepted(calls_.hold(0, conference));
    EXPECT_THAT(take(0), ElementsAre("CallHeld (3, true, 0)"));
    EXPECT_THAT(take(1), ElementsAre("CallHeld (1, false, 0)"));
    EXPECT_THAT(take(2), ElementsAre("CallHeld (1, false, 0)"));
    EXPECT_EQ(state(0, 1), CallState::kHeld);
    expect_refused(calls_.hold(0, 1), Result::kWrongState, "on hold already");
    expect_refused(calls_.resume(0, 1), Result::kWrongState, "takes part in conference 3");
    expect_accepted(calls_.resume(0, conference));
    EXPECT_THAT(take(1), ElementsAre("CallResumed (1, false, false, 0)"));
    EXPECT_EQ(state(2, 1), CallState::kActive);
    expect_refused(calls_.hold(0, 1), Result::kWrongState, "takes part in conference 3");
}

TEST_F(CallConference, AParticipantThatHangsUpLeavesAndTheLastEndsIt) {
    confer();
    expect_accepted(calls_.end(1, 1));
    EXPECT_THAT(take(0), ElementsAre("CallConfernceCallParticipantRemoved (3, 1)",
                                     "CallConfNotifyReceived (3, <[3, 4]>, 2, "
                                     "<['tel:+15550102', 'tel:+15550101']>, 2)",
                                     "CallEnded (1, 1)"));
    expect_accepted(calls_.end(2, 1));
    EXPECT_THAT(take(0), ElementsAre("CallConfernceCallParticipantRemoved (3, 2)",
                                     "CallConfNotifyReceived (3, <[4]>, 1, <['tel:+15550102']>, 1)",
                                     "CallEnded (2, 1)", "CallEnded (3, 9)"));
    EXPECT_THAT(calls_.list(0), IsEmpty());
}

TEST_F(CallConference, EndingItEndsAllItsCalls) {
    const int conference = confer();
    expect_accepted(calls_.end(0, conference));
    EXPECT_THAT(take(0), ElementsAre("CallEnded (1, 9)", "CallEnded (2, 9)", "CallEnded (3, 0)"));
    EXPECT_THAT(take(1), ElementsAre("CallEnded (1, 1)"));
    EXPECT_THAT(take(2), ElementsAre("CallEnded (1, 1)"));
}

TEST_F(CallConference, AParticipantIsRemovedByTheOneWhoHasIt) {
    const int conference = confer();
    expect_accepted(calls_.remove_participant(0, conference, 2));
    EXPECT_THAT(take(0), ElementsAre("CallConfernceCallParticipantRemoved (3, 2)",
                                     "CallConfNotifyReceived (3, <[3, 4]>, 2, "
                                     "<['tel:+15550101', 'tel:+15550102']>, 2)",
                                     "CallEnded (2, 8)"));
    EXPECT_THAT(take(2), ElementsAre("CallEnded (1, 8)"));
    expect_refused(calls_.remove_participant(0, conference, 2), Result::kUnknownSession,
                   "no call 2");
    expect_refused(calls_.remove_participant(0, 1, 1), Result::kWrongState, "is not a conference");
    const auto other = ring(3, 0);
    expect_refused(calls_.remove_participant(0, conference, other.callee), Result::kWrongState,
                   "does not take part");
    expect_refused(calls_.remove_participant(0, 77, 1), Result::kUnknownSession, "no call 77");
}

TEST_F(CallConference, StartedFromTwoNamedCalls) {
    const auto pair = active_and_held(0);
    expect_refused(calls_.start_nway(0, pair.active, pair.active, CallType::kVoice),
                   Result::kInvalidArgument, "twice");
    expect_refused(calls_.start_nway(0, pair.active, 99, CallType::kVoice), Result::kUnknownSession,
                   "no call 99");
    expect_refused(calls_.start_nway(0, 99, pair.active, CallType::kVoice), Result::kUnknownSession,
                   "no call 99");
    expect_refused(calls_.start_nway(0, pair.active, pair.held, CallType::kVideo),
                   Result::kWrongState, "is not a video call");
    expect_refused(calls_.start_nway(0, pair.active, pair.held, CallType::kEmergency),
                   Result::kInvalidArgument, "not 2");
    const auto id = calls_.start_nway(0, pair.active, pair.held, CallType::kVoice);
    ASSERT_TRUE(id);
    EXPECT_EQ(*id, 3);
    EXPECT_EQ(state(0, pair.held), CallState::kActive);
    expect_refused(calls_.start_nway(0, *id, pair.held, CallType::kVoice), Result::kWrongState,
                   "add the other call to it");
    expect_refused(calls_.start_nway(0, pair.active, pair.held, CallType::kVoice),
                   Result::kWrongState, "takes part in conference 3 already");
}

TEST_F(CallConference, ACallIsAddedToARunningOne) {
    const int conference = confer();
    expect_accepted(calls_.hold(0, conference));
    const auto third = connect(0, 3);
    expect_accepted(calls_.add_participant(0, conference, third.caller));
    // It takes over the state of the conference, which is on hold.
    EXPECT_THAT(take(0),
                ElementsAre("CallHeld (4, true, 0)", "CallConfernceCallParticipantAdded (3, 4)",
                            "CallConfNotifyReceived (3, <[3, 3, 3]>, 3, <['tel:+15550101', "
                            "'tel:+15550102', 'tel:+15550103']>, 3)"));
    EXPECT_THAT(take(3), ElementsAre("CallHeld (1, false, 0)"));
    expect_refused(calls_.add_participant(0, conference, third.caller), Result::kWrongState,
                   "takes part in conference 3 already");
    expect_refused(calls_.add_participant(0, conference, conference), Result::kWrongState,
                   "is a conference itself");
    expect_refused(calls_.add_participant(0, conference, 88), Result::kUnknownSession, "no call");
    expect_refused(calls_.add_participant(0, 88, third.caller), Result::kUnknownSession, "no call");
}

TEST_F(CallConference, AnInvitedPartyJoinsWhenItAnswers) {
    const int conference = confer();
    expect_accepted(calls_.invite(0, conference, "+15550103", CallType::kVoice));
    advance(700ms);
    EXPECT_THAT(take(0),
                ElementsAre("CallConfNotifyReceived (3, <[3, 3, 1]>, 3, <['tel:+15550101', "
                            "'tel:+15550102', 'tel:+15550103']>, 3)",
                            "CallInProgress (4,)", "CallAlerting (4,)",
                            "CallConfNotifyReceived (3, <[3, 3, 2]>, 3, <['tel:+15550101', "
                            "'tel:+15550102', 'tel:+15550103']>, 3)"));
    expect_accepted(calls_.answer(3, 1, CallType::kVoice));
    EXPECT_THAT(take(0),
                ElementsAre("CallEstablished (4, 0, true, 'tel:+15550103', true)",
                            "CallConfernceCallParticipantAdded (3, 4)",
                            "CallConfNotifyReceived (3, <[3, 3, 3]>, 3, <['tel:+15550101', "
                            "'tel:+15550102', 'tel:+15550103']>, 3)"));
}

TEST_F(CallConference, AnInvitedPartyThatDeclinesIsReportedGone) {
    const int conference = confer();
    expect_accepted(calls_.invite(0, conference, "+15550200", CallType::kVoice));
    forget_events();
    advance(1s);
    EXPECT_THAT(take(0), ElementsAre("CallInProgress (4,)", "CallBusy (4,)",
                                     "CallConfNotifyReceived (3, <[3, 3, 4]>, 3, "
                                     "<['tel:+15550101', 'tel:+15550102', 'tel:+15550200']>, 3)",
                                     "CallEnded (4, 2)"));
    EXPECT_EQ(state(0, conference), CallState::kActive);
}

TEST_F(CallConference, AnInvitedPartyJoinsAHeldConferenceOnHold) {
    const int conference = confer();
    expect_accepted(calls_.invite(0, conference, "+15550103", CallType::kVoice));
    advance(700ms);
    expect_accepted(calls_.hold(0, conference));
    forget_events();
    expect_accepted(calls_.answer(3, 1, CallType::kVoice));
    EXPECT_THAT(take(3), ElementsAre("CallEstablished (1, 0, false, 'tel:+15550100', false)",
                                     "CallHeld (1, false, 0)"));
    EXPECT_EQ(state(0, 4), CallState::kHeld);
    expect_accepted(calls_.resume(0, conference));
    EXPECT_EQ(state(3, 1), CallState::kActive);
}

TEST_F(CallConference, InvitationsAreChecked) {
    const int conference = confer();
    const auto refused = [&](const char *number, const char *reason) {
        expect_refused(calls_.invite(0, conference, number, CallType::kVoice),
                       Result::kInvalidArgument, reason);
    };
    refused("bob", "is no number");
    refused("112", "cannot take part");
    refused("+15550100", "cannot take part");
    refused("+15550101", "takes part already");
    expect_refused(calls_.invite(0, conference, "+15559999", CallType::kEmergency),
                   Result::kInvalidArgument, "not 2");
    expect_refused(calls_.invite(0, 1, "+15559999", CallType::kVoice), Result::kWrongState,
                   "is not a conference");
    for (const auto *number : {"+15559001", "+15559002", "+15559003"})
        expect_accepted(calls_.invite(0, conference, number, CallType::kVoice));
    expect_refused(calls_.invite(0, conference, "+15559004", CallType::kVoice), Result::kTooMany,
                   "at most 5");
}

TEST_F(CallConference, StartedWithAListItStandsWithTheFirstAnswer) {
    const auto id =
        calls_.start_conference(0, CallType::kVoice, {"+15550101", "tel:+15550200", "+15559999"});
    ASSERT_TRUE(id);
    EXPECT_EQ(*id, 1);
    EXPECT_EQ(state(0, *id), CallState::kDialing);
    EXPECT_THAT(take(0), ElementsAre("CallConfNotifyReceived (1, <[1, 1, 1]>, 3, "
                                     "<['tel:+15550101', 'tel:+15550200', 'tel:+15559999']>, 3)"));
    advance(700ms);
    forget_events();
    expect_accepted(calls_.answer(1, 1, CallType::kVoice));
    EXPECT_THAT(take(0), ElementsAre("CallEstablished (2, 0, true, 'tel:+15550101', true)",
                                     "CallConfernceCallEstablished (1, 0)",
                                     "CallConfernceCallParticipantAdded (1, 2)",
                                     "CallConfNotifyReceived (1, <[3, 2]>, 2, "
                                     "<['tel:+15550101', 'tel:+15559999']>, 2)"));
    EXPECT_EQ(state(0, *id), CallState::kActive);
    advance(2s);
    EXPECT_EQ(state(0, 4), CallState::kActive);
}

TEST_F(CallConference, StartedWithAListThatNobodyAnswersItEnds) {
    ASSERT_TRUE(calls_.start_conference(0, CallType::kVoice, {"+15550200", "+15550211"}));
    advance(1min);
    EXPECT_EQ(take(0).back(), "CallEnded (1, 9)");
    EXPECT_THAT(calls_.list(0), IsEmpty());
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST_F(CallConference, AStartIsChecked) {
    const auto refused = [&](const std::vector<std::string> &numbers, Result code,
                             const char *reason) {
        expect_refused(calls_.start_conference(0, CallType::kVoice, numbers), code, reason);
    };
    refused({}, Result::kInvalidArgument, "no participant");
    refused({"+15559001", "bob"}, Result::kInvalidArgument, "is no number");
    refused({"+15559001", "15559001"}, Result::kInvalidArgument, "takes part already");
    refused({"1", "2", "3", "4", "5", "6"}, Result::kTooMany, "at most 5");
    expect_refused(calls_.start_conference(0, CallType{3}, {"+15559001"}), Result::kInvalidArgument,
                   "not 3");
    EXPECT_THAT(calls_.list(0), IsEmpty());
    connect_party(0);
    refused({"+15559001"}, Result::kLineInUse, "hold or end it first");
}

TEST_F(CallConference, ParticipantsAreAddedAndRemovedByNumber) {
    const int conference = confer();
    const auto added =
        calls_.modify_conference(0, conference, ConferenceChange::kAdd, {"+15559001"});
    ASSERT_TRUE(added);
    EXPECT_EQ(*added, conference);
    advance(3s);
    EXPECT_EQ(state(0, 4), CallState::kActive);
    const auto modify = [&](ConferenceChange change, const std::vector<std::string> &numbers) {
        return calls_.modify_conference(0, conference, change, numbers);
    };
    expect_refused(modify(ConferenceChange::kRemove, {"+15559001", "+15558888"}),
                   Result::kInvalidArgument, "does not take part");
    expect_refused(modify(ConferenceChange::kRemove, {}), Result::kInvalidArgument,
                   "no participant");
    expect_refused(modify(ConferenceChange::kRemove, {"bob"}), Result::kInvalidArgument,
                   "is no number");
    expect_refused(modify(ConferenceChange::kAdd, {"+15559001"}), Result::kInvalidArgument,
                   "takes part already");
    expect_refused(modify(ConferenceChange{3}, {"+15559001"}), Result::kInvalidArgument, "not 3");
    expect_refused(calls_.modify_conference(0, 1, ConferenceChange::kAdd, {"+15558888"}),
                   Result::kWrongState, "is not a conference");
    // Nothing of that has changed the conference.
    EXPECT_EQ(calls_.list(0).size(), 4U);
    forget_events();
    expect_accepted(modify(ConferenceChange::kRemove, {"tel:+15559001", "+15550101"}));
    EXPECT_THAT(take(1), ElementsAre("CallEnded (1, 8)"));
    EXPECT_EQ(calls_.list(0).size(), 2U);
}

TEST_F(CallConference, ItsCallsKeepTheirType) {
    const int conference = confer();
    expect_refused(changes_.upgrade(0, conference, CallType::kVideo), Result::kWrongState,
                   "cannot change");
    expect_refused(changes_.upgrade(0, 1, CallType::kVideo), Result::kWrongState, "cannot change");
}

TEST_F(CallConference, AnOpenChangeRequestLapsesWhenTheCallJoins) {
    const auto first = connect(0, 1);
    expect_accepted(calls_.hold(0, first.caller));
    const auto second = connect(0, 2);
    expect_accepted(changes_.upgrade(0, second.caller, CallType::kVideo));
    ASSERT_TRUE(calls_.merge(0));
    expect_refused(changes_.accept(2, second.callee), Result::kWrongState,
                   "has asked for no change");
}

TEST_F(CallConference, AMergeNeedsTwoCalls) {
    expect_refused(calls_.merge(0), Result::kWrongState, "no active one");
    connect_party(0);
    expect_refused(calls_.merge(0), Result::kWrongState, "no held one");
}

} // namespace
} // namespace sim::test
