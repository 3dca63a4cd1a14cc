// SPDX-License-Identifier: Apache-2.0
#include "sim/base/store.hpp"
#include "sim/settings/json.hpp"
#include "sim/settings/store.hpp"

#include "tests/sim/settings/directory.hpp"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/stat.h>

namespace sim::test {
namespace {

namespace fs = std::filesystem;
using testing::HasSubstr;

class SettingsStore : public testing::Test {
  protected:
    std::shared_ptr<Store> open() {
        const auto opened = Store::open(directory_.path());
        EXPECT_TRUE(opened) << opened.refusal().reason;
        return opened ? *opened : nullptr;
    }

    TemporaryDirectory directory_;
};

TEST_F(SettingsStore, AFileIsReplacedWhole) {
    const auto store = open();
    const auto missing = store->read("a");
    ASSERT_TRUE(missing);
    EXPECT_EQ(*missing, std::nullopt);
    for (const auto &content : {std::string(100000, 'x'), std::string("short"), std::string()}) {
        ASSERT_TRUE(store->write("a", content));
        EXPECT_EQ(**store->read("a"), content);
        EXPECT_EQ(content_of(directory_.file("a")), content);
    }
    EXPECT_EQ(std::distance(fs::directory_iterator(directory_.path()), {}), 1);
}

TEST_F(SettingsStore, FilesAreForTheirOwnerAlone) {
    ASSERT_TRUE(open()->write("a", "secret"));
    struct stat status {};
    ASSERT_EQ(stat(directory_.file("a").c_str(), &status), 0);
    EXPECT_EQ(status.st_mode & 07777, 0600U);
}

TEST_F(SettingsStore, ADirectoryBelongsToOneAtATime) {
    auto first = open();
    const auto second = Store::open(directory_.path());
    ASSERT_FALSE(second);
    EXPECT_THAT(second.refusal().reason, HasSubstr("another ims-sim"));
    first.reset();
    EXPECT_TRUE(Store::open(directory_.path()));
}

TEST_F(SettingsStore, ADirectoryIsMadeWithItsParents) {
    const auto path = directory_.file("one/two");
    ASSERT_TRUE(Store::open(path));
    EXPECT_TRUE(fs::is_directory(path));
}

TEST_F(SettingsStore, WhatIsNoDirectoryIsRefused) {
    put_content(directory_.file("file"), "x");
    EXPECT_THAT(Store::open(directory_.file("file")).refusal().reason, HasSubstr("file"));
    EXPECT_FALSE(Store::open(directory_.file("file/below")));
}

TEST_F(SettingsStore, WhatAKilledProcessLeftIsNotInTheWay) {
    put_content(directory_.file("a"), "old");
    put_content(directory_.file("a.new"), "half of somethi");
    const auto store = open();
    EXPECT_EQ(**store->read("a"), "old");
    ASSERT_TRUE(store->write("a", "new"));
    EXPECT_EQ(content_of(directory_.file("a")), "new");
    EXPECT_FALSE(fs::exists(directory_.file("a.new")));
}

TEST_F(SettingsStore, AWriteThatFailsChangesNothing) {
    const auto store = open();
    // Neither can be replaced by a file.
    fs::create_directory(directory_.file("a"));
    const auto replaced = store->write("a", "x");
    ASSERT_FALSE(replaced);
    EXPECT_THAT(replaced.refusal().reason, HasSubstr("cannot replace"));
    EXPECT_FALSE(fs::exists(directory_.file("a.new")));
    EXPECT_THAT(store->read("a").refusal().reason, HasSubstr("is no file"));
    fs::create_directory(directory_.file("b.new"));
    const auto made = store->write("b", "x");
    ASSERT_FALSE(made);
    EXPECT_THAT(made.refusal().reason, HasSubstr("cannot make"));
}

TEST_F(SettingsStore, EachSlotFindsItsOwnAgain) {
    SlotSettings expected[2];
    {
        SettingsModel model(2);
        ASSERT_EQ(keep_settings(open(), model), std::nullopt);
        EXPECT_TRUE(fs::is_empty(directory_.path()));
        EXPECT_TRUE(model.set_network_environment(0, 2));
        EXPECT_TRUE(model.delete_profile(0, 2));
        EXPECT_TRUE(model.add_set(1, {{"name", std::string("other")}}));
        expected[0] = model.of(0);
        expected[1] = model.of(1);
    }
    SettingsModel model(3);
    ASSERT_EQ(keep_settings(open(), model), std::nullopt);
    EXPECT_EQ(model.of(0), expected[0]);
    EXPECT_EQ(model.of(1), expected[1]);
    EXPECT_EQ(model.of(2), SlotSettings::shipped());
}

TEST_F(SettingsStore, ADamagedFileIsNamedAndKept) {
    const auto path = directory_.file("sub1.json");
    const auto half = to_json(SlotSettings::shipped()).substr(0, 1000);
    put_content(path, half);
    SettingsModel model(2);
    const auto error = keep_settings(open(), model);
    ASSERT_TRUE(error);
    EXPECT_THAT(*error, HasSubstr(path));
    EXPECT_EQ(content_of(path), half);
}

} // namespace
} // namespace sim::test
