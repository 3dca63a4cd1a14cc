// SPDX-License-Identifier: Apache-2.0
#include "sim/bus/applications.hpp"

#include <gtest/gtest.h>

namespace sim {
namespace {

TEST(Applications, IdsCountFromOneOverAllSlotsAndAreNotGivenTwice) {
    Applications applications;
    EXPECT_EQ(applications.add(0, ":1.1", "a"), 1);
    EXPECT_EQ(applications.add(1, ":1.1", "a"), 2);
    EXPECT_EQ(applications.add(0, ":1.2", "b"), 3);
    EXPECT_EQ(applications.forget(":1.2"), 1U);
    EXPECT_EQ(applications.add(0, ":1.3", "c"), 4);
}

TEST(Applications, AnIdBelongsToItsSlot) {
    Applications applications;
    const int id = applications.add(1, ":1.1", "a");
    EXPECT_TRUE(applications.known(1, id));
    EXPECT_FALSE(applications.known(0, id));
    EXPECT_FALSE(applications.known(1, id + 1));
}

TEST(Applications, TheLatestOfAConnectionOnASlot) {
    Applications applications;
    EXPECT_EQ(applications.latest(0, ":1.1"), std::nullopt);
    applications.add(0, ":1.1", "a");
    const int second = applications.add(0, ":1.1", "b");
    applications.add(1, ":1.1", "c");
    applications.add(0, ":1.2", "d");
    EXPECT_EQ(applications.latest(0, ":1.1"), second);
    EXPECT_EQ(applications.name_of(":1.1"), "c");
    EXPECT_EQ(applications.name_of(":1.9"), "");
}

TEST(Applications, AConnectionThatGoesTakesAllItsOwn) {
    Applications applications;
    applications.add(0, ":1.1", "a");
    applications.add(1, ":1.1", "a");
    const int other = applications.add(0, ":1.2", "b");
    EXPECT_EQ(applications.forget(":1.1"), 2U);
    EXPECT_EQ(applications.forget(":1.1"), 0U);
    EXPECT_FALSE(applications.known(0, 1));
    EXPECT_FALSE(applications.known(1, 2));
    EXPECT_TRUE(applications.known(0, other));
}

} // namespace
} // namespace sim
