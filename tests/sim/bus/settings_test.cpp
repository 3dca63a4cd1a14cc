// SPDX-License-Identifier: Apache-2.0
// org.kelvo.ims.Settings of the real program.
#include "tests/sim/bus/served_with_state.hpp"
#include "tests/sim/settings/samples.hpp"

#include <csignal>

namespace sim::test {
namespace {

using testing::HasSubstr;

constexpr const char *kSettings = "org.kelvo.ims.Settings";

GVariant *written(const OfferedEntries &entries) {
    GVariantBuilder builder;
    g_variant_builder_init(&builder, G_VARIANT_TYPE_VARDICT);
    for (const auto &entry : entries) {
        GVariant *value = nullptr;
        if (const auto *number = std::get_if<std::int32_t>(&entry.value))
            value = g_variant_new_int32(*number);
        else if (const auto *flag = std::get_if<bool>(&entry.value))
            value = g_variant_new_boolean(*flag);
        else
            value = g_variant_new_string(std::get<std::string>(entry.value).c_str());
        g_variant_builder_add(&builder, "{sv}", entry.key.c_str(), value);
    }
    return g_variant_new("(@a{sv})", g_variant_builder_end(&builder));
}

// What a service sends of this record, as text.
std::string expected_text(const SettingsFields &fields, const SettingsRecord &record) {
    OfferedEntries entries;
    for (std::size_t place = 0; place < fields.size(); ++place)
        entries.push_back(entry_of(fields[place], fields[place].get, record[place]));
    const auto tuple = Variant(written(entries));
    return Variant::adopt(g_variant_get_child_value(tuple.get(), 0)).print();
}

class SettingsBus : public ServedWithState {
  protected:
    Reply call(const char *method, const std::string &arguments = "()", int slot = 0) {
        return client_->call(slot, kSettings, method, arguments);
    }
    Reply send(const char *method, const OfferedEntries &entries, int slot = 0) {
        return client_->call(slot_path(slot), kSettings, method, Variant(written(entries)));
    }
};

TEST_F(SettingsBus, TheShippedSetGoesOutInOrderWithItsTimersAsText) {
    const auto reply = call("GetGlobalSettings", "('default',)");
    EXPECT_EQ(reply.type, "(ia{sv})");
    const auto &fields = global_settings_fields();
    EXPECT_EQ(reply.body, "(0, " + expected_text(fields, fields.shipped()) + ")");
    EXPECT_THAT(reply.body,
                HasSubstr("'poc_session_expire': <'1800'>, 'poc_ringing_timer': <'30'>, "
                          "'poc_invite_timeout': <'32'>"));
    EXPECT_THAT(reply.body, HasSubstr("'is_enable_emm_MCPTT': <0>"));
}

TEST_F(SettingsBus, AWholeSetIsAddedUpdatedAndDeleted) {
    const auto &fields = global_settings_fields();
    const auto with_shipped = [&](SettingsRecord record) {
        for (const auto *key : {"audio_port_end", "is_enable_srtp"})
            record[fields.place_of(key)] = fields.shipped()[fields.place_of(key)];
        return "(0, " + expected_text(fields, record) + ")";
    };
    auto record = sample_record(fields, "other");
    EXPECT_EQ(send("AddGlobalSettings", entries_of(fields, &SettingsField::add, record)).body,
              "(0,)");
    EXPECT_EQ(call("GetGlobalSettings", "('other',)").body, with_shipped(record));
    record = sample_record(fields, "other", 1);
    EXPECT_EQ(send("UpdateGlobalSettings", entries_of(fields, &SettingsField::update, record)).body,
              "(0,)");
    EXPECT_EQ(call("GetGlobalSettings", "('other',)").body, with_shipped(record));
    restart(SIGTERM);
    EXPECT_EQ(call("GetGlobalSettings", "('other',)").body, with_shipped(record));
    EXPECT_EQ(call("GetGlobalSettings", "('other',)", 1).body, "(19, {})");
    EXPECT_EQ(call("DeleteGlobalSettings", "('other',)").body, "(0,)");
    EXPECT_EQ(call("GetGlobalSettings", "('other',)").body, "(19, {})");
}

TEST_F(SettingsBus, ProfilesAreListedAddedUpdatedAndDeleted) {
    const auto &fields = profile_fields();
    const auto shipped = shipped_profiles();
    const auto list = [&](const std::vector<SettingsRecord> &profiles) {
        std::string text;
        for (const auto &profile : profiles)
            text += (text.empty() ? "" : ", ") + expected_text(fields, profile);
        return fmt::format("(0, {}, [{}])", profiles.size(), text);
    };
    EXPECT_EQ(call("GetProfileList").body, list(shipped));
    auto added = sample_record(fields, "third");
    EXPECT_EQ(send("AddProfile", entries_of(fields, &SettingsField::add, added)).body, "(0,)");
    EXPECT_EQ(call("GetProfileList").body, list({shipped[0], shipped[1], added}));
    const auto id = std::get<std::int32_t>(added[0]);
    added = sample_record(fields, "renamed", 1);
    added[0] = id;
    EXPECT_EQ(send("UpdateProfile", entries_of(fields, &SettingsField::update, added)).body,
              "(0,)");
    restart(SIGTERM);
    EXPECT_EQ(call("GetProfileList").body, list({shipped[0], shipped[1], added}));
    for (const auto gone : {id, 1, 2})
        EXPECT_EQ(call("DeleteProfile", fmt::format("({},)", gone)).body, "(0,)");
    const auto none = call("GetProfileList");
    EXPECT_EQ(none.body, "(0, 0, [])");
    EXPECT_EQ(none.type, "(iuaa{sv})");
    restart(SIGTERM);
    EXPECT_EQ(call("GetProfileList").body, "(0, 0, [])");
    EXPECT_EQ(call("GetProfileList", "()", 1).body, list(shipped));
}

TEST_F(SettingsBus, TheNetworkEnvironmentIsKept) {
    EXPECT_EQ(call("GetNetworkEnvironment").body, "(0, 0)");
    EXPECT_EQ(call("SetNetworkEnvironment", "(2,)").body, "(0,)");
    EXPECT_EQ(call("GetNetworkEnvironment").body, "(0, 2)");
    EXPECT_EQ(call("GetNetworkEnvironment", "()", 1).body, "(0, 0)");
    restart(SIGKILL);
    EXPECT_EQ(call("GetNetworkEnvironment").body, "(0, 2)");
    EXPECT_EQ(call("SetNetworkEnvironment", "(4,)").body, "(10,)");
    EXPECT_EQ(call("GetNetworkEnvironment").body, "(0, 2)");
}

TEST_F(SettingsBus, RefusalsAreLoggedWithTheirReason) {
    struct Refused {
        const char *method;
        const char *arguments;
        const char *reply;
        const char *why;
    };
    constexpr Refused kRefused[] = {
        {"UpdateGlobalSettings", "({'id': <1>},)", "(10,)", "\"name\" is missing"},
        {"UpdateGlobalSettings", "(@a{sv} {},)", "(10,)", "\"name\" is missing"},
        {"UpdateGlobalSettings", "({'name': <'x'>},)", "(19,)", "no settings set \"x\""},
        {"UpdateGlobalSettings", "({'name': <'default'>, 'id': <'1'>},)", "(10,)",
         "id is \"i\" here, and \"s\" came"},
        {"UpdateGlobalSettings", "({'name': <'default'>, 'id': <<1>>},)", "(10,)",
         "id is \"i\" here, and \"v\" came"},
        {"UpdateGlobalSettings", "({'name': <'default'>, 'poc_session_expire': <'1'>},)", "(10,)",
         "poc_session_expire is \"i\" here, and \"s\" came"},
        {"UpdateGlobalSettings", "({'name': <'default'>, 'no': <1>},)", "(10,)", "no key \"no\""},
        {"AddGlobalSettings", "({'name': <'default'>},)", "(20,)", "\"default\" already"},
        {"AddGlobalSettings", "({'name': <'x'>, 'is_enable_emm_MCPTT': <1>},)", "(10,)",
         "is_enable_emm_MCPTT is \"s\" here, and \"i\" came"},
        {"DeleteGlobalSettings", "('',)", "(19,)", "no settings set \"\""},
        {"GetGlobalSettings", "('',)", "(19, {})", "no settings set \"\""},
        {"AddProfile", "({'id': <2>, 'name': <'x'>},)", "(20,)", "a profile 2 already"},
        {"UpdateProfile", "({'id': <9>, 'name': <'x'>},)", "(19,)", "no profile 9"},
        {"DeleteProfile", "(9,)", "(19,)", "no profile 9"},
        {"SetNetworkEnvironment", "(-1,)", "(10,)", "not -1"},
    };
    for (const auto &refused : kRefused) {
        EXPECT_EQ(call(refused.method, refused.arguments).body, refused.reply) << refused.why;
        EXPECT_THAT(program_->read_errors(refused.method), HasSubstr(refused.why));
    }
    EXPECT_EQ(call("AddProfile", "(1,)").error, "org.freedesktop.DBus.Error.InvalidArgs");
    // Nothing was changed, so nothing was kept.
    EXPECT_TRUE(std::filesystem::is_empty(directory_.path()));
}

TEST_F(SettingsBus, WhatCannotBeKeptIsRefused) {
    std::filesystem::create_directory(directory_.file("sub0.json.new"));
    EXPECT_EQ(call("SetNetworkEnvironment", "(1,)").body, "(17,)");
    EXPECT_THAT(program_->read_errors("SetNetworkEnvironment"), HasSubstr("cannot be kept"));
    EXPECT_EQ(call("GetNetworkEnvironment").body, "(0, 0)");
}

TEST_F(SettingsBus, ADirectoryInUseIsRefused) {
    PrivateBus other;
    Program second({"serve", "--address", other.address(), "--state", directory_.path()});
    EXPECT_THAT(second.read_errors(), HasSubstr("another ims-sim keeps its state in"));
    EXPECT_EQ(second.wait(), 1);
}

TEST_F(SettingsBus, ADamagedFileKeepsTheProgramFromStarting) {
    EXPECT_EQ(call("SetNetworkEnvironment", "(1,)").body, "(0,)");
    program_->send_signal(SIGTERM);
    program_->wait();
    client_->wait_until_gone(kServiceName);
    const auto path = directory_.file("sub0.json");
    const auto whole = content_of(path);
    const auto half = whole.substr(0, whole.size() / 2);
    put_content(path, half);
    Program serving(arguments());
    EXPECT_THAT(serving.read_errors(), HasSubstr("cannot use " + path));
    EXPECT_EQ(serving.wait(), 1);
    Program running({"run", "--state", directory_.path(), "--", "true"});
    EXPECT_THAT(running.read_errors(), HasSubstr("cannot use " + path));
    EXPECT_EQ(running.wait(), 125);
    EXPECT_EQ(content_of(path), half);
    put_content(path, whole);
    program_ = std::make_unique<Program>(arguments());
    client_->wait_until_owned(kServiceName);
    EXPECT_EQ(call("GetNetworkEnvironment").body, "(0, 1)");
}

TEST(SettingsRun, ADirectoryWithoutANameIsWrongUsage) {
    Program running({"run", "--state", "", "--", "true"});
    EXPECT_THAT(running.read_errors(), HasSubstr("--state"));
    EXPECT_EQ(running.wait(), 2);
}

} // namespace
} // namespace sim::test
