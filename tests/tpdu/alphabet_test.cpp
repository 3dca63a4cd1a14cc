// SPDX-License-Identifier: Apache-2.0
#include "tests/tpdu/support.hpp"

#include "tpdu/alphabet.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <set>
#include <vector>

namespace {

using namespace std::string_literals;
using tpdu::ErrorKind;
using tpdu::Octets;
using tpdu_test::hex;
using tpdu_test::must;

/// The default alphabet as the standard's table shows it: eight columns of sixteen characters.
const std::vector<std::vector<std::string>> kColumns = {
    {"@", "£", "$", "¥", "è", "é", "ù", "ì", "ò", "Ç", "\n", "Ø", "ø", "\r", "Å", "å"},
    {"Δ", "_", "Φ", "Γ", "Λ", "Ω", "Π", "Ψ", "Σ", "Θ", "Ξ", "", "Æ", "æ", "ß", "É"},
    {" ", "!", "\"", "#", "¤", "%", "&", "'", "(", ")", "*", "+", ",", "-", ".", "/"},
    {"0", "1", "2", "3", "4", "5", "6", "7", "8", "9", ":", ";", "<", "=", ">", "?"},
    {"¡", "A", "B", "C", "D", "E", "F", "G", "H", "I", "J", "K", "L", "M", "N", "O"},
    {"P", "Q", "R", "S", "T", "U", "V", "W", "X", "Y", "Z", "Ä", "Ö", "Ñ", "Ü", "§"},
    {"¿", "a", "b", "c", "d", "e", "f", "g", "h", "i", "j", "k", "l", "m", "n", "o"},
    {"p", "q", "r", "s", "t", "u", "v", "w", "x", "y", "z", "ä", "ö", "ñ", "ü", "à"},
};

struct Extension {
    std::uint8_t code;
    std::string character;
};
const std::vector<Extension> kExtensions = {
    {0x0A, "\f"}, {0x14, "^"}, {0x28, "{"}, {0x29, "}"}, {0x2F, "\\"},
    {0x3C, "["},  {0x3D, "~"}, {0x3E, "]"}, {0x40, "|"}, {0x65, "€"},
};

TEST(Gsm7, EveryCharacterOfTheMainTableBothWays) {
    for (std::size_t column = 0; column < kColumns.size(); ++column) {
        for (std::size_t row = 0; row < kColumns[column].size(); ++row) {
            const auto code = static_cast<std::uint8_t>(column * 16 + row);
            if (code == tpdu::kGsm7Escape)
                continue;
            const std::string &character = kColumns[column][row];
            EXPECT_EQ(must(tpdu::gsm7_encode(character)), Octets{code}) << character;
            EXPECT_EQ(tpdu::gsm7_decode(Octets{code}), character) << int{code};
            EXPECT_EQ(tpdu::gsm7_septets(character), 1U) << character;
        }
    }
}

TEST(Gsm7, EveryCharacterOfTheExtensionTableBothWays) {
    for (const Extension &extension : kExtensions) {
        const Octets septets = {tpdu::kGsm7Escape, extension.code};
        EXPECT_EQ(must(tpdu::gsm7_encode(extension.character)), septets) << extension.character;
        EXPECT_EQ(tpdu::gsm7_decode(septets), extension.character);
        EXPECT_EQ(tpdu::gsm7_septets(extension.character), 2U);
    }
}

TEST(Gsm7, NoOtherCharacterOfTheBasicPlaneIsEncodable) {
    std::set<std::string> known;
    for (const auto &column : kColumns)
        known.insert(column.begin(), column.end());
    for (const Extension &extension : kExtensions)
        known.insert(extension.character);
    known.erase("");
    std::size_t encodable = 0;
    for (unsigned unit = 0; unit <= 0xFFFF; ++unit) {
        if (unit >= 0xD800 && unit <= 0xDFFF)
            continue;
        const Octets octets = {static_cast<std::uint8_t>(unit >> 8),
                               static_cast<std::uint8_t>(unit & 0xFF)};
        const std::string character = must(tpdu::ucs2_decode(octets));
        const bool expected = known.count(character) == 1;
        ASSERT_EQ(tpdu::gsm7_septets(character).has_value(), expected) << "U+" << std::hex << unit;
        encodable += expected ? 1 : 0;
    }
    EXPECT_EQ(encodable, 127U + 10U);
}

TEST(Gsm7, UnknownEscapesReadAsTheMainTable) {
    for (unsigned code = 0; code < 128; ++code) {
        const auto septet = static_cast<std::uint8_t>(code);
        const bool extended =
            std::any_of(kExtensions.begin(), kExtensions.end(),
                        [septet](const Extension &extension) { return extension.code == septet; });
        if (extended || septet == tpdu::kGsm7Escape)
            continue;
        EXPECT_EQ(tpdu::gsm7_decode(Octets{tpdu::kGsm7Escape, septet}),
                  kColumns[code / 16][code % 16]);
    }
}

TEST(Gsm7, EscapeWithoutAMeaningReadsAsASpace) {
    EXPECT_EQ(tpdu::gsm7_decode(Octets{'a', 0x1B}), "a ");
    EXPECT_EQ(tpdu::gsm7_decode(Octets{'a', 0x1B, 0x1B, 'b'}), "a b");
    EXPECT_EQ(tpdu::gsm7_decode(Octets{0x1B, 0x1B, 0x1B, 0x65}), " €");
}

TEST(Gsm7, CountsSeptets) {
    EXPECT_EQ(tpdu::gsm7_septets(""), 0U);
    EXPECT_EQ(tpdu::gsm7_septets("price: 5€ [net]"), 18U);
    EXPECT_EQ(tpdu::gsm7_septets("ç"), std::nullopt);
    EXPECT_EQ(tpdu::gsm7_septets("\x1B"), std::nullopt);
    EXPECT_EQ(tpdu::gsm7_septets("a\xFF"), std::nullopt);
}

TEST(Gsm7, SaysWhichCharacterHasNoPlace) {
    const auto missing = tpdu::gsm7_encode("naïve");
    ASSERT_FALSE(missing);
    EXPECT_EQ(missing.error().kind, ErrorKind::kNotEncodable);
    EXPECT_EQ(missing.error().message,
              "text contains U+00EF, which the GSM 7-bit alphabet does not have");
    const auto emoji = tpdu::gsm7_encode("😀");
    ASSERT_FALSE(emoji);
    EXPECT_EQ(emoji.error().message,
              "text contains U+1F600, which the GSM 7-bit alphabet does not have");
}

TEST(Packing, WorkedExamples) {
    EXPECT_EQ(tpdu::pack_septets(must(tpdu::gsm7_encode("hellohello"))),
              hex("E8 32 9B FD 46 97 D9 EC 37"));
    EXPECT_EQ(tpdu::pack_septets(must(tpdu::gsm7_encode("How are you?"))),
              hex("C8 F7 1D 14 96 97 41 F9 77 FD 07"));
    // Eight septets fill seven octets to the last bit; seven leave seven bits empty.
    EXPECT_EQ(tpdu::pack_septets(must(tpdu::gsm7_encode("12345678"))), hex("31D98C56B3DD70"));
    EXPECT_EQ(tpdu::pack_septets(must(tpdu::gsm7_encode("1234567"))), hex("31D98C56B3DD00"));
    EXPECT_TRUE(tpdu::pack_septets({}).empty());
}

TEST(Packing, FillBitsShiftTheFirstSeptet) {
    // 'A' is 1000001 and 'B' 1000010, 14 bits that begin at bit 0 to 6.
    const std::array<std::string, 7> expected = {"4121",   "8242",   "0485",  "080A01",
                                                 "101402", "202804", "405008"};
    for (std::size_t fill = 0; fill < expected.size(); ++fill) {
        EXPECT_EQ(tpdu::to_hex(tpdu::pack_septets(Octets{'A', 'B'}, fill)), expected[fill]) << fill;
        EXPECT_EQ(must(tpdu::unpack_septets(hex(expected[fill]), 2, fill)), (Octets{'A', 'B'}));
    }
}

TEST(Packing, UnpackingRefusesMoreThanThereIs) {
    EXPECT_EQ(must(tpdu::unpack_septets(hex("31D98C56B3DD70"), 8)).size(), 8U);
    const auto short_of_one = tpdu::unpack_septets(hex("31D98C56B3DD70"), 9);
    ASSERT_FALSE(short_of_one);
    EXPECT_EQ(short_of_one.error().kind, ErrorKind::kTruncated);
    EXPECT_EQ(short_of_one.error().message,
              "packed text should hold 9 septets but 7 octets hold 8 at most");
    EXPECT_FALSE(tpdu::unpack_septets(hex("31D98C56B3DD70"), 8, 1));
    EXPECT_FALSE(tpdu::unpack_septets({}, 1));
    EXPECT_FALSE(tpdu::unpack_septets(hex("00"), SIZE_MAX));
    EXPECT_TRUE(tpdu::unpack_septets({}, 0, 6));
}

TEST(Packing, RoundTripsEveryLengthAndFill) {
    tpdu_test::Random random(2303801);
    for (std::size_t length = 0; length <= 160; ++length) {
        for (std::size_t fill = 0; fill < 7; ++fill) {
            Octets septets = random.octets(length);
            for (std::uint8_t &septet : septets)
                septet &= 0x7F;
            const Octets packed = tpdu::pack_septets(septets, fill);
            ASSERT_EQ(packed.size(), (fill + length * 7 + 7) / 8);
            ASSERT_EQ(must(tpdu::unpack_septets(packed, length, fill)), septets);
        }
    }
}

TEST(Ucs2, WorkedExamples) {
    EXPECT_EQ(must(tpdu::ucs2_encode("Aß漢")), hex("0041 00DF 6F22"));
    EXPECT_EQ(must(tpdu::ucs2_decode(hex("0041 00DF 6F22"))), "Aß漢");
    EXPECT_EQ(must(tpdu::ucs2_encode("\0"s)), hex("0000"));
    EXPECT_EQ(tpdu::utf16_units("Aß漢"), 3U);
}

TEST(Ucs2, CharactersBeyondTheBasicPlaneSurvive) {
    EXPECT_EQ(must(tpdu::ucs2_encode("😀")), hex("D83D DE00"));
    EXPECT_EQ(must(tpdu::ucs2_decode(hex("D83D DE00"))), "😀");
    EXPECT_EQ(must(tpdu::ucs2_encode("\U00010000\U0010FFFF")), hex("D800DC00 DBFFDFFF"));
    EXPECT_EQ(must(tpdu::ucs2_decode(hex("D800DC00 DBFFDFFF"))), "\U00010000\U0010FFFF");
    EXPECT_EQ(tpdu::utf16_units("a😀"), 3U);
}

TEST(Ucs2, LoneSurrogatesReadAsTheReplacementCharacter) {
    EXPECT_EQ(must(tpdu::ucs2_decode(hex("0041 D83D"))), "A\uFFFD");
    EXPECT_EQ(must(tpdu::ucs2_decode(hex("D83D 0041"))), "\uFFFDA");
    EXPECT_EQ(must(tpdu::ucs2_decode(hex("DE00 D83D"))), "\uFFFD\uFFFD");
    EXPECT_EQ(must(tpdu::ucs2_decode(hex("D83D D83D DE00"))), "\uFFFD😀");
}

TEST(Ucs2, AnOddNumberOfOctetsIsAnError) {
    const auto odd = tpdu::ucs2_decode(hex("0041 00"));
    ASSERT_FALSE(odd);
    EXPECT_EQ(odd.error().kind, ErrorKind::kMalformed);
    EXPECT_EQ(odd.error().message, "UCS-2 text takes 3 octets, an odd number");
}

TEST(Utf8, IllFormedTextIsRefused) {
    const std::vector<std::string> ill_formed = {
        "ab\x80",         // continuation without a lead
        "ab\xC3",         // lead without its continuation
        "ab\xC3(",        // something else in its place
        "ab\xC0\xAF",     // overlong, two bytes
        "ab\xE0\x80\xAF", // overlong, three bytes
        "ab\xF0\x80\x80\xAF",
        "ab\xED\xA0\x80",     // a surrogate
        "ab\xF4\x90\x80\x80", // above U+10FFFF
        "ab\xF8\x88\x80\x80\x80",
        "ab\xFF",
    };
    for (const std::string &text : ill_formed) {
        const auto ucs2 = tpdu::ucs2_encode(text);
        const auto gsm7 = tpdu::gsm7_encode(text);
        ASSERT_FALSE(ucs2);
        ASSERT_FALSE(gsm7);
        EXPECT_EQ(ucs2.error().kind, ErrorKind::kNotEncodable);
        EXPECT_EQ(ucs2.error().message, "text is not well-formed UTF-8 at byte 2");
        EXPECT_EQ(gsm7.error().message, "text is not well-formed UTF-8 at byte 2");
        EXPECT_EQ(tpdu::utf16_units(text), std::nullopt);
    }
}

TEST(Hex, BothWays) {
    EXPECT_EQ(tpdu::to_hex(Octets{0x00, 0x9F, 0xA5}), "009FA5");
    EXPECT_EQ(must(tpdu::from_hex("009fA5")), (Octets{0x00, 0x9F, 0xA5}));
    EXPECT_EQ(tpdu::from_hex("009").error().message,
              "hexadecimal text has 3 digits, an odd number");
    EXPECT_EQ(tpdu::from_hex("0g").error().message, "hexadecimal text has no digit at position 1");
    EXPECT_EQ(tpdu::from_hex("x0").error().message, "hexadecimal text has no digit at position 0");
}

} // namespace
