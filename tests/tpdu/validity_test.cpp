// SPDX-License-Identifier: Apache-2.0
#include "tests/tpdu/support.hpp"

#include "tpdu/pdu.hpp"
#include "tpdu/validity.hpp"

#include <gtest/gtest.h>

#include <chrono>
#include <vector>

namespace {

using namespace std::chrono_literals;
using std::chrono::days;
using std::chrono::minutes;
using std::chrono::seconds;
using std::chrono::weeks;
using tpdu::ClockValidity;
using tpdu::EnhancedValidity;
using tpdu::ErrorKind;
using tpdu::RelativeValidity;
using tpdu::SecondsValidity;
using tpdu::Timestamp;
using tpdu::Validity;
using tpdu_test::hex;
using tpdu_test::must;

tpdu::Submit submit_valid_for(const Validity &validity) {
    tpdu::Submit submit;
    submit.destination = must(tpdu::number_address("1"));
    submit.validity = validity;
    return submit;
}

/// The same message on the wire around any TP-VP: to "1", reference 0, no text.
tpdu::Octets message_with(std::uint8_t first, std::string_view validity) {
    tpdu::Octets octets = hex("00 00 01 81 F1 00 00");
    octets[0] = first;
    const tpdu::Octets middle = hex(validity);
    octets.insert(octets.end(), middle.begin(), middle.end());
    octets.push_back(0);
    return octets;
}

TEST(RelativeValidity, StepsOfTheScale) {
    const std::vector<std::pair<int, minutes>> steps = {
        {0, 5min},      {1, 10min},     {143, 12h},      {144, 12h + 30min}, {167, 24h},
        {168, days(2)}, {170, days(4)}, {196, days(30)}, {197, weeks(5)},    {255, weeks(63)},
    };
    for (const auto &[value, period] : steps) {
        const RelativeValidity validity{static_cast<std::uint8_t>(value)};
        EXPECT_EQ(tpdu::period_of(validity), period) << value;
        EXPECT_EQ(must(tpdu::relative_validity(period)), validity) << value;
    }
}

TEST(RelativeValidity, RoundsUpToTheNextStep) {
    EXPECT_EQ(must(tpdu::relative_validity(0min)).value, 0);
    EXPECT_EQ(must(tpdu::relative_validity(6min)).value, 1);
    EXPECT_EQ(must(tpdu::relative_validity(12h + 1min)).value, 144);
    EXPECT_EQ(must(tpdu::relative_validity(24h + 1min)).value, 168);
    EXPECT_EQ(must(tpdu::relative_validity(days(31))).value, 197);
    const auto too_long = tpdu::relative_validity(weeks(63) + 1min);
    ASSERT_FALSE(too_long);
    EXPECT_EQ(too_long.error().kind, ErrorKind::kOutOfRange);
    EXPECT_EQ(too_long.error().message, "TP-VP cannot be 635041 minutes: 63 weeks at most");
}

struct ValidityRow {
    const char *name;
    Validity validity;
    std::uint8_t first; // TP-VPF beside the type
    std::string_view octets;
};

const std::vector<ValidityRow> kValidityRows = {
    {"none", std::monostate{}, 0x01, ""},
    {"relative", RelativeValidity{0xA7}, 0x11, "A7"},
    {"absolute", Timestamp{2031, 4, 9, 8, 15, 30, -20}, 0x19, "13 40 90 80 51 03 0A"},
    {"enhanced, no period", EnhancedValidity{}, 0x09, "00 00 00 00 00 00 00"},
    {"single shot", EnhancedValidity{true, std::monostate{}}, 0x09, "40 00 00 00 00 00 00"},
    {"enhanced relative", EnhancedValidity{false, RelativeValidity{0xA7}}, 0x09,
     "01 A7 00 00 00 00 00"},
    {"seconds", EnhancedValidity{false, SecondsValidity{90}}, 0x09, "02 5A 00 00 00 00 00"},
    {"clock, single shot", EnhancedValidity{true, ClockValidity{12, 34, 56}}, 0x09,
     "43 21 43 65 00 00 00"},
};

TEST(Validity, EveryFormatBothWays) {
    for (const ValidityRow &row : kValidityRows) {
        const tpdu::Octets octets = message_with(row.first, row.octets);
        EXPECT_EQ(must(tpdu::encode(submit_valid_for(row.validity))), octets) << row.name;
        EXPECT_EQ(must(tpdu::decode_submit(octets)), submit_valid_for(row.validity)) << row.name;
    }
}

TEST(Validity, ReservedBitsAndPaddingOfTheEnhancedFormatAreIgnored) {
    const auto submit = must(tpdu::decode_submit(message_with(0x09, "3A 5A FF FF FF FF FF")));
    EXPECT_EQ(submit.validity, Validity(EnhancedValidity{false, SecondsValidity{90}}));
}

TEST(Validity, DecodingRefusesWhatItCannotKnow) {
    for (unsigned format = 4; format <= 7; ++format) {
        tpdu::Octets octets = message_with(0x09, "00 00 00 00 00 00 00");
        octets[7] = static_cast<std::uint8_t>(format);
        const auto submit = tpdu::decode_submit(octets);
        ASSERT_FALSE(submit);
        EXPECT_EQ(submit.error().kind, ErrorKind::kUnsupported);
        EXPECT_EQ(submit.error().message, "TP-VP has the enhanced format " +
                                              std::to_string(format) + ", which is reserved");
    }
    const auto extended = tpdu::decode_submit(message_with(0x09, "80 00 00 00 00 00 00"));
    ASSERT_FALSE(extended);
    EXPECT_EQ(extended.error().message, "TP-VP extends its functionality indicator");
}

TEST(Validity, EncodingRefusesWhatCannotBeExpressed) {
    const std::vector<std::pair<Validity, std::string_view>> misfits = {
        {EnhancedValidity{false, SecondsValidity{0}}, "TP-VP cannot be 0 seconds"},
        {EnhancedValidity{false, ClockValidity{100, 0, 0}},
         "TP-VP has hours, minutes or seconds out of range (99:59:59)"},
        {EnhancedValidity{false, ClockValidity{0, 60, 0}},
         "TP-VP has hours, minutes or seconds out of range (99:59:59)"},
        {EnhancedValidity{false, ClockValidity{0, 0, -1}},
         "TP-VP has hours, minutes or seconds out of range (99:59:59)"},
        {Timestamp{2031, 2, 30, 0, 0, 0, 0},
         "TP-VP cannot hold 2031-02-30T00:00:00+00:00: no such time in the years 2000 to 2099"},
    };
    for (const auto &[validity, message] : misfits) {
        const auto octets = tpdu::encode(submit_valid_for(validity));
        ASSERT_FALSE(octets) << message;
        EXPECT_EQ(octets.error().kind, ErrorKind::kOutOfRange);
        EXPECT_EQ(octets.error().message, message);
    }
}

TEST(Validity, Lifetime) {
    constexpr std::int64_t kNow = 1933506930; // 2031-04-09T08:15:30-05:00
    const auto of = [](const Validity &validity) { return tpdu::lifetime(validity, kNow); };
    EXPECT_EQ(of(std::monostate{}), std::nullopt);
    EXPECT_EQ(of(RelativeValidity{0}), seconds(300));
    EXPECT_EQ(of(Timestamp{2031, 4, 9, 8, 16, 0, -20}), seconds(30));
    EXPECT_EQ(of(Timestamp{2031, 4, 9, 8, 15, 0, -20}), seconds(0));
    EXPECT_EQ(of(Timestamp{2031, 13, 9, 8, 15, 0, -20}), std::nullopt);
    EXPECT_EQ(of(EnhancedValidity{true, std::monostate{}}), std::nullopt);
    EXPECT_EQ(of(EnhancedValidity{true, RelativeValidity{0}}), seconds(300));
    EXPECT_EQ(of(EnhancedValidity{true, SecondsValidity{7}}), seconds(7));
    EXPECT_EQ(of(EnhancedValidity{true, SecondsValidity{0}}), std::nullopt);
    EXPECT_EQ(of(EnhancedValidity{true, ClockValidity{1, 2, 3}}), seconds(3723));
}

} // namespace
