// SPDX-License-Identifier: Apache-2.0
#include "tests/library/sms/event_rows.hpp"

#include "ims.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <string_view>

namespace test {
namespace {

using namespace std::string_view_literals;

// Lengths of 32 bits, whatever decoding counts in.
static_assert(sizeof(ims_sms_incoming_s::tpdu_length) == 4);
static_assert(sizeof(ims_sms_incoming_s) == 24);
static_assert(offsetof(ims_sms_incoming_s, tpdu_length) == 0);
static_assert(offsetof(ims_sms_incoming_s, tpdu) == 8);
static_assert(offsetof(ims_sms_incoming_s, member_3) == 16);
static_assert(offsetof(ims_sms_incoming_s, member_4) == 20);

static_assert(sizeof(ims_sms_send_ack_s::tpdu_length) == 4);
static_assert(sizeof(ims_sms_send_ack_s) == 32);
static_assert(offsetof(ims_sms_send_ack_s, member_1) == 0);
static_assert(offsetof(ims_sms_send_ack_s, member_2) == 4);
static_assert(offsetof(ims_sms_send_ack_s, member_3) == 8);
static_assert(offsetof(ims_sms_send_ack_s, tpdu) == 16);
static_assert(offsetof(ims_sms_send_ack_s, tpdu_length) == 24);
static_assert(offsetof(ims_sms_send_ack_s, member_6) == 28);

static_assert(sizeof(ims_sms_delivery_report_ack_s) == 8);
static_assert(offsetof(ims_sms_delivery_report_ack_s, member_1) == 0);
static_assert(offsetof(ims_sms_delivery_report_ack_s, member_2) == 4);

void expect_tpdu(const std::uint8_t *tpdu, std::uint32_t length, std::string_view expected) {
    ASSERT_NE(tpdu, nullptr);
    ASSERT_EQ(length, expected.size());
    EXPECT_EQ(std::string_view(reinterpret_cast<const char *>(tpdu), length), expected);
}

void is_hello(const void *event) {
    const auto &record = as<ims_sms_incoming_s>(event);
    expect_tpdu(record.tpdu, record.tpdu_length, "hello");
    EXPECT_EQ(record.member_3, -3);
    EXPECT_EQ(record.member_4, 4);
}

void is_any_bytes(const void *event) {
    const auto &record = as<ims_sms_incoming_s>(event);
    expect_tpdu(record.tpdu, record.tpdu_length, "\0\xffhi\0"sv);
    EXPECT_EQ(record.member_3, -2147483647 - 1);
    EXPECT_EQ(record.member_4, 2147483647);
}

void is_one_byte(const void *event) {
    const auto &record = as<ims_sms_incoming_s>(event);
    expect_tpdu(record.tpdu, record.tpdu_length, "A");
    EXPECT_EQ(record.member_3, -1);
    EXPECT_EQ(record.member_4, -1);
}

// The member behind the length has all bits set: a longer length would clear them.
void is_ack(const void *event) {
    const auto &record = as<ims_sms_send_ack_s>(event);
    EXPECT_EQ(record.member_1, 1);
    EXPECT_EQ(record.member_2, -2);
    EXPECT_EQ(record.member_3, 3);
    expect_tpdu(record.tpdu, record.tpdu_length, "\0\xffhi\0"sv);
    EXPECT_EQ(record.member_6, -1);
}

void is_report_ack(const void *event) {
    const auto &record = as<ims_sms_delivery_report_ack_s>(event);
    EXPECT_EQ(record.member_1, -1);
    EXPECT_EQ(record.member_2, 2147483647);
}

constexpr EventRow kRows[] = {
    {"Incoming", 0x301, "IncomingSms", "(isii)", "(5, 'aGVsbG8=', -3, 4)", is_hello},
    {"IncomingOfAnyBytes", 0x301, "IncomingSms", "(isii)",
     "(5, 'AP9oaQA=', -2147483648, 2147483647)", is_any_bytes},
    {"IncomingOfOneByte", 0x301, "IncomingSms", "(isii)", "(1, 'QQ==', -1, -1)", is_one_byte},
    {"IncomingWhoseLengthIsTooSmall", 0x301, "IncomingSms", "(isii)", "(3, 'aGVsbG8=', -3, 4)",
     is_hello},
    {"IncomingWhoseLengthIsTooLarge", 0x301, "IncomingSms", "(isii)", "(164, 'aGVsbG8=', -3, 4)",
     is_hello},
    {"IncomingWhoseLengthIsNone", 0x301, "IncomingSms", "(isii)", "(0, 'aGVsbG8=', -3, 4)",
     is_hello},
    {"IncomingWhoseLengthIsNegative", 0x301, "IncomingSms", "(isii)", "(-1, 'aGVsbG8=', -3, 4)",
     is_hello},
    {"IncomingWhoseLengthIsTheLargest", 0x301, "IncomingSms", "(isii)",
     "(2147483647, 'aGVsbG8=', -3, 4)", is_hello},
    {"IncomingWhoseLengthIsTheSmallest", 0x301, "IncomingSms", "(isii)",
     "(-2147483648, 'aGVsbG8=', -3, 4)", is_hello},
    {"SendAck", 0x302, "SendSmsAck", "(iiisii)", "(1, -2, 3, 'AP9oaQA=', 5, -1)", is_ack},
    {"SendAckWhoseLengthIsTooSmall", 0x302, "SendSmsAck", "(iiisii)",
     "(1, -2, 3, 'AP9oaQA=', 2, -1)", is_ack},
    {"SendAckWhoseLengthIsTooLarge", 0x302, "SendSmsAck", "(iiisii)",
     "(1, -2, 3, 'AP9oaQA=', 164, -1)", is_ack},
    {"SendAckWhoseLengthIsNone", 0x302, "SendSmsAck", "(iiisii)", "(1, -2, 3, 'AP9oaQA=', 0, -1)",
     is_ack},
    {"SendAckWhoseLengthIsNegative", 0x302, "SendSmsAck", "(iiisii)",
     "(1, -2, 3, 'AP9oaQA=', -1, -1)", is_ack},
    {"SendAckWhoseLengthIsTheLargest", 0x302, "SendSmsAck", "(iiisii)",
     "(1, -2, 3, 'AP9oaQA=', 2147483647, -1)", is_ack},
    {"SendAckWhoseLengthIsTheSmallest", 0x302, "SendSmsAck", "(iiisii)",
     "(1, -2, 3, 'AP9oaQA=', -2147483648, -1)", is_ack},
    {"DeliveryReportAck", 0x303, "DeliveryReportAck", "(ii)", "(-1, 2147483647)", is_report_ack},
};

} // namespace

std::span<const EventRow> sms_event_rows() {
    return kRows;
}

} // namespace test
