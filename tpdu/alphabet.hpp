// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tpdu/octets.hpp"
#include "tpdu/result.hpp"

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

/// The character sets of short messages (3GPP TS 23.038). Text is UTF-8 throughout; encoded GSM
/// 7-bit text is held unpacked, one septet (0 to 127) an element, until it goes on the wire.
namespace tpdu {

enum class Alphabet : std::uint8_t {
    kGsm7,     ///< GSM 7-bit default alphabet with its extension table
    kEightBit, ///< uninterpreted octets
    kUcs2,     ///< 16-bit units; handled as UTF-16, big-endian, so that every character passes
};

/// The septet that announces a character of the extension table.
inline constexpr std::uint8_t kGsm7Escape = 0x1B;

/// How many septets `text` takes in the GSM 7-bit alphabet (a character of the extension table
/// takes two). Nothing when some character is in neither table or `text` is not UTF-8.
std::optional<std::size_t> gsm7_septets(std::string_view text);

/// `text` as septets. The error says which character has no place in the alphabet.
Result<Octets> gsm7_encode(std::string_view text);

/// Septets as text. Never fails: an escaped code that the extension table lacks reads as the same
/// code of the main table, an escape with nothing (or another escape) behind it as a space.
std::string gsm7_decode(OctetView septets);

/// Packs septets, least significant bits first, behind `fill_bits` (0 to 6) zero bits. Bits that
/// remain in the last octet are zero.
Octets pack_septets(OctetView septets, std::size_t fill_bits = 0);

/// Unpacks `count` septets that begin after `fill_bits` bits. Fails when `octets` holds fewer.
Result<Octets> unpack_septets(OctetView octets, std::size_t count, std::size_t fill_bits = 0);

/// How many 16-bit units `text` takes in UTF-16; nothing when it is not UTF-8.
std::optional<std::size_t> utf16_units(std::string_view text);

/// `text` as UTF-16, big-endian.
Result<Octets> ucs2_encode(std::string_view text);

/// UTF-16, big-endian, as text. A surrogate without its partner reads as U+FFFD; an odd number of
/// octets is an error.
Result<std::string> ucs2_decode(OctetView octets);

} // namespace tpdu
