// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

/// The little UTF-8 and UTF-16 that the alphabets need. For the codec's own units.
namespace tpdu::detail {

inline constexpr char32_t kReplacementCharacter = 0xFFFD;

constexpr bool is_high_surrogate(char32_t unit) {
    return unit >= 0xD800 && unit <= 0xDBFF;
}
constexpr bool is_low_surrogate(char32_t unit) {
    return unit >= 0xDC00 && unit <= 0xDFFF;
}

/// The code point that starts at `position`, which moves behind it. Nothing, and `position` stays,
/// when the bytes there are not well-formed UTF-8 (overlong forms and surrogates included).
std::optional<char32_t> next_code_point(std::string_view text, std::size_t &position);

/// Appends one code point (a Unicode scalar value) in UTF-8.
void append_utf8(std::string &text, char32_t code_point);

} // namespace tpdu::detail
