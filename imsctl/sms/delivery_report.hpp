// SPDX-License-Identifier: Apache-2.0
// The answer to a received message.
#pragma once

#include "imsctl/output/values.hpp"

#include "tpdu/tpdu.hpp"

#include <ims.h>
#include <optional>

namespace imsctl {

// How the layer below the TPDU says the same (3GPP TS 24.011).
namespace report_code {
inline constexpr std::int32_t kReceived = 0;
inline constexpr std::int32_t kMemoryExceeded = 22;
inline constexpr std::int32_t kProtocolError = 111;
} // namespace report_code

namespace failure_cause {
inline constexpr std::int32_t kMemoryExceeded = 0xD3;
}

struct ReportValues {
    std::int32_t code;
    std::int32_t option; // which message it is about
};

// An acknowledgement, or the refusal with a cause of 0x80 or above.
tpdu::Octets delivery_report_tpdu(std::optional<std::uint8_t> failure_cause);

// Refers to the octets.
ims_sms_deliver_report_s delivery_report(const tpdu::Octets &octets, const ReportValues &values);

} // namespace imsctl
