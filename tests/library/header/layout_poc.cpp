// SPDX-License-Identifier: Apache-2.0
// Where each field of the push-to-talk records is on a machine with 64-bit pointers. A change here
// is a change of the binary interface.
#include "ims.h"

#include <cstddef>

static_assert(IMS_POC_INT_SET_SIZE == 4 && IMS_POC_FLOOR_QUERY_CAPACITY == 64);

static_assert(sizeof(ims_poc_peer_info_s) == 40);
static_assert(offsetof(ims_poc_peer_info_s, uri_type) == 0);
static_assert(offsetof(ims_poc_peer_info_s, uri) == 8);
static_assert(offsetof(ims_poc_peer_info_s, display_name) == 16);
static_assert(offsetof(ims_poc_peer_info_s, is_group_uri) == 24);
static_assert(offsetof(ims_poc_peer_info_s, next) == 32);

static_assert(sizeof(ims_poc_file_attributes_s) == 56);
static_assert(offsetof(ims_poc_file_attributes_s, file_name) == 0);
static_assert(offsetof(ims_poc_file_attributes_s, file_description) == 8);
static_assert(offsetof(ims_poc_file_attributes_s, file_size) == 16);
static_assert(offsetof(ims_poc_file_attributes_s, push) == 20);
static_assert(offsetof(ims_poc_file_attributes_s, start) == 24);
static_assert(offsetof(ims_poc_file_attributes_s, end) == 28);
static_assert(offsetof(ims_poc_file_attributes_s, transfer_id) == 32);
static_assert(offsetof(ims_poc_file_attributes_s, content_type) == 40);
static_assert(offsetof(ims_poc_file_attributes_s, file_type) == 48);

static_assert(sizeof(ims_poc_make_call_s) == 72);
static_assert(offsetof(ims_poc_make_call_s, flag_1) == 0);
static_assert(offsetof(ims_poc_make_call_s, flag_2) == 1);
static_assert(offsetof(ims_poc_make_call_s, flag_3) == 2);
static_assert(offsetof(ims_poc_make_call_s, text_1) == 8);
static_assert(offsetof(ims_poc_make_call_s, value_1) == 16);
static_assert(offsetof(ims_poc_make_call_s, text_2) == 24);
static_assert(offsetof(ims_poc_make_call_s, int_set_1) == 32);
static_assert(offsetof(ims_poc_make_call_s, int_set_2) == 48);
static_assert(offsetof(ims_poc_make_call_s, value_2) == 64);

static_assert(sizeof(ims_poc_call_media_s) == 44);
static_assert(offsetof(ims_poc_call_media_s, flag_1) == 0);
static_assert(offsetof(ims_poc_call_media_s, flag_2) == 1);
static_assert(offsetof(ims_poc_call_media_s, value_1) == 4);
static_assert(offsetof(ims_poc_call_media_s, value_2) == 8);
static_assert(offsetof(ims_poc_call_media_s, int_set_1) == 12);
static_assert(offsetof(ims_poc_call_media_s, int_set_2) == 28);

static_assert(sizeof(ims_poc_user_s) == 48);
static_assert(offsetof(ims_poc_user_s, uri_type) == 0);
static_assert(offsetof(ims_poc_user_s, uri) == 8);
static_assert(offsetof(ims_poc_user_s, display_name) == 16);
static_assert(offsetof(ims_poc_user_s, is_group_uri) == 24);
static_assert(offsetof(ims_poc_user_s, is_anonymous) == 25);
static_assert(offsetof(ims_poc_user_s, participant_state) == 28);
static_assert(offsetof(ims_poc_user_s, uri_usage_type) == 32);
static_assert(offsetof(ims_poc_user_s, next) == 40);

