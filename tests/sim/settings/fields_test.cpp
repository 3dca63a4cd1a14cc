// SPDX-License-Identifier: Apache-2.0
#include "sim/settings/fields.hpp"

#include <algorithm>
#include <gtest/gtest.h>
#include <set>

namespace sim {
namespace {

std::string forms(const SettingsField &field) {
    return {static_cast<char>(field.get), static_cast<char>(field.update),
            static_cast<char>(field.add)};
}

template <typename T>
auto count_of(const SettingsFields &fields) {
    return std::ranges::count_if(
        fields, [](const auto &field) { return std::holds_alternative<T>(field.value); });
}

auto count_of(Form SettingsField::*direction, Form form) {
    return std::ranges::count(global_settings_fields(), form, direction);
}

std::set<std::string> keys_of(const SettingsFields &fields) {
    std::set<std::string> keys;
    for (const auto &field : fields)
        keys.insert(field.key);
    return keys;
}

TEST(SettingsFields, ASetHasItsKeysOnceEach) {
    const auto &fields = global_settings_fields();
    EXPECT_EQ(fields.size(), 334U);
    EXPECT_EQ(keys_of(fields).size(), 334U);
    EXPECT_EQ(count_of<std::int32_t>(fields), 163);
    EXPECT_EQ(count_of<std::string>(fields), 158);
    EXPECT_EQ(count_of<bool>(fields), 13);
}

TEST(SettingsFields, AProfileHasItsKeysOnceEach) {
    const auto &fields = profile_fields();
    EXPECT_EQ(fields.size(), 51U);
    EXPECT_EQ(keys_of(fields).size(), 51U);
    EXPECT_EQ(count_of<std::int32_t>(fields), 27);
    EXPECT_EQ(count_of<std::string>(fields), 20);
    EXPECT_EQ(count_of<bool>(fields), 4);
    for (const auto &field : fields)
        EXPECT_TRUE(field.get == field.update && field.get == field.add) << field.key;
}

TEST(SettingsFields, TheGroupsStandWhereTheyBelong) {
    struct Place {
        std::size_t position;
        const char *key;
    };
    constexpr Place kPlaces[] = {
        {1, "id"},
        {33, "subscribe_max_entry"},
        {34, "xdm_enable"},
        {47, "enable_gba"},
        {48, "conf_uri"},
        {71, "smsc_psi"},
        {72, "rtp_timeout"},
        {74, "enable_cp_autio_path"},
        {88, "audio_port_end"},
        {97, "is_enable_srtp"},
        {120, "rtp_keep_alive"},
        {121, "rtp_timeout_B2BPTT"},
        {169, "rtp_keep_alive_B2BPTT"},
        {170, "xdm_enable_b2ptt"},
        {183, "enable_gba_b2ptt"},
        {184, "xdm_enable_mcptt"},
        {197, "enable_gba_mcptt"},
        {198, "rtp_timeout_MCPTT"},
        {219, "is_enable_emm_MCPTT"},
        {246, "rtp_keep_alive_MCPTT"},
        {247, "support_ims_in_roaming"},
        {331, "poc_session_expire"},
        {334, "conference_factory_uri"},
    };
    for (const auto &place : kPlaces) {
        EXPECT_EQ(global_settings_fields()[place.position - 1].key, place.key);
        EXPECT_EQ(global_settings_fields().find(place.key), place.position - 1);
    }
    EXPECT_EQ(profile_fields()[32].key, "timer1");
    EXPECT_EQ(profile_fields()[34].key, "timer4");
    EXPECT_EQ(profile_fields()[50].key, "network_environment_type");
}

TEST(SettingsFields, KeysAreFoundByTheirExactLetters) {
    for (const auto *key : {"", "Id", "rtp_timeout_mcptt", "xdm_enable_MCPTT", "xdm_enable_b2bptt",
                            "enable_cp_audio_path", "timer1"})
        EXPECT_EQ(global_settings_fields().find(key), std::nullopt) << key;
    EXPECT_EQ(profile_fields().find("timer3"), std::nullopt);
}

TEST(SettingsFields, SixKeysDifferByDirection) {
    std::set<std::string> different;
    for (const auto &field : global_settings_fields())
        if (field.get != field.update || field.get != field.add)
            different.insert(field.key + " " + forms(field));
    EXPECT_EQ(different,
              (std::set<std::string>{"audio_port_end i--", "is_enable_srtp i--",
                                     "is_enable_emm_MCPTT iis", "poc_session_expire sii",
                                     "poc_ringing_timer sii", "poc_invite_timeout sii"}));
    EXPECT_EQ(count_of(&SettingsField::update, Form::kInt), 161);
    EXPECT_EQ(count_of(&SettingsField::add, Form::kText), 159);
    EXPECT_EQ(count_of(&SettingsField::get, Form::kText), 161);
}

TEST(SettingsFields, ABlankRecordHoldsNothing) {
    const auto blank = global_settings_fields().blank();
    for (std::size_t place = 0; place < blank.size(); ++place) {
        EXPECT_EQ(blank[place].index(), global_settings_fields()[place].value.index());
        EXPECT_TRUE(blank[place] == SettingValue(0) || blank[place] == SettingValue(false) ||
                    blank[place] == SettingValue(std::string()));
    }
}

} // namespace
} // namespace sim
