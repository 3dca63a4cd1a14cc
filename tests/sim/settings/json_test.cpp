// SPDX-License-Identifier: Apache-2.0
#include "sim/settings/json.hpp"

#include "tests/sim/settings/samples.hpp"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

namespace sim::test {
namespace {

using nlohmann::ordered_json;
using testing::HasSubstr;

SlotSettings sample_settings() {
    auto settings = SlotSettings::shipped();
    settings.network_environment = 3;
    settings.sets.push_back(sample_record(global_settings_fields(), "other"));
    auto profile = sample_record(profile_fields(), "third");
    profile[0] = INT32_MIN;
    settings.profiles.push_back(profile);
    return settings;
}

TEST(SettingsJson, EverythingComesBack) {
    for (const auto &settings : {SlotSettings::shipped(), sample_settings(), SlotSettings{}}) {
        const auto restored = from_json(to_json(settings));
        ASSERT_TRUE(restored) << restored.refusal().reason;
        EXPECT_EQ(*restored, settings);
    }
}

TEST(SettingsJson, KeysStandInWireOrder) {
    const auto whole = ordered_json::parse(to_json(SlotSettings::shipped()));
    std::size_t place = 0;
    for (const auto &[key, value] : whole["global_settings"][0].items())
        EXPECT_EQ(key, global_settings_fields()[place++].key);
    EXPECT_EQ(place, 334U);
}

TEST(SettingsJson, NoPartOfAFileIsAFile) {
    const auto text = to_json(SlotSettings::shipped());
    // The last two characters are the closing brace and the line end.
    for (std::size_t length = 0; length + 2 <= text.size(); length += 97)
        EXPECT_FALSE(from_json(text.substr(0, length))) << length;
    EXPECT_FALSE(from_json(text.substr(0, text.size() - 2)));
    EXPECT_FALSE(from_json(text + "{}"));
}

TEST(SettingsJson, ForeignAndDamagedFilesAreRefusedWithTheReason) {
    struct Damage {
        const char *pointer;
        ordered_json value; // null takes the member away
        const char *why;
    };
    const Damage damages[] = {
        {"/format", "something else", "no file of ims-sim's settings"},
        {"/format", nullptr, "no file of ims-sim's settings"},
        {"/version", 2, "version is not 1"},
        {"/version", nullptr, "\"version\" is missing"},
        {"/extra", 1, "more than settings"},
        {"/network_environment", "1", "\"network_environment\" is no 32-bit number"},
        {"/network_environment", 9, "no network environment 9"},
        {"/network_environment", nullptr, "\"network_environment\" is missing"},
        {"/global_settings", 1, "\"global_settings\" is no list"},
        {"/profiles", nullptr, "\"profiles\" is missing"},
        {"/profiles/0", 1, "no object"},
        {"/global_settings/0/apn_selection", nullptr, "the key \"apn_selection\" is missing"},
        {"/global_settings/0/nothing", 1, "no key \"nothing\""},
        {"/global_settings/0/id", "1", "\"id\" is no 32-bit number"},
        {"/global_settings/0/id", 2147483648U, "\"id\" is no 32-bit number"},
        {"/global_settings/0/id", -2147483649L, "\"id\" is no 32-bit number"},
        {"/global_settings/0/id", 18446744073709551615UL, "\"id\" is no 32-bit number"},
        {"/global_settings/0/id", 1.5, "\"id\" is no 32-bit number"},
        {"/global_settings/0/is_rcs_enabled", 1, "\"is_rcs_enabled\" is neither true nor false"},
        {"/global_settings/0/network", 1, "\"network\" is no text"},
        {"/global_settings/0/network", std::string("a\0b", 3), "\"network\" holds a NUL"},
        {"/global_settings/0/name", "", "no name"},
        {"/profiles/0/name", "Example laboratory", "two have the same"},
        {"/profiles/0/id", 2, "two profiles have the id 2"},
    };
    for (const auto &damage : damages) {
        auto whole = ordered_json::parse(to_json(SlotSettings::shipped()));
        const ordered_json::json_pointer pointer(damage.pointer);
        if (damage.value.is_null())
            whole[pointer.parent_pointer()].erase(pointer.back());
        else
            whole[pointer] = damage.value;
        const auto settings = from_json(whole.dump());
        ASSERT_FALSE(settings) << damage.pointer;
        EXPECT_THAT(settings.refusal().reason, HasSubstr(damage.why)) << damage.pointer;
    }
    for (const auto *text :
         {"", "[]", "null", "42", "{}", "\xff", "{\"format\": \"ims-sim settings\"}"})
        EXPECT_FALSE(from_json(text)) << text;
    EXPECT_THAT(from_json("{\n\"format\": ,").refusal().reason, HasSubstr("line 2"));
}

} // namespace
} // namespace sim::test