static_assert(sizeof(ims_poc_ad_hoc_call_s) == 88);
static_assert(offsetof(ims_poc_ad_hoc_call_s, int_set_1) == 0);
static_assert(offsetof(ims_poc_ad_hoc_call_s, flag_1) == 16);
static_assert(offsetof(ims_poc_ad_hoc_call_s, int_set_2) == 20);
static_assert(offsetof(ims_poc_ad_hoc_call_s, text_1) == 40);
static_assert(offsetof(ims_poc_ad_hoc_call_s, text_2) == 48);
static_assert(offsetof(ims_poc_ad_hoc_call_s, flag_2) == 56);
static_assert(offsetof(ims_poc_ad_hoc_call_s, user_count) == 60);
static_assert(offsetof(ims_poc_ad_hoc_call_s, flag_3) == 64);
static_assert(offsetof(ims_poc_ad_hoc_call_s, value_1) == 68);
static_assert(offsetof(ims_poc_ad_hoc_call_s, user_list) == 72);
static_assert(offsetof(ims_poc_ad_hoc_call_s, value_2) == 80);

static_assert(sizeof(ims_poc_content_s) == 48);
static_assert(offsetof(ims_poc_content_s, content_type) == 0);
static_assert(offsetof(ims_poc_content_s, content_disposition) == 8);
static_assert(offsetof(ims_poc_content_s, content_id) == 16);
static_assert(offsetof(ims_poc_content_s, content_encoding_type) == 24);
static_assert(offsetof(ims_poc_content_s, content_description) == 32);
static_assert(offsetof(ims_poc_content_s, content) == 40);

static_assert(sizeof(ims_poc_users_s) == 40);
static_assert(offsetof(ims_poc_users_s, value_1) == 0);
static_assert(offsetof(ims_poc_users_s, user_count) == 4);
static_assert(offsetof(ims_poc_users_s, value_2) == 8);
static_assert(offsetof(ims_poc_users_s, user_list) == 16);
static_assert(offsetof(ims_poc_users_s, value_3) == 24);
static_assert(offsetof(ims_poc_users_s, content) == 32);

static_assert(sizeof(ims_poc_value_pair_s) == 8);
static_assert(offsetof(ims_poc_value_pair_s, value_1) == 0);
static_assert(offsetof(ims_poc_value_pair_s, value_2) == 4);

static_assert(sizeof(ims_poc_floor_s) == 40);
static_assert(offsetof(ims_poc_floor_s, session_id) == 0);
static_assert(offsetof(ims_poc_floor_s, int_set) == 4);
static_assert(offsetof(ims_poc_floor_s, value_1) == 20);
static_assert(offsetof(ims_poc_floor_s, value_2) == 24);
static_assert(offsetof(ims_poc_floor_s, text) == 32);

static_assert(sizeof(ims_poc_floor_query_s) == 260);
static_assert(offsetof(ims_poc_floor_query_s, count) == 0);
static_assert(offsetof(ims_poc_floor_query_s, values) == 4);

static_assert(sizeof(ims_poc_record_request_s) == 24);
static_assert(offsetof(ims_poc_record_request_s, value_1) == 0);
static_assert(offsetof(ims_poc_record_request_s, value_2) == 4);
static_assert(offsetof(ims_poc_record_request_s, value_3) == 8);
static_assert(offsetof(ims_poc_record_request_s, text) == 16);

static_assert(sizeof(ims_poc_message_s) == 72);
static_assert(offsetof(ims_poc_message_s, value_1) == 0);
static_assert(offsetof(ims_poc_message_s, text_1) == 8);
static_assert(offsetof(ims_poc_message_s, targets) == 16);
static_assert(offsetof(ims_poc_message_s, value_2) == 24);
static_assert(offsetof(ims_poc_message_s, text_2) == 32);
static_assert(offsetof(ims_poc_message_s, text_3) == 40);
static_assert(offsetof(ims_poc_message_s, value_3) == 48);
static_assert(offsetof(ims_poc_message_s, originator) == 56);
static_assert(offsetof(ims_poc_message_s, value_4) == 64);

static_assert(sizeof(ims_poc_name_node_s) == 24);
static_assert(offsetof(ims_poc_name_node_s, uri) == 0);
static_assert(offsetof(ims_poc_name_node_s, display_name) == 8);
static_assert(offsetof(ims_poc_name_node_s, next) == 16);

