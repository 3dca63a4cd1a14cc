// SPDX-License-Identifier: Apache-2.0
// The numbers with a meaning.
#include "sim/call/parties.hpp"

#include "tests/sim/network.hpp"

#include <set>

namespace sim::test {
namespace {

class Parties : public NetworkTest {
  protected:
    std::vector<std::string> call(const std::string &number, std::chrono::nanoseconds time) {
        dial(0, number);
        advance(time);
        return take(0);
    }
};

constexpr const char *kProceeds = "CallInProgress (1,)";
constexpr const char *kRings = "CallAlerting (1,)";

std::string answers(const std::string &number) {
    return "CallEstablished (1, 0, true, 'tel:" + number + "', false)";
}

TEST_F(Parties, Busy) {
    EXPECT_THAT(call("+15550200", 1min),
                ElementsAre(kProceeds, "CallBusy (1,)", "CallEnded (1, 2)"));
}

TEST_F(Parties, NoAnswer) {
    EXPECT_THAT(call("+15550201", 30s), ElementsAre(kProceeds, kRings));
    advance(1s);
    EXPECT_THAT(take(0), ElementsAre("CallEnded (1, 4)"));
}

TEST_F(Parties, NetworkError) {
    EXPECT_THAT(
        call("+15550202", 1min),
        ElementsAre(kProceeds, "CallError (1, 503, 'the network failed')", "CallEnded (1, 7)"));
}

TEST_F(Parties, EarlyMedia) {
    EXPECT_THAT(call("+15550203", 1min),
                ElementsAre(kProceeds, "CallEarlyMediaStart (1, 'audio')", "CallStopAlertTone (1,)",
                            answers("+15550203")));
}

TEST_F(Parties, HangsUp) {
    EXPECT_THAT(call("+15550204", 1min),
                ElementsAre(kProceeds, kRings, answers("+15550204"), "CallEnded (1, 1)"));
}

TEST_F(Parties, Forwarded) {
    EXPECT_THAT(call("+15550205", 1min),
                ElementsAre(kProceeds, "CallForwarded (1,)", kRings, answers("+15550205")));
}

TEST_F(Parties, Declines) {
    EXPECT_THAT(call("+15550206", 1min), ElementsAre(kProceeds, kRings, "CallEnded (1, 3)"));
}

TEST_F(Parties, RingsForEver) {
    EXPECT_THAT(call("+15550207", 24h), ElementsAre(kProceeds, kRings));
    EXPECT_EQ(state(0, 1), CallState::kAlerting);
}

TEST_F(Parties, HoldsAndResumes) {
    EXPECT_THAT(call("+15550208", 3700ms),
                ElementsAre(kProceeds, kRings, answers("+15550208"), "CallHeld (1, false, 0)"));
    EXPECT_EQ(state(0, 1), CallState::kHeldByPeer);
    // Both ends hold by themselves.
    expect_accepted(calls_.hold(0, 1));
    forget_events();
    advance(2s);
    EXPECT_THAT(take(0), ElementsAre("CallResumed (1, false, true, 0)"));
    EXPECT_EQ(state(0, 1), CallState::kHeld);
    expect_accepted(calls_.resume(0, 1));
    EXPECT_THAT(take(0), ElementsAre("CallResumed (1, true, false, 0)"));
}

TEST_F(Parties, AsksForVideo) {
    EXPECT_THAT(call("+15550209", 4s), ElementsAre(kProceeds, kRings, answers("+15550209"),
                                                   "CallChangeRequest (1, 1, 'YXVkaW8sdmlkZW8=')"));
    expect_accepted(changes_.accept(0, 1));
    EXPECT_THAT(take(0), ElementsAre("CallSwitched (1, 1)"));
}

TEST_F(Parties, AsksForVideoInVain) {
    call("+15550209", 4s);
    expect_accepted(changes_.reject(0, 1));
    EXPECT_THAT(take(0), IsEmpty());
    EXPECT_EQ(calls_.list(0).front().type, CallType::kVoice);
    expect_refused(changes_.accept(0, 1), Result::kWrongState, "has asked for no change");
}

TEST_F(Parties, WaitsAQuarterOfAMinuteForTheAnswer) {
    call("+15550209", 4s);
    advance(15s);
    expect_refused(changes_.accept(0, 1), Result::kWrongState, "has asked for no change");
}

TEST_F(Parties, DoesNotAskForVideoWhileOnHold) {
    call("+15550209", 3s);
    expect_accepted(calls_.hold(0, 1));
    forget_events();
    advance(5s);
    EXPECT_THAT(take(0), IsEmpty());
}

TEST_F(Parties, RefusesChanges) {
    call("+15550210", 3s);
    expect_accepted(changes_.upgrade(0, 1, CallType::kVideo));
    advance(1s);
    EXPECT_THAT(take(0), ElementsAre("CallError (1, 488, 'the change request was rejected')"));
    EXPECT_EQ(calls_.list(0).front().type, CallType::kVoice);
}

TEST_F(Parties, Nobody) {
    EXPECT_THAT(
        call("+15550211", 1min),
        ElementsAre(kProceeds, "CallError (1, 404, 'nobody has this number')", "CallEnded (1, 6)"));
}

TEST_F(Parties, NetworkDropsTheCall) {
    EXPECT_THAT(call("+15550212", 1min),
                ElementsAre(kProceeds, kRings, answers("+15550212"),
                            "CallError (1, 503, 'the network failed')", "CallEnded (1, 7)"));
}

TEST_F(Parties, CallsBack) {
    EXPECT_THAT(call("+15550213", 5699ms),
                ElementsAre(kProceeds, kRings, answers("+15550213"), "CallEnded (1, 1)"));
    advance(1ms);
    EXPECT_THAT(take(0), ElementsAre("CallIncomingInd (2, 'tel:+15550213', 0, 'tel:+15550100', "
                                     "'', '', '', '', false)"));
    expect_accepted(calls_.answer(0, 2, CallType::kVoice));
    EXPECT_THAT(take(0), ElementsAre("CallEstablished (2, 0, false, 'tel:+15550213', false)"));
}

TEST_F(Parties, CallsBackInVainWhenTheLineIsInUse) {
    call("+15550213", 4s);
    dial(0, "+15550207");
    forget_events();
    advance(1min);
    EXPECT_THAT(take(0), ElementsAre("CallInProgress (2,)", "CallAlerting (2,)"));
}

TEST_F(Parties, PressesKeys) {
    EXPECT_THAT(call("+15550214", 1min),
                ElementsAre(kProceeds, kRings, answers("+15550214"), "CallDtmfEvent (0x31,)",
                            "CallDtmfEvent (0x32,)", "CallDtmfEvent (0x33,)",
                            "CallDtmfEvent (0x23,)"));
}

TEST_F(Parties, DoNothingMoreOnceTheCallHasEnded) {
    call("+15550208", 3s);
    expect_accepted(calls_.end(0, 1));
    forget_events();
    advance(1min);
    EXPECT_THAT(take(0), IsEmpty());
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST(NumberPlanTest, NoTwoPartiesShareANumberAndNoneIsASlots) {
    std::set<std::string_view> numbers;
    for (const auto &party : parties()) {
        EXPECT_TRUE(numbers.insert(party.number).second) << party.number;
        for (int slot = 0; slot < 64; ++slot)
            EXPECT_FALSE(same_number(party.number, NumberPlan::default_slot_number(slot)));
    }
}

} // namespace
} // namespace sim::test
