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
    {.name = "Incoming",
     .id = 0x301,
     .member = "IncomingSms",
     .type = "(isii)",
     .value = "(5, 'aGVsbG8=', -3, 4)",
     .check = is_hello},
    {.name = "IncomingOfAnyBytes",
     .id = 0x301,
     .member = "IncomingSms",
     .type = "(isii)",
     .value = "(5, 'AP9oaQA=', -2147483648, 2147483647)",
     .check = is_any_bytes},
    {.name = "IncomingOfOneByte",
     .id = 0x301,
     .member = "IncomingSms",
     .type = "(isii)",
     .value = "(1, 'QQ==', -1, -1)",
     .check = is_one_byte},
    {.name = "IncomingWhoseLengthIsTooSmall",
     .id = 0x301,
     .member = "IncomingSms",
     .type = "(isii)",
     .value = "(3, 'aGVsbG8=', -3, 4)",
     .check = is_hello},
    {.name = "IncomingWhoseLengthIsTooLarge",
     .id = 0x301,
     .member = "IncomingSms",
     .type = "(isii)",
     .value = "(164, 'aGVsbG8=', -3, 4)",
     .check = is_hello},
    {.name = "IncomingWhoseLengthIsNone",
     .id = 0x301,
     .member = "IncomingSms",
     .type = "(isii)",
     .value = "(0, 'aGVsbG8=', -3, 4)",
     .check = is_hello},
    {.name = "IncomingWhoseLengthIsNegative",
     .id = 0x301,
     .member = "IncomingSms",
     .type = "(isii)",
     .value = "(-1, 'aGVsbG8=', -3, 4)",
     .check = is_hello},
    {.name = "IncomingWhoseLengthIsTheLargest",
     .id = 0x301,
     .member = "IncomingSms",
     .type = "(isii)",
     .value = "(2147483647, 'aGVsbG8=', -3, 4)",
     .check = is_hello},
    {.name = "IncomingWhoseLengthIsTheSmallest",
     .id = 0x301,
     .member = "IncomingSms",
     .type = "(isii)",
     .value = "(-2147483648, 'aGVsbG8=', -3, 4)",
     .check = is_hello},
    {.name = "SendAck",
     .id = 0x302,
     .member = "SendSmsAck",
     .type = "(iiisii)",
     .value = "(1, -2, 3, 'AP9oaQA=', 5, -1)",
     .check = is_ack},
    {.name = "SendAckWhoseLengthIsTooSmall",
     .id = 0x302,
     .member = "SendSmsAck",
     .type = "(iiisii)",
     .value = "(1, -2, 3, 'AP9oaQA=', 2, -1)",
     .check = is_ack},
    {.name = "SendAckWhoseLengthIsTooLarge",
     .id = 0x302,
     .member = "SendSmsAck",
     .type = "(iiisii)",
     .value = "(1, -2, 3, 'AP9oaQA=', 164, -1)",
     .check = is_ack},
    {.name = "SendAckWhoseLengthIsNone",
     .id = 0x302,
     .member = "SendSmsAck",
     .type = "(iiisii)",
     .value = "(1, -2, 3, 'AP9oaQA=', 0, -1)",
     .check = is_ack},
    {.name = "SendAckWhoseLengthIsNegative",
     .id = 0x302,
     .member = "SendSmsAck",
     .type = "(iiisii)",
     .value = "(1, -2, 3, 'AP9oaQA=', -1, -1)",
     .check = is_ack},
    {.name = "SendAckWhoseLengthIsTheLargest",
     .id = 0x302,
     .member = "SendSmsAck",
     .type = "(iiisii)",
     .value = "(1, -2, 3, 'AP9oaQA=', 2147483647, -1)",
     .check = is_ack},
    {.name = "SendAckWhoseLengthIsTheSmallest",
     .id = 0x302,
     .member = "SendSmsAck",
     .type = "(iiisii)",
     .value = "(1, -2, 3, 'AP9oaQA=', -2147483648, -1)",
     .check = is_ack},
    {.name = "DeliveryReportAck",
     .id = 0x303,
     .member = "DeliveryReportAck",
     .type = "(ii)",
     .value = "(-1, 2147483647)",
     .check = is_report_ack},
};

} // namespace

std::span<const EventRow> sms_event_rows() {
    return kRows;
}

} // namespace test
