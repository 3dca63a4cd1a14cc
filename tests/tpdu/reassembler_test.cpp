// SPDX-License-Identifier: Apache-2.0
#include "tests/tpdu/support.hpp"

#include "tpdu/concatenation.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <vector>

namespace {

using namespace tpdu;
using tpdu_test::hex;
using tpdu_test::must;

const Address kAlice{TypeOfNumber::kInternational, NumberingPlan::kIsdn, "15550100"};
const Address kBob{TypeOfNumber::kInternational, NumberingPlan::kIsdn, "15550101"};

UserData part_of(const Concatenation &concatenation, std::string_view text) {
    UserData user_data = must(encode_text(text, Alphabet::kGsm7));
    user_data.header = UserDataHeader{{must(concatenation_element(concatenation))}};
    return user_data;
}

UserData part(std::uint16_t reference, std::uint8_t total, std::uint8_t number,
              std::string_view text) {
    return part_of({reference, ReferenceWidth::k8Bit, total, number}, text);
}

TEST(Reassembler, AMessageWithoutPartsIsCompleteAtOnce) {
    Reassembler reassembler;
    Deliver deliver;
    deliver.originator = kAlice;
    deliver.user_data = must(encode_text("hello", Alphabet::kGsm7));
    const auto message = reassembler.add(deliver);
    ASSERT_TRUE(message);
    EXPECT_EQ(message->sender, kAlice);
    EXPECT_EQ(must(message->text()), "hello");
    EXPECT_EQ(reassembler.pending(), 0U);
}

TEST(Reassembler, OtherElementsDoNotMakeItAPart) {
    Reassembler reassembler;
    UserData user_data = must(encode_text("hello", Alphabet::kGsm7));
    user_data.header = UserDataHeader{{{0x70, hex("01")}, {0x00, hex("070304")}}};
    const auto message = reassembler.add(kAlice, 0x00, user_data);
    ASSERT_TRUE(message);
    EXPECT_EQ(must(message->text()), "hello");
}

TEST(Reassembler, ATotalOfOneIsCompleteAtOnce) {
    Reassembler reassembler;
    EXPECT_EQ(must(reassembler.add(kAlice, 0x00, part(7, 1, 1, "alone"))->text()), "alone");
    EXPECT_EQ(reassembler.pending(), 0U);
}

TEST(Reassembler, AnyOrder) {
    std::vector<std::uint8_t> order = {1, 2, 3, 4};
    const std::vector<std::string> texts = {"one ", "two ", "three ", "four"};
    do {
        Reassembler reassembler;
        for (std::size_t i = 0; i < order.size(); ++i) {
            const auto message =
                reassembler.add(kAlice, 0x00, part(7, 4, order[i], texts[order[i] - 1U]));
            ASSERT_EQ(message.has_value(), i + 1 == order.size());
            if (message) {
                EXPECT_EQ(must(message->text()), "one two three four");
                EXPECT_EQ(message->parts.size(), 4U);
            }
        }
        EXPECT_EQ(reassembler.pending(), 0U);
    } while (std::next_permutation(order.begin(), order.end()));
}

TEST(Reassembler, ARepeatedPartIsIgnored) {
    Reassembler reassembler;
    EXPECT_FALSE(reassembler.add(kAlice, 0x00, part(7, 2, 1, "first ")));
    EXPECT_FALSE(reassembler.add(kAlice, 0x00, part(7, 2, 1, "again ")));
    EXPECT_EQ(reassembler.pending(), 1U);
    EXPECT_EQ(must(reassembler.add(kAlice, 0x00, part(7, 2, 2, "second"))->text()), "first second");
}

TEST(Reassembler, KeepsSendersReferencesTotalsAndWidthsApart) {
    Reassembler reassembler;
    EXPECT_FALSE(reassembler.add(kAlice, 0x00, part(7, 2, 1, "a")));
    EXPECT_FALSE(reassembler.add(kBob, 0x00, part(7, 2, 2, "b")));
    EXPECT_FALSE(reassembler.add(kAlice, 0x00, part(8, 2, 2, "c")));
    EXPECT_FALSE(reassembler.add(kAlice, 0x00, part(7, 3, 2, "d")));
    EXPECT_FALSE(reassembler.add(kAlice, 0x00, part_of({7, ReferenceWidth::k16Bit, 2, 2}, "e")));
    EXPECT_EQ(reassembler.pending(), 5U);
    EXPECT_EQ(must(reassembler.add(kAlice, 0x00, part(7, 2, 2, "z"))->text()), "az");
    EXPECT_EQ(reassembler.pending(), 4U);
}

TEST(Reassembler, AReferenceCanBeUsedAgainOnceComplete) {
    Reassembler reassembler;
    EXPECT_FALSE(reassembler.add(kAlice, 0x00, part(7, 2, 1, "a")));
    EXPECT_TRUE(reassembler.add(kAlice, 0x00, part(7, 2, 2, "b")));
    EXPECT_FALSE(reassembler.add(kAlice, 0x00, part(7, 2, 2, "d")));
    EXPECT_EQ(must(reassembler.add(kAlice, 0x00, part(7, 2, 1, "c"))->text()), "cd");
}

TEST(Reassembler, TheOldestIncompleteMessageIsDroppedBeyondTheLimit) {
    Reassembler reassembler(2);
    EXPECT_FALSE(reassembler.add(kAlice, 0x00, part(1, 2, 1, "1")));
    EXPECT_FALSE(reassembler.add(kAlice, 0x00, part(2, 3, 1, "2")));
    // A further part does not make the first one younger.
    EXPECT_FALSE(reassembler.add(kAlice, 0x00, part(2, 3, 2, "2")));
    EXPECT_FALSE(reassembler.add(kAlice, 0x00, part(3, 2, 1, "3")));
    EXPECT_EQ(reassembler.pending(), 2U);
    EXPECT_EQ(must(reassembler.add(kAlice, 0x00, part(2, 3, 3, "2"))->text()), "222");
    EXPECT_EQ(must(reassembler.add(kAlice, 0x00, part(3, 2, 2, "3"))->text()), "33");
    // The first part of message 1 is gone, so its second one starts anew.
    EXPECT_FALSE(reassembler.add(kAlice, 0x00, part(1, 2, 2, "1")));
    EXPECT_EQ(reassembler.pending(), 1U);
}

TEST(Reassembler, ALimitOfZeroKeepsNothing) {
    Reassembler reassembler(0);
    EXPECT_FALSE(reassembler.add(kAlice, 0x00, part(1, 2, 1, "a")));
    EXPECT_EQ(reassembler.pending(), 0U);
    EXPECT_TRUE(reassembler.add(kAlice, 0x00, part(1, 1, 1, "a")));
}

TEST(Reassembler, NeverHoldsMoreThanTheLimit) {
    Reassembler reassembler(16);
    tpdu_test::Random random(23040);
    for (int i = 0; i < 5000; ++i) {
        const auto total = static_cast<std::uint8_t>(1 + random.below(255));
        const auto number = static_cast<std::uint8_t>(1 + random.below(total));
        reassembler.add(random.coin() ? kAlice : kBob, random.octet(),
                        part(static_cast<std::uint16_t>(random.below(256)), total, number, "x"));
        ASSERT_LE(reassembler.pending(), 16U);
    }
}

TEST(Reassembler, ACharacterSplitBySomebodyElseIsWholeAgain) {
    const auto reassembled = [](std::uint8_t data_coding, const Octets &first,
                                const Octets &second) {
        Reassembler reassembler;
        UserData user_data = part(7, 2, 1, "");
        user_data.body = first;
        EXPECT_FALSE(reassembler.add(kAlice, data_coding, user_data));
        user_data = part(7, 2, 2, "");
        user_data.body = second;
        return must(reassembler.add(kAlice, data_coding, user_data)->text());
    };
    EXPECT_EQ(reassembled(0x00, {'5', 0x1B}, {0x65, '!'}), "5€!");
    EXPECT_EQ(reassembled(0x08, hex("0041 D83D"), hex("DE00 0042")), "A😀B");
    EXPECT_EQ(reassembled(0x08, hex("0041 D8"), hex("3D DE00 0042")), "A😀B");
}

TEST(Reassembler, PartsOfDifferentAlphabets) {
    Reassembler reassembler;
    EXPECT_FALSE(reassembler.add(kAlice, 0x00, part(7, 3, 1, "one ")));
    UserData ucs2 = part(7, 3, 2, "");
    ucs2.body = must(ucs2_encode("二 "));
    EXPECT_FALSE(reassembler.add(kAlice, 0x08, ucs2));
    // Another coding octet of the same alphabet.
    EXPECT_EQ(must(reassembler.add(kAlice, 0x11, part(7, 3, 3, "three"))->text()), "one 二 three");
}

TEST(Reassembler, DataIsCompleteButNoText) {
    Reassembler reassembler;
    UserData data = part(7, 2, 1, "");
    data.body = hex("CA");
    EXPECT_FALSE(reassembler.add(kAlice, 0x04, data));
    data = part(7, 2, 2, "");
    data.body = hex("FE");
    const auto message = reassembler.add(kAlice, 0x04, data);
    ASSERT_TRUE(message);
    EXPECT_EQ(message->text().error().kind, ErrorKind::kUnsupported);
    EXPECT_EQ(message->parts,
              (std::vector<CompleteMessage::Part>{{0x04, hex("CA")}, {0x04, hex("FE")}}));
}

TEST(Reassembler, CompressedPartsAreNotTakenForText) {
    Reassembler reassembler;
    EXPECT_FALSE(reassembler.add(kAlice, 0x00, part(7, 2, 1, "a")));
    const auto message = reassembler.add(kAlice, 0x20, part(7, 2, 2, "b"));
    ASSERT_TRUE(message);
    EXPECT_EQ(message->text().error().message, "TP-UD holds compressed text");
}

} // namespace
