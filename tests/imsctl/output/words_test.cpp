// SPDX-License-Identifier: Apache-2.0
// Numbers, named values and suggestions.
#include "imsctl/client/call_values.hpp"
#include "imsctl/line/suggestions.hpp"
#include "imsctl/output/values.hpp"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace imsctl {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

TEST(ParseNumber, TakesWholeNumbersOf32Bits) {
    EXPECT_EQ(parse_number("0"), 0);
    EXPECT_EQ(parse_number("-17"), -17);
    EXPECT_EQ(parse_number("2147483647"), 2147483647);
    EXPECT_EQ(parse_number("-2147483648"), INT32_MIN);
}

TEST(ParseNumber, RefusesEverythingElse) {
    for (const char *text : {"", " 1", "1 ", "+1", "1.0", "0x1", "1e3", "one", "2147483648", "--1"})
        EXPECT_EQ(parse_number(text), std::nullopt) << text;
}

TEST(ParseValue, TakesNamesAndNumbers) {
    EXPECT_EQ(parse_value(kCallTypes, "video"), 1);
    EXPECT_EQ(parse_value(kCallTypes, "7"), 7);
    EXPECT_EQ(parse_value(kCallTypes, "Video"), std::nullopt);
    EXPECT_EQ(parse_value(kCallTypes, ""), std::nullopt);
}

TEST(NameOf, FallsBackToTheNumber) {
    EXPECT_EQ(name_of(kCallStates, 7), "held-by-peer");
    EXPECT_EQ(name_of(kCallStates, 77), "77");
    EXPECT_EQ(choices(kSwitch), "off, on or a number");
}

TEST(EditDistance, CountsSlips) {
    EXPECT_EQ(edit_distance("dial", "dial"), 0u);
    EXPECT_EQ(edit_distance("", "dial"), 4u);
    EXPECT_EQ(edit_distance("dail", "dial"), 1u); // swapped
    EXPECT_EQ(edit_distance("dal", "dial"), 1u);
    EXPECT_EQ(edit_distance("diall", "dial"), 1u);
    EXPECT_EQ(edit_distance("sial", "dial"), 1u);
    EXPECT_EQ(edit_distance("kitten", "sitting"), 3u);
}

TEST(Nearest, PutsTheNearestFirst) {
    const std::vector<std::string> verbs = {"hold", "held", "resume", "reject", "record"};
    EXPECT_THAT(nearest("hodl", verbs), ElementsAre("hold"));
    EXPECT_THAT(nearest("helld", verbs), ElementsAre("held"));
    EXPECT_THAT(nearest("re", verbs), ElementsAre("resume", "reject", "record"));
    EXPECT_THAT(nearest("xyzzy", verbs), IsEmpty());
}

TEST(Nearest, IsNothingToALongWord) {
    const std::vector<std::string> verbs = {"hold", "resume"};
    EXPECT_THAT(nearest("resumeresume", verbs), IsEmpty());
    EXPECT_THAT(nearest("resumeresumer", verbs), IsEmpty());
    EXPECT_THAT(nearest(std::string(300'000, 'r'), verbs), IsEmpty());
    EXPECT_THAT(nearest("resume", {}), IsEmpty());
}

TEST(DidYouMean, IsAQuestionOrNothing) {
    EXPECT_EQ(did_you_mean("dail", {"dial", "end"}), "; did you mean \"dial\"?");
    EXPECT_EQ(did_you_mean("en", {"end", "enter"}), "; did you mean \"end\" or \"enter\"?");
    EXPECT_EQ(did_you_mean("xyzzy", {"dial"}), "");
}

} // namespace
} // namespace imsctl
