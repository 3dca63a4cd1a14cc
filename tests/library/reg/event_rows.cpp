// SPDX-License-Identifier: Apache-2.0
#include "tests/library/reg/event_rows.hpp"

#include "ims.h"

#include <gtest/gtest.h>

#include <cstddef>

namespace test {
namespace {

static_assert(sizeof(ims_registration_info_s) == 24);
static_assert(offsetof(ims_registration_info_s, registered) == 0);
static_assert(offsetof(ims_registration_info_s, value_1) == 4);
static_assert(offsetof(ims_registration_info_s, value_2) == 8);
static_assert(offsetof(ims_registration_info_s, value_3) == 12);
static_assert(offsetof(ims_registration_info_s, value_4) == 16);
static_assert(offsetof(ims_registration_info_s, value_5) == 20);

static_assert(sizeof(ims_emergency_registration_info_s) == 12);
static_assert(offsetof(ims_emergency_registration_info_s, registered) == 0);
static_assert(offsetof(ims_emergency_registration_info_s, value_1) == 4);
static_assert(offsetof(ims_emergency_registration_info_s, value_2) == 8);

void is_registered(const void *event) {
    const auto &record = as<ims_registration_info_s>(event);
    EXPECT_EQ(record.registered, 1);
    EXPECT_EQ(record.value_1, 1U);
    EXPECT_EQ(record.value_2, 2U);
    EXPECT_EQ(record.value_3, 3);
    EXPECT_EQ(record.value_4, 4);
    EXPECT_EQ(record.value_5, 5);
}

void is_not_registered(const void *event) {
    const auto &record = as<ims_registration_info_s>(event);
    EXPECT_EQ(record.registered, 0);
    EXPECT_EQ(record.value_1, 4294967295U);
    EXPECT_EQ(record.value_2, 2147483648U);
    EXPECT_EQ(record.value_3, -1);
    EXPECT_EQ(record.value_4, -2147483647 - 1);
    EXPECT_EQ(record.value_5, 2147483647);
}

void is_emergency(const void *event) {
    const auto &record = as<ims_emergency_registration_info_s>(event);
    EXPECT_EQ(record.registered, 1);
    EXPECT_EQ(record.value_1, 4294967295U);
    EXPECT_EQ(record.value_2, -2147483647 - 1);
}

void is_no_emergency(const void *event) {
    const auto &record = as<ims_emergency_registration_info_s>(event);
    EXPECT_EQ(record.registered, 0);
    EXPECT_EQ(record.value_1, 7U);
    EXPECT_EQ(record.value_2, -1);
}

constexpr EventRow kRows[] = {
    {.name = "Registered",
     .id = 0x101,
     .member = "RegistrationStatus",
     .type = "(buuiii)",
     .value = "(true, 1, 2, 3, 4, 5)",
     .check = is_registered},
    {.name = "NotRegisteredWithExtremes",
     .id = 0x101,
     .member = "RegistrationStatus",
     .type = "(buuiii)",
     .value = "(false, 4294967295, 2147483648, -1, -2147483648, 2147483647)",
     .check = is_not_registered},
    {.name = "EmergencyWithExtremes",
     .id = 0x102,
     .member = "EmergencyRegistrationStatus",
     .type = "(bui)",
     .value = "(true, 4294967295, -2147483648)",
     .check = is_emergency},
    {.name = "EmergencyFalseSevenMinusOne",
     .id = 0x102,
     .member = "EmergencyRegistrationStatus",
     .type = "(bui)",
     .value = "(false, 7, -1)",
     .check = is_no_emergency},
};

} // namespace

std::span<const EventRow> reg_event_rows() {
    return kRows;
}

} // namespace test
