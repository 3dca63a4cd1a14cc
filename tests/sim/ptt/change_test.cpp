// SPDX-License-Identifier: Apache-2.0
// Other media and other terms.
#include "tests/sim/ptt/network.hpp"

namespace sim::test {
namespace {

constexpr FourIntegers kWithVideo{1, 1, 0, 0};

class PttChangeTest : public PttNetwork {
  protected:
    Status offer(int slot, FourIntegers media = kWithVideo, std::int32_t reference = 42) {
        return ptt_changes_.modify(slot, {true, false, 1, reference, media, {}});
    }
    Status accept(int slot, bool narrows = false, FourIntegers media = {}) {
        return ptt_changes_.accept(slot, {narrows, false, 1, 0, media, {}});
    }
};

TEST_F(PttChangeTest, AnOfferIsAcceptedByTheOther) {
    connect_two();
    expect_accepted(offer(0));
    EXPECT_THAT(take(0), IsEmpty());
    EXPECT_THAT(take(1), ElementsAre("PocCallModifyRequest (true, false, 1, 42, <[1, 1, 0, 0]>, "
                                     "<[0, 0, 0, 0]>)"));
    expect_accepted(accept(1));
    for (const int slot : {0, 1})
        EXPECT_THAT(take(slot), ElementsAre("PocCallModifyStatus (true, true, false, 1, 42, "
                                            "<[1, 1, 0, 0]>, <[0, 0, 0, 0]>)"));
    EXPECT_EQ(timers_.next_due(), std::nullopt);
    expect_accepted(floor_.request(0, {1, kWithVideo, 0, 0, {}}));
}

TEST_F(PttChangeTest, AnAnswerMayTakeLess) {
    connect_two();
    expect_accepted(offer(0));
    expect_refused(accept(1, true, {0, 0, 1, 1}), Result::kInvalidArgument, "was offered");
    expect_accepted(accept(1, true, {1, 0, 1, 0}));
    EXPECT_THAT(take(0), ElementsAre("PocCallModifyStatus (true, true, false, 1, 42, "
                                     "<[1, 0, 0, 0]>, <[0, 0, 0, 0]>)"));
}

TEST_F(PttChangeTest, ARejectedOfferChangesNothing) {
    connect_two();
    expect_accepted(offer(0));
    expect_accepted(ptt_changes_.reject(1, 1));
    EXPECT_THAT(take(0), ElementsAre("PocCallModifyStatus (false, true, false, 1, 42, "
                                     "<[1, 0, 1, 1]>, <[0, 0, 0, 0]>)"));
    expect_refused(ptt_changes_.reject(1, 1), Result::kWrongState, "nobody has offered");
}

TEST_F(PttChangeTest, InAGroupItIsEnoughThatOneAccepts) {
    connect_team();
    expect_accepted(offer(0));
    expect_accepted(ptt_changes_.reject(1, 1));
    EXPECT_THAT(take(0), IsEmpty());
    forget_events();
    expect_accepted(accept(2));
    EXPECT_THAT(take(0), ElementsAre(HasSubstr("(true, true, false, 1, 42, <[1, 1, 0, 0]>")));
    EXPECT_THAT(take(2), ElementsAre(HasSubstr("(true, true, false, 1, 42, <[1, 1, 0, 0]>")));
    EXPECT_THAT(take(1), IsEmpty());
}

TEST_F(PttChangeTest, OneWhoDoesNotAnswerHasRejected) {
    connect_two();
    expect_accepted(offer(0));
    forget_events();
    advance(15s);
    EXPECT_THAT(take(0), ElementsAre(HasSubstr("ModifyStatus (false,")));
    expect_refused(accept(1), Result::kWrongState, "nobody has offered");
}

TEST_F(PttChangeTest, AnOfferGoesWithTheOneWhoMadeItAndIsSettledWhenAnotherGoes) {
    connect_team();
    expect_accepted(offer(0));
    expect_accepted(ptt_.end(0, 1, PttEndScope::kLeave));
    expect_refused(accept(1), Result::kWrongState, "nobody has offered");
    expect_accepted(offer(1));
    forget_events();
    expect_accepted(ptt_.end(2, 1, PttEndScope::kLeave));
    // Alone, it ends.
    EXPECT_EQ(take(1).back(), "PocCallEnded (1, 9)");
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST_F(PttChangeTest, TermsAreTheOwnAlone) {
    connect_two();
    expect_accepted(ptt_changes_.modify(0, {false, true, 1, 7, {}, {2, 1, 12, 0}}));
    EXPECT_THAT(take(0), ElementsAre("PocCallModifyStatus (true, false, true, 1, 7, "
                                     "<[1, 0, 1, 1]>, <[2, 1, 12, 0]>)"));
    EXPECT_THAT(take(1), IsEmpty());
    expect_accepted(ask_floor(0));
    EXPECT_EQ(take(0).back(), "PocCallFloorGranted (1, <[1, 0, 0, 0]>, 2, 'tel:+15550100', 2, '', "
                              "0, 12, 0, '')");
}

TEST_F(PttChangeTest, PartiesOfTheNetworkAnswerAndAsk) {
    place(0, "+15550221");
    advance(5s);
    forget_events();
    expect_accepted(offer(0));
    advance(500ms);
    EXPECT_THAT(take(0), ElementsAre(HasSubstr("ModifyStatus (true,")));
    expect_accepted(ptt_.end(0, 1, PttEndScope::kLeave));
    place(0, "+15550210");
    advance(5s);
    expect_accepted(ptt_changes_.modify(0, {true, false, 2, 0, kWithVideo, {}}));
    advance(500ms);
    EXPECT_THAT(take(0).back(), HasSubstr("ModifyStatus (false,"));
    expect_accepted(ptt_.end(0, 2, PttEndScope::kLeave));
    place(0, "+15550209");
    advance(5s);
    EXPECT_THAT(take(0).back(), HasSubstr("ModifyRequest (true, false, 3, 0, <[1, 1, 1, 1]>"));
    expect_accepted(ptt_changes_.accept(0, {false, false, 3, 0, {}, {}}));
    EXPECT_THAT(take(0), ElementsAre(HasSubstr("ModifyStatus (true, true, false, 3, 0,")));
}

TEST_F(PttChangeTest, RequestsThatMakeNoSenseAreRefused) {
    expect_refused(offer(0), Result::kUnknownSession, "session 1");
    expect_refused(accept(0), Result::kUnknownSession, "session 1");
    expect_refused(ptt_changes_.reject(0, 1), Result::kUnknownSession, "session 1");
    connect_two();
    expect_refused(ptt_changes_.modify(0, {false, false, 1, 0, {}, {}}), Result::kInvalidArgument,
                   "neither of the flags");
    expect_refused(offer(0, {2, 0, 0, 0}), Result::kInvalidArgument, "not 2");
    expect_refused(ptt_changes_.modify(0, {false, true, 1, 0, {}, {9, 0, 0, 0}}),
                   Result::kInvalidArgument, "not 9");
    expect_refused(accept(0), Result::kWrongState, "nobody has offered");
    expect_accepted(offer(0));
    expect_refused(offer(1), Result::kWrongState, "another change");
    expect_refused(accept(0), Result::kWrongState, "nobody has offered");
    expect_refused(accept(1, true, {5, 0, 0, 0}), Result::kInvalidArgument, "not 5");
}

} // namespace
} // namespace sim::test
