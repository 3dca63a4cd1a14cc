// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tpdu/octets.hpp"
#include "tpdu/result.hpp"
#include "tpdu/timestamp.hpp"

#include <chrono>
#include <cstdint>
#include <optional>
#include <variant>

/// TP-VP, how long the service centre keeps trying to deliver a submitted message.
namespace tpdu {

/// One octet on a scale from 5 minutes to 63 weeks.
struct RelativeValidity {
    std::uint8_t value = 0;

    friend bool operator==(const RelativeValidity &, const RelativeValidity &) = default;
};

/// The scale's meaning of `validity`.
std::chrono::minutes period_of(RelativeValidity validity);

/// The shortest step of the scale that is not shorter than `period`. Fails above 63 weeks.
Result<RelativeValidity> relative_validity(std::chrono::minutes period);

/// A period of the enhanced format in seconds, 1 to 255.
struct SecondsValidity {
    std::uint8_t seconds = 1;

    friend bool operator==(const SecondsValidity &, const SecondsValidity &) = default;
};

/// A period of the enhanced format in hours (0 to 99), minutes and seconds.
struct ClockValidity {
    int hours = 0;
    int minutes = 0;
    int seconds = 0;

    friend bool operator==(const ClockValidity &, const ClockValidity &) = default;
};

/// The enhanced format: one delivery attempt only, if so wished, and a period or none.
struct EnhancedValidity {
    bool single_shot = false;
    std::variant<std::monostate, RelativeValidity, SecondsValidity, ClockValidity> period{};

    friend bool operator==(const EnhancedValidity &, const EnhancedValidity &) = default;
};

/// No period, or one in any of the three formats; the alternative held is TP-VPF.
using Validity = std::variant<std::monostate, RelativeValidity, Timestamp, EnhancedValidity>;

/// How long a message submitted at `now` (seconds since 1970) stays valid: zero when an absolute
/// time is past, nothing when no usable period is given.
std::optional<std::chrono::seconds> lifetime(const Validity &validity, std::int64_t now);

namespace detail {

class Reader;
class Writer;

/// TP-VPF, two bits of the first octet.
unsigned validity_format(const Validity &validity);
Validity read_validity(Reader &in, unsigned format);
void write_validity(Writer &out, const Validity &validity);

} // namespace detail

} // namespace tpdu
