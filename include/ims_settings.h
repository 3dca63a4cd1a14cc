/*
 * SPDX-License-Identifier: Apache-2.0
 */
#ifndef KELVO_IMS_SETTINGS_H
#define KELVO_IMS_SETTINGS_H

/**
 * @file
 * @brief The service's global settings sets, its registration profiles and its network environment.
 */

/**
 * @defgroup ims_settings Settings and profiles
 * @brief Global settings sets, registration profiles, network environment:
 * `org.kelvo.ims.Settings`.
 *
 * @section ims_settings_life The life of a set and of a profile
 *
 * The service keeps sets of global settings, each known by its name, and registration profiles,
 * each known by its id; a profile names the set that goes with it in `globalSettings`. They outlive
 * applications. To change one, read it, change fields and write it back; all fields are written.
 * There are no events: who wants to know, asks again.
 *
 * @code{.c}
 * #include <ims.h>
 * #include <stdlib.h>
 *
 * int let_it_ring(ims_h handle, const char *name, int32_t ringing_timer) {
 *     ims_global_settings_s *set = calloc(1, sizeof *set); // zeroed before its first use
 *     if (set == NULL)
 *         return IMS_ERROR_OPERATION_FAILED;
 *     int error = ims_get_global_settings_info(handle, name, set);
 *     if (error == IMS_ERROR_NONE) {
 *         set->ringing_timer = ringing_timer;
 *         error = ims_update_global_settings(handle, set, NULL, NULL); // read now, not later
 *     }
 *     ims_global_settings_clear(set);
 *     free(set);
 *     return error;
 * }
 * @endcode
 *
 * A set or a profile crosses the bus as one dictionary `a{sv}`, whose keys are the names of the
 * fields: `int32_t` as `i`, `bool` as `b`, `char *` as `s`. The service defines what the values
 * mean, their units and ranges, see @ref ims_values.
 *
 * What all functions share is said in @ref ims_requests and @ref ims_errors. None of the methods
 * carries the application id. The reply to a request is `(i)`, the result, and its callback's data
 * is NULL.
 *
 * @section ims_settings_records Records
 *
 * To be read: zero a record before its first use. A key that the service leaves out, or whose value
 * has another type, leaves its field as the caller had it; a key that no field is named after is
 * skipped. Every text that the service sends is a copy that the caller owns; a text that a field
 * held before is overwritten, not freed. The clear functions free the texts of a record, those of a
 * list also behind its count, and zero it whole; they need no handle and no IMS feature, and NULL
 * does nothing.
 *
 * To be written: the record is the caller's and read during the call only. No text may be NULL:
 * that is an invalid parameter.
 *
 * @{
 */

#include "ims_types.h"

