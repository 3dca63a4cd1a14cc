// SPDX-License-Identifier: Apache-2.0
#include "imsctl/client/call_values.hpp"
#include "imsctl/client/session_choice.hpp"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace imsctl {
namespace {

ims_call_info_s call(std::int32_t session_id, std::int32_t state, bool conference = false) {
    ims_call_info_s info{};
    info.session_id = session_id;
    info.call_state = state;
    info.bconfcall = conference;
    return info;
}

std::string session_refusal(const Fitting &fitting, std::span<const ims_call_info_s> calls) {
    try {
        return "chose " + std::to_string(choose_session(fitting, calls));
    } catch (const Failure &failure) {
        EXPECT_EQ(failure.kind, FailureKind::kSession);
        return failure.what();
    }
}

struct FittingRow {
    const Fitting *fitting;
    std::vector<std::int32_t> states; // those that fit
};

class Fittings : public ::testing::TestWithParam<FittingRow> {};

TEST_P(Fittings, FitTheirStates) {
    for (const NamedValue &state : kCallStates) {
        const auto &fitting = GetParam().states;
        const bool expected =
            std::find(fitting.begin(), fitting.end(), state.value) != fitting.end();
        EXPECT_EQ(GetParam().fitting->test(call(1, state.value)), expected) << state.name;
    }
}

INSTANTIATE_TEST_SUITE_P(All, Fittings,
                         ::testing::Values(FittingRow{&kAnyCall, {1, 2, 3, 4, 5, 6, 7}},
                                           FittingRow{&kRingingHere, {3, 4}},
                                           FittingRow{&kInConversation, {5, 7}},
                                           FittingRow{&kOnHold, {6}},
                                           FittingRow{&kEstablished, {5, 6, 7}},
                                           FittingRow{&kConference, {}}));

TEST(SessionChoice, TakesTheOnlyOneThatFits) {
    const ims_call_info_s calls[] = {call(4, call_state::kHeld), call(9, call_state::kActive)};
    EXPECT_EQ(choose_session(kOnHold, calls), 4);
    EXPECT_EQ(choose_session(kInConversation, calls), 9);
}

TEST(SessionChoice, FindsAConference) {
    const ims_call_info_s calls[] = {call(4, call_state::kHeld), call(9, 5, true)};
    EXPECT_EQ(choose_session(kConference, calls), 9);
}

TEST(SessionChoice, SaysThatThereAreNoCalls) {
    EXPECT_EQ(session_refusal(kAnyCall, {}), "there are no calls");
}

TEST(SessionChoice, SaysWhichCallsThereAre) {
    const ims_call_info_s calls[] = {call(1, call_state::kActive), call(2, 99, true)};
    EXPECT_EQ(session_refusal(kOnHold, calls),
              "there are no calls on hold; all calls: 1 (-, active), 2 (-, 99, conference)");
    EXPECT_EQ(session_refusal(kAnyCall, calls),
              "there are 2 calls: 1 (-, active), 2 (-, 99, conference)");
}

} // namespace
} // namespace imsctl
