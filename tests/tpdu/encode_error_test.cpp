// SPDX-License-Identifier: Apache-2.0
#include "tests/tpdu/support.hpp"

#include "tpdu/pdu.hpp"

#include <gtest/gtest.h>

namespace {

using namespace tpdu;
using tpdu_test::hex;

Submit submit() {
    Submit message;
    message.destination.text = "12";
    return message;
}

void expect_error(const Result<Octets> &result, ErrorKind kind, std::string_view message) {
    ASSERT_FALSE(result) << "encoded, but expected: " << message;
    EXPECT_EQ(result.error().kind, kind) << message;
    EXPECT_EQ(result.error().message, message);
    EXPECT_EQ(result.error().field, message.substr(0, message.find(' ')));
}

TEST(EncodeErrors, Addresses) {
    Submit message = submit();
    message.destination.text = "+12";
    expect_error(encode(message), ErrorKind::kNotEncodable,
                 "TP-DA has no digit for '+' in \"+12\" (0-9 * # a b c)");
    message.destination.text = std::string(21, '1');
    expect_error(encode(message), ErrorKind::kTooLong,
                 "TP-DA has 21 digits, more than the 20 that fit");
    message.destination = {TypeOfNumber::kAlphanumeric, NumberingPlan::kUnknown, "twelve chars"};
    expect_error(encode(message), ErrorKind::kTooLong,
                 "TP-DA has a name of 12 septets, more than the 11 that fit");
    message.destination.text = "漢";
    expect_error(encode(message), ErrorKind::kNotEncodable,
                 "TP-DA cannot be encoded: text contains U+6F22, which the GSM 7-bit alphabet does "
                 "not have");
    Deliver deliver;
    deliver.originator = {static_cast<TypeOfNumber>(8), NumberingPlan::kIsdn, "1"};
    expect_error(encode(deliver), ErrorKind::kOutOfRange,
                 "TP-OA has a type or plan that its octet cannot hold");
    StatusReport report;
    report.recipient.text = "x";
    expect_error(encode(report), ErrorKind::kNotEncodable,
                 "TP-RA has no digit for 'x' in \"x\" (0-9 * # a b c)");
}

TEST(EncodeErrors, UserData) {
    Submit message = submit();
    message.user_data.body = Octets(161, 'x');
    expect_error(encode(message), ErrorKind::kTooLong,
                 "TP-UD takes 161 septets but an SMS-SUBMIT carries 160 at most");
    message.user_data.body = {0x80};
    expect_error(encode(message), ErrorKind::kOutOfRange, "TP-UD has a septet above 127");
    message.data_coding = 0x04;
    message.user_data.body = Octets(141, 'x');
    expect_error(encode(message), ErrorKind::kTooLong,
                 "TP-UD takes 141 octets but an SMS-SUBMIT carries 140 at most");
    for (const std::uint8_t ucs2 : {0x08, 0x19, 0x48, 0xE0}) {
        message.data_coding = ucs2;
        message.user_data.body = hex("004100");
        expect_error(encode(message), ErrorKind::kMalformed,
                     "TP-UD has an odd number of octets for UCS-2 text");
    }
}

TEST(EncodeErrors, ReservedValuesAreNotSent) {
    DeliverReport deliver_report;
    deliver_report.failure_cause = 0x7F;
    expect_error(encode(deliver_report), ErrorKind::kOutOfRange,
                 "TP-FCS cannot be 127: values below 128 are reserved");
    SubmitReport submit_report;
    submit_report.failure_cause = 0;
    expect_error(encode(submit_report), ErrorKind::kOutOfRange,
                 "TP-FCS cannot be 0: values below 128 are reserved");
    StatusReport status_report;
    status_report.status = 0x80;
    expect_error(encode(status_report), ErrorKind::kOutOfRange,
                 "TP-ST cannot be 128: values above 127 are reserved");
}

TEST(EncodeErrors, Timestamps) {
    StatusReport report;
    report.discharge_time.month = 13;
    expect_error(
        encode(report), ErrorKind::kOutOfRange,
        "TP-DT cannot hold 2000-13-01T00:00:00+00:00: no such time in the years 2000 to 2099");
    SubmitReport submit_report;
    submit_report.service_centre_time.year = 1999;
    expect_error(
        encode(submit_report), ErrorKind::kOutOfRange,
        "TP-SCTS cannot hold 1999-01-01T00:00:00+00:00: no such time in the years 2000 to 2099");
}

TEST(EncodeErrors, TheFirstProblemIsReported) {
    Submit message = submit();
    message.destination.text = "x";
    message.user_data.body = Octets(200, 'x');
    expect_error(encode(message), ErrorKind::kNotEncodable,
                 "TP-DA has no digit for 'x' in \"x\" (0-9 * # a b c)");
}

} // namespace
