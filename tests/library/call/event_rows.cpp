// SPDX-License-Identifier: Apache-2.0
#include "tests/library/call/event_rows.hpp"

#include "ims.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <cstring>

namespace test {
namespace {

// The application takes each text over.
void take(char *text, const char *expected) {
    EXPECT_STREQ(text, expected);
    std::free(text);
}

// A boolean is one byte, 0 or 1.
void expect_flag(const bool &flag, int expected) {
    unsigned char byte = 0xFF;
    std::memcpy(&byte, &flag, 1);
    EXPECT_EQ(byte, expected);
}

void expect_bytes(const std::uint8_t *data, std::int32_t length, const char *expected,
                  std::int32_t expected_length) {
    ASSERT_EQ(length, expected_length);
    if (length > 0) {
        EXPECT_EQ(std::memcmp(data, expected, static_cast<std::size_t>(length)), 0);
    }
}

template <std::int32_t Session>
void is_session(const void *event) {
    EXPECT_EQ(as<ims_call_session_s>(event).session_id, Session);
}

template <std::int32_t Session, std::int32_t Value>
void is_conference_event(const void *event) {
    const auto &record = as<ims_call_conference_event_s>(event);
    EXPECT_EQ(record.session_id, Session);
    EXPECT_EQ(record.value_1, Value);
}

template <bool Flag>
void is_incoming(const void *event) {
    const auto &record = as<ims_call_incoming_s>(event);
    EXPECT_EQ(record.session_id, 1);
    take(record.number, "+4912345");
    EXPECT_EQ(record.call_type, -3);
    take(record.text_1, "one");
    take(record.text_2, "");
    take(record.text_3, "three");
    take(record.text_4, "zo\xc3\xab");
    take(record.text_5, "five");
    expect_flag(record.flag_1, Flag);
}

template <bool First, bool Second>
void is_established(const void *event) {
    const auto &record = as<ims_call_established_s>(event);
    EXPECT_EQ(record.session_id, 1);
    EXPECT_EQ(record.call_type, 2);
    expect_flag(record.flag_1, First);
    take(record.text_1, "sip:b@example.org");
    expect_flag(record.flag_2, Second);
}

template <bool Flag>
void is_held(const void *event) {
    const auto &record = as<ims_call_held_s>(event);
    EXPECT_EQ(record.session_id, 1);
    expect_flag(record.flag_1, Flag);
    EXPECT_EQ(record.value_1, 9);
}

template <bool First, bool Second>
void is_resumed(const void *event) {
    const auto &record = as<ims_call_resumed_s>(event);
    EXPECT_EQ(record.session_id, 1);
    expect_flag(record.flag_1, First);
    expect_flag(record.flag_2, Second);
    EXPECT_EQ(record.value_1, 0x01020304);
    // Side by side behind the first int, the second int after them.
    const auto *bytes = static_cast<const unsigned char *>(event);
    EXPECT_EQ(bytes[4], First);
    EXPECT_EQ(bytes[5], Second);
    EXPECT_EQ(std::memcmp(bytes + 8, "\4\3\2\1", 4), 0);
}

void is_ended(const void *event) {
    const auto &record = as<ims_call_ended_s>(event);
    EXPECT_EQ(record.session_id, 3);
    EXPECT_EQ(record.reason, 16);
}

void is_switched(const void *event) {
    const auto &record = as<ims_call_switched_s>(event);
    EXPECT_EQ(record.session_id, 3);
    EXPECT_EQ(record.call_type, 2);
}

void is_change_request(const void *event) {
    const auto &record = as<ims_call_change_request_s>(event);
    EXPECT_EQ(record.session_id, 1);
    EXPECT_EQ(record.call_type, 2);
    expect_bytes(record.data, record.length, "\0v=0\xff", 5);
}

void is_empty_change_request(const void *event) {
    const auto &record = as<ims_call_change_request_s>(event);
    EXPECT_EQ(record.session_id, 1);
    EXPECT_EQ(record.call_type, 2);
    EXPECT_EQ(record.length, 0);
}

void is_conf_notify(const void *event) {
    const auto &record = as<ims_call_conf_notify_s>(event);
    EXPECT_EQ(record.session_id, 1);
    ASSERT_EQ(record.value_count, 2);
    EXPECT_EQ(record.values[0], 10);
    EXPECT_EQ(record.values[1], -20);
    ASSERT_EQ(record.text_count, 3);
    take(record.texts[0], "c");
    take(record.texts[1], "a");
    take(record.texts[2], "");
}

void is_early_media(const void *event) {
    const auto &record = as<ims_call_early_media_s>(event);
    EXPECT_EQ(record.session_id, 1);
    take(record.text_1, "announcement");
}

void is_error(const void *event) {
    const auto &record = as<ims_call_error_s>(event);
    EXPECT_EQ(record.session_id, 1);
    EXPECT_EQ(record.error_code, -5);
    take(record.text_1, "no resources");
}

void is_ussd(const void *event) {
    const auto &record = as<ims_call_ussd_indication_s>(event);
    EXPECT_EQ(record.value_1, 1);
    EXPECT_EQ(record.value_2, 2);
    EXPECT_EQ(record.value_3, 3);
    expect_bytes(record.data, record.length, "hello", 5);
}

template <int Tone>
void is_tone(const void *event) {
    EXPECT_EQ(as<ims_call_dtmf_event_s>(event).tone, Tone);
}

struct FlagRecord {
    std::int32_t value;
    bool flag;
};

void is_flag(const void *event) {
    EXPECT_EQ(as<FlagRecord>(event).value, 1);
    expect_flag(as<FlagRecord>(event).flag, 1);
}

struct FlagTextRecord {
    std::int32_t value;
    bool flag;
    char *text;
};

void is_flag_text(const void *event) {
    EXPECT_EQ(as<FlagTextRecord>(event).value, 1);
    expect_flag(as<FlagTextRecord>(event).flag, 1);
    take(as<FlagTextRecord>(event).text, "text");
}

constexpr EventRow kRows[] = {
    {.name = "Incoming",
     .id = 0x201,
     .member = "CallIncomingInd",
     .type = "(isisssssb)",
     .value = "(1, '+4912345', -3, 'one', '', 'three', 'zo\xc3\xab', 'five', true)",
     .check = is_incoming<true>},
    {.name = "IncomingFalse",
     .id = 0x201,
     .member = "CallIncomingInd",
     .type = "(isisssssb)",
     .value = "(1, '+4912345', -3, 'one', '', 'three', 'zo\xc3\xab', 'five', false)",
     .check = is_incoming<false>},
    {.name = "InProgress",
     .id = 0x202,
     .member = "CallInProgress",
     .type = "(i)",
     .value = "(2,)",
     .check = is_session<2>},
    {.name = "Alerting",
     .id = 0x203,
     .member = "CallAlerting",
     .type = "(i)",
     .value = "(3,)",
     .check = is_session<3>},
    {.name = "Busy",
     .id = 0x204,
     .member = "CallBusy",
     .type = "(i)",
     .value = "(-4,)",
     .check = is_session<-4>},
    {.name = "Established",
     .id = 0x205,
     .member = "CallEstablished",
     .type = "(iibsb)",
     .value = "(1, 2, true, 'sip:b@example.org', false)",
     .check = is_established<true, false>},
    {.name = "EstablishedOtherFlags",
     .id = 0x205,
     .member = "CallEstablished",
     .type = "(iibsb)",
     .value = "(1, 2, false, 'sip:b@example.org', true)",
     .check = is_established<false, true>},
    {.name = "Held",
     .id = 0x206,
     .member = "CallHeld",
     .type = "(ibi)",
     .value = "(1, true, 9)",
     .check = is_held<true>},
    {.name = "HeldFalse",
     .id = 0x206,
     .member = "CallHeld",
     .type = "(ibi)",
     .value = "(1, false, 9)",
     .check = is_held<false>},
    {.name = "Resumed",
     .id = 0x207,
     .member = "CallResumed",
     .type = "(ibbi)",
     .value = "(1, true, false, 0x01020304)",
     .check = is_resumed<true, false>},
    {.name = "ResumedOtherFlags",
     .id = 0x207,
     .member = "CallResumed",
     .type = "(ibbi)",
     .value = "(1, false, true, 0x01020304)",
     .check = is_resumed<false, true>},
    {.name = "Forwarded",
     .id = 0x208,
     .member = "CallForwarded",
     .type = "(i)",
     .value = "(8,)",
     .check = is_session<8>},
    {.name = "EndedThreeSixteen",
     .id = 0x209,
     .member = "CallEnded",
     .type = "(ii)",
     .value = "(3, 16)",
     .check = is_ended},
    {.name = "Switched",
     .id = 0x20A,
     .member = "CallSwitched",
     .type = "(ii)",
     .value = "(3, 2)",
     .check = is_switched},
    {.name = "ChangeRequest",
     .id = 0x20B,
     .member = "CallChangeRequest",
     .type = "(iis)",
     .value = "(1, 2, 'AHY9MP8=')",
     .check = is_change_request},
    {.name = "ChangeRequestWithoutBytes",
     .id = 0x20B,
     .member = "CallChangeRequest",
     .type = "(iis)",
     .value = "(1, 2, '')",
     .check = is_empty_change_request},
    {.name = "ConfNotifyOfTwoAndThree",
     .id = 0x20C,
     .member = "CallConfNotifyReceived",
     .type = "(ivivi)",
     .value = "(1, <[10, -20]>, 2, <['c', 'a', '']>, 3)",
     .check = is_conf_notify},
    {.name = "EarlyMediaStart",
     .id = 0x20D,
     .member = "CallEarlyMediaStart",
     .type = "(is)",
     .value = "(1, 'announcement')",
     .check = is_early_media},
    {.name = "StopAlertTone",
     .id = 0x20E,
     .member = "CallStopAlertTone",
     .type = "(i)",
     .value = "(14,)",
     .check = is_session<14>},
    {.name = "Error",
     .id = 0x20F,
     .member = "CallError",
     .type = "(iis)",
     .value = "(1, -5, 'no resources')",
     .check = is_error},
    {.name = "ConferenceEstablished",
     .id = 0x210,
     .member = "CallConfernceCallEstablished",
     .type = "(ii)",
     .value = "(16, 1)",
     .check = is_conference_event<16, 1>},
    {.name = "ParticipantAdded",
     .id = 0x211,
     .member = "CallConfernceCallParticipantAdded",
     .type = "(ii)",
     .value = "(17, 2)",
     .check = is_conference_event<17, 2>},
    {.name = "ParticipantRemoved",
     .id = 0x212,
     .member = "CallConfernceCallParticipantRemoved",
     .type = "(ii)",
     .value = "(18, 3)",
     .check = is_conference_event<18, 3>},
    {.name = "UssdIndicationOfFiveBytes",
     .id = 0x213,
     .member = "CallUssdIndication",
     .type = "(iiis)",
     .value = "(1, 2, 3, 'aGVsbG8=')",
     .check = is_ussd},
    {.name = "DtmfEvent",
     .id = 0x223,
     .member = "CallDtmfEvent",
     .type = "(y)",
     .value = "(0x35,)",
     .check = is_tone<0x35>},
    {.name = "DtmfEventHighByte",
     .id = 0x223,
     .member = "CallDtmfEvent",
     .type = "(y)",
     .value = "(0xfe,)",
     .check = is_tone<0xfe>},
};

constexpr EventRow kUndelivered[] = {
    {.name = "x214",
     .id = 0x214,
     .type = "(ii)",
     .value = "(1, 2)",
     .check = is_conference_event<1, 2>},
    {.name = "x215", .id = 0x215, .type = "(i)", .value = "(1,)", .check = is_session<1>},
    {.name = "x216", .id = 0x216, .type = "(i)", .value = "(1,)", .check = is_session<1>},
    {.name = "x217",
     .id = 0x217,
     .type = "(ii)",
     .value = "(1, 2)",
     .check = is_conference_event<1, 2>},
    {.name = "x218", .id = 0x218, .type = "(ibi)", .value = "(1, true, 9)", .check = is_held<true>},
    {.name = "x219", .id = 0x219, .type = "(i)", .value = "(1,)", .check = is_session<1>},
    {.name = "x21A", .id = 0x21A, .type = "(i)", .value = "(1,)", .check = is_session<1>},
    {.name = "x21B",
     .id = 0x21B,
     .type = "(ibs)",
     .value = "(1, true, 'text')",
     .check = is_flag_text},
    {.name = "x21C", .id = 0x21C, .type = "(ib)", .value = "(1, true)", .check = is_flag},
    {.name = "x21D", .id = 0x21D, .type = "(i)", .value = "(1,)", .check = is_session<1>},
    {.name = "x21E", .id = 0x21E, .type = "(i)", .value = "(1,)", .check = is_session<1>},
    {.name = "x21F", .id = 0x21F, .type = "(i)", .value = "(1,)", .check = is_session<1>},
    {.name = "x220",
     .id = 0x220,
     .type = "(ii)",
     .value = "(1, 2)",
     .check = is_conference_event<1, 2>},
    {.name = "x221",
     .id = 0x221,
     .type = "(ii)",
     .value = "(1, 2)",
     .check = is_conference_event<1, 2>},
    {.name = "x222", .id = 0x222, .type = "(i)", .value = "(1,)", .check = is_session<1>},
};

} // namespace

std::span<const EventRow> call_event_rows() {
    return kRows;
}
std::span<const EventRow> undelivered_event_rows() {
    return kUndelivered;
}

} // namespace test