#ifdef __cplusplus
extern "C" {
#endif

/** A timer that the service sends as text and takes as a number. */
typedef struct ims_settings_timer_s {
    char *text;    /**< read: a copy that the caller owns, NULL when the service sent no text. Never
                        written */
    int32_t value; /**< read: the number that the text spells, otherwise 0. Written as `i` */
} ims_settings_timer_s;

/**
 * One named set of global settings; ims_global_settings_clear() releases it. See
 * @ref ims_settings_records.
 *
 * Written and read back, a set keeps its values, with two exceptions that the service counts on:
 * `audio_port_end` and `is_enable_srtp` are read but never written.
 */
typedef struct ims_global_settings_s {
    /** @name Identity and presence
     * @{ */
    /** The key of this name. */
    int32_t id;
    char *name;
    char *network;
    bool is_rcs_enabled;
    int32_t rcs_version;
    int32_t rcs_auto_config_source;
    int32_t rcs_home_pref;
    int32_t rcs_roaming_pref;
    bool closed_group_chat;
    char *local_uri_type;
    char *remote_uri_type;
    int32_t subscribe_for_reg;
    int32_t use_precondition;
    char *sip_user_agent;
    int32_t log_level;
    bool sip_uri_only;
    int32_t publish_timer;
    int32_t publish_expiry;
    int32_t extended_publish_timer;
    int32_t is_gzip_enable;
    int32_t subscription_expiry;
    int32_t expire_header;
    int32_t set_default_uri;
    int32_t subscribe_list_sync_enabled;
    int32_t add_phone_extension;
    int32_t bad_event_expiry;
    int32_t cap_cache_expiry;
    char *add_pres_list_dummy;
    bool anonymous_fetch;
    bool update_auto_config;
    int32_t publish_err_retry;
    int32_t poll_list_sub_expiry;
    int32_t subscribe_max_entry;
    /** @} */

    /** @name Access to the XDM document server
     * @{ */
    /** The key of this name. */
    int32_t xdm_enable;
    char *http_user_name;
    char *http_password;
    char *xcap_root_uri;
    char *agg_proxy_ip;
    char *auth_proxy_ip;
    int32_t auth_proxy_port;
    char *xdm_user_agent;
    char *apn_selection;
    int32_t xcap_root_uri_pref;
    char *xdm_user_id_domain;
    char *bsf_ip;
    char *bsf_port;
    int32_t enable_gba;
    /** @} */

    /** @name Session, SIP and registration timers
     * @{ */
    /** The key of this name. */
    char *conf_uri;
    char *conf_subscribe;
    char *conf_dialog_type;
    int32_t reg_retry_base_time;
    int32_t reg_retry_max_time;
    int32_t session_expire;
    int32_t ringing_timer;
    int32_t ringback_timer;
    int32_t subscriber_timer;
    int32_t dtmf_mode;
    int32_t enable_mwi;
    int32_t mwi_subscribeexpiry;
    int32_t enable_ciq;
    int32_t enable_hasati;
    int32_t invite_timeout;
    int32_t enable_gruu;
    bool ims_test_mode;
    char *reg_expire;
    char *self_port;
    char *wifi_self_port;
    int32_t transport_in_contact;
    int32_t sip_mobility;
    int32_t session_refresh_method;
    char *smsc_psi;
    /** @} */

    /** @name Media
     * @{ */
    /** The key of this name. */
    int32_t rtp_timeout;
    int32_t rtcp_timeout;
    int32_t enable_cp_autio_path;
    int32_t amr_bundle_rate;
    int32_t log_trp_packets_to_file;
    int32_t bit_rate;
    char *audio_codec_mode_val;
    int32_t audio_video_tx_val;
    char *amr_nb_mode;
    char *amr_wb_mode;
    int32_t frame_rate;
    char *curr_disp_format;
    char *audio_codec_val;
    char *video_codec_val;
    int32_t text_port;
    int32_t audio_port_start;
    int32_t audio_port_end;
    int32_t video_port_start;
    int32_t video_port_end;
    int32_t jitter_buffer_settings;
    char *presence_list_max_entries;
    int32_t is_enable_emm;
    int32_t is_enable_loopback;
    int32_t is_external_gtty;
    int32_t is_avpf_enabled;
    int32_t is_enable_srtp;
    int32_t is_disp_fps_bitrate_enabled;
    int32_t audio_as;
    int32_t audio_rs;
    int32_t audio_rr;
    int32_t video_as;
    int32_t video_rs;
    int32_t video_rr;
    int32_t amrnbbe_payload_val;
    int32_t amrnboa_payload_val;
    int32_t amrwbbe_payload_val;
    int32_t amrwboa_payload_val;
    int32_t h264qvga_payload_val;
    int32_t h264vga_payload_val;
    int32_t h264vgal_payload_val;
    int32_t dtmf_nb_payload_val;
    int32_t dtmf_wb_payload_val;
    char *packetization_model;
    char *enable_g711_codec;
    char *audio_capabilities;
    char *dtmf_codec_mode;
    char *enable_bwm;
    char *enable_bwm_default;
    int32_t rtp_keep_alive;
    /** @} */

    /** @name Media for B2B push-to-talk
     * @{ */
    /** The key of this name. */
    int32_t rtp_timeout_B2BPTT;
    int32_t rtcp_timeout_B2BPTT;
    int32_t enable_cp_autio_path_B2BPTT;
    int32_t amr_bundle_rate_B2BPTT;
    int32_t log_trp_packets_to_file_B2BPTT;
    int32_t bit_rate_B2BPTT;
    char *audio_codec_mode_val_B2BPTT;
    int32_t audio_video_tx_val_B2BPTT;
    char *amr_nb_mode_B2BPTT;
    char *amr_wb_mode_B2BPTT;
    int32_t frame_rate_B2BPTT;
    char *curr_disp_format_B2BPTT;
    char *audio_codec_val_B2BPTT;
    char *video_codec_val_B2BPTT;
    int32_t text_port_B2BPTT;
    int32_t audio_port_start_B2BPTT;
    int32_t audio_port_end_B2BPTT;
    int32_t video_port_start_B2BPTT;
    int32_t video_port_end_B2BPTT;
    int32_t jitter_buffer_settings_B2BPTT;
    char *presence_list_max_entries_B2BPTT;
    int32_t is_enable_emm_B2BPTT;
    int32_t is_enable_loopback_B2BPTT;
    int32_t is_external_gtty_B2BPTT;
    int32_t is_avpf_enabled_B2BPTT;
    int32_t is_enable_srtp_B2BPTT;
    int32_t is_disp_fps_bitrate_enabled_B2BPTT;
    int32_t audio_as_B2BPTT;
    int32_t audio_rs_B2BPTT;
    int32_t audio_rr_B2BPTT;
    int32_t video_as_B2BPTT;
    int32_t video_rs_B2BPTT;
    int32_t video_rr_B2BPTT;
    int32_t amrnbbe_payload_val_B2BPTT;
    int32_t amrnboa_payload_val_B2BPTT;
    int32_t amrwbbe_payload_val_B2BPTT;
    int32_t amrwboa_payload_val_B2BPTT;
    int32_t h264qvga_payload_val_B2BPTT;
    int32_t h264vga_payload_val_B2BPTT;
    int32_t h264vgal_payload_val_B2BPTT;
    int32_t dtmf_nb_payload_val_B2BPTT;
    int32_t dtmf_wb_payload_val_B2BPTT;
    char *packetization_model_B2BPTT;
    char *enable_g711_codec_B2BPTT;
    char *audio_capabilities_B2BPTT;
    char *dtmf_codec_mode_B2BPTT;
    char *enable_bwm_B2BPTT;
    char *enable_bwm_default_B2BPTT;
    int32_t rtp_keep_alive_B2BPTT;
    /** @} */

    /** @name Access to the XDM document server for B2B push-to-talk
     * @{ */
    /** The key of this name. */
    int32_t xdm_enable_b2ptt;
    char *http_user_name_b2ptt;
    char *http_password_b2ptt;
    char *xcap_root_uri_b2ptt;
    char *agg_proxy_ip_b2ptt;
    char *auth_proxy_ip_b2ptt;
    int32_t auth_proxy_port_b2ptt;
    char *xdm_user_agent_b2ptt;
    char *apn_selection_b2ptt;
    int32_t xcap_root_uri_pref_b2ptt;
    char *xdm_user_id_domain_b2ptt;
    char *bsf_ip_b2ptt;
    char *bsf_port_b2ptt;
    int32_t enable_gba_b2ptt;
    /** @} */

    /** @name Access to the XDM document server for mission critical push-to-talk
     * @{ */
    /** The key of this name. */
    int32_t xdm_enable_mcptt;
    char *http_user_name_mcptt;
    char *http_password_mcptt;
    char *xcap_root_uri_mcptt;
    char *agg_proxy_ip_mcptt;
    char *auth_proxy_ip_mcptt;
    int32_t auth_proxy_port_mcptt;
    char *xdm_user_agent_mcptt;
    char *apn_selection_mcptt;
    int32_t xcap_root_uri_pref_mcptt;
    char *xdm_user_id_domain_mcptt;
    char *bsf_ip_mcptt;
    char *bsf_port_mcptt;
    int32_t enable_gba_mcptt;
    /** @} */

    /** @name Media for mission critical push-to-talk
     * @{ */
    /** The key of this name. */
    int32_t rtp_timeout_MCPTT;
    int32_t rtcp_timeout_MCPTT;
    int32_t enable_cp_autio_path_MCPTT;
    int32_t amr_bundle_rate_MCPTT;
    int32_t log_trp_packets_to_file_MCPTT;
    int32_t bit_rate_MCPTT;
    char *audio_codec_mode_val_MCPTT;
    int32_t audio_video_tx_val_MCPTT;
    char *amr_nb_mode_MCPTT;
    char *amr_wb_mode_MCPTT;
    int32_t frame_rate_MCPTT;
    char *curr_disp_format_MCPTT;
    char *audio_codec_val_MCPTT;
    char *video_codec_val_MCPTT;
    int32_t text_port_MCPTT;
    int32_t audio_port_start_MCPTT;
    int32_t audio_port_end_MCPTT;
    int32_t video_port_start_MCPTT;
    int32_t video_port_end_MCPTT;
    int32_t jitter_buffer_settings_MCPTT;
    char *presence_list_max_entries_MCPTT;
    int32_t is_enable_emm_MCPTT;
    int32_t is_enable_loopback_MCPTT;
    int32_t is_external_gtty_MCPTT;
    int32_t is_avpf_enabled_MCPTT;
    int32_t is_enable_srtp_MCPTT;
    int32_t is_disp_fps_bitrate_enabled_MCPTT;
    int32_t audio_as_MCPTT;
    int32_t audio_rs_MCPTT;
    int32_t audio_rr_MCPTT;
    int32_t video_as_MCPTT;
    int32_t video_rs_MCPTT;
    int32_t video_rr_MCPTT;
    int32_t amrnbbe_payload_val_MCPTT;
    int32_t amrnboa_payload_val_MCPTT;
    int32_t amrwbbe_payload_val_MCPTT;
    int32_t amrwboa_payload_val_MCPTT;
    int32_t h264qvga_payload_val_MCPTT;
    int32_t h264vga_payload_val_MCPTT;
    int32_t h264vgal_payload_val_MCPTT;
    int32_t dtmf_nb_payload_val_MCPTT;
    int32_t dtmf_wb_payload_val_MCPTT;
    char *packetization_model_MCPTT;
    char *enable_g711_codec_MCPTT;
    char *audio_capabilities_MCPTT;
    char *dtmf_codec_mode_MCPTT;
    char *enable_bwm_MCPTT;
    char *enable_bwm_default_MCPTT;
    int32_t rtp_keep_alive_MCPTT;
    /** @} */

    /** @name Operator, device management, logging and push-to-talk timers
     * @{ */
    /** The key of this name. */
    bool support_ims_in_roaming;
    bool is_volte_enabled;
    bool is_lvc_enabled;
    bool is_eab_enabled;
    bool is_eab_pub_failed;
    char *sms_format;
    char *sms_write_uicc;
    char *sms_over_ip;
    char *vzw_timer;
    char *t_delay;
    char *ut_pdn_type;
    char *ut_apn_name;
    int32_t tvolte_hys_timer;
    char *ims_config_name;
    char *slick_config_name;
    bool enable_all_log;
    bool enforce_gba_support;
    char *show_reg_icon;
    char *volte_reg_icon_id;
    char *all_enabled_log_level;
    char *default_user_log_level;
    char *default_eng_log_level;
    char *build_type;
    char *default_enablers_log_level;
    char *default_framework_log_level;
    char *default_sip_stack_log_level;
    char *default_msrp_log_level;
    char *default_media_log_level;
    char *default_platform_log_level;
    char *use_apcs;
    int32_t cap_poll_interval;
    char *src_throttle_publish;
    char *avail_cache_exp;
    char *cap_discovery;
    char *video_capabilities;
    char *custom_codecs;
    char *h264lvga_payload_val;
    char *ims_enabled;
    char *apcs_service_status;
    char *sms_psi;
    char *lvc_beta_setting;
    char *eab_setting;
    char *dm_app_id;
    char *dm_user_disp_name;
    char *dm_con_ref;
    char *pdp_context_pref;
    char *pcscf_address;
    char *public_user_id;
    char *icsi;
    char *icsi_rsc_alloc_mode;
    char *rsc_alloc_mode;
    char *voice_domain_pref_eutran;
    char *voice_domain_pref_utran;
    char *udp_keep_alive;
    char *ims_voice_termination;
    char *ss_domain_setting;
    char *ss_control_pref;
    char *dm_polling_period;
    char *conf_factory_uri;
    char *min_se;
    char *dcn_number;
    char *tlte911_fail;
    char *domain_pui;
    char *uri_media_rsc_serve_3way_call;
    char *phone_context_uri;
    char *amr_wb;
    char *src_amr;
    char *src_amr_wb;
    char *hd_voice;
    char *speaker_default_video;
    char *volte_enabled_by_user;
    char *lvc_enabled_by_user;
    char *ussd_domain_setting;
    char *emer_domain_setting;
    char *volte_domain_ui_show;
    char *sms_domain_ui_show;
    char *ut_apn_setting_ui_show;
    char *conf_factory_uri_show;
    char *pip;
    char *home_domain;
    char *epdg_enabled;
    char *ehrpd_enabled;
    char *ss_csfb_with_ims_error;
    char *show_reg_info_to_setting_app;
    ims_settings_timer_s poc_session_expire;
    ims_settings_timer_s poc_ringing_timer;
    ims_settings_timer_s poc_invite_timeout;
    char *conference_factory_uri;
    /** @} */
} ims_global_settings_s;

/**
 * One registration profile; ims_profile_clear() releases it. See @ref ims_settings_records.
 */
typedef struct ims_profile_s {
    /** @name The keys
     * @{ */
    /** The key of this name. */
    int32_t id;
    int32_t enabled;
    char *name;
    char *mccmnc;
    char *defaultMccMnc;
    char *impi;
    char *impu;
    char *domain;
    char *pdn;
    char *network;
    char *service;
    char *networkEnabled;
    int32_t priority;
    char *authname;
    char *password;
    char *pcscf;
    int32_t pcscfPref;
    bool roaming;
    int32_t port;
    char *transport;
    char *ipver;
    char *regiAlgo;
    bool ipsec;
    int32_t saPortC;
    int32_t saPortS;
    char *encAlgo;
    char *authAlgo;
    bool isEmergencySupport;
    int32_t rport;
    bool isRegEnabled;
    char *globalSettings;
    char *opmode;
    int32_t timer1;
    int32_t timer2;
    int32_t timer4;
    int32_t timerA;
    int32_t timerB;
    int32_t timerC;
    int32_t timerD;
    int32_t timerE;
    int32_t timerF;
    int32_t timerG;
    int32_t timerH;
    int32_t timerI;
    int32_t timerJ;
    int32_t timerK;
    int32_t mtuSize;
    int32_t sipRegKeepAliveTimer;
    int32_t vtSupported;
    int32_t volteSupported;
    int32_t network_environment_type;
    /** @} */
} ims_profile_s;

/** How many profiles an #ims_profile_list_s holds. */
#define IMS_PROFILE_LIST_CAPACITY 64

/** The profiles. Zero it before its first use; ims_profile_list_clear() releases it. */
typedef struct ims_profile_list_s {
    uint32_t count;                                    /**< how many profiles are filled */
    ims_profile_s profiles[IMS_PROFILE_LIST_CAPACITY]; /**< the profiles, in the service's order */
} ims_profile_list_s;

/**
 * Reads a set of global settings.
 *
 * D-Bus: `GetGlobalSettings`, sends `(s)`: the name; expects `(ia{sv})`: the result and the set.
 *
 * @param         name      the set's name; NULL is sent as an empty text
 * @param[in,out] settings  receives the set; untouched on failure
 */
IMS_API int ims_get_global_settings_info(ims_h handle, const char *name,
                                         ims_global_settings_s *settings);

/**
 * Changes a set of global settings.
 *
 * D-Bus: `UpdateGlobalSettings`, sends `(a{sv})`: all fields in the order of their declaration,
 * where `audio_port_start` and `is_avpf_enabled` are sent a second time in the place of
 * `audio_port_end` and `is_enable_srtp`.
 *
 * @param settings  the set, addressed by its name
 */
IMS_API int ims_update_global_settings(ims_h handle, const ims_global_settings_s *settings,
                                       ims_response_cb callback, void *user_data);

/**
 * Adds a set of global settings.
 *
 * D-Bus: `AddGlobalSettings`, sends `(a{sv})` as ims_update_global_settings() does, except that
 * `is_enable_emm_MCPTT` goes as `s`: its number as decimal text.
 *
 * @param settings  the set
 */
IMS_API int ims_add_global_settings(ims_h handle, const ims_global_settings_s *settings,
                                    ims_response_cb callback, void *user_data);

/**
 * Deletes a set of global settings.
 *
 * D-Bus: `DeleteGlobalSettings`, sends `(s)`: the set's name.
 *
 * @param settings  the set, of which the name is used; a NULL name is sent as an empty text. Not
 *                  checked: must not be NULL
 */
IMS_API int ims_delete_global_settings(ims_h handle, const ims_global_settings_s *settings,
                                       ims_response_cb callback, void *user_data);

/**
 * Frees the texts of a set and zeroes it.
 *
 * @param settings  a set that was zeroed before its first use and whose texts free() may release
 */
IMS_API void ims_global_settings_clear(ims_global_settings_s *settings);

/**
 * Reads the list of profiles.
 *
 * A list that is empty, or whose count is not the number of entries that came, is reported as
 * success with @p list->count 0. Of more than #IMS_PROFILE_LIST_CAPACITY profiles the first ones
 * are kept.
 *
 * D-Bus: `GetProfileList`, sends no parameters; expects `(iuaa{sv})`: the result, the count and one
 * dictionary a profile.
 *
 * @param[in,out] list  receives the profiles. On a failure of the service itself, its count is the
 *                      reply's and no profile was written; otherwise untouched on failure
 */
IMS_API int ims_get_profile_list_info(ims_h handle, ims_profile_list_s *list);

/**
 * Changes a profile.
 *
 * D-Bus: `UpdateProfile`, sends `(a{sv})`: all fields in the order of their declaration.
 *
 * @param profile  the profile
 */
IMS_API int ims_update_profile(ims_h handle, const ims_profile_s *profile, ims_response_cb callback,
                               void *user_data);

/**
 * Adds a profile.
 *
 * D-Bus: `AddProfile`, sends `(a{sv})`: all fields in the order of their declaration.
 *
 * @param profile  the profile
 */
IMS_API int ims_add_profile(ims_h handle, const ims_profile_s *profile, ims_response_cb callback,
                            void *user_data);

/**
 * Deletes a profile.
 *
 * D-Bus: `DeleteProfile`, sends `(i)`: the profile's id.
 *
 * @param profile  the profile, of which the id is used. Not checked: must not be NULL
 */
IMS_API int ims_delete_profile(ims_h handle, const ims_profile_s *profile, ims_response_cb callback,
                               void *user_data);

/**
 * Frees the texts of a profile and zeroes it.
 *
 * @param profile  a profile that was zeroed before its first use and whose texts free() may release
 */
IMS_API void ims_profile_clear(ims_profile_s *profile);

/**
 * Frees the texts of every profile in a list and zeroes it.
 *
 * @param list  a list that was zeroed before its first use
 */
IMS_API void ims_profile_list_clear(ims_profile_list_s *list);

/**
 * Sets the network environment.
 *
 * D-Bus: `SetNetworkEnvironment`, sends `(i)`: the type.
 *
 * @param environment_type  the type
 */
IMS_API int ims_set_network_environment(ims_h handle, int32_t environment_type,
                                        ims_response_cb callback, void *user_data);

/**
 * Reads the network environment.
 *
 * The service's own result is not looked at: whatever it is, the type that came with it is stored.
 *
 * D-Bus: `GetNetworkEnvironment`, sends no parameters; expects `(ii)`: the result and the type.
 *
 * @param[out] environment_type  receives the type; untouched on failure
 */
IMS_API int ims_get_network_environment(ims_h handle, int32_t *environment_type);

/** @} */

#ifdef __cplusplus
}
#endif

#endif
