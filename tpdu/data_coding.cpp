// SPDX-License-Identifier: Apache-2.0
#include "tpdu/data_coding.hpp"

namespace tpdu {

namespace {

constexpr std::uint8_t kCompressedBit = 0x20;
constexpr std::uint8_t kClassBit = 0x10;
constexpr std::uint8_t kEightBitDataBit = 0x04;
constexpr std::uint8_t kWaitingActiveBit = 0x08;
constexpr std::uint8_t kReservedAlphabet = 3;

DataCoding decode_general(std::uint8_t octet, CodingGroup group) {
    const unsigned alphabet = octet >> 2 & 0x03;
    DataCoding coding;
    if (alphabet == kReservedAlphabet) {
        coding.group = CodingGroup::kReserved;
        return coding;
    }
    coding.group = group;
    coding.alphabet = static_cast<Alphabet>(alphabet);
    coding.compressed = (octet & kCompressedBit) != 0;
    if ((octet & kClassBit) != 0)
        coding.message_class = static_cast<MessageClass>(octet & 0x03);
    return coding;
}

DataCoding decode_waiting(std::uint8_t octet, CodingGroup group, Alphabet alphabet) {
    DataCoding coding;
    coding.group = group;
    coding.alphabet = alphabet;
    coding.waiting =
        MessageWaiting{(octet & kWaitingActiveBit) != 0, static_cast<WaitingKind>(octet & 0x03)};
    return coding;
}

DataCoding decode_data_or_class(std::uint8_t octet) {
    DataCoding coding;
    coding.group = CodingGroup::kDataOrClass;
    coding.alphabet = (octet & kEightBitDataBit) != 0 ? Alphabet::kEightBit : Alphabet::kGsm7;
    coding.message_class = static_cast<MessageClass>(octet & 0x03);
    return coding;
}

Error misfit(std::string_view problem) {
    return make_error(ErrorKind::kOutOfRange, "TP-DCS", problem);
}

Result<std::uint8_t> encode_general(const DataCoding &coding, unsigned group_bits) {
    if (coding.waiting)
        return misfit("cannot express a message waiting indication in a general group");
    unsigned octet = group_bits | static_cast<unsigned>(coding.alphabet) << 2;
    if (coding.compressed)
        octet |= kCompressedBit;
    if (coding.message_class)
        octet |= kClassBit | static_cast<unsigned>(*coding.message_class);
    return static_cast<std::uint8_t>(octet);
}

Result<std::uint8_t> encode_waiting(const DataCoding &coding, unsigned group_bits,
                                    Alphabet alphabet) {
    if (!coding.waiting)
        return misfit("lacks the indication that its message waiting group stands for");
    if (coding.alphabet != alphabet || coding.compressed || coding.message_class)
        return misfit("cannot express this alphabet, compression or class in a waiting group");
    unsigned octet = group_bits | static_cast<unsigned>(coding.waiting->kind);
    if (coding.waiting->active)
        octet |= kWaitingActiveBit;
    return static_cast<std::uint8_t>(octet);
}

Result<std::uint8_t> encode_data_or_class(const DataCoding &coding) {
    if (!coding.message_class)
        return misfit("lacks the class that group 1111 always has");
    if (coding.alphabet == Alphabet::kUcs2 || coding.compressed || coding.waiting)
        return misfit("cannot express UCS-2, compression or an indication in group 1111");
    unsigned octet = 0xF0 | static_cast<unsigned>(*coding.message_class);
    if (coding.alphabet == Alphabet::kEightBit)
        octet |= kEightBitDataBit;
    return static_cast<std::uint8_t>(octet);
}

} // namespace

DataCoding decode_data_coding(std::uint8_t octet) {
    switch (octet >> 4) {
    case 0x0:
    case 0x1:
    case 0x2:
    case 0x3:
        return decode_general(octet, CodingGroup::kGeneral);
    case 0x4:
    case 0x5:
    case 0x6:
    case 0x7:
        return decode_general(octet, CodingGroup::kAutomaticDeletion);
    case 0xC:
        return decode_waiting(octet, CodingGroup::kWaitingDiscard, Alphabet::kGsm7);
    case 0xD:
        return decode_waiting(octet, CodingGroup::kWaitingStore, Alphabet::kGsm7);
    case 0xE:
        return decode_waiting(octet, CodingGroup::kWaitingStoreUcs2, Alphabet::kUcs2);
    case 0xF:
        return decode_data_or_class(octet);
    default: {
        DataCoding coding;
        coding.group = CodingGroup::kReserved;
        return coding;
    }
    }
}

Result<std::uint8_t> encode_data_coding(const DataCoding &coding) {
    switch (coding.group) {
    case CodingGroup::kGeneral:
        return encode_general(coding, 0x00);
    case CodingGroup::kAutomaticDeletion:
        return encode_general(coding, 0x40);
    case CodingGroup::kWaitingDiscard:
        return encode_waiting(coding, 0xC0, Alphabet::kGsm7);
    case CodingGroup::kWaitingStore:
        return encode_waiting(coding, 0xD0, Alphabet::kGsm7);
    case CodingGroup::kWaitingStoreUcs2:
        return encode_waiting(coding, 0xE0, Alphabet::kUcs2);
    case CodingGroup::kDataOrClass:
        return encode_data_or_class(coding);
    case CodingGroup::kReserved:
        break;
    }
    return misfit("has no octet for a reserved group");
}

std::uint8_t data_coding_for(Alphabet alphabet, std::optional<MessageClass> message_class) {
    unsigned octet = static_cast<unsigned>(alphabet) << 2;
    if (message_class)
        octet |= kClassBit | static_cast<unsigned>(*message_class);
    return static_cast<std::uint8_t>(octet);
}

} // namespace tpdu
