// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/network.hpp"

#include <chrono>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <map>
#include <string>
#include <vector>

namespace sim::test {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

// A network of four registered slots whose time stands still until a test moves it on. Events are
// kept as the signals that they become: "CallEnded (1, 0)".
class NetworkTest : public testing::Test {
  protected:
    // 2031-05-06T07:08:09Z, the time of day when a test begins less the 0.3 s that it takes to
    // register.
    static constexpr std::int64_t kEpoch = 1935817689;

    NetworkTest();

    void advance(std::chrono::nanoseconds by);
    // What a slot has been told since it was last asked.
    std::vector<std::string> take(int slot);
    void forget_events();

    // A call from one slot to another, up to the point that the name says. The ids are those of
    // the two ends.
    struct Ends {
        int caller;
        int callee;
    };
    int dial(int slot, const std::string &number, CallType type = CallType::kVoice);
    Ends ring(int from, int to, CallType type = CallType::kVoice);
    Ends connect(int from, int to, CallType type = CallType::kVoice);
    // A call to a party of the network that answers.
    int connect_party(int slot, const std::string &number = "+15559999");
    // One active and one held call, both answered by parties of the network.
    struct Pair {
        int active;
        int held;
    };
    Pair active_and_held(int slot);

    CallState state(int slot, int id);

    // Flight mode, until the slot is back.
    void lose(int slot);
    void come_back(int slot);

    std::chrono::nanoseconds now_{0};
    Timers timers_;
    std::map<int, std::vector<std::string>> events_;
    std::map<int, std::vector<MessageEvent>> messages_; // the same once more, as records
    Network network_;

    // The parts of the network.
    const NumberPlan &plan_ = network_.plan;
    Registrations &registrations_ = network_.registrations;
    SupplementaryServices &services_ = network_.services;
    CallModel &calls_ = network_.calls;
    CallMedia &media_ = calls_.media();
    CallChanges &changes_ = calls_.changes();
    CallRadio &radio_ = calls_.radio();
    VideoTelephony &video_ = network_.video;
    UssdService &ussd_ = network_.ussd;
    Logins &logins_ = network_.logins;
    ServiceCentre &centre_ = network_.centre;
};

// A refusal with this code whose reason holds this text.
template <typename T>
void expect_refused(const Answer<T> &answer, Result code, const std::string &reason) {
    ASSERT_FALSE(answer) << "accepted, should say: " << reason;
    EXPECT_EQ(answer.refusal().code, code) << answer.refusal().reason;
    EXPECT_THAT(answer.refusal().reason, HasSubstr(reason));
}

template <typename T>
void expect_accepted(const Answer<T> &answer) {
    EXPECT_TRUE(static_cast<bool>(answer)) << answer.refusal().reason;
}

} // namespace sim::test
