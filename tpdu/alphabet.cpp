// SPDX-License-Identifier: Apache-2.0
#include "tpdu/alphabet.hpp"

#include "tpdu/cursor.hpp"
#include "tpdu/unicode.hpp"

#include <algorithm>
#include <array>

namespace tpdu {

namespace {

// Main table by code; the escape's own place holds U+FFFF, which no text contains as such.
constexpr char16_t kNoCharacter = 0xFFFF;
constexpr std::array<char16_t, 128> kMainTable = {
    u'@',   0x00A3, u'$',   0x00A5, 0x00E8, 0x00E9, 0x00F9, 0x00EC, // 0x00
    0x00F2, 0x00C7, u'\n',  0x00D8, 0x00F8, u'\r',  0x00C5, 0x00E5, // 0x08
    0x0394, u'_',   0x03A6, 0x0393, 0x039B, 0x03A9, 0x03A0, 0x03A8, // 0x10
    0x03A3, 0x0398, 0x039E, 0xFFFF, 0x00C6, 0x00E6, 0x00DF, 0x00C9, // 0x18
    u' ',   u'!',   u'"',   u'#',   0x00A4, u'%',   u'&',   u'\'',  // 0x20
    u'(',   u')',   u'*',   u'+',   u',',   u'-',   u'.',   u'/',   // 0x28
    u'0',   u'1',   u'2',   u'3',   u'4',   u'5',   u'6',   u'7',   // 0x30
    u'8',   u'9',   u':',   u';',   u'<',   u'=',   u'>',   u'?',   // 0x38
    0x00A1, u'A',   u'B',   u'C',   u'D',   u'E',   u'F',   u'G',   // 0x40
    u'H',   u'I',   u'J',   u'K',   u'L',   u'M',   u'N',   u'O',   // 0x48
    u'P',   u'Q',   u'R',   u'S',   u'T',   u'U',   u'V',   u'W',   // 0x50
    u'X',   u'Y',   u'Z',   0x00C4, 0x00D6, 0x00D1, 0x00DC, 0x00A7, // 0x58
    0x00BF, u'a',   u'b',   u'c',   u'd',   u'e',   u'f',   u'g',   // 0x60
    u'h',   u'i',   u'j',   u'k',   u'l',   u'm',   u'n',   u'o',   // 0x68
    u'p',   u'q',   u'r',   u's',   u't',   u'u',   u'v',   u'w',   // 0x70
    u'x',   u'y',   u'z',   0x00E4, 0x00F6, 0x00F1, 0x00FC, 0x00E0, // 0x78
};

struct ExtensionEntry {
    std::uint8_t code;
    char16_t character;
};
constexpr std::array<ExtensionEntry, 10> kExtensionTable = {{
    {0x0A, u'\f'},
    {0x14, u'^'},
    {0x28, u'{'},
    {0x29, u'}'},
    {0x2F, u'\\'},
    {0x3C, u'['},
    {0x3D, u'~'},
    {0x3E, u']'},
    {0x40, u'|'},
    {0x65, 0x20AC},
}};

struct Gsm7Code {
    bool escaped;
    std::uint8_t code;
};

std::optional<Gsm7Code> find_gsm7(char32_t character) {
    if (character >= kNoCharacter)
        return std::nullopt;
    const auto main = std::find(kMainTable.begin(), kMainTable.end(), character);
    if (main != kMainTable.end())
        return Gsm7Code{false, static_cast<std::uint8_t>(main - kMainTable.begin())};
    for (const ExtensionEntry &entry : kExtensionTable) {
        if (entry.character == character)
            return Gsm7Code{true, entry.code};
    }
    return std::nullopt;
}

char16_t read_escaped(std::uint8_t code) {
    if (code == kGsm7Escape)
        return u' ';
    for (const ExtensionEntry &entry : kExtensionTable) {
        if (entry.code == code)
            return entry.character;
    }
    return kMainTable[code];
}

Error not_utf8(std::size_t position) {
    return make_error(ErrorKind::kNotEncodable, "text",
                      "is not well-formed UTF-8 at byte " + std::to_string(position));
}

std::string code_point_name(char32_t code_point) {
    constexpr std::string_view kHexDigits = "0123456789ABCDEF";
    std::string name;
    for (char32_t rest = code_point; rest != 0 || name.size() < 4; rest >>= 4)
        name.insert(name.begin(), kHexDigits[rest & 0x0F]);
    return "U+" + name;
}

void append_unit(Octets &octets, char32_t unit) {
    octets.push_back(static_cast<std::uint8_t>(unit >> 8));
    octets.push_back(static_cast<std::uint8_t>(unit & 0xFF));
}

} // namespace

std::optional<std::size_t> gsm7_septets(std::string_view text) {
    std::size_t septets = 0;
    for (std::size_t position = 0; position < text.size();) {
        const auto character = detail::next_code_point(text, position);
        if (!character)
            return std::nullopt;
        const auto found = find_gsm7(*character);
        if (!found)
            return std::nullopt;
        septets += found->escaped ? 2 : 1;
    }
    return septets;
}

Result<Octets> gsm7_encode(std::string_view text) {
    Octets septets;
    septets.reserve(text.size());
    for (std::size_t position = 0; position < text.size();) {
        const auto character = detail::next_code_point(text, position);
        if (!character)
            return not_utf8(position);
        const auto found = find_gsm7(*character);
        if (!found) {
            return make_error(ErrorKind::kNotEncodable, "text",
                              "contains " + code_point_name(*character) +
                                  ", which the GSM 7-bit alphabet does not have");
        }
        if (found->escaped)
            septets.push_back(kGsm7Escape);
        septets.push_back(found->code);
    }
    return septets;
}

std::string gsm7_decode(OctetView septets) {
    std::string text;
    text.reserve(septets.size());
    for (std::size_t i = 0; i < septets.size(); ++i) {
        const std::uint8_t code = septets[i] & 0x7F;
        if (code != kGsm7Escape) {
            detail::append_utf8(text, kMainTable[code]);
        } else if (i + 1 == septets.size()) {
            text += ' ';
        } else {
            detail::append_utf8(text, read_escaped(septets[++i] & 0x7F));
        }
    }
    return text;
}

Octets pack_septets(OctetView septets, std::size_t fill_bits) {
    Octets octets((fill_bits + septets.size() * 7 + 7) / 8, 0);
    std::size_t bit = fill_bits;
    for (const std::uint8_t septet : septets) {
        const unsigned placed = (septet & 0x7FU) << (bit % 8);
        octets[bit / 8] = static_cast<std::uint8_t>(octets[bit / 8] | (placed & 0xFF));
        if (placed > 0xFF)
            octets[bit / 8 + 1] = static_cast<std::uint8_t>(placed >> 8);
        bit += 7;
    }
    return octets;
}

Result<Octets> unpack_septets(OctetView octets, std::size_t count, std::size_t fill_bits) {
    const std::size_t bits = octets.size() * 8;
    const std::size_t available = bits > fill_bits ? (bits - fill_bits) / 7 : 0;
    if (count > available) {
        return make_error(ErrorKind::kTruncated, "packed text",
                          "should hold " + detail::count_of(count, "septet") + " but " +
                              detail::count_of(octets.size(), "octet") + " hold " +
                              std::to_string(available) + " at most");
    }
    Octets septets;
    septets.reserve(count);
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t bit = fill_bits + i * 7;
        unsigned window = octets[bit / 8];
        if (bit / 8 + 1 < octets.size())
            window |= static_cast<unsigned>(octets[bit / 8 + 1]) << 8;
        septets.push_back(static_cast<std::uint8_t>(window >> (bit % 8) & 0x7F));
    }
    return septets;
}

