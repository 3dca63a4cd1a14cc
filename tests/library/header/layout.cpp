// SPDX-License-Identifier: Apache-2.0
// Where each field of the public records is on a machine with 64-bit pointers. A change here is a
// change of the binary interface.
#include "ims.h"

#include <cstddef>

static_assert(sizeof(void *) == 8 && sizeof(bool) == 1 && sizeof(ims_h) == 8);
static_assert(sizeof(ims_error_e) == 4 && sizeof(ims_noti_id_e) == 4);

static_assert(sizeof(ims_call_make_info_s) == 48);
static_assert(offsetof(ims_call_make_info_s, number) == 0);
static_assert(offsetof(ims_call_make_info_s, call_type) == 8);
static_assert(offsetof(ims_call_make_info_s, text_1) == 16);
static_assert(offsetof(ims_call_make_info_s, text_2) == 24);
static_assert(offsetof(ims_call_make_info_s, text_3) == 32);
static_assert(offsetof(ims_call_make_info_s, text_4) == 40);

static_assert(sizeof(ims_call_ussd_info_s) == 24);
static_assert(offsetof(ims_call_ussd_info_s, type) == 0);
static_assert(offsetof(ims_call_ussd_info_s, value_1) == 4);
static_assert(offsetof(ims_call_ussd_info_s, text) == 8);
static_assert(offsetof(ims_call_ussd_info_s, text_length) == 16);

static_assert(sizeof(ims_call_id_info_s) == 12);
static_assert(offsetof(ims_call_id_info_s, session_id) == 0);
static_assert(offsetof(ims_call_id_info_s, value_1) == 4);
static_assert(offsetof(ims_call_id_info_s, value_2) == 8);

static_assert(sizeof(ims_call_pair_info_s) == 8);
static_assert(offsetof(ims_call_pair_info_s, session_id) == 0);
static_assert(offsetof(ims_call_pair_info_s, value_1) == 4);

static_assert(sizeof(ims_call_dtmf_info_s) == 16);
static_assert(offsetof(ims_call_dtmf_info_s, session_id) == 0);
static_assert(offsetof(ims_call_dtmf_info_s, digits) == 8);

static_assert(sizeof(ims_call_dtmf_tone_s) == 8);
static_assert(offsetof(ims_call_dtmf_tone_s, session_id) == 0);
static_assert(offsetof(ims_call_dtmf_tone_s, tone) == 4);

static_assert(sizeof(ims_call_record_info_s) == 16);
static_assert(offsetof(ims_call_record_info_s, session_id) == 0);
static_assert(offsetof(ims_call_record_info_s, value_1) == 4);
static_assert(offsetof(ims_call_record_info_s, text_1) == 8);

static_assert(sizeof(ims_call_tty_data_s) == 24);
static_assert(offsetof(ims_call_tty_data_s, session_id) == 0);
static_assert(offsetof(ims_call_tty_data_s, data) == 8);
static_assert(offsetof(ims_call_tty_data_s, length) == 16);

static_assert(sizeof(ims_call_conf_user_s) == 24);
static_assert(offsetof(ims_call_conf_user_s, session_id) == 0);
static_assert(offsetof(ims_call_conf_user_s, number) == 8);
static_assert(offsetof(ims_call_conf_user_s, value_1) == 16);

static_assert(sizeof(ims_call_ssac_info_s) == 20);
static_assert(offsetof(ims_call_ssac_info_s, value_1) == 0);
static_assert(offsetof(ims_call_ssac_info_s, value_2) == 4);
static_assert(offsetof(ims_call_ssac_info_s, value_3) == 8);
static_assert(offsetof(ims_call_ssac_info_s, value_4) == 12);
static_assert(offsetof(ims_call_ssac_info_s, value_5) == 16);

static_assert(sizeof(ims_call_emergency_pdn_s) == 32);
static_assert(offsetof(ims_call_emergency_pdn_s, text_1) == 0);
static_assert(offsetof(ims_call_emergency_pdn_s, count) == 8);
static_assert(offsetof(ims_call_emergency_pdn_s, texts) == 16);
static_assert(offsetof(ims_call_emergency_pdn_s, text_2) == 24);

static_assert(sizeof(ims_call_participant_s) == 16);
static_assert(offsetof(ims_call_participant_s, text) == 0);
static_assert(offsetof(ims_call_participant_s, next) == 8);

static_assert(sizeof(ims_call_conference_s) == 16);
static_assert(offsetof(ims_call_conference_s, value_1) == 0);
static_assert(offsetof(ims_call_conference_s, count) == 4);
static_assert(offsetof(ims_call_conference_s, participants) == 8);

static_assert(sizeof(ims_call_conference_modify_s) == 24);
static_assert(offsetof(ims_call_conference_modify_s, session_id) == 0);
static_assert(offsetof(ims_call_conference_modify_s, value_1) == 4);
static_assert(offsetof(ims_call_conference_modify_s, count) == 8);
static_assert(offsetof(ims_call_conference_modify_s, participants) == 16);

static_assert(sizeof(ims_call_change_result_s) == 16);
static_assert(offsetof(ims_call_change_result_s, value_1) == 0);
static_assert(offsetof(ims_call_change_result_s, text_1) == 8);

static_assert(sizeof(ims_call_tty_mode_s) == 24);
static_assert(offsetof(ims_call_tty_mode_s, value_1) == 0);
static_assert(offsetof(ims_call_tty_mode_s, value_2) == 4);
static_assert(offsetof(ims_call_tty_mode_s, data) == 8);
static_assert(offsetof(ims_call_tty_mode_s, length) == 16);

