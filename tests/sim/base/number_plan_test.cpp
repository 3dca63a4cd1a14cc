// SPDX-License-Identifier: Apache-2.0
#include "sim/base/number_plan.hpp"

#include "tests/sim/network.hpp"

namespace sim {
namespace {

using test::expect_refused;

TEST(Numbers, AreUnderstoodInEveryWayOfWriting) {
    for (const auto *text :
         {"+15550101", "tel:+15550101", "sip:+15550101@ims.example.org", "+1 (555) 01-01",
          "tel:+1-555-0101;phone-context=example.org", "sip:+15550101;user=phone@example.org"}) {
        const auto number = parse_number(text);
        ASSERT_TRUE(number) << text;
        EXPECT_EQ(*number, "+15550101") << text;
    }
    EXPECT_EQ(*parse_number("112"), "112");
}

TEST(Numbers, ThatMakeNoSenseAreRefusedWithTheReason) {
    const struct {
        const char *text;
        const char *reason;
    } rows[] = {
        {"", "no digits"},
        {"+", "no digits"},
        {"tel:", "no digits"},
        {"alice", "is no number"},
        {"555x1", "is no number"},
        {"55+5", "is no number"},
        {"sip:+1555", "lacks the host"},
        {"sip:+1555@", "lacks the host"},
        {"sip:alice@example.org", "is no number"},
        {"*100#", "SendUssd"},
        {"123456789012345678901", "20 are the most"},
    };
    for (const auto &row : rows)
        expect_refused(parse_number(row.text), Result::kInvalidArgument, row.reason);
}

TEST(Numbers, AreTheSameWithAndWithoutThePlus) {
    EXPECT_TRUE(same_number("+15550101", "15550101"));
    EXPECT_FALSE(same_number("+15550101", "+15550102"));
}

TEST(Numbers, OfTheEmergencyServiceAreNoOthers) {
    for (const auto *number : {"112", "911", "+112"})
        EXPECT_TRUE(is_emergency(number)) << number;
    for (const auto *number : {"1120", "11", "+1112", ""})
        EXPECT_FALSE(is_emergency(number)) << number;
}

TEST(NumberPlanTest, FindsTheSlotOfANumber) {
    const NumberPlan plan({"+15550100", "+447700900123"});
    EXPECT_EQ(plan.slot_of("447700900123"), 1);
    EXPECT_EQ(plan.slot_of("+15550101"), std::nullopt);
    EXPECT_EQ(NumberPlan::default_slot_number(0), "+15550100");
    EXPECT_EQ(NumberPlan::default_slot_number(12), "+15550112");
}

} // namespace
} // namespace sim
