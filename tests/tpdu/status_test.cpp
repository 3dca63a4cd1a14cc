// SPDX-License-Identifier: Apache-2.0
#include "tests/tpdu/support.hpp"

#include "tpdu/status.hpp"

#include <gtest/gtest.h>

namespace {

using tpdu::StatusClass;

TEST(Status, Classes) {
    EXPECT_EQ(tpdu::status_class(0x00), StatusClass::kCompleted);
    EXPECT_EQ(tpdu::status_class(0x1F), StatusClass::kCompleted);
    EXPECT_EQ(tpdu::status_class(0x20), StatusClass::kStillTrying);
    EXPECT_EQ(tpdu::status_class(0x3F), StatusClass::kStillTrying);
    EXPECT_EQ(tpdu::status_class(0x40), StatusClass::kFailed);
    EXPECT_EQ(tpdu::status_class(0x5F), StatusClass::kFailed);
    EXPECT_EQ(tpdu::status_class(0x60), StatusClass::kGaveUp);
    EXPECT_EQ(tpdu::status_class(0x7F), StatusClass::kGaveUp);
    EXPECT_EQ(tpdu::status_class(0x80), StatusClass::kGaveUp);
    EXPECT_EQ(tpdu::status_class(0xFF), StatusClass::kGaveUp);
}

TEST(Status, EveryValueHasAText) {
    for (unsigned value = 0; value <= 0xFF; ++value) {
        EXPECT_FALSE(tpdu::describe_status(static_cast<std::uint8_t>(value)).empty());
        EXPECT_FALSE(tpdu::describe_failure_cause(static_cast<std::uint8_t>(value)).empty());
    }
    EXPECT_EQ(tpdu::describe_status(0x00), "received by the addressee");
    EXPECT_EQ(tpdu::describe_status(0x46), "validity period expired");
    EXPECT_EQ(tpdu::describe_status(0x5F), "permanent error (other status)");
    EXPECT_EQ(tpdu::describe_failure_cause(0xD3), "memory exceeded");
    EXPECT_EQ(tpdu::describe_failure_cause(0xE7), "application-specific error");
    EXPECT_EQ(tpdu::describe_failure_cause(0xFF), "unspecified error");
    EXPECT_EQ(tpdu::describe_failure_cause(0x12), "unspecified error (reserved cause)");
}

} // namespace