static_assert(sizeof(ims_poc_msg_notification_s) == 48);
static_assert(offsetof(ims_poc_msg_notification_s, value_1) == 0);
static_assert(offsetof(ims_poc_msg_notification_s, text_1) == 8);
static_assert(offsetof(ims_poc_msg_notification_s, originator) == 16);
static_assert(offsetof(ims_poc_msg_notification_s, parties) == 24);
static_assert(offsetof(ims_poc_msg_notification_s, text_2) == 32);
static_assert(offsetof(ims_poc_msg_notification_s, value_2) == 40);

static_assert(sizeof(ims_poc_file_transfer_s) == 32);
static_assert(offsetof(ims_poc_file_transfer_s, session_id) == 0);
static_assert(offsetof(ims_poc_file_transfer_s, targets) == 8);
static_assert(offsetof(ims_poc_file_transfer_s, attributes) == 16);
static_assert(offsetof(ims_poc_file_transfer_s, originator) == 24);

static_assert(sizeof(ims_poc_transfer_answer_s) == 16);
static_assert(offsetof(ims_poc_transfer_answer_s, session_id) == 0);
static_assert(offsetof(ims_poc_transfer_answer_s, transfer_id) == 8);

static_assert(sizeof(ims_poc_floor_status_s) == 32);
static_assert(offsetof(ims_poc_floor_status_s, session_id) == 0);
static_assert(offsetof(ims_poc_floor_status_s, status) == 4);
static_assert(offsetof(ims_poc_floor_status_s, participant_count) == 8);
static_assert(offsetof(ims_poc_floor_status_s, floor_taken_uri) == 16);
static_assert(offsetof(ims_poc_floor_status_s, next) == 24);

static_assert(sizeof(ims_poc_recording_info_s) == 24);
static_assert(offsetof(ims_poc_recording_info_s, session_id) == 0);
static_assert(offsetof(ims_poc_recording_info_s, record_state) == 4);
static_assert(offsetof(ims_poc_recording_info_s, record_error) == 8);
static_assert(offsetof(ims_poc_recording_info_s, record_file_path) == 16);

static_assert(sizeof(ims_poc_msg_result_s) == 12);
static_assert(offsetof(ims_poc_msg_result_s, value_1) == 0);
static_assert(offsetof(ims_poc_msg_result_s, value_2) == 4);
static_assert(offsetof(ims_poc_msg_result_s, value_3) == 8);

static_assert(sizeof(ims_poc_transfer_result_s) == 8);
static_assert(offsetof(ims_poc_transfer_result_s, value_1) == 0);
static_assert(offsetof(ims_poc_transfer_result_s, value_2) == 4);

static_assert(sizeof(ims_poc_call_incoming_s) == 96);
static_assert(offsetof(ims_poc_call_incoming_s, flag_1) == 0);
static_assert(offsetof(ims_poc_call_incoming_s, flag_2) == 1);
static_assert(offsetof(ims_poc_call_incoming_s, flag_3) == 2);
static_assert(offsetof(ims_poc_call_incoming_s, flag_4) == 3);
static_assert(offsetof(ims_poc_call_incoming_s, text_1) == 8);
static_assert(offsetof(ims_poc_call_incoming_s, text_2) == 16);
static_assert(offsetof(ims_poc_call_incoming_s, text_3) == 24);
static_assert(offsetof(ims_poc_call_incoming_s, text_4) == 32);
static_assert(offsetof(ims_poc_call_incoming_s, text_5) == 40);
static_assert(offsetof(ims_poc_call_incoming_s, text_6) == 48);
static_assert(offsetof(ims_poc_call_incoming_s, value_1) == 56);
static_assert(offsetof(ims_poc_call_incoming_s, value_2) == 60);
static_assert(offsetof(ims_poc_call_incoming_s, int_set_1) == 64);
static_assert(offsetof(ims_poc_call_incoming_s, int_set_2) == 80);

