// SPDX-License-Identifier: Apache-2.0
#include "tests/library/settings/settings_rows.hpp"

#include "tests/library/settings/sample.hpp"

#include <string>

namespace test {
namespace {

constexpr Module kSettings{.unit = "ims_settings.cpp", .interface = "org.kelvo.ims.Settings"};

template <typename Record>
Record filled(std::span<const KeyRow> keys) {
    Record record{};
    fill(&record, keys);
    return record;
}

const ims_global_settings_s kSampleSet = filled<ims_global_settings_s>(settings_keys());
const ims_profile_s kSampleProfile = filled<ims_profile_s>(profile_keys());

constexpr std::int32_t kEnvironment = 3;
const char *const kSetName = "a set";

// The record without its text in one field.
template <auto Field>
BadText no_text() {
    return []<typename Record, typename Text>(Text Record::*) {
        return spoilt<Record>("no " + std::string{name_of<Field>()},
                              [](Record &record) { record.*Field = nullptr; });
    }(Field);
}

// Three texts that the bus would take one by one, but not together.
template <auto First, auto... Others>
BadText large_texts() {
    return []<typename Record, typename Text>(Text Record::*) {
        return spoilt<Record>("too large together", [](Record &record) {
            static std::string text(std::size_t{6} << 20, 'x');
            record.*First = text.data();
            ((record.*Others = text.data()), ...);
        });
    }(First);
}

std::vector<BadText> bad_sets() {
    using S = ims_global_settings_s;
    return {
        no_text<&S::name>(),
        no_text<&S::xcap_root_uri_b2ptt>(),
        no_text<&S::conference_factory_uri>(),
        bad_text<&S::network>(),
        bad_text<&S::audio_codec_val_MCPTT>(),
        large_texts<&S::name, &S::network, &S::conference_factory_uri>(),
    };
}

std::vector<BadText> bad_profiles() {
    using P = ims_profile_s;
    return {
        no_text<&P::name>(),
        no_text<&P::opmode>(),
        bad_text<&P::password>(),
        large_texts<&P::name, &P::impi, &P::opmode>(),
    };
}

} // namespace

std::vector<RequestRow> settings_request_rows() {
    std::vector<RequestRow> rows{
        {.function = request<ims_update_global_settings, kSampleSet>(),
         .method = "UpdateGlobalSettings",
         .type = "(a{sv})",
         .arguments = written_settings(Direction::kUpdate),
         .bad_texts = bad_sets()},
        {.function = request<ims_add_global_settings, kSampleSet>(),
         .method = "AddGlobalSettings",
         .type = "(a{sv})",
         .arguments = written_settings(Direction::kAdd),
         .bad_texts = bad_sets()},
        {.function = request<ims_delete_global_settings, kSampleSet>(),
         .method = "DeleteGlobalSettings",
         .type = "(s)",
         .arguments = "('text 2',)",
         .checked = Checked::kHandle,
         .bad_texts = {bad_text<&ims_global_settings_s::name>()}},
        {.function = request<ims_update_profile, kSampleProfile>(),
         .method = "UpdateProfile",
         .type = "(a{sv})",
         .arguments = written_profile(),
         .bad_texts = bad_profiles()},
        {.function = request<ims_add_profile, kSampleProfile>(),
         .method = "AddProfile",
         .type = "(a{sv})",
         .arguments = written_profile(),
         .bad_texts = bad_profiles()},
        {.function = request<ims_delete_profile, kSampleProfile>(),
         .method = "DeleteProfile",
         .type = "(i)",
         .arguments = "(-68999,)",
         .checked = Checked::kHandle},
        {.function = request<ims_set_network_environment, kEnvironment>(),
         .method = "SetNetworkEnvironment",
         .type = "(i)",
         .arguments = "(3,)"},
    };
    // The handlers of the whole unit carry its name, which the functions do not.
    for (RequestRow &row : rows)
        row.handler = "on_response_settings_" + without_prefix(row.function.name);
    return requests_of(kSettings, rows);
}

std::vector<QueryRow> settings_query_rows() {
    const std::vector<QueryRow> rows{
        {.function = query<ims_get_global_settings_info, kSetName>(),
         .method = "GetGlobalSettings",
         .type = "(s)",
         .arguments = "('a set',)",
         .reply_type = "(ia{sv})",
         .reply = "(0, {'id': <1>, 'name': <'a set'>})",
         .refused_reply = "(5, {'id': <1>, 'name': <'a set'>})",
         .refused_message = "Failed to get global settings Info: 5"},
        {.function = query<ims_get_profile_list_info>(),
         .method = "GetProfileList",
         .reply_type = "(iuaa{sv})",
         .reply = "(0, 1, [{'id': <1>}])",
         .refused_reply = "(6, 1, [{'id': <1>}])",
         .refused_message = "Failed to get profile Info: 6"},
    };
    return queries_of(kSettings, rows);
}

} // namespace test
