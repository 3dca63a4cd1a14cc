// SPDX-License-Identifier: Apache-2.0
// The fields of a settings set.
#include "sim/settings/rows.hpp"

#include <algorithm>

namespace sim {

namespace {

constexpr SettingsRow kIdentity[] = {
    number("id", 1),
    text("name", "default"),
    text("network", "lte"),
    flag("is_rcs_enabled", false),
    number("rcs_version", 5),
    number("rcs_auto_config_source", 0),
    number("rcs_home_pref", 0),
    number("rcs_roaming_pref", 0),
    flag("closed_group_chat", false),
    text("local_uri_type", "SIP"),
    text("remote_uri_type", "TEL"),
    number("subscribe_for_reg", 1),
    number("use_precondition", 1),
    text("sip_user_agent", "ims-sim"),
    number("log_level", 3),
    flag("sip_uri_only", false),
    number("publish_timer", 1200),
    number("publish_expiry", 3600),
    number("extended_publish_timer", 1200),
    number("is_gzip_enable", 1),
    number("subscription_expiry", 3600),
    number("expire_header", 3600),
    number("set_default_uri", 0),
    number("subscribe_list_sync_enabled", 1),
    number("add_phone_extension", 0),
    number("bad_event_expiry", 259200),
    number("cap_cache_expiry", 7776000),
    text("add_pres_list_dummy", "0"),
    flag("anonymous_fetch", false),
    flag("update_auto_config", false),
    number("publish_err_retry", 3),
    number("poll_list_sub_expiry", 30),
    number("subscribe_max_entry", 100),
};

constexpr SettingsRow kXdm[] = {
    number("xdm_enable", 1),
    text("http_user_name", "user@ims.example.org"),
    text("http_password", ""),
    text("xcap_root_uri", "http://xcap.ims.example.org"),
    text("agg_proxy_ip", "192.0.2.10"),
    text("auth_proxy_ip", "192.0.2.11"),
    number("auth_proxy_port", 80),
    text("xdm_user_agent", "ims-sim XDM"),
    text("apn_selection", "ims"),
    number("xcap_root_uri_pref", 0),
    text("xdm_user_id_domain", "ims.example.org"),
    text("bsf_ip", "192.0.2.12"),
    text("bsf_port", "8080"),
    number("enable_gba", 0),
};

constexpr SettingsRow kTimers[] = {
    text("conf_uri", "sip:conference@conf.example.org"),
    text("conf_subscribe", "1"),
    text("conf_dialog_type", "0"),
    number("reg_retry_base_time", 30),
    number("reg_retry_max_time", 1800),
    number("session_expire", 1800),
    number("ringing_timer", 60),
    number("ringback_timer", 180),
    number("subscriber_timer", 3600),
    number("dtmf_mode", 0),
    number("enable_mwi", 1),
    number("mwi_subscribeexpiry", 86400),
    number("enable_ciq", 0),
    number("enable_hasati", 0),
    number("invite_timeout", 30),
    number("enable_gruu", 1),
    flag("ims_test_mode", false),
    text("reg_expire", "600000"),
    text("self_port", "5060"),
    text("wifi_self_port", "5060"),
    number("transport_in_contact", 0),
    number("sip_mobility", 0),
    number("session_refresh_method", 1),
    text("smsc_psi", "tel:+15550199"),
};

constexpr SettingsRow kMedia[] = {
    number("rtp_timeout", 30),
    number("rtcp_timeout", 60),
    // So the key is spelled on the wire.
    number("enable_cp_autio_path", 1),
    number("amr_bundle_rate", 1),
    number("log_trp_packets_to_file", 0),
    number("bit_rate", 384),
    text("audio_codec_mode_val", "7"),
    number("audio_video_tx_val", 0),
    text("amr_nb_mode", "0,2,4,7"),
    text("amr_wb_mode", "0,1,2,8"),
    number("frame_rate", 15),
    text("curr_disp_format", "QVGA"),
    text("audio_codec_val", "AMR-WB,AMR"),
    text("video_codec_val", "H264"),
    number("text_port", 57000),
    number("audio_port_start", 50000),
    number("audio_port_end", 50098),
    number("video_port_start", 51000),
    number("video_port_end", 51098),
    number("jitter_buffer_settings", 0),
    text("presence_list_max_entries", "100"),
    number("is_enable_emm", 0),
    number("is_enable_loopback", 0),
    number("is_external_gtty", 0),
    number("is_avpf_enabled", 1),
    number("is_enable_srtp", 0),
    number("is_disp_fps_bitrate_enabled", 0),
    number("audio_as", 41),
    number("audio_rs", 300),
    number("audio_rr", 1000),
    number("video_as", 450),
    number("video_rs", 8000),
    number("video_rr", 6000),
    number("amrnbbe_payload_val", 97),
    number("amrnboa_payload_val", 98),
    number("amrwbbe_payload_val", 99),
    number("amrwboa_payload_val", 100),
    number("h264qvga_payload_val", 113),
    number("h264vga_payload_val", 114),
    number("h264vgal_payload_val", 116),
    number("dtmf_nb_payload_val", 101),
    number("dtmf_wb_payload_val", 102),
    text("packetization_model", "1"),
    text("enable_g711_codec", "0"),
    text("audio_capabilities", "AMR-WB,AMR"),
    text("dtmf_codec_mode", "0"),
    text("enable_bwm", "0"),
    text("enable_bwm_default", "0"),
    number("rtp_keep_alive", 15),
};

// The calls of each kind have ports of their own.
constexpr SettingsRow kPortsOfCopies[] = {
    number("text_port_B2BPTT", 57100),       number("audio_port_start_B2BPTT", 50100),
    number("audio_port_end_B2BPTT", 50198),  number("video_port_start_B2BPTT", 51100),
    number("video_port_end_B2BPTT", 51198),  number("text_port_MCPTT", 57200),
    number("audio_port_start_MCPTT", 50200), number("audio_port_end_MCPTT", 50298),
    number("video_port_start_MCPTT", 51200), number("video_port_end_MCPTT", 51298),
};

// Where a key does not travel the same way in all directions.
struct Exception {
    std::string_view key;
    Form get;
    Form update;
    Form add;
};

constexpr Exception kExceptions[] = {
    // Clients write the key before these a second time in their place, so they keep their values.
    {"audio_port_end", Form::kInt, Form::kAbsent, Form::kAbsent},
    {"is_enable_srtp", Form::kInt, Form::kAbsent, Form::kAbsent},
    // Only a new set brings this number as decimal text.
    {"is_enable_emm_MCPTT", Form::kInt, Form::kInt, Form::kText},
    // Clients take these timers as decimal text and write them as numbers.
    {"poc_session_expire", Form::kText, Form::kInt, Form::kInt},
    {"poc_ringing_timer", Form::kText, Form::kInt, Form::kInt},
    {"poc_invite_timeout", Form::kText, Form::kInt, Form::kInt},
};

SettingsFields make_global_settings_fields() {
    std::vector<SettingsField> fields;
    const auto append = [&](std::span<const SettingsRow> rows, std::string_view suffix = {}) {
        for (const auto &row : rows)
            fields.push_back(plain_field(row, suffix));
    };
    // The suffixes differ in their case, and one in its spelling.
    append(kIdentity);
    append(kXdm);
    append(kTimers);
    append(kMedia);
    append(kMedia, "_B2BPTT");
    append(kXdm, "_b2ptt");
    append(kXdm, "_mcptt");
    append(kMedia, "_MCPTT");
    append(operator_rows());
    const auto field = [&](std::string_view key) -> SettingsField & {
        return *std::ranges::find(fields, key, &SettingsField::key);
    };
    for (const auto &row : kPortsOfCopies)
        field(row.key).value = value_of(row);
    for (const auto &exception : kExceptions) {
        auto &found = field(exception.key);
        found.get = exception.get;
        found.update = exception.update;
        found.add = exception.add;
    }
    return SettingsFields(std::move(fields));
}

} // namespace

const SettingsFields &global_settings_fields() {
    static const SettingsFields fields = make_global_settings_fields();
    return fields;
}

} // namespace sim