static_assert(sizeof(ims_poc_call_event_s) == 4);
static_assert(offsetof(ims_poc_call_event_s, value_1) == 0);

static_assert(sizeof(ims_poc_call_established_s) == 104);
static_assert(offsetof(ims_poc_call_established_s, value_1) == 0);
static_assert(offsetof(ims_poc_call_established_s, value_2) == 4);
static_assert(offsetof(ims_poc_call_established_s, flag_1) == 8);
static_assert(offsetof(ims_poc_call_established_s, text_1) == 16);
static_assert(offsetof(ims_poc_call_established_s, flag_2) == 24);
static_assert(offsetof(ims_poc_call_established_s, int_set_1) == 28);
static_assert(offsetof(ims_poc_call_established_s, flag_3) == 44);
static_assert(offsetof(ims_poc_call_established_s, int_set_2) == 48);
static_assert(offsetof(ims_poc_call_established_s, peer) == 64);

static_assert(sizeof(ims_poc_call_ended_s) == 8);
static_assert(offsetof(ims_poc_call_ended_s, value_1) == 0);
static_assert(offsetof(ims_poc_call_ended_s, value_2) == 4);

static_assert(sizeof(ims_poc_floor_event_s) == 72);
static_assert(offsetof(ims_poc_floor_event_s, value_1) == 0);
static_assert(offsetof(ims_poc_floor_event_s, int_set_1) == 4);
static_assert(offsetof(ims_poc_floor_event_s, value_2) == 20);
static_assert(offsetof(ims_poc_floor_event_s, text_1) == 24);
static_assert(offsetof(ims_poc_floor_event_s, value_3) == 32);
static_assert(offsetof(ims_poc_floor_event_s, text_2) == 40);
static_assert(offsetof(ims_poc_floor_event_s, value_4) == 48);
static_assert(offsetof(ims_poc_floor_event_s, value_5) == 52);
static_assert(offsetof(ims_poc_floor_event_s, value_6) == 56);
static_assert(offsetof(ims_poc_floor_event_s, text_3) == 64);

static_assert(sizeof(ims_poc_modify_request_s) == 44);
static_assert(offsetof(ims_poc_modify_request_s, flag_1) == 0);
static_assert(offsetof(ims_poc_modify_request_s, flag_2) == 1);
static_assert(offsetof(ims_poc_modify_request_s, value_1) == 4);
static_assert(offsetof(ims_poc_modify_request_s, value_2) == 8);
static_assert(offsetof(ims_poc_modify_request_s, int_set_1) == 12);
static_assert(offsetof(ims_poc_modify_request_s, int_set_2) == 28);

static_assert(sizeof(ims_poc_modify_status_s) == 44);
static_assert(offsetof(ims_poc_modify_status_s, flag_1) == 0);
static_assert(offsetof(ims_poc_modify_status_s, flag_2) == 1);
static_assert(offsetof(ims_poc_modify_status_s, flag_3) == 2);
static_assert(offsetof(ims_poc_modify_status_s, value_1) == 4);
static_assert(offsetof(ims_poc_modify_status_s, value_2) == 8);
static_assert(offsetof(ims_poc_modify_status_s, int_set_1) == 12);
static_assert(offsetof(ims_poc_modify_status_s, int_set_2) == 28);

static_assert(sizeof(ims_poc_group_content_s) == 40);
static_assert(offsetof(ims_poc_group_content_s, content_byte) == 0);
static_assert(offsetof(ims_poc_group_content_s, content_type) == 8);
static_assert(offsetof(ims_poc_group_content_s, content_disposition) == 16);
static_assert(offsetof(ims_poc_group_content_s, content_length) == 24);
static_assert(offsetof(ims_poc_group_content_s, next) == 32);

