// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tpdu/octets.hpp"
#include "tpdu/result.hpp"

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

/// Points in time as TP-SCTS, TP-DT and an absolute TP-VP carry them: seven octets of swapped
/// decimal digits.
namespace tpdu {

/// Local time and its distance from UTC. The wire has two digits for the year: 2000 to 2099.
struct Timestamp {
    int year = 2000;
    int month = 1;
    int day = 1;
    int hour = 0;
    int minute = 0;
    int second = 0;
    int zone_quarters = 0; ///< local time minus UTC in quarters of an hour, -79 to 79

    friend bool operator==(const Timestamp &, const Timestamp &) = default;
};

/// Whether the date exists and the time of day and zone are in range. What a network sends need
/// not be: decoding keeps month 13 as it came.
bool is_valid(const Timestamp &time);

/// Local time in ISO 8601, such as "2031-04-09T08:15:30-05:00".
std::string to_text(const Timestamp &time);

/// Seconds since 1970-01-01T00:00Z; nothing when the time is not valid.
std::optional<std::int64_t> to_unix_seconds(const Timestamp &time);

/// The local time in the given zone. Fails outside the years 2000 to 2099 or the zone's range.
Result<Timestamp> timestamp_from_unix(std::int64_t seconds, int zone_quarters = 0);

/// The seven octets. Fails when `time` is not valid. `field` names it in errors.
Result<Octets> encode_timestamp(const Timestamp &time, std::string_view field = "timestamp");

/// The reverse of encode_timestamp(). A semi-octet that is no decimal digit reads as 0.
Result<Timestamp> decode_timestamp(OctetView octets, std::string_view field = "timestamp");

namespace detail {

class Reader;
class Writer;

/// Two decimal digits in an octet, the tens in the lower half.
std::uint8_t to_swapped_decimal(int value);
int from_swapped_decimal(std::uint8_t octet);

Timestamp read_timestamp(Reader &in, std::string_view field);
void write_timestamp(Writer &out, const Timestamp &time, std::string_view field);

} // namespace detail

} // namespace tpdu
