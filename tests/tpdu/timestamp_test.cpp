// SPDX-License-Identifier: Apache-2.0
#include "tests/tpdu/support.hpp"

#include "tpdu/timestamp.hpp"

#include <gtest/gtest.h>

#include <climits>
#include <vector>

namespace {

using tpdu::ErrorKind;
using tpdu::Timestamp;
using tpdu_test::hex;
using tpdu_test::must;

struct TimestampRow {
    Timestamp time;
    std::string_view octets;
    std::string_view text;
    std::int64_t unix_seconds;
};

// Seconds of the epoch as `date -u -d TEXT +%s` gives them.
const std::vector<TimestampRow> kTimestampRows = {
    {{2000, 1, 1, 0, 0, 0, 0}, "00 10 10 00 00 00 00", "2000-01-01T00:00:00+00:00", 946684800},
    {{2031, 4, 9, 8, 15, 30, 8}, "13 40 90 80 51 03 80", "2031-04-09T08:15:30+02:00", 1933481730},
    // Five hours behind UTC: 20 quarters, and the sign in the tens' top bit.
    {{2031, 4, 9, 8, 15, 30, -20}, "13 40 90 80 51 03 0A", "2031-04-09T08:15:30-05:00", 1933506930},
    // A quarter of an hour behind.
    {{2024, 2, 29, 23, 59, 59, -1},
     "42 20 92 32 95 95 18",
     "2024-02-29T23:59:59-00:15",
     1709251199 + 900},
    {{2099, 12, 31, 23, 59, 59, 55},
     "99 21 13 32 95 95 55",
     "2099-12-31T23:59:59+13:45",
     4102444799 - 55 * 900},
    {{2050, 6, 15, 12, 0, 0, -79},
     "05 60 51 21 00 00 9F",
     "2050-06-15T12:00:00-19:45",
     2538907200 + 79 * 900},
    {{2050, 6, 15, 12, 0, 0, 79},
     "05 60 51 21 00 00 97",
     "2050-06-15T12:00:00+19:45",
     2538907200 - 79 * 900},
};

TEST(Timestamp, BothWays) {
    for (const TimestampRow &row : kTimestampRows) {
        EXPECT_EQ(must(tpdu::encode_timestamp(row.time)), hex(row.octets)) << row.text;
        EXPECT_EQ(must(tpdu::decode_timestamp(hex(row.octets))), row.time) << row.text;
        EXPECT_TRUE(tpdu::is_valid(row.time));
    }
}

TEST(Timestamp, AsText) {
    for (const TimestampRow &row : kTimestampRows)
        EXPECT_EQ(to_text(row.time), row.text);
}

TEST(Timestamp, ToAndFromSecondsOfTheEpoch) {
    for (const TimestampRow &row : kTimestampRows) {
        EXPECT_EQ(tpdu::to_unix_seconds(row.time), row.unix_seconds) << row.text;
        EXPECT_EQ(must(tpdu::timestamp_from_unix(row.unix_seconds, row.time.zone_quarters)),
                  row.time);
    }
}

TEST(Timestamp, NegativeZeroIsUtc) {
    EXPECT_EQ(must(tpdu::decode_timestamp(hex("13 40 90 80 51 03 08"))).zone_quarters, 0);
}

TEST(Timestamp, ANibbleThatIsNoDigitReadsAsZero) {
    const Timestamp time = must(tpdu::decode_timestamp(hex("A3 4F 90 8B 51 03 A1")));
    EXPECT_EQ(time, (Timestamp{2030, 4, 9, 8, 15, 30, 10}));
}

TEST(Timestamp, KeepsADateThatDoesNotExist) {
    const Timestamp time = must(tpdu::decode_timestamp(hex("13 31 90 80 51 03 00")));
    EXPECT_EQ(time.month, 13);
    EXPECT_FALSE(tpdu::is_valid(time));
    EXPECT_EQ(tpdu::to_unix_seconds(time), std::nullopt);
    EXPECT_EQ(to_text(time), "2031-13-09T08:15:30+00:00");
    const Timestamp unset = must(tpdu::decode_timestamp(hex("00 00 00 00 00 00 00")));
    EXPECT_FALSE(tpdu::is_valid(unset));
}

TEST(Timestamp, EncodingRefusesWhatIsNoTime) {
    const std::vector<Timestamp> invalid = {
        {1999, 12, 31, 0, 0, 0, 0},
        {2100, 1, 1, 0, 0, 0, 0},
        {2031, 0, 1, 0, 0, 0, 0},
        {2031, 13, 1, 0, 0, 0, 0},
        {2031, 2, 29, 0, 0, 0, 0},
        {2031, 4, 31, 0, 0, 0, 0},
        {2031, 4, 0, 0, 0, 0, 0},
        {2031, 4, 1, 24, 0, 0, 0},
        {2031, 4, 1, -1, 0, 0, 0},
        {2031, 4, 1, 0, 60, 0, 0},
        {2031, 4, 1, 0, 0, 60, 0},
        {2031, 4, 1, 0, 0, 0, 80},
        {2031, 4, 1, 0, 0, 0, -80},
        {2031, 4, 1, 0, 0, 0, INT_MIN},
        {INT_MIN, INT_MIN, INT_MIN, INT_MIN, INT_MIN, INT_MIN, INT_MIN},
    };
    for (const Timestamp &time : invalid) {
        const auto octets = tpdu::encode_timestamp(time, "TP-SCTS");
        ASSERT_FALSE(octets) << to_text(time);
        EXPECT_EQ(octets.error().kind, ErrorKind::kOutOfRange);
        EXPECT_EQ(octets.error().field, "TP-SCTS");
    }
    EXPECT_EQ(tpdu::encode_timestamp({2031, 2, 29, 0, 0, 0, 0}, "TP-SCTS").error().message,
              "TP-SCTS cannot hold 2031-02-29T00:00:00+00:00: no such time in the years 2000 to "
              "2099");
}

TEST(Timestamp, FromSecondsOutsideTheCentury) {
    EXPECT_FALSE(tpdu::timestamp_from_unix(946684799));
    EXPECT_TRUE(tpdu::timestamp_from_unix(946684799, 1));
    EXPECT_TRUE(tpdu::timestamp_from_unix(4102444799));
    EXPECT_FALSE(tpdu::timestamp_from_unix(4102444800));
    EXPECT_FALSE(tpdu::timestamp_from_unix(INT64_MIN));
    EXPECT_FALSE(tpdu::timestamp_from_unix(INT64_MAX, 79));
    EXPECT_FALSE(tpdu::timestamp_from_unix(1933481730, 80));
    EXPECT_FALSE(tpdu::timestamp_from_unix(1933481730, INT_MIN));
    EXPECT_EQ(tpdu::timestamp_from_unix(946684799).error().message,
              "timestamp cannot hold second 946684799 of the epoch in zone 0: years 2000 to 2099, "
              "zones -79 to 79");
}

TEST(Timestamp, DecodingTakesExactlySevenOctets) {
    const auto short_of_one = tpdu::decode_timestamp(hex("13 40 90 80 51 03"), "TP-DT");
    ASSERT_FALSE(short_of_one);
    EXPECT_EQ(short_of_one.error().kind, ErrorKind::kTruncated);
    EXPECT_EQ(short_of_one.error().message, "TP-DT needs 7 octets but only 6 octets follow");
    const auto one_more = tpdu::decode_timestamp(hex("13 40 90 80 51 03 00 00"), "TP-DT");
    ASSERT_FALSE(one_more);
    EXPECT_EQ(one_more.error().kind, ErrorKind::kTrailing);
}

TEST(Timestamp, RandomTimesRoundTrip) {
    tpdu_test::Random random(7);
    for (int i = 0; i < 5000; ++i) {
        const std::int64_t seconds = 946771200 + std::int64_t{random.below(3155000000U)};
        const int zone = static_cast<int>(random.below(159)) - 79;
        const Timestamp time = must(tpdu::timestamp_from_unix(seconds, zone));
        ASSERT_EQ(tpdu::to_unix_seconds(time), seconds);
        ASSERT_EQ(must(tpdu::decode_timestamp(must(tpdu::encode_timestamp(time)))), time);
    }
}

} // namespace