static_assert(sizeof(ims_call_incoming_s) == 72);
static_assert(offsetof(ims_call_incoming_s, session_id) == 0);
static_assert(offsetof(ims_call_incoming_s, number) == 8);
static_assert(offsetof(ims_call_incoming_s, call_type) == 16);
static_assert(offsetof(ims_call_incoming_s, text_1) == 24);
static_assert(offsetof(ims_call_incoming_s, text_2) == 32);
static_assert(offsetof(ims_call_incoming_s, text_3) == 40);
static_assert(offsetof(ims_call_incoming_s, text_4) == 48);
static_assert(offsetof(ims_call_incoming_s, text_5) == 56);
static_assert(offsetof(ims_call_incoming_s, flag_1) == 64);

static_assert(sizeof(ims_call_session_s) == 4);
static_assert(offsetof(ims_call_session_s, session_id) == 0);

static_assert(sizeof(ims_call_established_s) == 32);
static_assert(offsetof(ims_call_established_s, session_id) == 0);
static_assert(offsetof(ims_call_established_s, call_type) == 4);
static_assert(offsetof(ims_call_established_s, flag_1) == 8);
static_assert(offsetof(ims_call_established_s, text_1) == 16);
static_assert(offsetof(ims_call_established_s, flag_2) == 24);

static_assert(sizeof(ims_call_held_s) == 12);
static_assert(offsetof(ims_call_held_s, session_id) == 0);
static_assert(offsetof(ims_call_held_s, flag_1) == 4);
static_assert(offsetof(ims_call_held_s, value_1) == 8);

static_assert(sizeof(ims_call_resumed_s) == 12);
static_assert(offsetof(ims_call_resumed_s, session_id) == 0);
static_assert(offsetof(ims_call_resumed_s, flag_1) == 4);
static_assert(offsetof(ims_call_resumed_s, flag_2) == 5);
static_assert(offsetof(ims_call_resumed_s, value_1) == 8);

static_assert(sizeof(ims_call_ended_s) == 8);
static_assert(offsetof(ims_call_ended_s, session_id) == 0);
static_assert(offsetof(ims_call_ended_s, reason) == 4);

static_assert(sizeof(ims_call_switched_s) == 8);
static_assert(offsetof(ims_call_switched_s, session_id) == 0);
static_assert(offsetof(ims_call_switched_s, call_type) == 4);

static_assert(sizeof(ims_call_change_request_s) == 24);
static_assert(offsetof(ims_call_change_request_s, session_id) == 0);
static_assert(offsetof(ims_call_change_request_s, call_type) == 4);
static_assert(offsetof(ims_call_change_request_s, data) == 8);
static_assert(offsetof(ims_call_change_request_s, length) == 16);

static_assert(sizeof(ims_call_conf_notify_s) == 40);
static_assert(offsetof(ims_call_conf_notify_s, session_id) == 0);
static_assert(offsetof(ims_call_conf_notify_s, values) == 8);
static_assert(offsetof(ims_call_conf_notify_s, value_count) == 16);
static_assert(offsetof(ims_call_conf_notify_s, texts) == 24);
static_assert(offsetof(ims_call_conf_notify_s, text_count) == 32);

static_assert(sizeof(ims_call_early_media_s) == 16);
static_assert(offsetof(ims_call_early_media_s, session_id) == 0);
static_assert(offsetof(ims_call_early_media_s, text_1) == 8);

static_assert(sizeof(ims_call_error_s) == 16);
static_assert(offsetof(ims_call_error_s, session_id) == 0);
static_assert(offsetof(ims_call_error_s, error_code) == 4);
static_assert(offsetof(ims_call_error_s, text_1) == 8);

static_assert(sizeof(ims_call_conference_event_s) == 8);
static_assert(offsetof(ims_call_conference_event_s, session_id) == 0);
static_assert(offsetof(ims_call_conference_event_s, value_1) == 4);

static_assert(sizeof(ims_call_ussd_indication_s) == 32);
static_assert(offsetof(ims_call_ussd_indication_s, value_1) == 0);
static_assert(offsetof(ims_call_ussd_indication_s, value_2) == 4);
static_assert(offsetof(ims_call_ussd_indication_s, value_3) == 8);
static_assert(offsetof(ims_call_ussd_indication_s, data) == 16);
static_assert(offsetof(ims_call_ussd_indication_s, length) == 24);

static_assert(sizeof(ims_call_dtmf_event_s) == 1);
static_assert(offsetof(ims_call_dtmf_event_s, tone) == 0);

static_assert(sizeof(ims_call_info_s) == 32);
static_assert(offsetof(ims_call_info_s, session_id) == 0);
static_assert(offsetof(ims_call_info_s, peer_uri) == 8);
static_assert(offsetof(ims_call_info_s, call_type) == 16);
static_assert(offsetof(ims_call_info_s, bmocall) == 20);
static_assert(offsetof(ims_call_info_s, call_state) == 24);
static_assert(offsetof(ims_call_info_s, bconfcall) == 28);

static_assert(IMS_CALL_LIST_CAPACITY == 64);
static_assert(sizeof(ims_call_list_info_s) == 2056);
static_assert(offsetof(ims_call_list_info_s, count) == 0);
static_assert(offsetof(ims_call_list_info_s, entries) == 8);
