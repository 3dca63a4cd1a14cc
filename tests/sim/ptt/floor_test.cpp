// SPDX-License-Identifier: Apache-2.0
// Who speaks, who waits, who is interrupted.
#include "tests/sim/ptt/network.hpp"

namespace sim::test {
namespace {

class PttFloorTest : public PttNetwork {
  protected:
    // "(session, media, priority, speaker, participants, name, position, seconds, cause, text)"
    static std::string taken(const std::string &speaker, int priority = 0) {
        return fmt::format(
            "PocCallFloorTaken (1, <[1, 0, 0, 0]>, {}, 'tel:{}', 3, '', 0, 0, 0, '')", priority,
            speaker);
    }
    static std::string granted(const std::string &speaker, int seconds = 30, int priority = 0) {
        return fmt::format(
            "PocCallFloorGranted (1, <[1, 0, 0, 0]>, {}, 'tel:{}', 3, '', 0, {}, 0, '')", priority,
            speaker, seconds);
    }
    static std::string queued(const std::string &speaker, int position) {
        return fmt::format(
            "PocCallFloorQueuePosition (1, <[1, 0, 0, 0]>, 0, 'tel:{}', 3, '', {}, 0, 0, '')",
            speaker, position);
    }
    static constexpr const char *kIdle =
        "PocCallFloorIdle (1, <[0, 0, 0, 0]>, 0, '', 3, '', 0, 0, 0, '')";
};

TEST_F(PttFloorTest, TheFirstIsGrantedTheSecondWaitsAndIsGrantedThen) {
    connect_team();
    expect_accepted(ask_floor(0));
    expect_accepted(ask_floor(1));
    EXPECT_THAT(take(0), ElementsAre(granted("+15550100")));
    EXPECT_THAT(take(1), ElementsAre(taken("+15550100"), queued("+15550100", 1)));
    EXPECT_THAT(take(2), ElementsAre(taken("+15550100")));
    expect_accepted(floor_.release(0, 1));
    EXPECT_THAT(take(0), ElementsAre(taken("+15550101")));
    EXPECT_THAT(take(1), ElementsAre(granted("+15550101")));
    EXPECT_THAT(take(2), ElementsAre(taken("+15550101")));
    expect_accepted(floor_.release(1, 1));
    for (const int slot : {0, 1, 2})
        EXPECT_THAT(take(slot), ElementsAre(kIdle));
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST_F(PttFloorTest, AHigherPriorityGoesBeforeInTheQueue) {
    connect_team();
    expect_accepted(ask_floor(0));
    expect_accepted(ask_floor(1));
    forget_events();
    expect_accepted(ask_floor(2, 3));
    EXPECT_THAT(take(2), ElementsAre(queued("+15550100", 1)));
    EXPECT_THAT(take(1), ElementsAre(queued("+15550100", 2)));
    expect_accepted(floor_.release(0, 1));
    EXPECT_THAT(take(2), ElementsAre(granted("+15550102", 30, 3)));
    EXPECT_THAT(take_floor(1).size(), 2u); // taken, and now the first
    expect_accepted(floor_.release(1, 1));
    EXPECT_THAT(take(1), ElementsAre("PocCallFloorCanceled (1, <[1, 0, 0, 0]>, 3, "
                                     "'tel:+15550102', 3, '', 0, 0, 6, 'withdrawn')"));
}

TEST_F(PttFloorTest, TopPriorityInterruptsThoseBelowIt) {
    connect_team();
    expect_accepted(ask_floor(0, 6));
    forget_events();
    expect_accepted(ask_floor(1, 7));
    EXPECT_THAT(take(0),
                ElementsAre("PocCallFloorCanceled (1, <[1, 0, 0, 0]>, 6, 'tel:+15550100', 3, '', "
                            "0, 0, 4, 'interrupted by a request of top priority')",
                            taken("+15550101", 7)));
    EXPECT_THAT(take(1), ElementsAre(granted("+15550101", 30, 7)));
    expect_accepted(ask_floor(2, 7));
    EXPECT_EQ(take(2).back(), "PocCallFloorQueuePosition (1, <[1, 0, 0, 0]>, 7, 'tel:+15550101', "
                              "3, '', 1, 0, 0, '')");
}

TEST_F(PttFloorTest, InACrisisTheOneWhoDeclaredItHasTopPriority) {
    connect_team();
    expect_accepted(ask_floor(0));
    expect_accepted(ptt_.convert_to_crisis(1, 1));
    forget_events();
    expect_accepted(ask_floor(1));
    EXPECT_EQ(take(1).front(), granted("+15550101", 30, 7));
}

TEST_F(PttFloorTest, TalkTimeIsLimited) {
    connect_team({.terms = {0, 0, 10, 0}});
    expect_accepted(ask_floor(0));
    EXPECT_THAT(take(0), ElementsAre(granted("+15550100", 10)));
    advance(9999ms);
    EXPECT_THAT(take(0), IsEmpty());
    advance(1ms);
    EXPECT_THAT(take(0),
                ElementsAre("PocCallFloorCanceled (1, <[1, 0, 0, 0]>, 0, 'tel:+15550100', 3, '', "
                            "0, 0, 5, 'the talk time is over')",
                            kIdle));
}

TEST_F(PttFloorTest, OneWhoHasWaitedTooLongIsTold) {
    connect_team();
    expect_accepted(ask_floor(0));
    expect_accepted(ask_floor(1, 0, 5));
    forget_events();
    advance(5s);
    EXPECT_THAT(take(1),
                ElementsAre("PocCallFloorRequestTimeout (1, <[1, 0, 0, 0]>, 0, 'tel:+15550100', "
                            "3, '', 0, 0, 7, 'waited too long')"));
    expect_accepted(ask_floor(1));
    EXPECT_THAT(take(1), ElementsAre(queued("+15550100", 1)));
}

TEST_F(PttFloorTest, OneWhoDoesNotWaitIsRejected) {
    connect_team({.terms = {0, 1, 0, 0}});
    expect_accepted(ask_floor(1));
    forget_events();
    expect_accepted(ask_floor(0));
    EXPECT_THAT(take(0),
                ElementsAre("PocCallFloorRejected (1, <[1, 0, 0, 0]>, 0, 'tel:+15550101', 3, '', "
                            "0, 0, 1, 'somebody else speaks')"));
}

TEST_F(PttFloorTest, ASpeakerWhoLeavesLeavesTheFloorToTheNext) {
    connect_team();
    expect_accepted(ask_floor(0));
    expect_accepted(ask_floor(1));
    forget_events();
    expect_accepted(ptt_.end(0, 1, PttEndScope::kLeave));
    EXPECT_THAT(take_floor(1), ElementsAre("PocCallFloorGranted (1, <[1, 0, 0, 0]>, 0, "
                                           "'tel:+15550101', 2, '', 0, 30, 0, '')"));
    expect_accepted(ask_floor(2));
    forget_events();
    expect_accepted(ptt_.end(2, 1, PttEndScope::kLeave));
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST_F(PttFloorTest, AQueueHasAnEnd) {
    PttFloor floor;
    for (int who = 1; who <= 8; ++who) {
        EXPECT_FALSE(floor.full());
        floor.wait({who, 0, {}, {}});
    }
    EXPECT_TRUE(floor.full());
    floor.withdraw(1);
    EXPECT_EQ(floor.position(8), 7);
    EXPECT_EQ(floor.next()->who, 2);
}

TEST(PttFloorQueue, OneMoreThanMayWaitIsRejected) {
    constexpr int kSlots = 10;
    std::vector<std::string> numbers;
    for (int slot = 0; slot < kSlots; ++slot)
        numbers.push_back(NumberPlan::default_slot_number(slot));
    std::chrono::nanoseconds now{0};
    Timers timers(0, [&] { return now; });
    std::vector<PttFloorEvent> told;
    Network network({.numbers = numbers}, timers,
                    {.registration = [](int, const RegistrationEvent &) {},
                     .login = {},
                     .call = {},
                     .sms = {},
                     .ptt =
                         [&](int slot, const PttEvent &event) {
                             if (const auto *floor = std::get_if<PttFloorEvent>(&event);
                                 floor && slot == kSlots - 1)
                                 told.push_back(*floor);
                         }});
    PttCalls &calls = network.ptt;
    const auto settle = [&] {
        now += 1ms;
        timers.run_due();
    };
    network.registrations.start();
    settle();
    for (int slot = 0; slot < kSlots; ++slot)
        expect_accepted(calls.set_channel(slot, 1, PttChannelMode::kTalkAndListen));
    expect_accepted(calls.make_call(0, {{}, "", PttCallType::kChannel}));
    settle();
    for (int slot = 0; slot < kSlots; ++slot)
        expect_accepted(calls.floor().request(slot, {1, {}, 0, 0, {}}));
    ASSERT_FALSE(told.empty());
    EXPECT_EQ(told.back().kind, PttFloorKind::kRejected);
    EXPECT_EQ(told.back().cause, PttFloorCause::kQueueFull);
    EXPECT_EQ(told.back().text, "too many wait");
}

TEST_F(PttFloorTest, TheStateIsToldOfTheSessionsThatAreNamedOrOfAll) {
    connect_team();
    expect_accepted(ask_floor(0));
    expect_accepted(ask_floor(1));
    place(0, "+15550103");
    advance(700ms);
    using enum PttFloorState;
    const auto all = floor_.status(0, {});
    ASSERT_TRUE(all);
    EXPECT_THAT(*all, ElementsAre(PttFloorStatus{1, kGranted, 3, "tel:+15550100"},
                                  PttFloorStatus{2, kIdle, 0, ""}));
    EXPECT_THAT(*floor_.status(1, {1}),
                ElementsAre(PttFloorStatus{1, kWaiting, 3, "tel:+15550100"}));
    EXPECT_THAT(*floor_.status(2, {1}), ElementsAre(PttFloorStatus{1, kTaken, 3, "tel:+15550100"}));
    EXPECT_EQ(floor_.status(2, {})->size(), 1u);
    expect_refused(floor_.status(0, {1, 7}), Result::kUnknownSession, "session 7");
}

TEST_F(PttFloorTest, RequestsThatMakeNoSenseAreRefused) {
    expect_refused(ask_floor(0), Result::kUnknownSession, "session 1");
    place(0, kTeam, PttCallType::kGroup);
    expect_refused(ask_floor(0), Result::kWrongState, "not established");
    advance(700ms);
    answer_all({1, 2});
    expect_refused(floor_.release(0, 1), Result::kWrongState, "neither");
    expect_refused(ask_floor(0, 8), Result::kInvalidArgument, "not 8");
    expect_refused(ask_floor(0, 0, -1), Result::kInvalidArgument, "the time to wait");
    expect_refused(floor_.request(0, {1, {0, 1, 0, 0}, 0, 0, {}}), Result::kInvalidArgument,
                   "all of these media");
    expect_refused(floor_.request(0, {1, {3, 0, 0, 0}, 0, 0, {}}), Result::kInvalidArgument,
                   "not 3");
    expect_accepted(ask_floor(0));
    expect_refused(ask_floor(0), Result::kWrongState, "has the floor already");
    expect_accepted(ask_floor(1));
    expect_refused(ask_floor(1), Result::kWrongState, "waits for the floor already");
    expect_refused(floor_.release(2, 1), Result::kWrongState, "neither");
}

} // namespace
} // namespace sim::test
