// SPDX-License-Identifier: Apache-2.0
#include "tpdu/validity.hpp"

#include "tpdu/cursor.hpp"

#include <array>

namespace tpdu {

namespace {

using std::chrono::days;
using std::chrono::hours;
using std::chrono::minutes;
using std::chrono::seconds;
using std::chrono::weeks;

constexpr std::string_view kField = "TP-VP";

constexpr unsigned kFormatNone = 0;
constexpr unsigned kFormatEnhanced = 1;
constexpr unsigned kFormatRelative = 2;
constexpr unsigned kFormatAbsolute = 3;

constexpr std::uint8_t kExtensionBit = 0x80;
constexpr std::uint8_t kSingleShotBit = 0x40;
constexpr std::uint8_t kPeriodMask = 0x07;
constexpr std::size_t kEnhancedSize = 7;

template <typename... Visitors>
struct Overloaded : Visitors... {
    using Visitors::operator()...;
};
template <typename... Visitors>
Overloaded(Visitors...) -> Overloaded<Visitors...>;

EnhancedValidity read_enhanced(detail::Reader &in) {
    const auto octets = in.octets<kEnhancedSize>(kField);
    EnhancedValidity validity;
    if ((octets[0] & kExtensionBit) != 0) {
        in.fail(ErrorKind::kUnsupported, kField, "extends its functionality indicator");
        return validity;
    }
    validity.single_shot = (octets[0] & kSingleShotBit) != 0;
    const unsigned format = octets[0] & kPeriodMask;
    switch (format) {
    case 0:
        break;
    case 1:
        validity.period = RelativeValidity{octets[1]};
        break;
    case 2:
        validity.period = SecondsValidity{octets[1]};
        break;
    case 3:
        validity.period = ClockValidity{detail::from_swapped_decimal(octets[1]),
                                        detail::from_swapped_decimal(octets[2]),
                                        detail::from_swapped_decimal(octets[3])};
        break;
    default:
        in.fail(ErrorKind::kUnsupported, kField,
                "has the enhanced format " + std::to_string(format) + ", which is reserved");
    }
    return validity;
}

void write_enhanced(detail::Writer &out, const EnhancedValidity &validity) {
    std::array<std::uint8_t, kEnhancedSize> octets{};
    // The alternatives stand in the order of the format numbers, 0 (no period) to 3.
    octets[0] = static_cast<std::uint8_t>((validity.single_shot ? kSingleShotBit : 0) |
                                          validity.period.index());
    if (const auto *relative = std::get_if<RelativeValidity>(&validity.period)) {
        octets[1] = relative->value;
    } else if (const auto *short_period = std::get_if<SecondsValidity>(&validity.period)) {
        if (short_period->seconds == 0)
            out.fail(ErrorKind::kOutOfRange, kField, "cannot be 0 seconds");
        octets[1] = short_period->seconds;
    } else if (const auto *clock = std::get_if<ClockValidity>(&validity.period)) {
        if (clock->hours < 0 || clock->hours > 99 || clock->minutes < 0 || clock->minutes > 59 ||
            clock->seconds < 0 || clock->seconds > 59) {
            out.fail(ErrorKind::kOutOfRange, kField,
                     "has hours, minutes or seconds out of range (99:59:59)");
            return;
        }
        octets[1] = detail::to_swapped_decimal(clock->hours);
        octets[2] = detail::to_swapped_decimal(clock->minutes);
        octets[3] = detail::to_swapped_decimal(clock->seconds);
    }
    out.octets(octets);
}

std::optional<seconds> enhanced_period(const EnhancedValidity &validity) {
    using Period = std::optional<seconds>;
    return std::visit(
        Overloaded{[](std::monostate) { return Period(); },
                   [](RelativeValidity relative) { return Period(period_of(relative)); },
                   [](SecondsValidity value) {
                       return value.seconds == 0 ? Period() : Period(seconds(value.seconds));
                   },
                   [](const ClockValidity &clock) {
                       return Period(hours(clock.hours) + minutes(clock.minutes) +
                                     seconds(clock.seconds));
                   }},
        validity.period);
}

} // namespace

std::chrono::minutes period_of(RelativeValidity validity) {
    const int value = validity.value;
    if (value <= 143)
        return minutes(5) * (value + 1);
    if (value <= 167)
        return hours(12) + minutes(30) * (value - 143);
    if (value <= 196)
        return days(value - 166);
    return weeks(value - 192);
}

Result<RelativeValidity> relative_validity(std::chrono::minutes period) {
    for (unsigned value = 0; value <= 255; ++value) {
        const RelativeValidity step{static_cast<std::uint8_t>(value)};
        if (period_of(step) >= period)
            return step;
    }
    return make_error(ErrorKind::kOutOfRange, kField,
                      "cannot be " + std::to_string(period.count()) + " minutes: 63 weeks at most");
}

std::optional<std::chrono::seconds> lifetime(const Validity &validity, std::int64_t now) {
    using Period = std::optional<seconds>;
    return std::visit(
        Overloaded{[](std::monostate) { return Period(); },
                   [](RelativeValidity relative) { return Period(period_of(relative)); },
                   [now](const Timestamp &end) {
                       const auto end_seconds = to_unix_seconds(end);
                       if (!end_seconds)
                           return Period();
                       return Period(seconds(*end_seconds > now ? *end_seconds - now : 0));
                   },
                   [](const EnhancedValidity &enhanced) { return enhanced_period(enhanced); }},
        validity);
}

namespace detail {

unsigned validity_format(const Validity &validity) {
    constexpr std::array<unsigned, 4> kFormats = {kFormatNone, kFormatRelative, kFormatAbsolute,
                                                  kFormatEnhanced};
    static_assert(std::variant_size_v<Validity> == kFormats.size());
    return kFormats[validity.index()];
}

Validity read_validity(Reader &in, unsigned format) {
    switch (format) {
    case kFormatRelative:
        return RelativeValidity{in.octet(kField)};
    case kFormatAbsolute:
        return read_timestamp(in, kField);
    case kFormatEnhanced:
        return read_enhanced(in);
    default:
        return std::monostate{};
    }
}

void write_validity(Writer &out, const Validity &validity) {
    std::visit(
        Overloaded{[](std::monostate) {},
                   [&out](RelativeValidity relative) { out.octet(relative.value); },
                   [&out](const Timestamp &end) { write_timestamp(out, end, kField); },
                   [&out](const EnhancedValidity &enhanced) { write_enhanced(out, enhanced); }},
        validity);
}

} // namespace detail

} // namespace tpdu
