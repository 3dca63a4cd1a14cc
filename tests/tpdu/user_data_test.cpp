// SPDX-License-Identifier: Apache-2.0
#include "tests/tpdu/support.hpp"

#include "tpdu/pdu.hpp"
#include "tpdu/user_data.hpp"

#include <gtest/gtest.h>

#include <vector>

namespace {

using tpdu::Alphabet;
using tpdu::ErrorKind;
using tpdu::InformationElement;
using tpdu::Octets;
using tpdu::Submit;
using tpdu::UserData;
using tpdu::UserDataHeader;
using tpdu_test::hex;
using tpdu_test::must;

constexpr std::uint8_t kHeaderBit = 0x40;

/// Everything in front of TP-UDL in a message to "1".
Octets message(std::uint8_t data_coding, bool with_header, std::string_view user_data) {
    Octets octets = hex("01 00 01 81 F1 00 00");
    octets[0] = static_cast<std::uint8_t>(octets[0] | (with_header ? kHeaderBit : 0));
    octets[6] = data_coding;
    const Octets tail = hex(user_data);
    octets.insert(octets.end(), tail.begin(), tail.end());
    return octets;
}

Submit submit_with(std::uint8_t data_coding, UserData user_data) {
    Submit submit;
    submit.destination = must(tpdu::number_address("1"));
    submit.data_coding = data_coding;
    submit.user_data = std::move(user_data);
    return submit;
}

void expect_both_ways(std::uint8_t data_coding, const UserData &user_data,
                      std::string_view octets) {
    const Octets whole = message(data_coding, user_data.header.has_value(), octets);
    EXPECT_EQ(tpdu::to_hex(must(tpdu::encode(submit_with(data_coding, user_data)))),
              tpdu::to_hex(whole));
    EXPECT_EQ(must(tpdu::decode_submit(whole)), submit_with(data_coding, user_data));
}

UserDataHeader header_of(std::vector<InformationElement> elements) {
    return {std::move(elements)};
}

TEST(UserData, EachAlphabetBothWays) {
    expect_both_ways(0x00, {std::nullopt, {'H', 'i'}}, "02 C834");
    expect_both_ways(0x04, {std::nullopt, hex("00FF80")}, "03 00FF80");
    expect_both_ways(0x08, {std::nullopt, hex("D83DDE00")}, "04 D83DDE00");
    expect_both_ways(0x00, {}, "00");
}

TEST(UserData, CompressedTextIsCountedInOctets) {
    expect_both_ways(0x20, {std::nullopt, hex("FFEEDD")}, "03 FFEEDD");
    expect_both_ways(0x28, {std::nullopt, hex("FFEEDD")}, "03 FFEEDD");
}

TEST(UserData, HeaderBeforeEachAlphabet) {
    const UserDataHeader ports = header_of({{0x05, hex("0B84 23F0")}});
    expect_both_ways(0x04, {ports, hex("CAFE")}, "09 06 05 04 0B84 23F0 CAFE");
    expect_both_ways(0x08, {ports, hex("6F22")}, "09 06 05 04 0B84 23F0 6F22");
    // 7 octets are 8 septets, with no bit to fill.
    expect_both_ways(0x00, {ports, {'A', 'B'}}, "0A 06 05 04 0B84 23F0 4121");
}

TEST(UserData, FillBitsBringTheTextToASeptetBoundary) {
    struct Row {
        std::size_t header_octets;
        std::string_view length; // septets of the header and the fill bits, plus two
        std::string_view text;   // "AB" behind 7 * ceil(bits / 7) - bits zeros
    };
    const std::vector<Row> rows = {
        {3, "06", "101402"}, // 24 bits, 4 to fill
        {4, "07", "080A01"}, // 32 bits, 3
        {5, "08", "0485"},   // 40 bits, 2
        {6, "09", "8242"},   // 48 bits, 1
        {7, "0A", "4121"},   // 56 bits, none
        {8, "0C", "405008"}, // 64 bits, 6
        {9, "0D", "202804"}, // 72 bits, 5
    };
    for (const Row &row : rows) {
        const std::size_t data_size = row.header_octets - 3;
        const UserDataHeader header = header_of({{0x70, Octets(data_size, 0xAA)}});
        const Octets sizes = {static_cast<std::uint8_t>(row.header_octets - 1), 0x70,
                              static_cast<std::uint8_t>(data_size)};
        const std::string octets = std::string(row.length) + tpdu::to_hex(sizes) +
                                   tpdu::to_hex(Octets(data_size, 0xAA)) + std::string(row.text);
        expect_both_ways(0x00, {header, {'A', 'B'}}, octets);
        EXPECT_EQ(tpdu::header_size(header), row.header_octets);
    }
}

TEST(UserData, FillBitsThatAreSetAreIgnored) {
    // As the row of 3 header octets, with its four fill bits set.
    const auto submit = must(tpdu::decode_submit(message(0x00, true, "06 02 70 00 1F1402")));
    EXPECT_EQ(submit.user_data.body, (Octets{'A', 'B'}));
}

TEST(UserData, AHeaderAlone) {
    // 48 bits are 6 septets and 6 bits: one bit to fill, for which a seventh octet is there.
    const UserDataHeader concatenation = header_of({{0x00, hex("070302")}});
    expect_both_ways(0x00, {concatenation, {}}, "07 05 00 03 070302 00");
    expect_both_ways(0x08, {concatenation, {}}, "06 05 00 03 070302");
    EXPECT_EQ(tpdu::header_septets(concatenation), 7U);
    EXPECT_EQ(tpdu::header_septets(std::nullopt), 0U);
    EXPECT_EQ(tpdu::header_size(std::nullopt), 0U);
}

TEST(UserData, AnEmptyHeaderIsStillAHeader) {
    expect_both_ways(0x04, {UserDataHeader{}, hex("41")}, "02 00 41");
    // 8 bits, 6 to fill.
    expect_both_ways(0x00, {UserDataHeader{}, {'A'}}, "03 00 4010");
}

TEST(UserData, UnknownElementsAreKeptInOrder) {
    const UserDataHeader header =
        header_of({{0x7F, hex("0102")}, {0x00, hex("070302")}, {0x7F, {}}, {0xE0, hex("FF")}});
    expect_both_ways(0x04, {header, hex("AA")}, "10 0E 7F020102 0003070302 7F00 E001FF AA");
}

TEST(UserData, LongestForEachAlphabet) {
    for (const auto &[data_coding, size] :
         std::vector<std::pair<int, std::size_t>>{{0x00, 160}, {0x04, 140}, {0x08, 140}}) {
        const auto coding = static_cast<std::uint8_t>(data_coding);
        const Submit longest = submit_with(coding, {std::nullopt, Octets(size, 0x41)});
        const Octets octets = must(tpdu::encode(longest));
        EXPECT_EQ(octets.size(), 8U + 140U);
        EXPECT_EQ(must(tpdu::decode_submit(octets)), longest);
        const auto too_long =
            tpdu::encode(submit_with(coding, {std::nullopt, Octets(size + 2, 0x41)}));
        ASSERT_FALSE(too_long);
        EXPECT_EQ(too_long.error().kind, ErrorKind::kTooLong);
    }
}

TEST(UserData, LongestBehindAHeader) {
    const UserDataHeader concatenation = header_of({{0x00, hex("070302")}});
    for (const auto &[size, fits] :
         std::vector<std::pair<std::size_t, bool>>{{152, true}, {153, true}, {154, false}}) {
        const auto octets = tpdu::encode(submit_with(0x00, {concatenation, Octets(size, 'x')}));
        EXPECT_EQ(octets.ok(), fits) << size;
    }
    EXPECT_TRUE(tpdu::encode(submit_with(0x08, {concatenation, Octets(134, 0)})));
    EXPECT_FALSE(tpdu::encode(submit_with(0x08, {concatenation, Octets(136, 0)})));
    // A header of 140 octets leaves no room for a single character.
    const UserDataHeader full = header_of({{0x70, Octets(137, 0)}});
    EXPECT_TRUE(tpdu::encode(submit_with(0x00, {full, {}})));
    EXPECT_FALSE(tpdu::encode(submit_with(0x00, {full, {'x'}})));
    EXPECT_FALSE(tpdu::encode(submit_with(0x04, {header_of({{0x70, Octets(300, 0)}}), {}})));
}

TEST(UserData, TextInAndOut) {
    const UserData gsm7 = must(tpdu::encode_text("5€", Alphabet::kGsm7));
    EXPECT_EQ(gsm7.body, (Octets{'5', 0x1B, 0x65}));
    EXPECT_EQ(must(tpdu::decode_text(0x00, gsm7.body)), "5€");
    const UserData ucs2 = must(tpdu::encode_text("漢😀", Alphabet::kUcs2));
    EXPECT_EQ(ucs2.body, hex("6F22 D83DDE00"));
    EXPECT_EQ(must(tpdu::decode_text(0x08, ucs2.body)), "漢😀");
    // The alphabet also follows from the waiting and class groups, and from reserved codings.
    EXPECT_EQ(must(tpdu::decode_text(0xE8, ucs2.body)), "漢😀");
    EXPECT_EQ(must(tpdu::decode_text(0xF0, gsm7.body)), "5€");
    EXPECT_EQ(must(tpdu::decode_text(0x8C, gsm7.body)), "5€");
}

TEST(UserData, WhatIsNoText) {
    EXPECT_EQ(tpdu::decode_text(0x04, hex("41")).error().message,
              "TP-UD holds 8-bit data, not text");
    EXPECT_EQ(tpdu::decode_text(0x20, hex("41")).error().message, "TP-UD holds compressed text");
    EXPECT_EQ(tpdu::decode_text(0x08, hex("0041 00")).error().kind, ErrorKind::kMalformed);
    EXPECT_EQ(tpdu::encode_text("x", Alphabet::kEightBit).error().kind, ErrorKind::kUnsupported);
    EXPECT_EQ(tpdu::encode_text("漢", Alphabet::kGsm7).error().kind, ErrorKind::kNotEncodable);
}

} // namespace
