// SPDX-License-Identifier: Apache-2.0
#include "imsctl/settings/keys.hpp"

#include <iterator>

namespace imsctl {
namespace {

// A name that cannot be another member's.
#define IMSCTL_KEY(member)                                                                         \
    { #member, &SettingsRecord::member, offsetof(SettingsRecord, member) }

// The keys that come three times. Note the case of the suffixes below.
// clang-format off
#define IMSCTL_XDM_KEYS(suffix)                                                                    \
    IMSCTL_KEY(xdm_enable##suffix), IMSCTL_KEY(http_user_name##suffix),                            \
    IMSCTL_KEY(http_password##suffix), IMSCTL_KEY(xcap_root_uri##suffix),                          \
    IMSCTL_KEY(agg_proxy_ip##suffix), IMSCTL_KEY(auth_proxy_ip##suffix),                           \
    IMSCTL_KEY(auth_proxy_port##suffix), IMSCTL_KEY(xdm_user_agent##suffix),                       \
    IMSCTL_KEY(apn_selection##suffix), IMSCTL_KEY(xcap_root_uri_pref##suffix),                     \
    IMSCTL_KEY(xdm_user_id_domain##suffix), IMSCTL_KEY(bsf_ip##suffix),                            \
    IMSCTL_KEY(bsf_port##suffix), IMSCTL_KEY(enable_gba##suffix)

#define IMSCTL_MEDIA_KEYS(suffix)                                                                  \
    IMSCTL_KEY(rtp_timeout##suffix), IMSCTL_KEY(rtcp_timeout##suffix),                             \
    IMSCTL_KEY(enable_cp_autio_path##suffix), IMSCTL_KEY(amr_bundle_rate##suffix),                 \
    IMSCTL_KEY(log_trp_packets_to_file##suffix), IMSCTL_KEY(bit_rate##suffix),                     \
    IMSCTL_KEY(audio_codec_mode_val##suffix), IMSCTL_KEY(audio_video_tx_val##suffix),              \
    IMSCTL_KEY(amr_nb_mode##suffix), IMSCTL_KEY(amr_wb_mode##suffix),                              \
    IMSCTL_KEY(frame_rate##suffix), IMSCTL_KEY(curr_disp_format##suffix),                          \
    IMSCTL_KEY(audio_codec_val##suffix), IMSCTL_KEY(video_codec_val##suffix),                      \
    IMSCTL_KEY(text_port##suffix), IMSCTL_KEY(audio_port_start##suffix),                           \
    IMSCTL_KEY(audio_port_end##suffix), IMSCTL_KEY(video_port_start##suffix),                      \
    IMSCTL_KEY(video_port_end##suffix), IMSCTL_KEY(jitter_buffer_settings##suffix),                \
    IMSCTL_KEY(presence_list_max_entries##suffix), IMSCTL_KEY(is_enable_emm##suffix),              \
    IMSCTL_KEY(is_enable_loopback##suffix), IMSCTL_KEY(is_external_gtty##suffix),                  \
    IMSCTL_KEY(is_avpf_enabled##suffix), IMSCTL_KEY(is_enable_srtp##suffix),                       \
    IMSCTL_KEY(is_disp_fps_bitrate_enabled##suffix), IMSCTL_KEY(audio_as##suffix),                 \
    IMSCTL_KEY(audio_rs##suffix), IMSCTL_KEY(audio_rr##suffix), IMSCTL_KEY(video_as##suffix),      \
    IMSCTL_KEY(video_rs##suffix), IMSCTL_KEY(video_rr##suffix),                                    \
    IMSCTL_KEY(amrnbbe_payload_val##suffix), IMSCTL_KEY(amrnboa_payload_val##suffix),              \
    IMSCTL_KEY(amrwbbe_payload_val##suffix), IMSCTL_KEY(amrwboa_payload_val##suffix),              \
    IMSCTL_KEY(h264qvga_payload_val##suffix), IMSCTL_KEY(h264vga_payload_val##suffix),             \
    IMSCTL_KEY(h264vgal_payload_val##suffix), IMSCTL_KEY(dtmf_nb_payload_val##suffix),             \
    IMSCTL_KEY(dtmf_wb_payload_val##suffix), IMSCTL_KEY(packetization_model##suffix),              \
    IMSCTL_KEY(enable_g711_codec##suffix), IMSCTL_KEY(audio_capabilities##suffix),                 \
    IMSCTL_KEY(dtmf_codec_mode##suffix), IMSCTL_KEY(enable_bwm##suffix),                           \
    IMSCTL_KEY(enable_bwm_default##suffix), IMSCTL_KEY(rtp_keep_alive##suffix)
// clang-format on

constexpr Key<SettingsRecord> kSettingsKeys[] = {
    // clang-format off
    // Identity and presence
    IMSCTL_KEY(id), IMSCTL_KEY(name), IMSCTL_KEY(network), IMSCTL_KEY(is_rcs_enabled),
    IMSCTL_KEY(rcs_version), IMSCTL_KEY(rcs_auto_config_source), IMSCTL_KEY(rcs_home_pref),
    IMSCTL_KEY(rcs_roaming_pref), IMSCTL_KEY(closed_group_chat), IMSCTL_KEY(local_uri_type),
    IMSCTL_KEY(remote_uri_type), IMSCTL_KEY(subscribe_for_reg), IMSCTL_KEY(use_precondition),
    IMSCTL_KEY(sip_user_agent), IMSCTL_KEY(log_level), IMSCTL_KEY(sip_uri_only),
    IMSCTL_KEY(publish_timer), IMSCTL_KEY(publish_expiry), IMSCTL_KEY(extended_publish_timer),
    IMSCTL_KEY(is_gzip_enable), IMSCTL_KEY(subscription_expiry), IMSCTL_KEY(expire_header),
    IMSCTL_KEY(set_default_uri), IMSCTL_KEY(subscribe_list_sync_enabled),
    IMSCTL_KEY(add_phone_extension), IMSCTL_KEY(bad_event_expiry), IMSCTL_KEY(cap_cache_expiry),
    IMSCTL_KEY(add_pres_list_dummy), IMSCTL_KEY(anonymous_fetch), IMSCTL_KEY(update_auto_config),
    IMSCTL_KEY(publish_err_retry), IMSCTL_KEY(poll_list_sub_expiry),
    IMSCTL_KEY(subscribe_max_entry),
    IMSCTL_XDM_KEYS(),
    // Session, SIP and registration timers
    IMSCTL_KEY(conf_uri), IMSCTL_KEY(conf_subscribe), IMSCTL_KEY(conf_dialog_type),
    IMSCTL_KEY(reg_retry_base_time), IMSCTL_KEY(reg_retry_max_time), IMSCTL_KEY(session_expire),
    IMSCTL_KEY(ringing_timer), IMSCTL_KEY(ringback_timer), IMSCTL_KEY(subscriber_timer),
    IMSCTL_KEY(dtmf_mode), IMSCTL_KEY(enable_mwi), IMSCTL_KEY(mwi_subscribeexpiry),
    IMSCTL_KEY(enable_ciq), IMSCTL_KEY(enable_hasati), IMSCTL_KEY(invite_timeout),
    IMSCTL_KEY(enable_gruu), IMSCTL_KEY(ims_test_mode), IMSCTL_KEY(reg_expire),
    IMSCTL_KEY(self_port), IMSCTL_KEY(wifi_self_port), IMSCTL_KEY(transport_in_contact),
    IMSCTL_KEY(sip_mobility), IMSCTL_KEY(session_refresh_method), IMSCTL_KEY(smsc_psi),
    IMSCTL_MEDIA_KEYS(),
    IMSCTL_MEDIA_KEYS(_B2BPTT),
    IMSCTL_XDM_KEYS(_b2ptt),
    IMSCTL_XDM_KEYS(_mcptt),
    IMSCTL_MEDIA_KEYS(_MCPTT),
    // Operator, device management, logging and push-to-talk timers
    IMSCTL_KEY(support_ims_in_roaming), IMSCTL_KEY(is_volte_enabled), IMSCTL_KEY(is_lvc_enabled),
    IMSCTL_KEY(is_eab_enabled), IMSCTL_KEY(is_eab_pub_failed), IMSCTL_KEY(sms_format),
    IMSCTL_KEY(sms_write_uicc), IMSCTL_KEY(sms_over_ip), IMSCTL_KEY(vzw_timer), IMSCTL_KEY(t_delay),
    IMSCTL_KEY(ut_pdn_type), IMSCTL_KEY(ut_apn_name), IMSCTL_KEY(tvolte_hys_timer),
    IMSCTL_KEY(ims_config_name), IMSCTL_KEY(slick_config_name), IMSCTL_KEY(enable_all_log),
    IMSCTL_KEY(enforce_gba_support), IMSCTL_KEY(show_reg_icon), IMSCTL_KEY(volte_reg_icon_id),
    IMSCTL_KEY(all_enabled_log_level), IMSCTL_KEY(default_user_log_level),
    IMSCTL_KEY(default_eng_log_level), IMSCTL_KEY(build_type),
    IMSCTL_KEY(default_enablers_log_level), IMSCTL_KEY(default_framework_log_level),
    IMSCTL_KEY(default_sip_stack_log_level), IMSCTL_KEY(default_msrp_log_level),
    IMSCTL_KEY(default_media_log_level), IMSCTL_KEY(default_platform_log_level),
    IMSCTL_KEY(use_apcs), IMSCTL_KEY(cap_poll_interval), IMSCTL_KEY(src_throttle_publish),
    IMSCTL_KEY(avail_cache_exp), IMSCTL_KEY(cap_discovery), IMSCTL_KEY(video_capabilities),
    IMSCTL_KEY(custom_codecs), IMSCTL_KEY(h264lvga_payload_val), IMSCTL_KEY(ims_enabled),
    IMSCTL_KEY(apcs_service_status), IMSCTL_KEY(sms_psi), IMSCTL_KEY(lvc_beta_setting),
    IMSCTL_KEY(eab_setting), IMSCTL_KEY(dm_app_id), IMSCTL_KEY(dm_user_disp_name),
    IMSCTL_KEY(dm_con_ref), IMSCTL_KEY(pdp_context_pref), IMSCTL_KEY(pcscf_address),
    IMSCTL_KEY(public_user_id), IMSCTL_KEY(icsi), IMSCTL_KEY(icsi_rsc_alloc_mode),
    IMSCTL_KEY(rsc_alloc_mode), IMSCTL_KEY(voice_domain_pref_eutran),
    IMSCTL_KEY(voice_domain_pref_utran), IMSCTL_KEY(udp_keep_alive),
    IMSCTL_KEY(ims_voice_termination), IMSCTL_KEY(ss_domain_setting), IMSCTL_KEY(ss_control_pref),
    IMSCTL_KEY(dm_polling_period), IMSCTL_KEY(conf_factory_uri), IMSCTL_KEY(min_se),
    IMSCTL_KEY(dcn_number), IMSCTL_KEY(tlte911_fail), IMSCTL_KEY(domain_pui),
    IMSCTL_KEY(uri_media_rsc_serve_3way_call), IMSCTL_KEY(phone_context_uri), IMSCTL_KEY(amr_wb),
    IMSCTL_KEY(src_amr), IMSCTL_KEY(src_amr_wb), IMSCTL_KEY(hd_voice),
    IMSCTL_KEY(speaker_default_video), IMSCTL_KEY(volte_enabled_by_user),
    IMSCTL_KEY(lvc_enabled_by_user), IMSCTL_KEY(ussd_domain_setting),
    IMSCTL_KEY(emer_domain_setting), IMSCTL_KEY(volte_domain_ui_show),
    IMSCTL_KEY(sms_domain_ui_show), IMSCTL_KEY(ut_apn_setting_ui_show),
    IMSCTL_KEY(conf_factory_uri_show), IMSCTL_KEY(pip), IMSCTL_KEY(home_domain),
    IMSCTL_KEY(epdg_enabled), IMSCTL_KEY(ehrpd_enabled), IMSCTL_KEY(ss_csfb_with_ims_error),
    IMSCTL_KEY(show_reg_info_to_setting_app), IMSCTL_KEY(poc_session_expire),
    IMSCTL_KEY(poc_ringing_timer), IMSCTL_KEY(poc_invite_timeout),
    IMSCTL_KEY(conference_factory_uri),
    // clang-format on
};

#undef IMSCTL_MEDIA_KEYS
#undef IMSCTL_XDM_KEYS
#undef IMSCTL_KEY

static_assert(std::size(kSettingsKeys) == 334);
static_assert(covers(kSettingsKeys));

} // namespace

template <>
std::span<const Key<SettingsRecord>> keys_of() {
    return kSettingsKeys;
}

} // namespace imsctl
