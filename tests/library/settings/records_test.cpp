// SPDX-License-Identifier: Apache-2.0
// The settings and profile records against their dictionaries.
#include "tests/library/settings/sample.hpp"
#include "tests/support/expectations.hpp"
#include "tests/support/with_peer.hpp"

#include <cstdlib>
#include <cstring>
#include <map>

namespace test {
namespace {

constexpr const char *kGetSettings = "org.kelvo.ims.Settings.GetGlobalSettings";
constexpr const char *kGetProfiles = "org.kelvo.ims.Settings.GetProfileList";
constexpr const char *kGetEnvironment = "org.kelvo.ims.Settings.GetNetworkEnvironment";
constexpr int kWarningPriority = 5;

// The reply "(ia{sv})" with the entries that are given.
class SetReply {
  public:
    SetReply() { g_variant_builder_init(&entries_, G_VARIANT_TYPE_VARDICT); }
    SetReply &add(const char *key, GVariant *value) {
        g_variant_builder_add(&entries_, "{sv}", key, value);
        return *this;
    }
    Answer finish(int result = 0) {
        return reply_with(g_variant_new("(i@a{sv})", result, g_variant_builder_end(&entries_)));
    }

  private:
    GVariantBuilder entries_;
};

class SettingsRecord : public WithPeer {
  protected:
    // Padding included: some tests look at every byte.
    SettingsRecord() { std::memset(&set_, 0, sizeof set_); }
    void TearDown() override {
        ims_global_settings_clear(&set_);
        WithPeer::TearDown();
    }
    int get(Answer answer) {
        peer().on(kGetSettings, std::move(answer));
        return ims_get_global_settings_info(handle_, "a set", &set_);
    }
    std::string image() const { return {reinterpret_cast<const char *>(&set_), sizeof set_}; }

