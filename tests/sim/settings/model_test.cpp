// SPDX-License-Identifier: Apache-2.0
#include "sim/settings/entries.hpp"
#include "sim/settings/model.hpp"

#include "tests/sim/settings/samples.hpp"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace sim::test {
namespace {

using testing::HasSubstr;

constexpr auto kUpdate = &SettingsField::update;
constexpr auto kAdd = &SettingsField::add;

class SettingsModelTest : public testing::Test {
  protected:
    // The refusal has this code and says this; nothing has changed, nothing was kept.
    void expect_refused(const Status &status, Result code, const std::string &why) {
        ASSERT_FALSE(status) << why;
        EXPECT_EQ(status.code(), code) << status.refusal().reason;
        EXPECT_THAT(status.refusal().reason, HasSubstr(why));
        EXPECT_EQ(model_.of(0), before_);
        EXPECT_EQ(kept_, kept_before_);
    }
    void expect_done(const Status &status) {
        EXPECT_TRUE(status) << status.refusal().reason;
        before_ = model_.of(0);
        kept_before_ = kept_;
    }
    const SettingsRecord &set(const std::string &name) {
        const auto found = model_.find_set(0, name);
        EXPECT_TRUE(found) << found.refusal().reason;
        return **found;
    }

    SettingsModel model_{2};
    SlotSettings before_ = model_.of(0);
    int kept_ = 0;
    int kept_before_ = 0;

