// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <cstdint>
#include <string_view>

/// What the status and failure octets of reports mean.
namespace tpdu {

enum class StatusClass : std::uint8_t {
    kCompleted,   ///< delivered, forwarded or replaced
    kStillTrying, ///< a temporary error; the service centre tries on
    kFailed,      ///< a permanent error
    kGaveUp,      ///< a temporary error; the service centre no longer tries
};

/// The class of a TP-ST value. Reserved values count as kGaveUp, "service rejected".
StatusClass status_class(std::uint8_t status);

/// A short English text for a TP-ST value; never empty.
std::string_view describe_status(std::uint8_t status);

/// A short English text for a TP-FCS value; never empty.
std::string_view describe_failure_cause(std::uint8_t cause);

} // namespace tpdu
