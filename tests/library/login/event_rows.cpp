// SPDX-License-Identifier: Apache-2.0
#include "tests/library/login/event_rows.hpp"

#include "ims.h"

#include <gtest/gtest.h>

#include <cstddef>

namespace test {
namespace {

static_assert(sizeof(ims_login_state_s) == 12);
static_assert(offsetof(ims_login_state_s, value_1) == 0);
static_assert(offsetof(ims_login_state_s, value_2) == 4);
static_assert(offsetof(ims_login_state_s, value_3) == 8);

void is_one_two_three(const void *event) {
    const auto &record = as<ims_login_state_s>(event);
    EXPECT_EQ(record.value_1, 1);
    EXPECT_EQ(record.value_2, 2U);
    EXPECT_EQ(record.value_3, 3);
}

void is_extreme(const void *event) {
    const auto &record = as<ims_login_state_s>(event);
    EXPECT_EQ(record.value_1, -2147483647 - 1);
    EXPECT_EQ(record.value_2, 4294967295U);
    EXPECT_EQ(record.value_3, 2147483647);
}

constexpr EventRow kRows[] = {
    {.name = "OneTwoThreeFour",
     .id = 0x501,
     .member = "LoginState",
     .type = "(iuii)",
     .value = "(1, 2, 3, 4)",
     .check = is_one_two_three},
    // The last member is nobody's, whatever it is.
    {.name = "NegativeFourthMember",
     .id = 0x501,
     .member = "LoginState",
     .type = "(iuii)",
     .value = "(1, 2, 3, -2147483648)",
     .check = is_one_two_three},
    {.name = "Extremes",
     .id = 0x501,
     .member = "LoginState",
     .type = "(iuii)",
     .value = "(-2147483648, 4294967295, 2147483647, 0)",
     .check = is_extreme},
};

} // namespace

std::span<const EventRow> login_event_rows() {
    return kRows;
}

} // namespace test
