// SPDX-License-Identifier: Apache-2.0
// Push-to-talk calls from their first request to their end.
#include "tests/sim/ptt/network.hpp"

namespace sim::test {
namespace {

class PttSetup : public PttNetwork {};

TEST_F(PttSetup, ACallToAnotherSlotRingsThereAndBothAreToldOfTheAnswer) {
    EXPECT_EQ(place(0, "+15550101", PttCallType::kOneToOne,
                    {.takes_floor = false, .terms = {3, 0, 20, 0}, .caller_name = "Zoe"}),
              1);
    EXPECT_THAT(take(0), IsEmpty());
    advance(200ms);
    EXPECT_THAT(take(0), ElementsAre("PocCallInProgress (1,)"));
    advance(500ms);
    EXPECT_THAT(take(0), ElementsAre("PocCallAlerting (1,)"));
    EXPECT_THAT(take(1), ElementsAre("PocCallIncomingInd (false, false, false, false, "
                                     "'tel:+15550100', 'Zoe', 'tel:+15550101', '', '', '', 1, 0, "
                                     "<[1, 0, 1, 1]>, <[3, 0, 20, 0]>)"));
    expect_accepted(ptt_.answer(1, {false, false, 1, 0, {}, {}}));
    EXPECT_THAT(
        take(0),
        ElementsAre("PocCallEstablished (1, 0, true, 'tel:+15550101', false, <[1, 0, 1, 1]>, "
                    "false, <[3, 0, 20, 0]>, <{'uri_type': <int64 0>, 'uri': <'tel:+15550101'>, "
                    "'is_group_uri': <false>}>)",
                    "PocCallFloorIdle (1, <[0, 0, 0, 0]>, 0, '', 1, '', 0, 0, 0, '')"));
    // The rank of the caller is not the other's.
    EXPECT_THAT(
        take(1),
        ElementsAre("PocCallEstablished (1, 0, false, 'tel:+15550100', false, <[1, 0, 1, 1]>, "
                    "false, <[0, 0, 20, 0]>, <{'uri_type': <int64 0>, 'uri': <'tel:+15550100'>, "
                    "'display_name': <'Zoe'>, 'is_group_uri': <false>}>)",
                    "PocCallFloorIdle (1, <[0, 0, 0, 0]>, 0, '', 2, '', 0, 0, 0, '')"));
    expect_accepted(ptt_.end(1, 1, PttEndScope::kLeave));
    EXPECT_THAT(take(0), ElementsAre("PocCallEnded (1, 1)"));
    EXPECT_THAT(take(1), ElementsAre("PocCallEnded (1, 0)"));
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST_F(PttSetup, AGroupCallIsEstablishedWithTheFirstAnswer) {
    place(0, kTeam, PttCallType::kGroup);
    advance(700ms);
    EXPECT_THAT(take_names(0), ElementsAre("PocCallInProgress", "PocCallAlerting"));
    EXPECT_THAT(take(2), ElementsAre("PocCallIncomingInd (false, false, false, true, "
                                     "'tel:+15550100', '', 'tel:+15550102', "
                                     "'sip:team@example.org', '', 'tel:+15550101', 1, 1, "
                                     "<[1, 0, 1, 1]>, <[0, 0, 0, 0]>)"));
    EXPECT_THAT(take(3), IsEmpty());
    expect_accepted(ptt_.answer(1, {false, false, 1, 0, {}, {}}));
    EXPECT_THAT(take_names(0), ElementsAre("PocCallEstablished", "PocGroupConfParticipantInfo",
                                           "PocGroupConfParticipantInfo", "PocCallFloorIdle",
                                           "PocGroupConfParticipantInfo"));
    EXPECT_THAT(take_only(1, "PocGroup"),
                ElementsAre("PocGroupConfParticipantInfo (1, 'tel:+15550100', 'connected')",
                            "PocGroupConfParticipantInfo (1, 'tel:+15550102', 'alerting')"));
    expect_accepted(ptt_.answer(2, {false, false, 1, 0, {}, {}}));
    EXPECT_THAT(take(0),
                ElementsAre("PocGroupConfParticipantInfo (1, 'tel:+15550102', 'connected')"));
    // The one who placed the call may go; it goes on.
    forget_events();
    expect_accepted(ptt_.end(0, 1, PttEndScope::kLeave));
    EXPECT_THAT(take(1),
                ElementsAre("PocGroupConfParticipantInfo (1, 'tel:+15550100', 'disconnected')"));
    // The last one does not stay alone.
    expect_accepted(ptt_.end(2, 1, PttEndScope::kLeave));
    EXPECT_THAT(take(1),
                ElementsAre("PocGroupConfParticipantInfo (1, 'tel:+15550102', 'disconnected')",
                            "PocCallEnded (1, 9)"));
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST_F(PttSetup, TheOneWhoPlacedItMayEndItForEverybody) {
    connect_team();
    expect_refused(ptt_.end(1, 1, PttEndScope::kForAll), Result::kWrongState, "not placed here");
    expect_accepted(ask_floor(0));
    forget_events();
    expect_accepted(ptt_.end(0, 1, PttEndScope::kForAll));
    EXPECT_THAT(take(0), ElementsAre("PocCallEnded (1, 0)"));
    EXPECT_THAT(take(1), ElementsAre("PocCallEnded (1, 1)"));
    EXPECT_THAT(take(2), ElementsAre("PocCallEnded (1, 1)"));
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST_F(PttSetup, ACallThatNobodyTakesEndsWithTheReason) {
    struct Row {
        const char *called;
        const char *ended;
    };
    int session = 0;
    for (const Row &row : {Row{"+15550200", "2"}, Row{"+15550201", "4"}, Row{"+15550202", "7"},
                           Row{"+15550206", "3"}, Row{"+15550211", "6"}}) {
        place(0, row.called);
        advance(31s);
        EXPECT_EQ(take(0).back(), fmt::format("PocCallEnded ({}, {})", ++session, row.ended))
            << row.called;
    }
    place(0, kTeam, PttCallType::kGroup);
    advance(700ms);
    expect_accepted(ptt_.reject(1, 1, PttRejectReason::kBusy));
    EXPECT_EQ(take(1).back(), "PocCallEnded (1, 2)");
    expect_accepted(ptt_.reject(2, 1, PttRejectReason::kDecline));
    EXPECT_EQ(take(0).back(), "PocCallEnded (6, 3)");
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST_F(PttSetup, NobodyAnswersInTheTimeThatWasGiven) {
    place(0, "+15550101", PttCallType::kOneToOne, {.answer_time = 5});
    advance(5699ms);
    forget_events();
    advance(1ms);
    EXPECT_THAT(take(0), ElementsAre("PocCallEnded (1, 4)"));
    EXPECT_THAT(take(1), ElementsAre("PocCallEnded (1, 5)"));
}

TEST_F(PttSetup, TheCallerMayGiveUpAtEveryMoment) {
    place(0, kTeam, PttCallType::kGroup);
    expect_accepted(ptt_.end(0, 1, PttEndScope::kLeave));
    advance(1s);
    EXPECT_THAT(take(0), ElementsAre("PocCallEnded (1, 0)"));
    EXPECT_THAT(take(1), IsEmpty());
    place(0, kTeam, PttCallType::kGroup);
    advance(700ms);
    forget_events();
    expect_accepted(ptt_.end(0, 2, PttEndScope::kLeave));
    EXPECT_THAT(take(1), ElementsAre("PocCallEnded (1, 1)"));
    EXPECT_THAT(take(2), ElementsAre("PocCallEnded (1, 1)"));
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST_F(PttSetup, AnAutomaticCallIsAnsweredUnaskedAndItsCallerMayHaveTheFloorAtOnce) {
    place(0, "+15550101", PttCallType::kOneToOne, {.automatic = true, .takes_floor = true});
    advance(700ms);
    EXPECT_THAT(take_names(0), ElementsAre("PocCallInProgress", "PocCallAlerting",
                                           "PocCallEstablished", "PocCallFloorGranted"));
    EXPECT_THAT(take_names(1),
                ElementsAre("PocCallIncomingInd", "PocCallEstablished", "PocCallFloorTaken"));
}

TEST_F(PttSetup, ACallThatGoesOnCanBeJoined) {
    connect_team();
    expect_accepted(ptt_.end(2, 1, PttEndScope::kLeave));
    expect_accepted(ask_floor(0));
    forget_events();
    EXPECT_EQ(place(2, kTeam, PttCallType::kGroup), 2);
    advance(700ms);
    EXPECT_THAT(take_names(2), ElementsAre("PocCallInProgress", "PocCallEstablished",
                                           "PocGroupConfParticipantInfo",
                                           "PocGroupConfParticipantInfo", "PocCallFloorTaken"));
    EXPECT_THAT(take(1),
                ElementsAre("PocGroupConfParticipantInfo (1, 'tel:+15550102', 'connected')"));
    expect_refused(try_call(1, kTeam, PttCallType::kGroup), Result::kLineInUse, "session 1");
    expect_refused(try_call(3, kTeam, PttCallType::kGroup, {.media = {0, 1, 0, 0}}),
                   Result::kInvalidArgument, "none of these media");
    const auto running = ptt_.running(1);
    ASSERT_EQ(running.size(), 1u);
    EXPECT_EQ(running[0].list_service_uri, kTeam);
    EXPECT_EQ(running[0].inviting_user, "tel:+15550100");
    EXPECT_EQ(running[0].participants.size(), 3u);
    EXPECT_THAT(ptt_.running(3), IsEmpty());
}

TEST_F(PttSetup, FlightModeEndsThem) {
    connect_team();
    place(1, "+15550103");
    advance(700ms);
    forget_events();
    expect_accepted(registrations_.enable_flight_mode(1));
    EXPECT_THAT(take_only(1, "Poc"), ElementsAre("PocCallEnded (1, 0)", "PocCallEnded (2, 0)"));
    EXPECT_THAT(take(0),
                ElementsAre("PocGroupConfParticipantInfo (1, 'tel:+15550101', 'disconnected')"));
    EXPECT_THAT(take(3), ElementsAre("PocCallEnded (1, 7)"));
    for (const auto &refused :
         {Status(ptt_.keep_alive(1, 5)), Status(ptt_.set_channel(1, 1, PttChannelMode{}))})
        expect_refused(refused, Result::kWrongState, "flight mode");
    expect_refused(try_call(1, "+15550100"), Result::kWrongState, "flight mode");
    place(3, "+15550101");
    advance(700ms);
    EXPECT_EQ(take(3).back(), "PocCallEnded (2, 6)");
}

TEST_F(PttSetup, AMissedKeepAliveEndsWhatTheSlotTakesPartIn) {
    connect_two();
    expect_accepted(ptt_.keep_alive(0, 10));
    advance(9s);
    expect_accepted(ptt_.keep_alive(0, 10));
    advance(9s);
    EXPECT_THAT(take(0), IsEmpty());
    advance(1s);
    EXPECT_THAT(take(0), ElementsAre("PocCallEnded (1, 10)"));
    EXPECT_THAT(take(1), ElementsAre("PocCallEnded (1, 7)"));
    expect_accepted(ptt_.keep_alive(0, 10));
    expect_accepted(ptt_.keep_alive(0, 0));
    EXPECT_EQ(timers_.next_due(), std::nullopt);
    expect_refused(ptt_.keep_alive(0, -1), Result::kInvalidArgument, "0 to 3600");
}

TEST_F(PttSetup, ACrisisIsAnnouncedWhenItBeginsAndToThoseWhoCome) {
    connect_team();
    expect_accepted(ptt_.convert_to_crisis(1, 1));
    for (const int slot : {0, 1, 2})
        EXPECT_THAT(take(slot), ElementsAre("PocCallCrisisCallInitiated (1,)"));
    expect_refused(ptt_.convert_to_crisis(0, 1), Result::kWrongState, "crisis call already");
    expect_accepted(ptt_.end(0, 1, PttEndScope::kLeave));
    place(0, kTeam, PttCallType::kGroup);
    advance(700ms);
    EXPECT_THAT(take_only(0, "PocCallCrisis"), ElementsAre("PocCallCrisisCallInitiated (2,)"));
    place(3, "+15550221", PttCallType::kOneToOne, {.crisis = true});
    advance(5s);
    EXPECT_THAT(take_names(3),
                ElementsAre("PocCallInProgress", "PocCallAlerting", "PocCallEstablished",
                            "PocCallCrisisCallInitiated", "PocCallFloorIdle"));
}

TEST_F(PttSetup, PartiesOfTheNetworkHaveTheirHabits) {
    place(0, "+15550204");
    advance(10s);
    EXPECT_EQ(take(0).back(), "PocCallEnded (1, 1)");
    place(0, "+15550214");
    advance(10s);
    EXPECT_THAT(take_names(0),
                ElementsAre("PocCallInProgress", "PocCallAlerting", "PocCallEstablished",
                            "PocCallFloorIdle", "PocCallFloorTaken", "PocCallFloorIdle"));
}

TEST_F(PttSetup, AGroupOfTheNetworkAloneEndsWithItsOnlySlot) {
    place(0, "sip:network@groups.invalid", PttCallType::kGroup);
    advance(1200ms);
    EXPECT_EQ(ptt_.running(0).front().participants.size(), 4u);
    expect_accepted(ptt_.end(0, 1, PttEndScope::kLeave));
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST_F(PttSetup, RequestsThatMakeNoSenseAreRefusedAndChangeNothing) {
    using enum PttCallType;
    expect_refused(try_call(0, "alice"), Result::kInvalidArgument, "is no number");
    expect_refused(try_call(0, "+15550100"), Result::kInvalidArgument, "slot 0 itself");
    expect_refused(try_call(0, "sip:nobody@groups.invalid", kGroup), Result::kUnknownRecord,
                   "there is no group");
    expect_refused(try_call(0, "+15550101", kAdHoc), Result::kInvalidArgument, "not 2");
    expect_refused(try_call(0, "+15550101", PttCallType{7}), Result::kInvalidArgument, "not 7");
    expect_refused(try_call(0, "", kChannel), Result::kWrongState, "on no channel");
    expect_refused(try_call(0, "+15550101", kOneToOne, {.media = {2, 0, 0, 0}}),
                   Result::kInvalidArgument, "not 2");
    for (const FourIntegers &terms :
         {FourIntegers{8, 0, 0, 0}, FourIntegers{0, 2, 0, 0}, FourIntegers{0, 0, 3601, 0}})
        expect_refused(try_call(0, "+15550101", kOneToOne, {.terms = terms}),
                       Result::kInvalidArgument, "not");
    expect_refused(try_call(0, "+15550101", kOneToOne, {.answer_time = -1}),
                   Result::kInvalidArgument, "the time to answer");
    expect_refused(ptt_.end(0, 1, PttEndScope::kLeave), Result::kUnknownSession, "there is none");
    expect_refused(ptt_.answer(0, {false, false, 1, 0, {}, {}}), Result::kUnknownSession, "");

    place(0, "+15550101");
    expect_refused(ptt_.convert_to_crisis(0, 1), Result::kWrongState, "not established");
    expect_refused(ptt_.answer(0, {false, false, 1, 0, {}, {}}), Result::kWrongState,
                   "does not ring");
    expect_refused(ptt_.reject(0, 1, PttRejectReason::kBusy), Result::kWrongState, "not ring");
    advance(700ms);
    expect_refused(ptt_.end(1, 1, PttEndScope::kLeave), Result::kWrongState, "reject it");
    expect_refused(ptt_.reject(1, 1, PttRejectReason{2}), Result::kInvalidArgument, "not 2");
    expect_refused(ptt_.answer(1, {true, false, 1, 0, {0, 1, 0, 0}, {}}), Result::kInvalidArgument,
                   "none of these media");
    expect_refused(ptt_.end(0, 1, PttEndScope{2}), Result::kInvalidArgument, "not 2");
    expect_refused(ptt_.end(0, 9, PttEndScope::kLeave), Result::kUnknownSession,
                   "the sessions are 1");
    answer_all({1});
    for (int i = 0; i < 3; ++i)
        place(0, "+15550207");
    expect_refused(try_call(0, "+15550102"), Result::kTooMany, "no more can be");
}

TEST_F(PttSetup, AnAnswerMayTakeLessThanIsOffered) {
    place(0, "+15550101", PttCallType::kOneToOne, {.media = {1, 1, 0, 0}});
    advance(700ms);
    forget_events();
    expect_accepted(ptt_.answer(1, {true, true, 1, 0, {1, 0, 1, 0}, {5, 1, 9, 0}}));
    EXPECT_THAT(take(1).front(), HasSubstr("<[1, 0, 0, 0]>, false, <[5, 1, 9, 0]>"));
}

} // namespace
} // namespace sim::test
