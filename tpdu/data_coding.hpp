// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tpdu/alphabet.hpp"
#include "tpdu/result.hpp"

#include <cstdint>
#include <optional>

/// TP-DCS, the data coding scheme (3GPP TS 23.038).
namespace tpdu {

enum class MessageClass : std::uint8_t {
    kFlash = 0,             ///< class 0: show at once, do not store
    kMobileSpecific = 1,    ///< class 1: store in the device
    kSimSpecific = 2,       ///< class 2: store on the SIM
    kTerminalEquipment = 3, ///< class 3: hand to the attached equipment
};

enum class WaitingKind : std::uint8_t { kVoicemail = 0, kFax = 1, kEmail = 2, kOther = 3 };

/// A message waiting indication: whether messages of that kind wait or no longer do.
struct MessageWaiting {
    bool active = false;
    WaitingKind kind = WaitingKind::kVoicemail;

    friend bool operator==(const MessageWaiting &, const MessageWaiting &) = default;
};

/// The coding groups, told apart by the octet's upper bits.
enum class CodingGroup : std::uint8_t {
    kGeneral,           ///< 00xx
    kAutomaticDeletion, ///< 01xx: as general, and deleted once read
    kWaitingDiscard,    ///< 1100: indication, the text may be discarded
    kWaitingStore,      ///< 1101: indication, the text (GSM 7-bit) is to be stored
    kWaitingStoreUcs2,  ///< 1110: indication, the text (UCS-2) is to be stored
    kDataOrClass,       ///< 1111: GSM 7-bit or 8-bit data, always with a class
    kReserved,          ///< any other value; to be read like octet 0
};

/// A data coding scheme, taken apart.
struct DataCoding {
    CodingGroup group = CodingGroup::kGeneral;
    Alphabet alphabet = Alphabet::kGsm7;
    bool compressed = false;
    std::optional<MessageClass> message_class{};
    std::optional<MessageWaiting> waiting{};

    friend bool operator==(const DataCoding &, const DataCoding &) = default;
};

/// Takes any octet apart. Reserved codings read as plain GSM 7-bit text without a class; reserved
/// single bits are ignored.
DataCoding decode_data_coding(std::uint8_t octet);

/// The octet for `coding`. Fails when its group cannot express what it holds.
Result<std::uint8_t> encode_data_coding(const DataCoding &coding);

/// The octet of plain text or data in `alphabet`, with a class when one is given.
std::uint8_t data_coding_for(Alphabet alphabet,
                             std::optional<MessageClass> message_class = std::nullopt);

} // namespace tpdu