    ims_global_settings_s set_;
};

// Whether a record holds what the service sends for one key.
void expect_value(void *record, const KeyRow &row, std::size_t position) {
    switch (row.type) {
    case 'i':
        EXPECT_EQ(field_at<std::int32_t>(record, row.offset), sample_number(position)) << row.key;
        break;
    case 'b':
        EXPECT_EQ(field_at<unsigned char>(record, row.offset), sample_flag(position) ? 1 : 0)
            << row.key;
        break;
    case 's':
        EXPECT_STREQ(field_at<char *>(record, row.offset), sample_text(position)) << row.key;
        break;
    default: {
        const auto &timer = field_at<ims_settings_timer_s>(record, row.offset);
        EXPECT_STREQ(timer.text, std::to_string(sample_number(position)).c_str()) << row.key;
        EXPECT_EQ(timer.value, sample_number(position)) << row.key;
    }
    }
}

void empty_field(void *record, const KeyRow &row) {
    switch (row.type) {
    case 'i':
        field_at<std::int32_t>(record, row.offset) = 0;
        break;
    case 'b':
        field_at<bool>(record, row.offset) = false;
        break;
    default:
        std::free(field_at<char *>(record, row.offset));
        field_at<char *>(record, row.offset) = nullptr;
    }
    if (row.type == 't')
        field_at<ims_settings_timer_s>(record, row.offset).value = 0;
}

TEST(SettingsKeys, HaveTheNumbersTheServiceCounts) {
    std::map<char, int> types;
    for (const KeyRow &row : settings_keys())
        ++types[row.type];
    EXPECT_EQ(settings_keys().size(), 334U);
    EXPECT_EQ(types['i'] + types['t'], 163);
    EXPECT_EQ(types['s'], 158);
    EXPECT_EQ(types['b'], 13);
    types.clear();
    for (const KeyRow &row : profile_keys())
        ++types[row.type];
    EXPECT_EQ(profile_keys().size(), 51U);
    EXPECT_EQ(types['i'], 27);
    EXPECT_EQ(types['s'], 20);
    EXPECT_EQ(types['b'], 4);
}

TEST_F(SettingsRecord, EachKeyFillsItsFieldAndNoOther) {
    for (std::size_t at = 0; at < settings_keys().size(); ++at) {
        const KeyRow &row = settings_keys()[at];
        ASSERT_EQ(get(SetReply{}.add(row.key, sent_value(row, at + 1).get()).finish()),
                  IMS_ERROR_NONE);
        expect_value(&set_, row, at + 1);
        empty_field(&set_, row);
        // Nothing is left that another field got.
        ASSERT_EQ(image(), std::string(sizeof set_, '\0')) << row.key;
    }
}

TEST_F(SettingsRecord, AllKeysAreReadInAnyOrder) {
    for (const bool backwards : {false, true}) {
        SetReply answer;
        const std::size_t count = settings_keys().size();
        for (std::size_t step = 0; step < count; ++step) {
            const std::size_t at = backwards ? count - 1 - step : step;
            const KeyRow &row = settings_keys()[at];
            answer.add(row.key, sent_value(row, at + 1).get());
        }
        ASSERT_EQ(get(answer.finish()), IMS_ERROR_NONE);
        for (std::size_t at = 0; at < count; ++at)
            expect_value(&set_, settings_keys()[at], at + 1);
        ims_global_settings_clear(&set_);
    }
}

TEST_F(SettingsRecord, OnlyThreeKeysFillExactlyThoseFields) {
    fill(&set_, settings_keys());
    const std::string before = image();
    ASSERT_EQ(
        get(reply("(ia{sv})", "(0, {'id': <7>, 'name': <'other'>, 'network': <'elsewhere'>})")),
        IMS_ERROR_NONE);
    EXPECT_EQ(set_.id, 7);
    EXPECT_STREQ(set_.name, "other");
    EXPECT_STREQ(set_.network, "elsewhere");
    std::free(set_.name);
    std::free(set_.network);
    set_.id = sample_number(1);
    set_.name = const_cast<char *>(sample_text(2));
    set_.network = const_cast<char *>(sample_text(3));
    EXPECT_EQ(image(), before);
    set_ = {}; // the sample's texts are nobody's to free
}

TEST_F(SettingsRecord, UnknownKeysAreSkippedWithoutALine) {
    EXPECT_EQ(get(reply("(ia{sv})", "(0, {'no_such_key': <7>, '': <8>, 'id': <9>})")),
              IMS_ERROR_NONE);
    EXPECT_EQ(set_.id, 9);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(SettingsRecord, KeysAreComparedWithTheirCase) {
    EXPECT_EQ(get(reply("(ia{sv})", "(0, {'ID': <1>, 'rtp_timeout_b2bptt': <2>, "
                                    "'rtp_timeout_mcptt': <3>, 'xdm_enable_B2PTT': <4>, "
                                    "'xdm_enable_b2bptt': <5>, 'xdm_enable_MCPTT': <6>})")),
              IMS_ERROR_NONE);
    EXPECT_EQ(image(), std::string(sizeof set_, '\0'));
}

TEST_F(SettingsRecord, ValuesOfAnotherTypeCountAsMissing) {
    char kept[] = "kept";
    set_.id = -1;
    set_.rcs_version = 4;
    set_.is_rcs_enabled = true;
    set_.network = kept;
    EXPECT_EQ(get(reply("(ia{sv})", "(0, {'id': <'1'>, 'name': <2>, 'is_rcs_enabled': <1>, "
                                    "'rcs_version': <uint32 3>, 'network': <<'boxed twice'>>, "
                                    "'sip_uri_only': <'true'>})")),
              IMS_ERROR_NONE);
    EXPECT_EQ(set_.id, -1);
    EXPECT_EQ(set_.name, nullptr);
    EXPECT_EQ(set_.network, kept);
    EXPECT_EQ(set_.rcs_version, 4);
    EXPECT_TRUE(set_.is_rcs_enabled);
    EXPECT_FALSE(set_.sip_uri_only);
    set_.network = nullptr;
}

TEST_F(SettingsRecord, OfARepeatedKeyTheLaterValueStays) {
    SetReply answer;
    answer.add("name", g_variant_new_string("earlier")).add("id", g_variant_new_int32(1));
    answer.add("name", g_variant_new_string("later")).add("id", g_variant_new_int32(2));
    EXPECT_EQ(get(answer.finish()), IMS_ERROR_NONE);
    EXPECT_STREQ(set_.name, "later");
    EXPECT_EQ(set_.id, 2);
}

TEST_F(SettingsRecord, OfARepeatedKeyALaterValueOfAnotherTypeChangesNothing) {
    SetReply answer;
    answer.add("name", g_variant_new_string("earlier")).add("id", g_variant_new_int32(1));
    answer.add("name", g_variant_new_int32(2)).add("id", g_variant_new_string("2"));
    EXPECT_EQ(get(answer.finish()), IMS_ERROR_NONE);
    EXPECT_STREQ(set_.name, "earlier");
    EXPECT_EQ(set_.id, 1);
}

// The service sends the three timers as text and takes them as numbers.
TEST_F(SettingsRecord, ATimerKeepsItsTextAndTheNumberInIt) {
    EXPECT_EQ(get(reply("(ia{sv})", "(0, {'poc_session_expire': <'3600'>, "
                                    "'poc_ringing_timer': <'30 s'>, "
                                    "'poc_invite_timeout': <'-12'>})")),
              IMS_ERROR_NONE);
    EXPECT_STREQ(set_.poc_session_expire.text, "3600");
    EXPECT_EQ(set_.poc_session_expire.value, 3600);
    EXPECT_STREQ(set_.poc_ringing_timer.text, "30 s");
    EXPECT_EQ(set_.poc_ringing_timer.value, 0);
    EXPECT_EQ(set_.poc_invite_timeout.value, -12);
}

TEST_F(SettingsRecord, ATimerThatComesAsANumberYieldsNoText) {
    char stale[] = "stale";
    set_.poc_session_expire = {stale, 7};
    EXPECT_EQ(get(reply("(ia{sv})", "(0, {'poc_session_expire': <3600>})")), IMS_ERROR_NONE);
    EXPECT_EQ(set_.poc_session_expire.text, nullptr);
    EXPECT_EQ(set_.poc_session_expire.value, 0);
}

TEST_F(SettingsRecord, ANumberTooLargeForATimerIsNone) {
    EXPECT_EQ(get(reply("(ia{sv})", "(0, {'poc_session_expire': <'2147483648'>})")),
              IMS_ERROR_NONE);
    EXPECT_STREQ(set_.poc_session_expire.text, "2147483648");
    EXPECT_EQ(set_.poc_session_expire.value, 0);
}

TEST_F(SettingsRecord, IsUntouchedWhenTheServiceRefuses) {
    EXPECT_EQ(get(reply("(ia{sv})", "(5, {'id': <1>, 'name': <'a set'>})")),
              IMS_ERROR_OPERATION_FAILED);
    EXPECT_EQ(image(), std::string(sizeof set_, '\0'));
    expect_one_line("ims_settings.cpp", "ims_get_global_settings_info",
                    "Failed to get global settings Info: 5");
}

TEST_F(SettingsRecord, AMissingNameIsSentAsAnEmptyOne) {
    peer().on(kGetSettings, reply("(ia{sv})", "(0, {})"));
    EXPECT_EQ(ims_get_global_settings_info(handle_, nullptr, &set_), IMS_ERROR_NONE);
    const std::vector<Call> sent = requests();
    ASSERT_EQ(sent.size(), 1U);
    expect_sent(sent[0], "(s)", "('',)");
}

TEST_F(SettingsRecord, ANameThatIsNotUtf8IsNotSent) {
    EXPECT_EQ(ims_get_global_settings_info(handle_, "caf\xe9", &set_), IMS_ERROR_INVALID_PARAMETER);
    expect_one_line("ims_settings.cpp", "ims_get_global_settings_info", "Invalid parameter");
    EXPECT_TRUE(requests().empty());
}

TEST_F(SettingsRecord, WithoutANameIsDeletedUnderAnEmptyOne) {
    peer().on("org.kelvo.ims.Settings.DeleteGlobalSettings", reply("(i)", "(0,)"));
    EXPECT_EQ(ims_delete_global_settings(handle_, &set_, nullptr, nullptr), IMS_ERROR_NONE);
    const auto calls = peer().wait_for_calls("org.kelvo.ims.Settings.DeleteGlobalSettings", 1);
    expect_sent(calls[0], "(s)", "('',)");
}

// Written and read back, a set keeps everything but the two fields that are never written.
TEST_F(SettingsRecord, SurvivesTheWayToTheServiceAndBack) {
    ims_global_settings_s sent{};
    fill(&sent, settings_keys());
    peer().on("org.kelvo.ims.Settings.UpdateGlobalSettings", reply("(i)", "(0,)"));
    ResponseRecorder recorder;
    ASSERT_EQ(ims_update_global_settings(handle_, &sent, ResponseRecorder::callback, &recorder),
              IMS_ERROR_NONE);
    const auto calls = peer().wait_for_calls("org.kelvo.ims.Settings.UpdateGlobalSettings", 1);
    fence();
    EXPECT_EQ(recorder.count(), 1U);
    const Variant written{g_variant_get_child_value(calls[0].body.get(), 0)};
    EXPECT_EQ(g_variant_n_children(written.get()), 334U);
    ASSERT_EQ(get(reply_with(g_variant_new("(i@a{sv})", 0, written.get()))), IMS_ERROR_NONE);
    for (std::size_t at = 0; at < settings_keys().size(); ++at) {
        const KeyRow &row = settings_keys()[at];
        const std::string key = row.key;
        if (key == "audio_port_end" || key == "is_enable_srtp")
            EXPECT_EQ(field_at<std::int32_t>(&set_, row.offset), 0) << key;
        else if (row.type != 't')
            expect_value(&set_, row, at + 1);
    }
}

// Its timers came as text and go as numbers.
TEST_F(SettingsRecord, KeepsItsTimersWhenItIsWrittenAsItWasRead) {
    SetReply answer;
    for (std::size_t at = 0; at < settings_keys().size(); ++at)
        answer.add(settings_keys()[at].key, sent_value(settings_keys()[at], at + 1).get());
    ASSERT_EQ(get(answer.finish()), IMS_ERROR_NONE);
    peer().on("org.kelvo.ims.Settings.UpdateGlobalSettings", reply("(i)", "(0,)"));
    ASSERT_EQ(ims_update_global_settings(handle_, &set_, nullptr, nullptr), IMS_ERROR_NONE);
    const auto calls = peer().wait_for_calls("org.kelvo.ims.Settings.UpdateGlobalSettings", 1);
    expect_sent(calls[0], "(a{sv})", written_settings(Direction::kUpdate));
}

TEST(SettingsClear, ReleasesTheTextsAndZeroesTheRecord) {
    ims_global_settings_s set{};
    set.name = strdup("name");
    set.conference_factory_uri = strdup("last");
    set.poc_ringing_timer = {strdup("30"), 30};
    set.id = 5;
    ims_global_settings_clear(&set);
    EXPECT_EQ(set.name, nullptr);
    EXPECT_EQ(set.poc_ringing_timer.text, nullptr);
    EXPECT_EQ(set.id, 0);
    ims_global_settings_clear(nullptr);
    ims_profile_clear(nullptr);
    ims_profile_list_clear(nullptr);
}

class ProfileList : public WithPeer {
  protected:
    void TearDown() override {
        ims_profile_list_clear(list_.get());
        WithPeer::TearDown();
    }
    int get(Answer answer) {
        peer().on(kGetProfiles, std::move(answer));
        return ims_get_profile_list_info(handle_, list_.get());
    }
    void expect_count_warning(const char *count) {
        const std::vector<LogLine> lines = take_log();
        ASSERT_EQ(lines.size(), 1U) << ::testing::PrintToString(lines);
        EXPECT_EQ(lines[0].priority, kWarningPriority);
        EXPECT_EQ(lines[0].message,
                  std::string{"profile list count is NOT valid - Count: ["} + count + "]");
    }
    // One profile with these keys, the first of them from this position.
    static Answer one_profile(std::span<const KeyRow> keys, std::size_t position) {
        GVariantBuilder profile;
        g_variant_builder_init(&profile, G_VARIANT_TYPE_VARDICT);
        for (const KeyRow &row : keys)
            g_variant_builder_add(&profile, "{sv}", row.key, sent_value(row, position++).get());
        GVariant *dictionary = g_variant_builder_end(&profile);
        return reply_with(g_variant_new(
            "(iu@aa{sv})", 0, 1, g_variant_new_array(G_VARIANT_TYPE_VARDICT, &dictionary, 1)));
    }
    // So many profiles whose ids count from 0.
    static Answer profiles(guint count, guint entries) {
        GVariantBuilder list;
        g_variant_builder_init(&list, G_VARIANT_TYPE("aa{sv}"));
        for (guint id = 0; id < entries; ++id) {
            g_variant_builder_open(&list, G_VARIANT_TYPE_VARDICT);
            g_variant_builder_add(&list, "{sv}", "id",
                                  g_variant_new_int32(static_cast<gint32>(id)));
            g_variant_builder_add(&list, "{sv}", "name", g_variant_new_string("a profile"));
            g_variant_builder_close(&list);
        }
        return reply_with(g_variant_new("(iu@aa{sv})", 0, count, g_variant_builder_end(&list)));
    }

    std::unique_ptr<ims_profile_list_s> list_ = std::make_unique<ims_profile_list_s>();
};

TEST_F(ProfileList, EachKeyFillsItsFieldAndNoOther) {
    for (std::size_t at = 0; at < profile_keys().size(); ++at) {
        const KeyRow &row = profile_keys()[at];
        std::memset(list_.get(), 0, sizeof *list_);
        ASSERT_EQ(get(one_profile(profile_keys().subspan(at, 1), at + 1)), IMS_ERROR_NONE);
        ASSERT_EQ(list_->count, 1U);
        expect_value(&list_->profiles[0], row, at + 1);
        empty_field(&list_->profiles[0], row);
        const std::string image{reinterpret_cast<const char *>(list_->profiles),
                                sizeof list_->profiles};
        ASSERT_EQ(image, std::string(sizeof list_->profiles, '\0')) << row.key;
    }
}

TEST_F(ProfileList, AllKeysAreReadTogether) {
    ASSERT_EQ(get(one_profile(profile_keys(), 1)), IMS_ERROR_NONE);
    ASSERT_EQ(list_->count, 1U);
    for (std::size_t at = 0; at < profile_keys().size(); ++at)
        expect_value(&list_->profiles[0], profile_keys()[at], at + 1);
}

TEST_F(ProfileList, AnEmptyListIsASuccessWithAWarning) {
    EXPECT_EQ(get(profiles(0, 0)), IMS_ERROR_NONE);
    EXPECT_EQ(list_->count, 0U);
    expect_count_warning("0");
}

TEST_F(ProfileList, AListShorterThanItsCountIsEmpty) {
    EXPECT_EQ(get(profiles(3, 2)), IMS_ERROR_NONE);
    EXPECT_EQ(list_->count, 0U);
    EXPECT_EQ(list_->profiles[0].name, nullptr);
    expect_count_warning("3");
}

TEST_F(ProfileList, AListLongerThanTheRecordFillsTheRecord) {
    EXPECT_EQ(get(profiles(64, 64)), IMS_ERROR_NONE);
    EXPECT_EQ(list_->count, 64U);
    EXPECT_TRUE(take_log().empty());
    ims_profile_list_clear(list_.get());
    EXPECT_EQ(get(profiles(70, 70)), IMS_ERROR_NONE);
    EXPECT_EQ(list_->count, 64U);
    EXPECT_EQ(list_->profiles[63].id, 63);
    expect_count_warning("70");
}

TEST_F(ProfileList, KeepsTheServicesCountWhenTheServiceRefuses) {
    EXPECT_EQ(get(reply("(iuaa{sv})", "(6, 2, [])")), IMS_ERROR_OPERATION_FAILED);
    EXPECT_EQ(list_->count, 2U);
    expect_one_line("ims_settings.cpp", "ims_get_profile_list_info",
                    "Failed to get profile Info: 6");
    list_->count = 0;
}

class NetworkEnvironment : public WithPeer {};

TEST_F(NetworkEnvironment, IsStoredWhateverTheResultSays) {
    for (const char *answer : {"(0, 3)", "(9, 3)"}) {
        peer().on(kGetEnvironment, reply("(ii)", answer));
        std::int32_t type = -1;
        EXPECT_EQ(ims_get_network_environment(handle_, &type), IMS_ERROR_NONE);
        EXPECT_EQ(type, 3);
    }
    EXPECT_TRUE(take_log().empty());
    for (const Call &call : requests())
        EXPECT_EQ(call.signature, "");
}

TEST_F(NetworkEnvironment, IsUntouchedOnFailure) {
    std::int32_t type = -1;
    for (const Answer &answer : {failure(error_name::kFailed), empty_reply(), reply("(i)", "(0,)"),
                                 reply("(iu)", "(0, 3)")}) {
        peer().on(kGetEnvironment, answer);
        EXPECT_EQ(ims_get_network_environment(handle_, &type), IMS_ERROR_OPERATION_FAILED);
    }
    EXPECT_TRUE(take_log().empty());
    peer().on(kGetEnvironment, failure(error_name::kAccessDenied));
    EXPECT_EQ(ims_get_network_environment(handle_, &type), IMS_ERROR_PERMISSION_DENIED);
    expect_one_line("ims_settings.cpp", "ims_get_network_environment", "Permission denied");
    EXPECT_EQ(ims_get_network_environment(nullptr, &type), IMS_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(ims_get_network_environment(handle_, nullptr), IMS_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(type, -1);
}

TEST(NetworkEnvironmentGate, ComesBeforeTheArguments) {
    check_gate<ims_get_network_environment>("ims_settings.cpp");
}

} // namespace
} // namespace test