std::optional<std::size_t> utf16_units(std::string_view text) {
    std::size_t units = 0;
    for (std::size_t position = 0; position < text.size();) {
        const auto character = detail::next_code_point(text, position);
        if (!character)
            return std::nullopt;
        units += *character > 0xFFFF ? 2 : 1;
    }
    return units;
}

Result<Octets> ucs2_encode(std::string_view text) {
    Octets octets;
    octets.reserve(text.size() * 2);
    for (std::size_t position = 0; position < text.size();) {
        const auto character = detail::next_code_point(text, position);
        if (!character)
            return not_utf8(position);
        if (*character > 0xFFFF) {
            append_unit(octets, 0xD800 + ((*character - 0x10000) >> 10));
            append_unit(octets, 0xDC00 + ((*character - 0x10000) & 0x3FF));
        } else {
            append_unit(octets, *character);
        }
    }
    return octets;
}

Result<std::string> ucs2_decode(OctetView octets) {
    if (octets.size() % 2 != 0) {
        return make_error(ErrorKind::kMalformed, "UCS-2 text",
                          "takes " + detail::count_of(octets.size(), "octet") + ", an odd number");
    }
    const auto unit_at = [octets](std::size_t i) {
        return static_cast<char32_t>(octets[i] << 8 | octets[i + 1]);
    };
    std::string text;
    text.reserve(octets.size());
    for (std::size_t i = 0; i < octets.size(); i += 2) {
        char32_t character = unit_at(i);
        const bool paired = detail::is_high_surrogate(character) && i + 2 < octets.size() &&
                            detail::is_low_surrogate(unit_at(i + 2));
        if (paired) {
            i += 2;
            character = 0x10000 + ((character - 0xD800) << 10) + (unit_at(i) - 0xDC00);
        } else if (detail::is_high_surrogate(character) || detail::is_low_surrogate(character)) {
            character = detail::kReplacementCharacter;
        }
        detail::append_utf8(text, character);
    }
    return text;
}

} // namespace tpdu
