/*
 * SPDX-License-Identifier: Apache-2.0
 */
#ifndef KELVO_IMS_SETTINGS_KEYS_H
#define KELVO_IMS_SETTINGS_KEYS_H

/**
 * @file
 * @brief The keys of settings sets and profiles as lists, for programs that go through all of them.
 */

/**
 * @defgroup ims_settings_keys Keys of settings
 * @brief The keys of settings sets and profiles, to go through all of them.
 *
 * A field of #ims_global_settings_s or #ims_profile_s and its key on the bus have one name. Each
 * list here is a macro that takes the name of another one and expands to a use of that one for
 * every field, in the order of their declaration and with nothing in between. So a program shows or
 * compares whole records without a list of its own:
 *
 * @code{.c}
 * #include <ims_settings_keys.h>
 * #include <stddef.h>
 *
 * struct key {
 *     const char *name;
 *     size_t offset;
 * };
 *
 * #define PROFILE_KEY(key) {#key, offsetof(ims_profile_s, key)},
 * const struct key profile_keys[] = {IMS_PROFILE_KEYS(PROFILE_KEY)};
 * #undef PROFILE_KEY
 * @endcode
 *
 * ims.h does not include this header: few programs need it.
 *
 * @{
 */

#include "ims_settings.h"

/* clang-format off */

/**
 * The keys of access to the XDM document server, which a set has three times: as they are, for the
 * suffix `_b2ptt` and for `_mcptt`.
 *
 * @param KEY     the macro that takes a field's name
 * @param suffix  what the names end with; may be empty
 *
 * @hideinitializer
 */
