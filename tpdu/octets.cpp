// SPDX-License-Identifier: Apache-2.0
#include "tpdu/octets.hpp"

#include <optional>

namespace tpdu {

namespace {

std::optional<std::uint8_t> hex_digit(char c) {
    if (c >= '0' && c <= '9')
        return static_cast<std::uint8_t>(c - '0');
    if (c >= 'A' && c <= 'F')
        return static_cast<std::uint8_t>(c - 'A' + 10);
    if (c >= 'a' && c <= 'f')
        return static_cast<std::uint8_t>(c - 'a' + 10);
    return std::nullopt;
}

} // namespace

std::string to_hex(OctetView octets) {
    constexpr std::string_view kHexDigits = "0123456789ABCDEF";
    std::string text;
    text.reserve(octets.size() * 2);
    for (const std::uint8_t octet : octets) {
        text += kHexDigits[octet >> 4];
        text += kHexDigits[octet & 0x0F];
    }
    return text;
}

Result<Octets> from_hex(std::string_view text) {
    if (text.size() % 2 != 0) {
        return make_error(ErrorKind::kMalformed, "hexadecimal text",
                          "has " + std::to_string(text.size()) + " digits, an odd number");
    }
    Octets octets;
    octets.reserve(text.size() / 2);
    for (std::size_t i = 0; i < text.size(); i += 2) {
        const auto high = hex_digit(text[i]);
        const auto low = hex_digit(text[i + 1]);
        if (!high || !low) {
            return make_error(ErrorKind::kMalformed, "hexadecimal text",
                              "has no digit at position " + std::to_string(high ? i + 1 : i));
        }
        octets.push_back(static_cast<std::uint8_t>(*high << 4 | *low));
    }
    return octets;
}

} // namespace tpdu
