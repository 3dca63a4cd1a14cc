// SPDX-License-Identifier: Apache-2.0
#include "tpdu/unicode.hpp"

#include <cstdint>

namespace tpdu::detail {

namespace {

struct Lead {
    std::size_t length;
    char32_t bits;
    char32_t smallest; // anything below is an overlong form
};

std::optional<Lead> classify_lead(std::uint8_t byte) {
    if (byte < 0x80)
        return Lead{1, byte, 0};
    if ((byte & 0xE0) == 0xC0)
        return Lead{2, byte & 0x1FU, 0x80};
    if ((byte & 0xF0) == 0xE0)
        return Lead{3, byte & 0x0FU, 0x800};
    if ((byte & 0xF8) == 0xF0)
        return Lead{4, byte & 0x07U, 0x10000};
    return std::nullopt;
}

} // namespace

std::optional<char32_t> next_code_point(std::string_view text, std::size_t &position) {
    if (position >= text.size())
        return std::nullopt;
    const auto lead = classify_lead(static_cast<std::uint8_t>(text[position]));
    if (!lead || text.size() - position < lead->length)
        return std::nullopt;
    char32_t code_point = lead->bits;
    for (std::size_t i = 1; i < lead->length; ++i) {
        const auto byte = static_cast<std::uint8_t>(text[position + i]);
        if ((byte & 0xC0) != 0x80)
            return std::nullopt;
        code_point = code_point << 6 | (byte & 0x3FU);
    }
    if (code_point < lead->smallest || code_point > 0x10FFFF || is_high_surrogate(code_point) ||
        is_low_surrogate(code_point))
        return std::nullopt;
    position += lead->length;
    return code_point;
}

void append_utf8(std::string &text, char32_t code_point) {
    const auto append = [&text](char32_t byte) { text += static_cast<char>(byte); };
    const auto continuation = [code_point](unsigned shift) {
        return 0x80 | (code_point >> shift & 0x3F);
    };
    if (code_point < 0x80) {
        append(code_point);
    } else if (code_point < 0x800) {
        append(0xC0 | code_point >> 6);
        append(continuation(0));
    } else if (code_point < 0x10000) {
        append(0xE0 | code_point >> 12);
        append(continuation(6));
        append(continuation(0));
    } else {
        append(0xF0 | code_point >> 18);
        append(continuation(12));
        append(continuation(6));
        append(continuation(0));
    }
}

} // namespace tpdu::detail
