// SPDX-License-Identifier: Apache-2.0
#include "tests/tpdu/support.hpp"

#include "tpdu/concatenation.hpp"

#include <gtest/gtest.h>

#include <vector>

namespace {

using namespace tpdu;
using tpdu_test::hex;
using tpdu_test::must;

std::string repeated_text(std::string_view text, std::size_t count) {
    std::string repeated;
    for (std::size_t i = 0; i < count; ++i)
        repeated += text;
    return repeated;
}

std::vector<std::size_t> body_sizes(const SegmentedText &text) {
    std::vector<std::size_t> sizes;
    for (const UserData &part : text.parts)
        sizes.push_back(part.body.size());
    return sizes;
}

std::vector<std::size_t> sizes_of(std::string_view text, const SegmentOptions &options = {}) {
    return body_sizes(must(segment(text, options)));
}

using Sizes = std::vector<std::size_t>;

TEST(ConcatenationElement, BothWidthsBothWays) {
    const Concatenation narrow{0x07, ReferenceWidth::k8Bit, 3, 2};
    const InformationElement narrow_element{0x00, hex("070302")};
    EXPECT_EQ(must(concatenation_element(narrow)), narrow_element);
    EXPECT_EQ(find_concatenation({{narrow_element}}), narrow);

    const Concatenation wide{0x1234, ReferenceWidth::k16Bit, 255, 255};
    const InformationElement wide_element{0x08, hex("1234FFFF")};
    EXPECT_EQ(must(concatenation_element(wide)), wide_element);
    EXPECT_EQ(find_concatenation({{wide_element}}), wide);
}

TEST(ConcatenationElement, MeaninglessOnesCountAsAbsent) {
    for (const InformationElement &element : std::vector<InformationElement>{
             {0x00, hex("070002")},     // no parts in all
             {0x00, hex("070300")},     // part 0
             {0x00, hex("070304")},     // part 4 of 3
             {0x00, hex("0703")},       // too short
             {0x00, hex("07030201")},   // too long
             {0x08, hex("070302")},     // too short for its width
             {0x08, hex("0001030402")}, // too long
             {0x08, hex("00010304")},   // part 4 of 3
             {0x01, hex("070302")},     // another element
         }) {
        EXPECT_EQ(find_concatenation({{element}}), std::nullopt) << to_hex(element.data);
    }
    EXPECT_EQ(find_concatenation({}), std::nullopt);
}

TEST(ConcatenationElement, TheLastMeaningfulOneCounts) {
    const InformationElement first{0x00, hex("070302")};
    const InformationElement second{0x08, hex("01000501")};
    const InformationElement meaningless{0x00, hex("070304")};
    EXPECT_EQ(find_concatenation({{first, {0x70, {}}, second}})->reference, 0x0100);
    EXPECT_EQ(find_concatenation({{second, first}})->reference, 0x07);
    EXPECT_EQ(find_concatenation({{second, meaningless}})->reference, 0x0100);
}

TEST(ConcatenationElement, RefusesWhatMakesNoSense) {
    const auto problem = [](const Concatenation &concatenation) {
        return concatenation_element(concatenation).error().message;
    };
    EXPECT_EQ(problem({1, ReferenceWidth::k8Bit, 0, 1}), "concatenation cannot be part 1 of 0");
    EXPECT_EQ(problem({1, ReferenceWidth::k8Bit, 2, 0}), "concatenation cannot be part 0 of 2");
    EXPECT_EQ(problem({1, ReferenceWidth::k16Bit, 2, 3}), "concatenation cannot be part 3 of 2");
    EXPECT_EQ(problem({256, ReferenceWidth::k8Bit, 2, 1}),
              "concatenation has the reference 256, too large for 8 bits");
}

TEST(Segment, AShortTextStandsAlone) {
    const SegmentedText text = must(segment("hello"));
    EXPECT_EQ(text.alphabet, Alphabet::kGsm7);
    ASSERT_EQ(text.parts.size(), 1U);
    EXPECT_EQ(text.parts[0].header, std::nullopt);
    EXPECT_EQ(sizes_of(""), Sizes{0});
}

TEST(Segment, LimitsOfTheDefaultAlphabet) {
    EXPECT_EQ(sizes_of(repeated_text("x", 160)), Sizes{160});
    EXPECT_EQ(sizes_of(repeated_text("x", 161)), (Sizes{153, 8}));
    EXPECT_EQ(sizes_of(repeated_text("x", 306)), (Sizes{153, 153}));
    EXPECT_EQ(sizes_of(repeated_text("x", 307)), (Sizes{153, 153, 1}));
}

TEST(Segment, LimitsOfUcs2) {
    // Sizes are in octets: 70 units are 140, 67 are 134.
    EXPECT_EQ(sizes_of(repeated_text("漢", 70)), Sizes{140});
    EXPECT_EQ(sizes_of(repeated_text("漢", 71)), (Sizes{134, 8}));
    EXPECT_EQ(sizes_of(repeated_text("漢", 134)), (Sizes{134, 134}));
    EXPECT_EQ(sizes_of(repeated_text("漢", 135)), (Sizes{134, 134, 2}));
}

TEST(Segment, AWideReferenceCostsRoom) {
    const SegmentOptions wide{0x1234, ReferenceWidth::k16Bit, std::nullopt};
    EXPECT_EQ(sizes_of(repeated_text("x", 160), wide), Sizes{160});
    EXPECT_EQ(sizes_of(repeated_text("x", 305), wide), (Sizes{152, 152, 1}));
    EXPECT_EQ(sizes_of(repeated_text("漢", 133), wide), (Sizes{132, 132, 2}));
}

TEST(Segment, OneForeignCharacterMakesItUcs2) {
    EXPECT_EQ(must(segment(repeated_text("x", 70))).alphabet, Alphabet::kGsm7);
    EXPECT_EQ(must(segment(repeated_text("x", 69) + "ç")).alphabet, Alphabet::kUcs2);
    EXPECT_EQ(sizes_of(repeated_text("x", 70) + "ç"), (Sizes{134, 8}));
}

TEST(Segment, AnEscapedCharacterStaysInOnePart) {
    // As the 160th and 161st septet it makes the text too long for one message.
    EXPECT_EQ(sizes_of(repeated_text("x", 158) + "€"), Sizes{160});
    EXPECT_EQ(sizes_of(repeated_text("x", 159) + "€"), (Sizes{153, 8}));
    // Its escape would be the 153rd septet of the first part.
    EXPECT_EQ(sizes_of(repeated_text("x", 152) + "€" + repeated_text("x", 10)), (Sizes{152, 12}));
    EXPECT_EQ(sizes_of(repeated_text("x", 151) + "€" + repeated_text("x", 10)), (Sizes{153, 10}));
    // Two septets each: 76 and a single septet left over in every part.
    EXPECT_EQ(sizes_of(repeated_text("€", 160)), (Sizes{152, 152, 16}));
    for (const UserData &part : must(segment(repeated_text("€", 160))).parts)
        EXPECT_EQ(must(decode_text(0x00, part.body)), repeated_text("€", part.body.size() / 2));
}

TEST(Segment, ASurrogatePairStaysInOnePart) {
    EXPECT_EQ(sizes_of(repeated_text("漢", 68) + "😀"), Sizes{140});
    EXPECT_EQ(sizes_of(repeated_text("漢", 69) + "😀"), (Sizes{134, 8}));
    EXPECT_EQ(sizes_of(repeated_text("漢", 66) + "😀" + repeated_text("漢", 5)), (Sizes{132, 14}));
    EXPECT_EQ(sizes_of(repeated_text("漢", 65) + "😀" + repeated_text("漢", 5)), (Sizes{134, 10}));
    EXPECT_EQ(sizes_of(repeated_text("😀", 70)), (Sizes{132, 132, 16}));
    for (const UserData &part : must(segment(repeated_text("😀", 70))).parts)
        EXPECT_EQ(must(decode_text(0x08, part.body)), repeated_text("😀", part.body.size() / 4));
}

TEST(Segment, PartsAreNumberedAndShareTheReference) {
    const SegmentedText text =
        must(segment(repeated_text("x", 400), {200, ReferenceWidth::k8Bit, {}}));
    ASSERT_EQ(text.parts.size(), 3U);
    for (std::size_t i = 0; i < text.parts.size(); ++i) {
        const auto found = find_concatenation(*text.parts[i].header);
        EXPECT_EQ(found,
                  (Concatenation{200, ReferenceWidth::k8Bit, 3, static_cast<std::uint8_t>(i + 1)}));
    }
}

TEST(Segment, EveryPartFitsIntoAMessage) {
    for (const std::string &text :
         {repeated_text("x", 1000), repeated_text("€", 500), repeated_text("漢", 500)}) {
        for (const ReferenceWidth width : {ReferenceWidth::k8Bit, ReferenceWidth::k16Bit}) {
            const SegmentedText parts = must(segment(text, {9, width, std::nullopt}));
            for (const UserData &part : parts.parts) {
                Submit submit;
                submit.data_coding = data_coding_for(parts.alphabet);
                submit.user_data = part;
                EXPECT_EQ(must(decode_submit(must(encode(submit)))).user_data, part);
            }
        }
    }
}

TEST(Segment, AnAlphabetCanBeForced) {
    const SegmentOptions ucs2{0, ReferenceWidth::k8Bit, Alphabet::kUcs2};
    EXPECT_EQ(sizes_of("hello", ucs2), Sizes{10});
    const SegmentOptions gsm7{0, ReferenceWidth::k8Bit, Alphabet::kGsm7};
    EXPECT_EQ(segment("漢", gsm7).error().kind, ErrorKind::kNotEncodable);
    const SegmentOptions data{0, ReferenceWidth::k8Bit, Alphabet::kEightBit};
    EXPECT_EQ(segment("x", data).error().kind, ErrorKind::kUnsupported);
}

TEST(Segment, MoreThan255PartsAreAnError) {
    const SegmentedText longest = must(segment(repeated_text("x", 255 * 153)));
    EXPECT_EQ(longest.parts.size(), 255U);
    const auto too_long = segment(repeated_text("x", 255 * 153 + 1));
    ASSERT_FALSE(too_long);
    EXPECT_EQ(too_long.error().kind, ErrorKind::kTooLong);
    EXPECT_EQ(too_long.error().message, "text takes 256 messages but 255 parts are the most");
    // 67 surrogate halves do not go into a part: 66 do.
    EXPECT_EQ(must(segment(repeated_text("😀", 255 * 33))).parts.size(), 255U);
    EXPECT_FALSE(segment(repeated_text("😀", 255 * 33 + 1)));
}

TEST(Segment, RefusesIllFormedTextAndReferences) {
    EXPECT_EQ(segment("a\xFF").error().message, "text is not well-formed UTF-8 at byte 1");
    EXPECT_FALSE(segment(repeated_text("x", 161), {256, ReferenceWidth::k8Bit, std::nullopt}));
    EXPECT_TRUE(segment(repeated_text("x", 161), {256, ReferenceWidth::k16Bit, std::nullopt}));
}

} // namespace
