// SPDX-License-Identifier: Apache-2.0
#include "sim/base/clock.hpp"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <string>

namespace sim {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;

class TimersTest : public testing::Test {
  protected:
    Timers make(double speed) {
        return Timers(speed, [this] { return now_; });
    }
    auto note(std::string name) {
        return [this, name = std::move(name)] { fired_.push_back(name); };
    }

    std::chrono::nanoseconds now_{0};
    std::vector<std::string> fired_;
};

TEST_F(TimersTest, FiresInOrderOfTimeThenOfAsking) {
    Timers timers = make(1);
    const auto late = timers.after(3s, note("late"));
    const auto first = timers.after(1s, note("first"));
    const auto second = timers.after(1s, note("second"));
    EXPECT_EQ(timers.next_due(), 1s);
    now_ = 999ms;
    timers.run_due();
    EXPECT_THAT(fired_, IsEmpty());
    now_ = 1s;
    timers.run_due();
    EXPECT_THAT(fired_, ElementsAre("first", "second"));
    EXPECT_EQ(timers.next_due(), 3s);
    EXPECT_TRUE(late.pending());
    EXPECT_FALSE(first.pending());
}

TEST_F(TimersTest, ATimerThatGoesAwayDoesNotFire) {
    Timers timers = make(1);
    { const auto forgotten = timers.after(1s, note("forgotten")); }
    auto kept = timers.after(1s, note("replaced"));
    kept = timers.after(2s, note("kept"));
    const auto moved = std::move(kept);
    now_ = 5s;
    timers.run_due();
    EXPECT_THAT(fired_, ElementsAre("kept"));
    EXPECT_EQ(timers.next_due(), std::nullopt);
}

TEST_F(TimersTest, SpeedScalesTheNetworkAndNotPatience) {
    Timers timers = make(4);
    const auto scaled = timers.after(2s, note("scaled"));
    const auto patience = timers.after_unscaled(2s, note("patience"));
    now_ = 500ms;
    timers.run_due();
    EXPECT_THAT(fired_, ElementsAre("scaled"));
    EXPECT_EQ(timers.next_due(), 2s);
}

TEST_F(TimersTest, AtSpeedZeroEverythingIsDueAtOnceInItsOrder) {
    Timers timers = make(0);
    const auto later = timers.after(30s, note("later"));
    const auto sooner = timers.after(1s, note("sooner"));
    now_ = 1us;
    timers.run_due();
    EXPECT_THAT(fired_, ElementsAre("sooner", "later"));
}

TEST_F(TimersTest, AnActionMayReplaceItsOwnTimer) {
    Timers timers = make(1);
    Timer timer;
    timer = timers.after(1s, [&] {
        fired_.push_back("first");
        timer = timers.after(1s, note("second"));
    });
    now_ = 1s;
    timers.run_due();
    EXPECT_THAT(fired_, ElementsAre("first"));
    now_ = 2s;
    timers.run_due();
    EXPECT_THAT(fired_, ElementsAre("first", "second"));
}

TEST_F(TimersTest, WaitingIsScaledButNeverAtOnce) {
    Timers fast = make(10);
    const auto scaled = fast.after_waiting(10s, note("scaled"));
    EXPECT_EQ(fast.next_due(), 1s);
    Timers at_once = make(0);
    const auto unscaled = at_once.after_waiting(10s, note("unscaled"));
    EXPECT_EQ(at_once.next_due(), 10s);
}

TEST_F(TimersTest, NoDelayIsTooLongToCount) {
    Timers slow = make(1e-12);
    const auto timer = slow.after(std::chrono::hours(24 * 7 * 63), note("late"));
    EXPECT_GT(*slow.next_due(), std::chrono::hours(24 * 365 * 30));
}

TEST_F(TimersTest, TheNetworksTimeRunsAtItsPaceFromTheStart) {
    using Seconds = std::chrono::duration<double>;
    now_ = 100s;
    const Timers fast = make(10);
    const Timers at_once = make(0);
    EXPECT_EQ(fast.network_time(), Seconds(0));
    now_ = 107s;
    EXPECT_EQ(fast.network_time(), Seconds(70));
    EXPECT_EQ(at_once.network_time(), Seconds(7));
}

TEST_F(TimersTest, TellsWhenSomethingIsAdded) {
    Timers timers = make(1);
    int told = 0;
    timers.on_change([&] { ++told; });
    const auto timer = timers.after(1s, note("x"));
    EXPECT_EQ(told, 1);
}

} // namespace
} // namespace sim
