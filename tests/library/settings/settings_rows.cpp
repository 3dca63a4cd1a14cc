// SPDX-License-Identifier: Apache-2.0
#include "tests/library/settings/settings_rows.hpp"

#include "tests/library/settings/sample.hpp"

#include <memory>
#include <string>

namespace test {
namespace {

constexpr Module kModule{"ims_settings.cpp", "org.kelvo.ims.Settings"};

template <typename Record>
Record filled(std::span<const KeyRow> keys) {
    Record record{};
    fill(&record, keys);
    return record;
}

const ims_global_settings_s kSet = filled<ims_global_settings_s>(settings_keys());
const ims_profile_s kProfile = filled<ims_profile_s>(profile_keys());

// The record without its text in one field.
template <auto Function, const auto &Record, auto Field>
Variation no_text(const char *field) {
    return {std::string{"no "} + field,
            [](ims_h handle, ims_response_cb callback, void *user_data) {
                auto record = Record;
                record.*Field = nullptr;
                return Function(handle, &record, callback, user_data);
            }};
}

template <auto Function, const auto &Record, auto Field>
Variation wrong_text(const char *field) {
    return {field, [](ims_h handle, ims_response_cb callback, void *user_data) {
                auto record = Record;
                char text[] = "caf\xe9";
                record.*Field = text;
                return Function(handle, &record, callback, user_data);
            }};
}

// Three texts that the bus would take one by one, but not together.
template <auto Function, const auto &Record, auto... Fields>
Variation large_texts() {
    return {"too large together", [](ims_h handle, ims_response_cb callback, void *user_data) {
                auto record = Record;
                std::string text(std::size_t{6} << 20, 'x');
                ((record.*Fields = text.data()), ...);
                return Function(handle, &record, callback, user_data);
            }};
}

template <auto Function>
RequestRow settings_row(const char *function, const char *method, Direction direction) {
    const std::string sent = written_settings(direction);
    RequestRow row = record_row<Function, kSet>(kModule, function, method, "(a{sv})", sent.c_str());
    using S = ims_global_settings_s;
    row.bad_texts = {
        no_text<Function, kSet, &S::name>("name"),
        no_text<Function, kSet, &S::xcap_root_uri_b2ptt>("xcap_root_uri_b2ptt"),
        no_text<Function, kSet, &S::conference_factory_uri>("conference_factory_uri"),
        wrong_text<Function, kSet, &S::network>("network"),
        wrong_text<Function, kSet, &S::audio_codec_val_MCPTT>("audio_codec_val_MCPTT"),
        large_texts<Function, kSet, &S::name, &S::network, &S::conference_factory_uri>(),
    };
    return row;
}

template <auto Function>
RequestRow profile_row(const char *function, const char *method) {
    const std::string sent = written_profile();
    RequestRow row =
        record_row<Function, kProfile>(kModule, function, method, "(a{sv})", sent.c_str());
    row.bad_texts = {
        no_text<Function, kProfile, &ims_profile_s::name>("name"),
        no_text<Function, kProfile, &ims_profile_s::opmode>("opmode"),
        wrong_text<Function, kProfile, &ims_profile_s::password>("password"),
        large_texts<Function, kProfile, &ims_profile_s::name, &ims_profile_s::impi,
                    &ims_profile_s::opmode>(),
    };
    return row;
}

RequestRow delete_settings_row() {
    RequestRow row = unchecked_record_row<ims_delete_global_settings, kSet>(
        kModule, "ims_delete_global_settings", "DeleteGlobalSettings", "(s)", "('text 2',)");
    row.bad_texts = {
        wrong_text<ims_delete_global_settings, kSet, &ims_global_settings_s::name>("name")};
    return row;
}

// The handlers of the whole unit carry its name, which the functions do not.
RequestRow named_after_unit(RequestRow row) {
    row.handler = "on_response_settings_" + row.function.substr(sizeof "ims_" - 1);
    return row;
}

int get_settings(ims_h handle) {
    ims_global_settings_s settings{};
    const int code = ims_get_global_settings_info(handle, "a set", &settings);
    ims_global_settings_clear(&settings);
    return code;
}

int get_profiles(ims_h handle) {
    auto list = std::make_unique<ims_profile_list_s>();
    const int code = ims_get_profile_list_info(handle, list.get());
    ims_profile_list_clear(list.get());
    return code;
}

} // namespace

std::vector<RequestRow> settings_request_rows() {
    std::vector<RequestRow> rows{
        settings_row<ims_update_global_settings>("ims_update_global_settings",
                                                 "UpdateGlobalSettings", Direction::kUpdate),
        settings_row<ims_add_global_settings>("ims_add_global_settings", "AddGlobalSettings",
                                              Direction::kAdd),
        delete_settings_row(),
        profile_row<ims_update_profile>("ims_update_profile", "UpdateProfile"),
        profile_row<ims_add_profile>("ims_add_profile", "AddProfile"),
        unchecked_record_row<ims_delete_profile, kProfile>(kModule, "ims_delete_profile",
                                                           "DeleteProfile", "(i)", "(-68999,)"),
        value_row<ims_set_network_environment, 3>(kModule, "ims_set_network_environment",
                                                  "SetNetworkEnvironment", "(i)", "(3,)"),
    };
    for (RequestRow &row : rows)
        row = named_after_unit(row);
    return rows;
}

std::vector<QueryRow> settings_query_rows() {
    QueryRow settings;
    settings.function = "ims_get_global_settings_info";
    settings.unit = kModule.unit;
    settings.interface = kModule.interface;
    settings.method = "GetGlobalSettings";
    settings.sent_type = "(s)";
    settings.sent = "('a set',)";
    settings.call = get_settings;
    settings.call_with_nothing = with_nothing<ims_get_global_settings_info>;
    settings.missing_pointers = {
        {"handle",
         [](ims_h) {
             ims_global_settings_s record{};
             return ims_get_global_settings_info(nullptr, "a set", &record);
         }},
        {"record",
         [](ims_h handle) { return ims_get_global_settings_info(handle, "a set", nullptr); }},
    };
    settings.reply_type = "(ia{sv})";
    settings.reply = "(0, {'id': <1>, 'name': <'a set'>})";
    settings.refused_reply = "(5, {'id': <1>, 'name': <'a set'>})";
    settings.refused_message = "Failed to get global settings Info: 5";

    QueryRow profiles = settings;
    profiles.function = "ims_get_profile_list_info";
    profiles.method = "GetProfileList";
    profiles.sent_type = "";
    profiles.sent = "";
    profiles.call = get_profiles;
    profiles.call_with_nothing = with_nothing<ims_get_profile_list_info>;
    profiles.missing_pointers = {
        {"handle",
         [](ims_h) {
             auto list = std::make_unique<ims_profile_list_s>();
             return ims_get_profile_list_info(nullptr, list.get());
         }},
        {"list", [](ims_h handle) { return ims_get_profile_list_info(handle, nullptr); }},
    };
    profiles.reply_type = "(iuaa{sv})";
    profiles.reply = "(0, 1, [{'id': <1>}])";
    profiles.refused_reply = "(6, 1, [{'id': <1>}])";
    profiles.refused_message = "Failed to get profile Info: 6";
    return {settings, profiles};
}

} // namespace test