static_assert(sizeof(ims_poc_group_adv_s) == 64);
static_assert(offsetof(ims_poc_group_adv_s, subject) == 0);
static_assert(offsetof(ims_poc_group_adv_s, call_info) == 8);
static_assert(offsetof(ims_poc_group_adv_s, remote_uri) == 16);
static_assert(offsetof(ims_poc_group_adv_s, group_advertisement_content) == 56);

static_assert(sizeof(ims_poc_group_advertisement_s) == 16);
static_assert(offsetof(ims_poc_group_advertisement_s, value_1) == 0);
static_assert(offsetof(ims_poc_group_advertisement_s, group_adv) == 8);

static_assert(sizeof(ims_poc_participant_info_s) == 24);
static_assert(offsetof(ims_poc_participant_info_s, value_1) == 0);
static_assert(offsetof(ims_poc_participant_info_s, text_1) == 8);
static_assert(offsetof(ims_poc_participant_info_s, text_2) == 16);

static_assert(sizeof(ims_poc_route_header_s) == 24);
static_assert(offsetof(ims_poc_route_header_s, uri) == 0);
static_assert(offsetof(ims_poc_route_header_s, display_name) == 8);
static_assert(offsetof(ims_poc_route_header_s, next) == 16);

static_assert(sizeof(ims_poc_incoming_msg_s) == 88);
static_assert(offsetof(ims_poc_incoming_msg_s, value_1) == 0);
static_assert(offsetof(ims_poc_incoming_msg_s, peer_1) == 8);
static_assert(offsetof(ims_poc_incoming_msg_s, text_1) == 16);
static_assert(offsetof(ims_poc_incoming_msg_s, value_2) == 24);
static_assert(offsetof(ims_poc_incoming_msg_s, text_2) == 32);
static_assert(offsetof(ims_poc_incoming_msg_s, text_3) == 40);
static_assert(offsetof(ims_poc_incoming_msg_s, route_headers) == 48);
static_assert(offsetof(ims_poc_incoming_msg_s, text_4) == 56);
static_assert(offsetof(ims_poc_incoming_msg_s, value_3) == 64);
static_assert(offsetof(ims_poc_incoming_msg_s, value_4) == 68);
static_assert(offsetof(ims_poc_incoming_msg_s, value_5) == 72);
static_assert(offsetof(ims_poc_incoming_msg_s, peer_2) == 80);

static_assert(sizeof(ims_poc_msg_event_s) == 40);
static_assert(offsetof(ims_poc_msg_event_s, value_1) == 0);
static_assert(offsetof(ims_poc_msg_event_s, peer_1) == 8);
static_assert(offsetof(ims_poc_msg_event_s, text_1) == 16);
static_assert(offsetof(ims_poc_msg_event_s, value_2) == 24);
static_assert(offsetof(ims_poc_msg_event_s, value_3) == 28);
static_assert(offsetof(ims_poc_msg_event_s, peer_2) == 32);

static_assert(sizeof(ims_poc_incoming_file_s) == 40);
static_assert(offsetof(ims_poc_incoming_file_s, value_1) == 0);
static_assert(offsetof(ims_poc_incoming_file_s, peer_1) == 8);
static_assert(offsetof(ims_poc_incoming_file_s, attributes) == 16);
static_assert(offsetof(ims_poc_incoming_file_s, value_2) == 24);
static_assert(offsetof(ims_poc_incoming_file_s, peer_2) == 32);

static_assert(sizeof(ims_poc_file_progress_s) == 16);
static_assert(offsetof(ims_poc_file_progress_s, value_1) == 0);
static_assert(offsetof(ims_poc_file_progress_s, value_2) == 4);
static_assert(offsetof(ims_poc_file_progress_s, value_3) == 8);
static_assert(offsetof(ims_poc_file_progress_s, value_4) == 12);

static_assert(sizeof(ims_poc_file_terminated_s) == 12);
static_assert(offsetof(ims_poc_file_terminated_s, value_1) == 0);
static_assert(offsetof(ims_poc_file_terminated_s, value_2) == 4);
static_assert(offsetof(ims_poc_file_terminated_s, value_3) == 8);
