// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tpdu/user_data.hpp"

#include <cstdint>

/// Where the bits are, for both directions of the codec.
namespace tpdu::detail {

inline constexpr std::uint8_t kTypeMask = 0x03;

// TP-MTI. Each value means one message towards the device and another one from it.
inline constexpr std::uint8_t kTypeDeliver = 0;
inline constexpr std::uint8_t kTypeDeliverReport = 0;
inline constexpr std::uint8_t kTypeSubmit = 1;
inline constexpr std::uint8_t kTypeSubmitReport = 1;
inline constexpr std::uint8_t kTypeStatusReport = 2;
inline constexpr std::uint8_t kTypeCommand = 2;
inline constexpr std::uint8_t kTypeReserved = 3;

// SMS-SUBMIT.
inline constexpr std::uint8_t kRejectDuplicatesBit = 0x04;
inline constexpr unsigned kValidityFormatShift = 3;
inline constexpr unsigned kValidityFormatMask = 0x03;
inline constexpr std::uint8_t kStatusReportRequestBit = 0x20;

// SMS-DELIVER and SMS-STATUS-REPORT.
inline constexpr std::uint8_t kNoMoreMessagesBit = 0x04;
inline constexpr std::uint8_t kLoopPreventionBit = 0x08;
inline constexpr std::uint8_t kStatusReportIndicationBit = 0x20;
inline constexpr std::uint8_t kStatusReportQualifierBit = 0x20;

inline constexpr std::uint8_t kHeaderBit = 0x40;
inline constexpr std::uint8_t kReplyPathBit = 0x80;

// TP-PI.
inline constexpr std::uint8_t kProtocolIdentifierPresent = 0x01;
inline constexpr std::uint8_t kDataCodingPresent = 0x02;
inline constexpr std::uint8_t kUserDataPresent = 0x04;
inline constexpr std::uint8_t kReservedIndicators = 0xF8;
inline constexpr std::uint8_t kMoreIndicators = 0x80;

inline constexpr std::uint8_t kFirstFailureCause = 0x80;
inline constexpr std::uint8_t kFirstReservedStatus = 0x80;

// Every message ends up at 164 octets or less with all its other fields at their largest.
inline constexpr UserDataLimit kSubmitLimit{"an SMS-SUBMIT", 140};
inline constexpr UserDataLimit kDeliverLimit{"an SMS-DELIVER", 140};
inline constexpr UserDataLimit kStatusReportLimit{"an SMS-STATUS-REPORT", 131};
inline constexpr UserDataLimit kDeliverAckLimit{"an SMS-DELIVER-REPORT of success", 159};
inline constexpr UserDataLimit kDeliverErrorLimit{"an SMS-DELIVER-REPORT of failure", 158};
inline constexpr UserDataLimit kSubmitAckLimit{"an SMS-SUBMIT-REPORT of success", 152};
inline constexpr UserDataLimit kSubmitErrorLimit{"an SMS-SUBMIT-REPORT of failure", 151};

} // namespace tpdu::detail
