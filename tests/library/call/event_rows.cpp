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
    {"Incoming", 0x201, "CallIncomingInd", "(isisssssb)",
     "(1, '+4912345', -3, 'one', '', 'three', 'zo\xc3\xab', 'five', true)", is_incoming<true>},
    {"IncomingFalse", 0x201, "CallIncomingInd", "(isisssssb)",
     "(1, '+4912345', -3, 'one', '', 'three', 'zo\xc3\xab', 'five', false)", is_incoming<false>},
    {"InProgress", 0x202, "CallInProgress", "(i)", "(2,)", is_session<2>},
    {"Alerting", 0x203, "CallAlerting", "(i)", "(3,)", is_session<3>},
    {"Busy", 0x204, "CallBusy", "(i)", "(-4,)", is_session<-4>},
    {"Established", 0x205, "CallEstablished", "(iibsb)", "(1, 2, true, 'sip:b@example.org', false)",
     is_established<true, false>},
    {"EstablishedOtherFlags", 0x205, "CallEstablished", "(iibsb)",
     "(1, 2, false, 'sip:b@example.org', true)", is_established<false, true>},
    {"Held", 0x206, "CallHeld", "(ibi)", "(1, true, 9)", is_held<true>},
    {"HeldFalse", 0x206, "CallHeld", "(ibi)", "(1, false, 9)", is_held<false>},
    {"Resumed", 0x207, "CallResumed", "(ibbi)", "(1, true, false, 0x01020304)",
     is_resumed<true, false>},
    {"ResumedOtherFlags", 0x207, "CallResumed", "(ibbi)", "(1, false, true, 0x01020304)",
     is_resumed<false, true>},
    {"Forwarded", 0x208, "CallForwarded", "(i)", "(8,)", is_session<8>},
    {"EndedThreeSixteen", 0x209, "CallEnded", "(ii)", "(3, 16)", is_ended},
    {"Switched", 0x20A, "CallSwitched", "(ii)", "(3, 2)", is_switched},
    {"ChangeRequest", 0x20B, "CallChangeRequest", "(iis)", "(1, 2, 'AHY9MP8=')", is_change_request},
    {"ChangeRequestWithoutBytes", 0x20B, "CallChangeRequest", "(iis)", "(1, 2, '')",
     is_empty_change_request},
    {"ConfNotifyOfTwoAndThree", 0x20C, "CallConfNotifyReceived", "(ivivi)",
     "(1, <[10, -20]>, 2, <['c', 'a', '']>, 3)", is_conf_notify},
    {"EarlyMediaStart", 0x20D, "CallEarlyMediaStart", "(is)", "(1, 'announcement')",
     is_early_media},
    {"StopAlertTone", 0x20E, "CallStopAlertTone", "(i)", "(14,)", is_session<14>},
    {"Error", 0x20F, "CallError", "(iis)", "(1, -5, 'no resources')", is_error},
    {"ConferenceEstablished", 0x210, "CallConfernceCallEstablished", "(ii)", "(16, 1)",
     is_conference_event<16, 1>},
    {"ParticipantAdded", 0x211, "CallConfernceCallParticipantAdded", "(ii)", "(17, 2)",
     is_conference_event<17, 2>},
    {"ParticipantRemoved", 0x212, "CallConfernceCallParticipantRemoved", "(ii)", "(18, 3)",
     is_conference_event<18, 3>},
    {"UssdIndicationOfFiveBytes", 0x213, "CallUssdIndication", "(iiis)", "(1, 2, 3, 'aGVsbG8=')",
     is_ussd},
    {"DtmfEvent", 0x223, "CallDtmfEvent", "(y)", "(0x35,)", is_tone<0x35>},
    {"DtmfEventHighByte", 0x223, "CallDtmfEvent", "(y)", "(0xfe,)", is_tone<0xfe>},
};

constexpr EventRow kUndelivered[] = {
    {"x214", 0x214, nullptr, "(ii)", "(1, 2)", is_conference_event<1, 2>},
    {"x215", 0x215, nullptr, "(i)", "(1,)", is_session<1>},
    {"x216", 0x216, nullptr, "(i)", "(1,)", is_session<1>},
    {"x217", 0x217, nullptr, "(ii)", "(1, 2)", is_conference_event<1, 2>},
    {"x218", 0x218, nullptr, "(ibi)", "(1, true, 9)", is_held<true>},
    {"x219", 0x219, nullptr, "(i)", "(1,)", is_session<1>},
    {"x21A", 0x21A, nullptr, "(i)", "(1,)", is_session<1>},
    {"x21B", 0x21B, nullptr, "(ibs)", "(1, true, 'text')", is_flag_text},
    {"x21C", 0x21C, nullptr, "(ib)", "(1, true)", is_flag},
    {"x21D", 0x21D, nullptr, "(i)", "(1,)", is_session<1>},
    {"x21E", 0x21E, nullptr, "(i)", "(1,)", is_session<1>},
    {"x21F", 0x21F, nullptr, "(i)", "(1,)", is_session<1>},
    {"x220", 0x220, nullptr, "(ii)", "(1, 2)", is_conference_event<1, 2>},
    {"x221", 0x221, nullptr, "(ii)", "(1, 2)", is_conference_event<1, 2>},
    {"x222", 0x222, nullptr, "(i)", "(1,)", is_session<1>},
};

} // namespace

std::span<const EventRow> call_event_rows() {
    return kRows;
}
std::span<const EventRow> undelivered_event_rows() {
    return kUndelivered;
}

} // namespace test
