// SPDX-License-Identifier: Apache-2.0
// The push-to-talk records that cross the bus as dictionaries.
#pragma once

#include "ims_poc.h"
#include "wire/record_tree.hpp"

namespace ims::poc {

// Of an addressed party, and of a user the fields that address it.
template <typename Party>
inline constexpr auto kAddress = record_tree({
    value("uri_type", IMS_PLACE(Party, uri_type)),
    value("uri", IMS_PLACE(Party, uri)),
    value("display_name", IMS_PLACE(Party, display_name)),
    value("is_group_uri", IMS_PLACE(Party, is_group_uri)),
});
inline constexpr auto &kPeer = kAddress<ims_poc_peer_info_s>;

// The service takes a user's address out of two variants, the dictionary's own one counted.
inline constexpr int kAddressLayers = 2;
inline constexpr auto kUser = record_tree({
    group("uri_gv", kAddress<ims_poc_user_s>, kAddressLayers),
    value("is_anonymous", IMS_PLACE(ims_poc_user_s, is_anonymous)),
    value("participant_state", IMS_PLACE(ims_poc_user_s, participant_state)),
    value("uri_usage_type", IMS_PLACE(ims_poc_user_s, uri_usage_type)),
});

// Of a party that is only named, and of an entry of an intermediate route header.
template <typename Named>
inline constexpr auto kNames = record_tree({
    value("uri", IMS_PLACE(Named, uri)),
    value("display_name", IMS_PLACE(Named, display_name)),
});

inline constexpr auto kContent = record_tree({
    value("content_type", IMS_PLACE(ims_poc_content_s, content_type)),
    value("content_disposition", IMS_PLACE(ims_poc_content_s, content_disposition)),
    value("content_id", IMS_PLACE(ims_poc_content_s, content_id)),
    value("content_encoding_type", IMS_PLACE(ims_poc_content_s, content_encoding_type)),
    value("content_description", IMS_PLACE(ims_poc_content_s, content_description)),
    value("content", IMS_PLACE(ims_poc_content_s, content)),
});

inline constexpr auto kFileAttributes = record_tree({
    value("file_name", IMS_PLACE(ims_poc_file_attributes_s, file_name)),
    value("file_description", IMS_PLACE(ims_poc_file_attributes_s, file_description)),
    value("file_size", IMS_PLACE(ims_poc_file_attributes_s, file_size)),
    value("push", IMS_PLACE(ims_poc_file_attributes_s, push)),
    value("start", IMS_PLACE(ims_poc_file_attributes_s, start)),
    value("end", IMS_PLACE(ims_poc_file_attributes_s, end)),
    value("transfer_id", IMS_PLACE(ims_poc_file_attributes_s, transfer_id)),
    value("content_type", IMS_PLACE(ims_poc_file_attributes_s, content_type)),
    value("file_type", IMS_PLACE(ims_poc_file_attributes_s, file_type)),
});

inline constexpr auto kFloorStatus = record_tree({
    value("session_id", IMS_PLACE(ims_poc_floor_status_s, session_id)),
    value("status", IMS_PLACE(ims_poc_floor_status_s, status)),
    value("participant_count", IMS_PLACE(ims_poc_floor_status_s, participant_count)),
    value("floor_taken_uri", IMS_PLACE(ims_poc_floor_status_s, floor_taken_uri)),
});

inline constexpr auto kRecording = record_tree({
    value("session_id", IMS_PLACE(ims_poc_recording_info_s, session_id)),
    value("record_state", IMS_PLACE(ims_poc_recording_info_s, record_state)),
    value("record_error", IMS_PLACE(ims_poc_recording_info_s, record_error)),
    value("record_file_path", IMS_PLACE(ims_poc_recording_info_s, record_file_path)),
});

inline constexpr auto kGroupContent = record_tree({
    bytes("content_byte", IMS_PLACE(ims_poc_group_content_s, content_byte),
          IMS_PLACE(ims_poc_group_content_s, content_length)),
    value("content_type", IMS_PLACE(ims_poc_group_content_s, content_type)),
    value("content_disposition", IMS_PLACE(ims_poc_group_content_s, content_disposition)),
});
inline constexpr auto kGroupAdv = record_tree({
    value("subject", IMS_PLACE(ims_poc_group_adv_s, subject)),
    value("call_info", IMS_PLACE(ims_poc_group_adv_s, call_info)),
    part("remote_uri", IMS_PLACE(ims_poc_group_adv_s, remote_uri), kPeer),
    chain("group_advertisement_content",
          IMS_PLACE(ims_poc_group_adv_s, group_advertisement_content), kGroupContent),
});

} // namespace ims::poc
