// SPDX-License-Identifier: Apache-2.0
#include "tpdu/timestamp.hpp"

#include "tpdu/cursor.hpp"

#include <chrono>
#include <cstdlib>

namespace tpdu {

namespace {

constexpr int kFirstYear = 2000;
constexpr int kLastYear = 2099;
constexpr int kMaxZoneQuarters = 79;
constexpr std::uint8_t kNegativeZoneBit = 0x08;
constexpr int kSecondsPerQuarter = 15 * 60;

std::chrono::year_month_day date_of(const Timestamp &time) {
    return std::chrono::year(time.year) / std::chrono::month(static_cast<unsigned>(time.month)) /
           std::chrono::day(static_cast<unsigned>(time.day));
}

bool between(int value, int low, int high) {
    return value >= low && value <= high;
}

int decimal_or_zero(unsigned semi_octet) {
    return semi_octet <= 9 ? static_cast<int>(semi_octet) : 0;
}

std::uint8_t encode_zone(int quarters) {
    const std::uint8_t octet = detail::to_swapped_decimal(std::abs(quarters));
    return quarters < 0 ? static_cast<std::uint8_t>(octet | kNegativeZoneBit) : octet;
}

int decode_zone(std::uint8_t octet) {
    const int tens = octet & 0x07;
    const int quarters = tens * 10 + decimal_or_zero(octet >> 4);
    return (octet & kNegativeZoneBit) != 0 ? -quarters : quarters;
}

std::string padded(int value, std::size_t width) {
    std::string text = std::to_string(value);
    if (text.size() < width)
        text.insert(0, width - text.size(), '0');
    return text;
}

} // namespace

namespace detail {

std::uint8_t to_swapped_decimal(int value) {
    return static_cast<std::uint8_t>(value % 10 << 4 | value / 10);
}

int from_swapped_decimal(std::uint8_t octet) {
    return decimal_or_zero(octet & 0x0F) * 10 + decimal_or_zero(octet >> 4);
}

Timestamp read_timestamp(Reader &in, std::string_view field) {
    const auto octets = in.octets<7>(field);
    Timestamp time;
    time.year = kFirstYear + from_swapped_decimal(octets[0]);
    time.month = from_swapped_decimal(octets[1]);
    time.day = from_swapped_decimal(octets[2]);
    time.hour = from_swapped_decimal(octets[3]);
    time.minute = from_swapped_decimal(octets[4]);
    time.second = from_swapped_decimal(octets[5]);
    time.zone_quarters = decode_zone(octets[6]);
    return time;
}

void write_timestamp(Writer &out, const Timestamp &time, std::string_view field) {
    if (!is_valid(time)) {
        out.fail(ErrorKind::kOutOfRange, field,
                 "cannot hold " + to_text(time) + ": no such time in the years 2000 to 2099");
        return;
    }
    for (const int value :
         {time.year - kFirstYear, time.month, time.day, time.hour, time.minute, time.second})
        out.octet(to_swapped_decimal(value));
    out.octet(encode_zone(time.zone_quarters));
}

} // namespace detail

bool is_valid(const Timestamp &time) {
    return between(time.year, kFirstYear, kLastYear) && between(time.month, 1, 12) &&
           between(time.day, 1, 31) && date_of(time).ok() && between(time.hour, 0, 23) &&
           between(time.minute, 0, 59) && between(time.second, 0, 59) &&
           between(time.zone_quarters, -kMaxZoneQuarters, kMaxZoneQuarters);
}

std::string to_text(const Timestamp &time) {
    const int zone_minutes = std::abs(time.zone_quarters % 10000) * 15;
    return padded(time.year, 4) + '-' + padded(time.month, 2) + '-' + padded(time.day, 2) + 'T' +
           padded(time.hour, 2) + ':' + padded(time.minute, 2) + ':' + padded(time.second, 2) +
           (time.zone_quarters < 0 ? '-' : '+') + padded(zone_minutes / 60, 2) + ':' +
           padded(zone_minutes % 60, 2);
}

std::optional<std::int64_t> to_unix_seconds(const Timestamp &time) {
    if (!is_valid(time))
        return std::nullopt;
    const std::int64_t days = std::chrono::sys_days(date_of(time)).time_since_epoch().count();
    const std::int64_t local = ((days * 24 + time.hour) * 60 + time.minute) * 60 + time.second;
    return local - static_cast<std::int64_t>(time.zone_quarters) * kSecondsPerQuarter;
}

Result<Timestamp> timestamp_from_unix(std::int64_t seconds, int zone_quarters) {
    using std::chrono::floor;
    // Bounds beyond the years in question, so that the sums below cannot overflow.
    constexpr std::int64_t kFarFuture = std::int64_t{1} << 40;
    Timestamp time;
    time.zone_quarters = zone_quarters;
    if (between(zone_quarters, -kMaxZoneQuarters, kMaxZoneQuarters) && seconds >= 0 &&
        seconds < kFarFuture) {
        const std::int64_t local =
            seconds + static_cast<std::int64_t>(zone_quarters) * kSecondsPerQuarter;
        const std::chrono::sys_seconds instant{std::chrono::seconds(local)};
        const auto midnight = floor<std::chrono::days>(instant);
        const std::chrono::year_month_day date(midnight);
        const auto second_of_day = static_cast<int>((instant - midnight).count());
        time.year = static_cast<int>(date.year());
        time.month = static_cast<int>(static_cast<unsigned>(date.month()));
        time.day = static_cast<int>(static_cast<unsigned>(date.day()));
        time.hour = second_of_day / 3600;
        time.minute = second_of_day / 60 % 60;
        time.second = second_of_day % 60;
        if (is_valid(time))
            return time;
    }
    return make_error(ErrorKind::kOutOfRange, "timestamp",
                      "cannot hold second " + std::to_string(seconds) + " of the epoch in zone " +
                          std::to_string(zone_quarters) + ": years 2000 to 2099, zones -79 to 79");
}

Result<Octets> encode_timestamp(const Timestamp &time, std::string_view field) {
    detail::Writer out;
    detail::write_timestamp(out, time, field);
    return std::move(out).finish();
}

Result<Timestamp> decode_timestamp(OctetView octets, std::string_view field) {
    detail::Reader in(octets);
    const Timestamp time = detail::read_timestamp(in, field);
    in.expect_end(field);
    return in.finish(time);
}

} // namespace tpdu
