// SPDX-License-Identifier: Apache-2.0
#include "sim/bus/wire.hpp"

#include "sim/bus/form.hpp"
#include "sim/call/values.hpp"

#include <gtest/gtest.h>

namespace sim {
namespace {

TEST(Wire, PacksAndTakesMembersInOrder) {
    const auto tuple = wire::pack(std::int32_t{-3}, std::string("text"), true, std::uint8_t{7},
                                  std::uint32_t{9}, CallType::kVideo);
    EXPECT_EQ(tuple.print(), "(-3, 'text', true, 0x07, 9, 1)");
    wire::Arguments arguments(tuple.get());
    EXPECT_EQ(arguments.take<std::int32_t>(), -3);
    EXPECT_EQ(arguments.take<std::string>(), "text");
    EXPECT_TRUE(arguments.take<bool>());
    EXPECT_EQ(arguments.take<std::uint8_t>(), 7);
}

TEST(Wire, AVariantOfTextsMayHoldSomethingElse) {
    const auto texts = wire::pack(std::vector<std::string>{"a", "b"});
    EXPECT_EQ(wire::Arguments(texts.get()).take<wire::Texts>(),
              (std::vector<std::string>{"a", "b"}));
    const auto numbers = wire::pack(std::vector<std::int32_t>{1, 2});
    EXPECT_EQ(wire::Arguments(numbers.get()).take<wire::Texts>(), std::nullopt);
}

TEST(Wire, Base64IsStrict) {
    EXPECT_EQ(wire::decode_base64("aGVsbG8="), "hello");
    EXPECT_EQ(wire::decode_base64("aGk="), "hi");
    EXPECT_EQ(wire::decode_base64("YQ=="), "a");
    EXPECT_EQ(wire::decode_base64(""), "");
    for (const auto *bad : {"aGVsbG8", "a", "====", "YQ=a", "Y===", "aGV sbG8=", "aGVs\n", "YQ-_"})
        EXPECT_EQ(wire::decode_base64(bad), std::nullopt) << bad;
    const std::string bytes("\0\xff\x80zero", 7);
    EXPECT_EQ(wire::decode_base64(wire::encode_base64(bytes)), bytes);
}

TEST(Wire, ARefusalHasTheTypeOfTheReplyAndNothingButTheResult) {
    EXPECT_EQ(wire::refusal("(i)", 0, Result::kWrongState).print(), "(13,)");
    EXPECT_EQ(wire::refusal("(iis)", 0, Result::kWrongState).print(), "(13, 0, '')");
    const auto list = wire::refusal("(iuaa{sv})", 0, Result::kUnknownApplication);
    EXPECT_STREQ(g_variant_get_type_string(list.get()), "(iuaa{sv})");
    EXPECT_EQ(list.print(), "(11, 0, [])");
    EXPECT_EQ(wire::refusal("(bui)", 2, Result::kFailed).print(), "(false, 0, 17)");
}

} // namespace
} // namespace sim