#define IMS_GLOBAL_SETTINGS_XDM_KEYS(KEY, suffix)                                                  \
    KEY(xdm_enable##suffix) KEY(http_user_name##suffix) KEY(http_password##suffix)                 \
    KEY(xcap_root_uri##suffix) KEY(agg_proxy_ip##suffix) KEY(auth_proxy_ip##suffix)                \
    KEY(auth_proxy_port##suffix) KEY(xdm_user_agent##suffix) KEY(apn_selection##suffix)            \
    KEY(xcap_root_uri_pref##suffix) KEY(xdm_user_id_domain##suffix) KEY(bsf_ip##suffix)            \
    KEY(bsf_port##suffix) KEY(enable_gba##suffix)

/**
 * The keys of media, which a set has three times: as they are, for the suffix `_B2BPTT` and for
 * `_MCPTT`.
 *
 * @param KEY     the macro that takes a field's name
 * @param suffix  what the names end with; may be empty
 *
 * @hideinitializer
 */
#define IMS_GLOBAL_SETTINGS_MEDIA_KEYS(KEY, suffix)                                                \
    KEY(rtp_timeout##suffix) KEY(rtcp_timeout##suffix) KEY(enable_cp_autio_path##suffix)           \
    KEY(amr_bundle_rate##suffix) KEY(log_trp_packets_to_file##suffix) KEY(bit_rate##suffix)        \
    KEY(audio_codec_mode_val##suffix) KEY(audio_video_tx_val##suffix) KEY(amr_nb_mode##suffix)     \
    KEY(amr_wb_mode##suffix) KEY(frame_rate##suffix) KEY(curr_disp_format##suffix)                 \
    KEY(audio_codec_val##suffix) KEY(video_codec_val##suffix) KEY(text_port##suffix)               \
    KEY(audio_port_start##suffix) KEY(audio_port_end##suffix) KEY(video_port_start##suffix)        \
    KEY(video_port_end##suffix) KEY(jitter_buffer_settings##suffix)                                \
    KEY(presence_list_max_entries##suffix) KEY(is_enable_emm##suffix)                              \
    KEY(is_enable_loopback##suffix) KEY(is_external_gtty##suffix) KEY(is_avpf_enabled##suffix)     \
    KEY(is_enable_srtp##suffix) KEY(is_disp_fps_bitrate_enabled##suffix) KEY(audio_as##suffix)     \
    KEY(audio_rs##suffix) KEY(audio_rr##suffix) KEY(video_as##suffix) KEY(video_rs##suffix)        \
    KEY(video_rr##suffix) KEY(amrnbbe_payload_val##suffix) KEY(amrnboa_payload_val##suffix)        \
    KEY(amrwbbe_payload_val##suffix) KEY(amrwboa_payload_val##suffix)                              \
    KEY(h264qvga_payload_val##suffix) KEY(h264vga_payload_val##suffix)                             \
    KEY(h264vgal_payload_val##suffix) KEY(dtmf_nb_payload_val##suffix)                             \
    KEY(dtmf_wb_payload_val##suffix) KEY(packetization_model##suffix)                              \
    KEY(enable_g711_codec##suffix) KEY(audio_capabilities##suffix) KEY(dtmf_codec_mode##suffix)    \
    KEY(enable_bwm##suffix) KEY(enable_bwm_default##suffix) KEY(rtp_keep_alive##suffix)

/**
 * All 334 fields of #ims_global_settings_s.
 *
 * @param KEY  the macro that takes a field's name
 *
 * @hideinitializer
 */
#define IMS_GLOBAL_SETTINGS_KEYS(KEY)                                                              \
    KEY(id) KEY(name) KEY(network) KEY(is_rcs_enabled) KEY(rcs_version)                            \
    KEY(rcs_auto_config_source) KEY(rcs_home_pref) KEY(rcs_roaming_pref) KEY(closed_group_chat)    \
    KEY(local_uri_type) KEY(remote_uri_type) KEY(subscribe_for_reg) KEY(use_precondition)          \
    KEY(sip_user_agent) KEY(log_level) KEY(sip_uri_only) KEY(publish_timer) KEY(publish_expiry)    \
    KEY(extended_publish_timer) KEY(is_gzip_enable) KEY(subscription_expiry) KEY(expire_header)    \
    KEY(set_default_uri) KEY(subscribe_list_sync_enabled) KEY(add_phone_extension)                 \
    KEY(bad_event_expiry) KEY(cap_cache_expiry) KEY(add_pres_list_dummy) KEY(anonymous_fetch)      \
    KEY(update_auto_config) KEY(publish_err_retry) KEY(poll_list_sub_expiry)                       \
    KEY(subscribe_max_entry)                                                                       \
    IMS_GLOBAL_SETTINGS_XDM_KEYS(KEY, )                                                            \
    KEY(conf_uri) KEY(conf_subscribe) KEY(conf_dialog_type) KEY(reg_retry_base_time)               \
    KEY(reg_retry_max_time) KEY(session_expire) KEY(ringing_timer) KEY(ringback_timer)             \
    KEY(subscriber_timer) KEY(dtmf_mode) KEY(enable_mwi) KEY(mwi_subscribeexpiry) KEY(enable_ciq)  \
    KEY(enable_hasati) KEY(invite_timeout) KEY(enable_gruu) KEY(ims_test_mode) KEY(reg_expire)     \
    KEY(self_port) KEY(wifi_self_port) KEY(transport_in_contact) KEY(sip_mobility)                 \
    KEY(session_refresh_method) KEY(smsc_psi)                                                      \
    IMS_GLOBAL_SETTINGS_MEDIA_KEYS(KEY, )                                                          \
    IMS_GLOBAL_SETTINGS_MEDIA_KEYS(KEY, _B2BPTT)                                                   \
    IMS_GLOBAL_SETTINGS_XDM_KEYS(KEY, _b2ptt)                                                      \
    IMS_GLOBAL_SETTINGS_XDM_KEYS(KEY, _mcptt)                                                      \
    IMS_GLOBAL_SETTINGS_MEDIA_KEYS(KEY, _MCPTT)                                                    \
    KEY(support_ims_in_roaming) KEY(is_volte_enabled) KEY(is_lvc_enabled) KEY(is_eab_enabled)      \
    KEY(is_eab_pub_failed) KEY(sms_format) KEY(sms_write_uicc) KEY(sms_over_ip) KEY(vzw_timer)     \
    KEY(t_delay) KEY(ut_pdn_type) KEY(ut_apn_name) KEY(tvolte_hys_timer) KEY(ims_config_name)      \
    KEY(slick_config_name) KEY(enable_all_log) KEY(enforce_gba_support) KEY(show_reg_icon)         \
    KEY(volte_reg_icon_id) KEY(all_enabled_log_level) KEY(default_user_log_level)                  \
    KEY(default_eng_log_level) KEY(build_type) KEY(default_enablers_log_level)                     \
    KEY(default_framework_log_level) KEY(default_sip_stack_log_level) KEY(default_msrp_log_level)  \
    KEY(default_media_log_level) KEY(default_platform_log_level) KEY(use_apcs)                     \
    KEY(cap_poll_interval) KEY(src_throttle_publish) KEY(avail_cache_exp) KEY(cap_discovery)       \
    KEY(video_capabilities) KEY(custom_codecs) KEY(h264lvga_payload_val) KEY(ims_enabled)          \
    KEY(apcs_service_status) KEY(sms_psi) KEY(lvc_beta_setting) KEY(eab_setting) KEY(dm_app_id)    \
    KEY(dm_user_disp_name) KEY(dm_con_ref) KEY(pdp_context_pref) KEY(pcscf_address)                \
    KEY(public_user_id) KEY(icsi) KEY(icsi_rsc_alloc_mode) KEY(rsc_alloc_mode)                     \
    KEY(voice_domain_pref_eutran) KEY(voice_domain_pref_utran) KEY(udp_keep_alive)                 \
    KEY(ims_voice_termination) KEY(ss_domain_setting) KEY(ss_control_pref) KEY(dm_polling_period)  \
    KEY(conf_factory_uri) KEY(min_se) KEY(dcn_number) KEY(tlte911_fail) KEY(domain_pui)            \
    KEY(uri_media_rsc_serve_3way_call) KEY(phone_context_uri) KEY(amr_wb) KEY(src_amr)             \
    KEY(src_amr_wb) KEY(hd_voice) KEY(speaker_default_video) KEY(volte_enabled_by_user)            \
    KEY(lvc_enabled_by_user) KEY(ussd_domain_setting) KEY(emer_domain_setting)                     \
    KEY(volte_domain_ui_show) KEY(sms_domain_ui_show) KEY(ut_apn_setting_ui_show)                  \
    KEY(conf_factory_uri_show) KEY(pip) KEY(home_domain) KEY(epdg_enabled) KEY(ehrpd_enabled)      \
    KEY(ss_csfb_with_ims_error) KEY(show_reg_info_to_setting_app) KEY(poc_session_expire)          \
    KEY(poc_ringing_timer) KEY(poc_invite_timeout) KEY(conference_factory_uri)

/**
 * All 51 fields of #ims_profile_s.
 *
 * @param KEY  the macro that takes a field's name
 *
 * @hideinitializer
 */
#define IMS_PROFILE_KEYS(KEY)                                                                      \
    KEY(id) KEY(enabled) KEY(name) KEY(mccmnc) KEY(defaultMccMnc) KEY(impi) KEY(impu) KEY(domain)  \
    KEY(pdn) KEY(network) KEY(service) KEY(networkEnabled) KEY(priority) KEY(authname)             \
    KEY(password) KEY(pcscf) KEY(pcscfPref) KEY(roaming) KEY(port) KEY(transport) KEY(ipver)       \
    KEY(regiAlgo) KEY(ipsec) KEY(saPortC) KEY(saPortS) KEY(encAlgo) KEY(authAlgo)                  \
    KEY(isEmergencySupport) KEY(rport) KEY(isRegEnabled) KEY(globalSettings) KEY(opmode)           \
    KEY(timer1) KEY(timer2) KEY(timer4) KEY(timerA) KEY(timerB) KEY(timerC) KEY(timerD)            \
    KEY(timerE) KEY(timerF) KEY(timerG) KEY(timerH) KEY(timerI) KEY(timerJ) KEY(timerK)            \
    KEY(mtuSize) KEY(sipRegKeepAliveTimer) KEY(vtSupported) KEY(volteSupported)                    \
    KEY(network_environment_type)

/* clang-format on */

/** @} */

#endif