    void SetUp() override {
        model_.keep_with([this](int, const SlotSettings &) {
            ++kept_;
            return std::nullopt;
        });
    }
};

using Settings = SettingsModelTest;

TEST_F(Settings, OneSetAndTwoProfilesAreShipped) {
    ASSERT_EQ(model_.of(0).sets.size(), 1U);
    EXPECT_EQ(set("default"), global_settings_fields().shipped());
    ASSERT_EQ(model_.of(0).profiles.size(), 2U);
    EXPECT_EQ(model_.of(0).network_environment, 0);
    EXPECT_EQ(find_contradiction(model_.of(0)), std::nullopt);
    for (const auto &profile : model_.of(0).profiles)
        EXPECT_EQ(profile[profile_fields().place_of("globalSettings")],
                  SettingValue(std::string("default")));
}

TEST_F(Settings, EveryKeyIsUpdatedAlone) {
    const auto &fields = global_settings_fields();
    for (std::size_t place = 0; place < fields.size(); ++place) {
        const auto &field = fields[place];
        if (field.key == "name" || field.update == Form::kAbsent)
            continue;
        auto expected = set("default");
        expected[place] = sample_value(field, place);
        ASSERT_NE(expected, set("default")) << field.key;
        expect_done(model_.update_set(
            0, {{"name", std::string("default")}, entry_of(field, field.update, expected[place])}));
        ASSERT_EQ(set("default"), expected) << field.key;
    }
}

TEST_F(Settings, AWholeUpdateLeavesWhatItCannotBring) {
    const auto &fields = global_settings_fields();
    auto expected = sample_record(fields, "default");
    expect_done(model_.update_set(0, entries_of(fields, kUpdate, expected)));
    for (const auto *key : {"audio_port_end", "is_enable_srtp"})
        expected[fields.place_of(key)] = fields.shipped()[fields.place_of(key)];
    EXPECT_EQ(set("default"), expected);
    EXPECT_EQ(kept_, 1);
}

TEST_F(Settings, AWholeNewSet) {
    const auto &fields = global_settings_fields();
    auto expected = sample_record(fields, "other");
    expect_done(model_.add_set(0, entries_of(fields, kAdd, expected)));
    for (const auto *key : {"audio_port_end", "is_enable_srtp"})
        expected[fields.place_of(key)] = fields.shipped()[fields.place_of(key)];
    EXPECT_EQ(set("other"), expected);
    EXPECT_EQ(set("default"), fields.shipped());
    EXPECT_EQ(model_.of(1), SlotSettings::shipped());
}

TEST_F(Settings, ASetNeedsAName) {
    const OfferedEntries nameless{{"session_expire", 900}};
    const OfferedEntries empty{{"name", std::string()}, {"session_expire", 900}};
    expect_refused(model_.update_set(0, nameless), Result::kInvalidArgument, "\"name\" is missing");
    expect_refused(model_.add_set(0, nameless), Result::kInvalidArgument, "\"name\" is missing");
    expect_refused(model_.update_set(0, empty), Result::kInvalidArgument, "empty");
    expect_refused(model_.add_set(0, empty), Result::kInvalidArgument, "empty");
    expect_refused(model_.add_set(0, {}), Result::kInvalidArgument, "\"name\" is missing");
}

TEST_F(Settings, OnlySetsThatExistAreUpdatedAndDeleted) {
    expect_refused(model_.update_set(0, {{"name", std::string("other")}}), Result::kUnknownRecord,
                   "there is no settings set \"other\": the sets are \"default\"");
    expect_refused(model_.delete_set(0, "other"), Result::kUnknownRecord, "\"other\"");
    EXPECT_EQ(model_.find_set(0, "").code(), Result::kUnknownRecord);
    EXPECT_EQ(model_.find_set(0, "Default").code(), Result::kUnknownRecord);
    expect_done(model_.delete_set(0, "default"));
    EXPECT_THAT(model_.find_set(0, "default").refusal().reason, HasSubstr("the sets are none"));
    EXPECT_TRUE(model_.find_set(1, "default"));
}

TEST_F(Settings, OnlyNewNamesAreAdded) {
    expect_refused(model_.add_set(0, {{"name", std::string("default")}}), Result::kDuplicate,
                   "\"default\"");
}

TEST_F(Settings, EveryKeyRefusesOtherTypes) {
    const auto refuse_all = [&](const SettingsFields &fields, Form SettingsField::*direction,
                                const auto &offer) {
        for (const auto &field : fields) {
            const std::pair<Form, decltype(OfferedEntry::value)> offers[] = {
                {Form::kInt, 1},
                {Form::kFlag, true},
                {Form::kText, std::string("12")},
                {Form::kAbsent, ForeignValue{"u"}},
            };
            for (const auto &[form, value] : offers) {
                if (form == field.*direction && form != Form::kAbsent)
                    continue;
                OfferedEntries entries{{"name", std::string("default")}, {"id", 1}};
                std::erase_if(entries, [&](const auto &entry) { return entry.key == field.key; });
                entries.push_back({field.key, value});
                expect_refused(offer(entries), Result::kInvalidArgument, field.key);
            }
        }
    };
    refuse_all(global_settings_fields(), kUpdate,
               [&](const auto &entries) { return model_.update_set(0, entries); });
    refuse_all(global_settings_fields(), kAdd,
               [&](const auto &entries) { return model_.add_set(0, entries); });
    refuse_all(profile_fields(), kUpdate,
               [&](const auto &entries) { return model_.update_profile(0, entries); });
    refuse_all(profile_fields(), kAdd,
               [&](const auto &entries) { return model_.add_profile(0, entries); });
}

TEST_F(Settings, RefusalsSayWhatCameAndWhatShould) {
    const OfferedEntry name{"name", std::string("default")};
    expect_refused(model_.update_set(0, {name, {"session_expire", std::string("900")}}),
                   Result::kInvalidArgument, "session_expire is \"i\" here, and \"s\" came");
    expect_refused(model_.update_set(0, {name, {"session_expire", ForeignValue{"as"}}}),
                   Result::kInvalidArgument, "session_expire is \"i\" here, and \"as\" came");
    expect_refused(model_.update_set(0, {name, {"audio_port_end", 1}}), Result::kInvalidArgument,
                   "audio_port_end can only be read");
    expect_refused(model_.update_set(0, {name, {"nothing", 1}}), Result::kInvalidArgument,
                   "there is no key \"nothing\"");
    expect_refused(model_.update_set(0, {name, {"xdm_enable_MCPTT", 1}}), Result::kInvalidArgument,
                   "there is no key \"xdm_enable_MCPTT\"");
}

TEST_F(Settings, AMistakeAtTheEndUndoesTheRest) {
    auto entries = entries_of(global_settings_fields(), kUpdate,
                              sample_record(global_settings_fields(), "default"));
    entries.push_back({"nothing", 1});
    expect_refused(model_.update_set(0, entries), Result::kInvalidArgument, "\"nothing\"");
}

TEST_F(Settings, AKeyMayComeTwiceWithOneValue) {
    const OfferedEntry name{"name", std::string("default")};
    expect_done(
        model_.update_set(0, {name, {"audio_port_start", 6000}, {"audio_port_start", 6000}}));
    EXPECT_EQ(set("default")[global_settings_fields().place_of("audio_port_start")],
              SettingValue(6000));
    expect_refused(
        model_.update_set(0, {name, {"audio_port_start", 6000}, {"audio_port_start", 6002}}),
        Result::kInvalidArgument, "audio_port_start comes twice");
}

TEST_F(Settings, ANumberThatComesAsTextIsDecimal) {
    const OfferedEntry name{"name", std::string("other")};
    for (const auto *text : {"", " 1", "1 ", "+1", "0x1", "one", "2147483648", "1.0"})
        expect_refused(model_.add_set(0, {name, {"is_enable_emm_MCPTT", std::string(text)}}),
                       Result::kInvalidArgument, "is_enable_emm_MCPTT");
    expect_done(model_.add_set(0, {name, {"is_enable_emm_MCPTT", std::string("-2147483648")}}));
    EXPECT_EQ(set("other")[218], SettingValue(INT32_MIN));
}

TEST_F(Settings, ProfilesAreKnownByTheirId) {
    const auto &fields = profile_fields();
    auto wanted = sample_record(fields, "third");
    wanted[0] = 7;
    expect_done(model_.add_profile(0, entries_of(fields, kAdd, wanted)));
    ASSERT_EQ(model_.of(0).profiles.size(), 3U);
    EXPECT_EQ(model_.of(0).profiles[2], wanted);
    wanted = sample_record(fields, "renamed", 1);
    wanted[0] = 7;
    expect_done(model_.update_profile(0, entries_of(fields, kUpdate, wanted)));
    EXPECT_EQ(model_.of(0).profiles[2], wanted);
    expect_done(model_.delete_profile(0, 1));
    ASSERT_EQ(model_.of(0).profiles.size(), 2U);
    EXPECT_EQ(model_.of(0).profiles[1], wanted);
}

TEST_F(Settings, EveryKeyOfAProfileIsUpdatedAlone) {
    const auto &fields = profile_fields();
    const auto name = std::get<std::string>(fields.shipped()[fields.place_of("name")]);
    for (std::size_t place = 0; place < fields.size(); ++place) {
        const auto &field = fields[place];
        if (field.key == "name" || field.key == "id")
            continue;
        auto expected = model_.of(0).profiles[0];
        expected[place] = sample_value(field, place);
        expect_done(model_.update_profile(
            0, {{"id", 1}, {"name", name}, entry_of(field, field.update, expected[place])}));
        ASSERT_EQ(model_.of(0).profiles[0], expected) << field.key;
    }
}

TEST_F(Settings, WhatANewProfileLeavesOutIsBlank) {
    expect_done(model_.add_profile(0, {{"id", 3}, {"name", std::string("third")}}));
    auto expected = profile_fields().blank();
    expected[0] = 3;
    expected[profile_fields().place_of("name")] = std::string("third");
    EXPECT_EQ(model_.of(0).profiles[2], expected);
}

TEST_F(Settings, ProfilesNeedTheirOwnIdAndName) {
    const OfferedEntry id{"id", 3};
    const OfferedEntry name{"name", std::string("third")};
    const OfferedEntry taken{"name", std::string("Example laboratory")};
    for (const auto request : {&SettingsModel::add_profile, &SettingsModel::update_profile}) {
        expect_refused((model_.*request)(0, {name}), Result::kInvalidArgument, "\"id\" is missing");
        expect_refused((model_.*request)(0, {id}), Result::kInvalidArgument, "\"name\" is missing");
        expect_refused((model_.*request)(0, {id, {"name", std::string()}}),
                       Result::kInvalidArgument, "empty");
        expect_refused((model_.*request)(0, {id, name, {"nothing", 1}}), Result::kInvalidArgument,
                       "\"nothing\"");
    }
    expect_refused(model_.add_profile(0, {{"id", 2}, name}), Result::kDuplicate,
                   "there is a profile 2");
    expect_refused(model_.add_profile(0, {id, taken}), Result::kDuplicate, "profile 2 has");
    expect_refused(model_.update_profile(0, {{"id", 1}, taken}), Result::kDuplicate,
                   "profile 2 has");
    expect_refused(model_.update_profile(0, {id, name}), Result::kUnknownRecord,
                   "there is no profile 3: the profiles are 1, 2");
    expect_refused(model_.delete_profile(0, 3), Result::kUnknownRecord, "there is no profile 3");
    expect_done(model_.update_profile(0, {{"id", 2}, taken}));
}

TEST_F(Settings, TheNetworkEnvironmentHasFourValues) {
    for (const int type : {1, 2, 3, 0}) {
        expect_done(model_.set_network_environment(0, type));
        EXPECT_EQ(model_.of(0).network_environment, type);
    }
    expect_refused(model_.set_network_environment(0, -1), Result::kInvalidArgument, "not -1");
    expect_refused(model_.set_network_environment(0, 4), Result::kInvalidArgument, "0 to 3");
    EXPECT_EQ(model_.of(1).network_environment, 0);
}

TEST_F(Settings, WhatCannotBeKeptIsNotDone) {
    model_.keep_with([](int, const SlotSettings &) { return std::string("the disk is full"); });
    const OfferedEntry third{"name", std::string("third")};
    const char *why = "the disk is full";
    expect_refused(model_.update_set(0, {{"name", std::string("default")}, {"id", 5}}),
                   Result::kFailed, why);
    expect_refused(model_.add_set(0, {third}), Result::kFailed, why);
    expect_refused(model_.delete_set(0, "default"), Result::kFailed, why);
    expect_refused(model_.add_profile(0, {{"id", 3}, third}), Result::kFailed, why);
    expect_refused(model_.update_profile(0, {{"id", 1}, third}), Result::kFailed, why);
    expect_refused(model_.delete_profile(0, 1), Result::kFailed, why);
    expect_refused(model_.set_network_environment(0, 1), Result::kFailed, why);
}

TEST_F(Settings, WhatIsKeptIsWhatBecomesTrue) {
    std::vector<std::pair<int, SlotSettings>> kept;
    model_.keep_with([&](int slot, const SlotSettings &settings) {
        kept.emplace_back(slot, settings);
        return std::nullopt;
    });
    expect_done(model_.set_network_environment(1, 2));
    ASSERT_EQ(kept.size(), 1U);
    EXPECT_EQ(kept[0].first, 1);
    EXPECT_EQ(kept[0].second, model_.of(1));
}

} // namespace
} // namespace sim::test
