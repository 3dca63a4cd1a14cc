// SPDX-License-Identifier: Apache-2.0
// The keys of the settings and profile dictionaries, each stated once, in wire order.
#pragma once

#include "ims_settings.h"
#include "wire/dictionary.hpp"

namespace ims {

using Settings = ims_global_settings_s;

// The XDM and the media keys come three times, with suffixes of their own: the media copies in
// upper case, the XDM copies in lower case, and "_b2ptt" without a second "b".
// clang-format off
#define IMS_XDM_FIELDS(suffix)                                                                     \
    IMS_FIELD(Settings, xdm_enable##suffix),                                                       \
    IMS_FIELD(Settings, http_user_name##suffix),                                                   \
    IMS_FIELD(Settings, http_password##suffix),                                                    \
    IMS_FIELD(Settings, xcap_root_uri##suffix),                                                    \
    IMS_FIELD(Settings, agg_proxy_ip##suffix),                                                     \
    IMS_FIELD(Settings, auth_proxy_ip##suffix),                                                    \
    IMS_FIELD(Settings, auth_proxy_port##suffix),                                                  \
    IMS_FIELD(Settings, xdm_user_agent##suffix),                                                   \
    IMS_FIELD(Settings, apn_selection##suffix),                                                    \
    IMS_FIELD(Settings, xcap_root_uri_pref##suffix),                                               \
    IMS_FIELD(Settings, xdm_user_id_domain##suffix),                                               \
    IMS_FIELD(Settings, bsf_ip##suffix),                                                           \
    IMS_FIELD(Settings, bsf_port##suffix),                                                         \
    IMS_FIELD(Settings, enable_gba##suffix)

#define IMS_MEDIA_FIELDS(suffix)                                                                   \
    IMS_FIELD(Settings, rtp_timeout##suffix),                                                      \
    IMS_FIELD(Settings, rtcp_timeout##suffix),                                                     \
    IMS_FIELD(Settings, enable_cp_autio_path##suffix),                                             \
    IMS_FIELD(Settings, amr_bundle_rate##suffix),                                                  \
    IMS_FIELD(Settings, log_trp_packets_to_file##suffix),                                          \
    IMS_FIELD(Settings, bit_rate##suffix),                                                         \
    IMS_FIELD(Settings, audio_codec_mode_val##suffix),                                             \
    IMS_FIELD(Settings, audio_video_tx_val##suffix),                                               \
    IMS_FIELD(Settings, amr_nb_mode##suffix),                                                      \
    IMS_FIELD(Settings, amr_wb_mode##suffix),                                                      \
    IMS_FIELD(Settings, frame_rate##suffix),                                                       \
    IMS_FIELD(Settings, curr_disp_format##suffix),                                                 \
    IMS_FIELD(Settings, audio_codec_val##suffix),                                                  \
    IMS_FIELD(Settings, video_codec_val##suffix),                                                  \
    IMS_FIELD(Settings, text_port##suffix),                                                        \
    IMS_FIELD(Settings, audio_port_start##suffix),                                                 \
    IMS_FIELD(Settings, audio_port_end##suffix),                                                   \
    IMS_FIELD(Settings, video_port_start##suffix),                                                 \
    IMS_FIELD(Settings, video_port_end##suffix),                                                   \
    IMS_FIELD(Settings, jitter_buffer_settings##suffix),                                           \
    IMS_FIELD(Settings, presence_list_max_entries##suffix),                                        \
    IMS_FIELD(Settings, is_enable_emm##suffix),                                                    \
    IMS_FIELD(Settings, is_enable_loopback##suffix),                                               \
    IMS_FIELD(Settings, is_external_gtty##suffix),                                                 \
    IMS_FIELD(Settings, is_avpf_enabled##suffix),                                                  \
    IMS_FIELD(Settings, is_enable_srtp##suffix),                                                   \
    IMS_FIELD(Settings, is_disp_fps_bitrate_enabled##suffix),                                      \
    IMS_FIELD(Settings, audio_as##suffix),                                                         \
    IMS_FIELD(Settings, audio_rs##suffix),                                                         \
    IMS_FIELD(Settings, audio_rr##suffix),                                                         \
    IMS_FIELD(Settings, video_as##suffix),                                                         \
    IMS_FIELD(Settings, video_rs##suffix),                                                         \
    IMS_FIELD(Settings, video_rr##suffix),                                                         \
    IMS_FIELD(Settings, amrnbbe_payload_val##suffix),                                              \
    IMS_FIELD(Settings, amrnboa_payload_val##suffix),                                              \
    IMS_FIELD(Settings, amrwbbe_payload_val##suffix),                                              \
    IMS_FIELD(Settings, amrwboa_payload_val##suffix),                                              \
    IMS_FIELD(Settings, h264qvga_payload_val##suffix),                                             \
    IMS_FIELD(Settings, h264vga_payload_val##suffix),                                              \
    IMS_FIELD(Settings, h264vgal_payload_val##suffix),                                             \
    IMS_FIELD(Settings, dtmf_nb_payload_val##suffix),                                              \
    IMS_FIELD(Settings, dtmf_wb_payload_val##suffix),                                              \
    IMS_FIELD(Settings, packetization_model##suffix),                                              \
    IMS_FIELD(Settings, enable_g711_codec##suffix),                                                \
    IMS_FIELD(Settings, audio_capabilities##suffix),                                               \
    IMS_FIELD(Settings, dtmf_codec_mode##suffix),                                                  \
    IMS_FIELD(Settings, enable_bwm##suffix),                                                       \
    IMS_FIELD(Settings, enable_bwm_default##suffix),                                               \
    IMS_FIELD(Settings, rtp_keep_alive##suffix)
// clang-format on

inline constexpr Field kSettingsRows[] = {
    // Identity and presence
    IMS_FIELD(Settings, id),
    IMS_FIELD(Settings, name),
    IMS_FIELD(Settings, network),
    IMS_FIELD(Settings, is_rcs_enabled),
    IMS_FIELD(Settings, rcs_version),
    IMS_FIELD(Settings, rcs_auto_config_source),
    IMS_FIELD(Settings, rcs_home_pref),
    IMS_FIELD(Settings, rcs_roaming_pref),
    IMS_FIELD(Settings, closed_group_chat),
    IMS_FIELD(Settings, local_uri_type),
    IMS_FIELD(Settings, remote_uri_type),
    IMS_FIELD(Settings, subscribe_for_reg),
    IMS_FIELD(Settings, use_precondition),
    IMS_FIELD(Settings, sip_user_agent),
    IMS_FIELD(Settings, log_level),
    IMS_FIELD(Settings, sip_uri_only),
    IMS_FIELD(Settings, publish_timer),
    IMS_FIELD(Settings, publish_expiry),
    IMS_FIELD(Settings, extended_publish_timer),
    IMS_FIELD(Settings, is_gzip_enable),
    IMS_FIELD(Settings, subscription_expiry),
    IMS_FIELD(Settings, expire_header),
    IMS_FIELD(Settings, set_default_uri),
    IMS_FIELD(Settings, subscribe_list_sync_enabled),
    IMS_FIELD(Settings, add_phone_extension),
    IMS_FIELD(Settings, bad_event_expiry),
    IMS_FIELD(Settings, cap_cache_expiry),
    IMS_FIELD(Settings, add_pres_list_dummy),
    IMS_FIELD(Settings, anonymous_fetch),
    IMS_FIELD(Settings, update_auto_config),
    IMS_FIELD(Settings, publish_err_retry),
    IMS_FIELD(Settings, poll_list_sub_expiry),
    IMS_FIELD(Settings, subscribe_max_entry),
    IMS_XDM_FIELDS(),
    // Session, SIP and registration timers
    IMS_FIELD(Settings, conf_uri),
    IMS_FIELD(Settings, conf_subscribe),
    IMS_FIELD(Settings, conf_dialog_type),
    IMS_FIELD(Settings, reg_retry_base_time),
    IMS_FIELD(Settings, reg_retry_max_time),
    IMS_FIELD(Settings, session_expire),
    IMS_FIELD(Settings, ringing_timer),
    IMS_FIELD(Settings, ringback_timer),
    IMS_FIELD(Settings, subscriber_timer),
    IMS_FIELD(Settings, dtmf_mode),
    IMS_FIELD(Settings, enable_mwi),
    IMS_FIELD(Settings, mwi_subscribeexpiry),
    IMS_FIELD(Settings, enable_ciq),
    IMS_FIELD(Settings, enable_hasati),
    IMS_FIELD(Settings, invite_timeout),
    IMS_FIELD(Settings, enable_gruu),
    IMS_FIELD(Settings, ims_test_mode),
    IMS_FIELD(Settings, reg_expire),
    IMS_FIELD(Settings, self_port),
    IMS_FIELD(Settings, wifi_self_port),
    IMS_FIELD(Settings, transport_in_contact),
    IMS_FIELD(Settings, sip_mobility),
    IMS_FIELD(Settings, session_refresh_method),
    IMS_FIELD(Settings, smsc_psi),
    IMS_MEDIA_FIELDS(),
    IMS_MEDIA_FIELDS(_B2BPTT),
    IMS_XDM_FIELDS(_b2ptt),
    IMS_XDM_FIELDS(_mcptt),
    IMS_MEDIA_FIELDS(_MCPTT),
    // Operator, device management, logging and push-to-talk timers
    IMS_FIELD(Settings, support_ims_in_roaming),
    IMS_FIELD(Settings, is_volte_enabled),
    IMS_FIELD(Settings, is_lvc_enabled),
    IMS_FIELD(Settings, is_eab_enabled),
    IMS_FIELD(Settings, is_eab_pub_failed),
    IMS_FIELD(Settings, sms_format),
    IMS_FIELD(Settings, sms_write_uicc),
    IMS_FIELD(Settings, sms_over_ip),
    IMS_FIELD(Settings, vzw_timer),
    IMS_FIELD(Settings, t_delay),
    IMS_FIELD(Settings, ut_pdn_type),
    IMS_FIELD(Settings, ut_apn_name),
    IMS_FIELD(Settings, tvolte_hys_timer),
    IMS_FIELD(Settings, ims_config_name),
    IMS_FIELD(Settings, slick_config_name),
    IMS_FIELD(Settings, enable_all_log),
    IMS_FIELD(Settings, enforce_gba_support),
    IMS_FIELD(Settings, show_reg_icon),
    IMS_FIELD(Settings, volte_reg_icon_id),
    IMS_FIELD(Settings, all_enabled_log_level),
    IMS_FIELD(Settings, default_user_log_level),
    IMS_FIELD(Settings, default_eng_log_level),
    IMS_FIELD(Settings, build_type),
    IMS_FIELD(Settings, default_enablers_log_level),
    IMS_FIELD(Settings, default_framework_log_level),
    IMS_FIELD(Settings, default_sip_stack_log_level),
    IMS_FIELD(Settings, default_msrp_log_level),
    IMS_FIELD(Settings, default_media_log_level),
    IMS_FIELD(Settings, default_platform_log_level),
    IMS_FIELD(Settings, use_apcs),
    IMS_FIELD(Settings, cap_poll_interval),
    IMS_FIELD(Settings, src_throttle_publish),
    IMS_FIELD(Settings, avail_cache_exp),
    IMS_FIELD(Settings, cap_discovery),
    IMS_FIELD(Settings, video_capabilities),
    IMS_FIELD(Settings, custom_codecs),
    IMS_FIELD(Settings, h264lvga_payload_val),
    IMS_FIELD(Settings, ims_enabled),
    IMS_FIELD(Settings, apcs_service_status),
    IMS_FIELD(Settings, sms_psi),
    IMS_FIELD(Settings, lvc_beta_setting),
    IMS_FIELD(Settings, eab_setting),
    IMS_FIELD(Settings, dm_app_id),
    IMS_FIELD(Settings, dm_user_disp_name),
    IMS_FIELD(Settings, dm_con_ref),
    IMS_FIELD(Settings, pdp_context_pref),
    IMS_FIELD(Settings, pcscf_address),
    IMS_FIELD(Settings, public_user_id),
    IMS_FIELD(Settings, icsi),
    IMS_FIELD(Settings, icsi_rsc_alloc_mode),
    IMS_FIELD(Settings, rsc_alloc_mode),
    IMS_FIELD(Settings, voice_domain_pref_eutran),
    IMS_FIELD(Settings, voice_domain_pref_utran),
    IMS_FIELD(Settings, udp_keep_alive),
    IMS_FIELD(Settings, ims_voice_termination),
    IMS_FIELD(Settings, ss_domain_setting),
    IMS_FIELD(Settings, ss_control_pref),
    IMS_FIELD(Settings, dm_polling_period),
    IMS_FIELD(Settings, conf_factory_uri),
    IMS_FIELD(Settings, min_se),
    IMS_FIELD(Settings, dcn_number),
    IMS_FIELD(Settings, tlte911_fail),
    IMS_FIELD(Settings, domain_pui),
    IMS_FIELD(Settings, uri_media_rsc_serve_3way_call),
    IMS_FIELD(Settings, phone_context_uri),
    IMS_FIELD(Settings, amr_wb),
    IMS_FIELD(Settings, src_amr),
    IMS_FIELD(Settings, src_amr_wb),
    IMS_FIELD(Settings, hd_voice),
    IMS_FIELD(Settings, speaker_default_video),
    IMS_FIELD(Settings, volte_enabled_by_user),
    IMS_FIELD(Settings, lvc_enabled_by_user),
    IMS_FIELD(Settings, ussd_domain_setting),
    IMS_FIELD(Settings, emer_domain_setting),
    IMS_FIELD(Settings, volte_domain_ui_show),
    IMS_FIELD(Settings, sms_domain_ui_show),
    IMS_FIELD(Settings, ut_apn_setting_ui_show),
    IMS_FIELD(Settings, conf_factory_uri_show),
    IMS_FIELD(Settings, pip),
    IMS_FIELD(Settings, home_domain),
    IMS_FIELD(Settings, epdg_enabled),
    IMS_FIELD(Settings, ehrpd_enabled),
    IMS_FIELD(Settings, ss_csfb_with_ims_error),
    IMS_FIELD(Settings, show_reg_info_to_setting_app),
    // The service sends these three as text and takes them as numbers.
    IMS_FIELD(Settings, poc_session_expire),
    IMS_FIELD(Settings, poc_ringing_timer),
    IMS_FIELD(Settings, poc_invite_timeout),
    IMS_FIELD(Settings, conference_factory_uri),
};

#undef IMS_XDM_FIELDS
#undef IMS_MEDIA_FIELDS

static_assert(std::size(kSettingsRows) == 334);
static_assert(is_whole_record<Settings>(kSettingsRows));

inline constexpr auto kSettingsFields = field_table(kSettingsRows);

// Where writing is not the reverse of reading. The three push-to-talk timers are too, by their
// type.
inline constexpr WriteRule kSettingsWriteRules[] = {
    // The service takes these two from their neighbours, which it expects a second time in their
    // place; the copies with suffixes are written like every other key.
    {"audio_port_end", WriteAs::kOtherField, WriteAs::kOtherField, "audio_port_start"},
    {"is_enable_srtp", WriteAs::kOtherField, WriteAs::kOtherField, "is_avpf_enabled"},
    // A new set brings this number as text.
    {"is_enable_emm_MCPTT", WriteAs::kItself, WriteAs::kDecimalText, {}},
};
inline constexpr auto kSettingsUpdate =
    write_plan(kSettingsFields, kSettingsWriteRules, &WriteRule::update);
inline constexpr auto kSettingsAdd =
    write_plan(kSettingsFields, kSettingsWriteRules, &WriteRule::add);

inline constexpr Field kProfileRows[] = {
    IMS_FIELD(ims_profile_s, id),
    IMS_FIELD(ims_profile_s, enabled),
    IMS_FIELD(ims_profile_s, name),
    IMS_FIELD(ims_profile_s, mccmnc),
    IMS_FIELD(ims_profile_s, defaultMccMnc),
    IMS_FIELD(ims_profile_s, impi),
    IMS_FIELD(ims_profile_s, impu),
    IMS_FIELD(ims_profile_s, domain),
    IMS_FIELD(ims_profile_s, pdn),
    IMS_FIELD(ims_profile_s, network),
    IMS_FIELD(ims_profile_s, service),
    IMS_FIELD(ims_profile_s, networkEnabled),
    IMS_FIELD(ims_profile_s, priority),
    IMS_FIELD(ims_profile_s, authname),
    IMS_FIELD(ims_profile_s, password),
    IMS_FIELD(ims_profile_s, pcscf),
    IMS_FIELD(ims_profile_s, pcscfPref),
    IMS_FIELD(ims_profile_s, roaming),
    IMS_FIELD(ims_profile_s, port),
    IMS_FIELD(ims_profile_s, transport),
    IMS_FIELD(ims_profile_s, ipver),
    IMS_FIELD(ims_profile_s, regiAlgo),
    IMS_FIELD(ims_profile_s, ipsec),
    IMS_FIELD(ims_profile_s, saPortC),
    IMS_FIELD(ims_profile_s, saPortS),
    IMS_FIELD(ims_profile_s, encAlgo),
    IMS_FIELD(ims_profile_s, authAlgo),
    IMS_FIELD(ims_profile_s, isEmergencySupport),
    IMS_FIELD(ims_profile_s, rport),
    IMS_FIELD(ims_profile_s, isRegEnabled),
    IMS_FIELD(ims_profile_s, globalSettings),
    IMS_FIELD(ims_profile_s, opmode),
    IMS_FIELD(ims_profile_s, timer1),
    IMS_FIELD(ims_profile_s, timer2),
    IMS_FIELD(ims_profile_s, timer4),
    IMS_FIELD(ims_profile_s, timerA),
    IMS_FIELD(ims_profile_s, timerB),
    IMS_FIELD(ims_profile_s, timerC),
    IMS_FIELD(ims_profile_s, timerD),
    IMS_FIELD(ims_profile_s, timerE),
    IMS_FIELD(ims_profile_s, timerF),
    IMS_FIELD(ims_profile_s, timerG),
    IMS_FIELD(ims_profile_s, timerH),
    IMS_FIELD(ims_profile_s, timerI),
    IMS_FIELD(ims_profile_s, timerJ),
    IMS_FIELD(ims_profile_s, timerK),
    IMS_FIELD(ims_profile_s, mtuSize),
    IMS_FIELD(ims_profile_s, sipRegKeepAliveTimer),
    IMS_FIELD(ims_profile_s, vtSupported),
    IMS_FIELD(ims_profile_s, volteSupported),
    IMS_FIELD(ims_profile_s, network_environment_type),
};

static_assert(std::size(kProfileRows) == 51);
static_assert(is_whole_record<ims_profile_s>(kProfileRows));

inline constexpr auto kProfileFields = field_table(kProfileRows);
inline constexpr auto kProfileWrite = write_plan(kProfileFields, {}, &WriteRule::update);

} // namespace ims
