// SPDX-License-Identifier: Apache-2.0
#include "imsctl/settings/profile_choice.hpp"

#include "imsctl/output/failure.hpp"

#include <gtest/gtest.h>
#include <vector>

namespace imsctl {
namespace {

std::string profile_refusal(const std::string &text, std::size_t count) {
    std::vector<ProfileRecord> profiles(count);
    for (std::size_t i = 0; i < count; ++i)
        profiles[i].id = static_cast<std::int32_t>(i / 2);
    try {
        return "chose " + std::to_string(ProfileChoice(text).among(profiles).id);
    } catch (const Failure &failure) {
        EXPECT_EQ(failure.kind, FailureKind::kProfile);
        return failure.what();
    }
}

TEST(ProfileChoice, IsAnIdOrAName) {
    char name[] = "home";
    std::vector<ProfileRecord> profiles(2);
    profiles[0].id = 7;
    profiles[1].name = name;
    EXPECT_EQ(&ProfileChoice("7").among(profiles), &profiles[0]);
    EXPECT_EQ(&ProfileChoice("home").among(profiles), &profiles[1]);
}

TEST(ProfileChoice, SaysWhyNoneIsChosen) {
    EXPECT_EQ(profile_refusal("99", 63), "there is no profile \"99\"");
    EXPECT_EQ(profile_refusal("0", 63), "there is more than one profile \"0\"");
}

// The library keeps 64 profiles: what comes after them may well exist.
TEST(ProfileChoice, SaysThatAFullListMayHideOne) {
    EXPECT_EQ(profile_refusal("99", 64),
              "there is no profile \"99\"; only the first 64 can be seen");
    EXPECT_EQ(profile_refusal("home", 64),
              "there is no profile \"home\"; only the first 64 can be seen");
    EXPECT_EQ(profile_refusal("0", 64), "there is more than one profile \"0\"");
}

} // namespace
} // namespace imsctl
