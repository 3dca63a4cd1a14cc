// SPDX-License-Identifier: Apache-2.0
// What tells of push-to-talk.
#include "imsctl/output/event_fields.hpp"
#include "imsctl/ptt/module.hpp"
#include "imsctl/ptt/summaries.hpp"

namespace imsctl {
namespace {

Nested nested(const ims_poc_peer_info_s &peer) {
    return {{{"uri_type", std::int64_t{peer.uri_type}},
             {"uri", lent_text(peer.uri)},
             {"display_name", lent_text(peer.display_name)},
             {"is_group_uri", peer.is_group_uri}}};
}

Nested nested(const ims_poc_file_attributes_s &file) {
    return {{{"file_name", lent_text(file.file_name)},
             {"file_description", lent_text(file.file_description)},
             {"file_size", std::int64_t{file.file_size}},
             {"push", file.push},
             {"start", std::int64_t{file.start}},
             {"end", std::int64_t{file.end}},
             {"transfer_id", lent_text(file.transfer_id)},
             {"content_type", lent_text(file.content_type)},
             {"file_type", lent_text(file.file_type)}}};
}

Nested nested(const ims_poc_group_adv_s &adv) {
    NestedList contents;
    for (const auto *content = adv.group_advertisement_content; content != nullptr;
         content = content->next) {
        Bytes bytes;
        if (content->content_byte != nullptr)
            bytes.assign(content->content_byte, content->content_byte + content->content_length);
        contents.entries.push_back(
            {{"content_byte", bytes},
             {"content_type", lent_text(content->content_type)},
             {"content_disposition", lent_text(content->content_disposition)}});
    }
    return {{{"subject", lent_text(adv.subject)},
             {"call_info", lent_text(adv.call_info)},
             {"remote_uri", nested(adv.remote_uri)},
             {"group_advertisement_content", std::move(contents)}}};
}

template <auto Member>
Value take_embedded(void *record) {
    return nested(member_of<Member>(record));
}

template <auto Member>
Value take_pointed(void *record) {
    const auto *target = member_of<Member>(record);
    return target == nullptr ? Value() : Value(nested(*target));
}

Value take_route(void *record) {
    NestedList route;
    for (const auto *header = static_cast<ims_poc_incoming_msg_s *>(record)->route_headers;
         header != nullptr; header = header->next)
        route.entries.push_back(
            {{"uri", lent_text(header->uri)}, {"display_name", lent_text(header->display_name)}});
    return route;
}

template <auto Member>
constexpr FieldRow pointed(std::string_view name) {
    return {name, take_pointed<Member>};
}

constexpr FieldRow kIncomingFields[] = {
    field<&ims_poc_call_incoming_s::flag_1>("flag_1"),
    field<&ims_poc_call_incoming_s::flag_2>("flag_2"),
    field<&ims_poc_call_incoming_s::flag_3>("flag_3"),
    field<&ims_poc_call_incoming_s::flag_4>("flag_4"),
    field<&ims_poc_call_incoming_s::text_1>("text_1"),
    field<&ims_poc_call_incoming_s::text_2>("text_2"),
    field<&ims_poc_call_incoming_s::text_3>("text_3"),
    field<&ims_poc_call_incoming_s::text_4>("text_4"),
    field<&ims_poc_call_incoming_s::text_5>("text_5"),
    field<&ims_poc_call_incoming_s::text_6>("text_6"),
    field<&ims_poc_call_incoming_s::value_1>("value_1"),
    field<&ims_poc_call_incoming_s::value_2>("value_2"),
    field<&ims_poc_call_incoming_s::int_set_1>("int_set_1"),
    field<&ims_poc_call_incoming_s::int_set_2>("int_set_2"),
};

constexpr FieldRow kCallEventFields[] = {field<&ims_poc_call_event_s::value_1>("value_1")};

constexpr FieldRow kEstablishedFields[] = {
    field<&ims_poc_call_established_s::value_1>("value_1"),
    field<&ims_poc_call_established_s::value_2>("value_2"),
    field<&ims_poc_call_established_s::flag_1>("flag_1"),
    field<&ims_poc_call_established_s::text_1>("text_1"),
    field<&ims_poc_call_established_s::flag_2>("flag_2"),
    field<&ims_poc_call_established_s::int_set_1>("int_set_1"),
    field<&ims_poc_call_established_s::flag_3>("flag_3"),
    field<&ims_poc_call_established_s::int_set_2>("int_set_2"),
    {"peer", take_embedded<&ims_poc_call_established_s::peer>},
};

constexpr FieldRow kEndedFields[] = {
    field<&ims_poc_call_ended_s::value_1>("value_1"),
    field<&ims_poc_call_ended_s::value_2>("value_2"),
};

constexpr FieldRow kFloorFields[] = {
    field<&ims_poc_floor_event_s::value_1>("value_1"),
    field<&ims_poc_floor_event_s::int_set_1>("int_set_1"),
    field<&ims_poc_floor_event_s::value_2>("value_2"),
    field<&ims_poc_floor_event_s::text_1>("text_1"),
    field<&ims_poc_floor_event_s::value_3>("value_3"),
    field<&ims_poc_floor_event_s::text_2>("text_2"),
    field<&ims_poc_floor_event_s::value_4>("value_4"),
    field<&ims_poc_floor_event_s::value_5>("value_5"),
    field<&ims_poc_floor_event_s::value_6>("value_6"),
    field<&ims_poc_floor_event_s::text_3>("text_3"),
};

constexpr FieldRow kModifyRequestFields[] = {
    field<&ims_poc_modify_request_s::flag_1>("flag_1"),
    field<&ims_poc_modify_request_s::flag_2>("flag_2"),
    field<&ims_poc_modify_request_s::value_1>("value_1"),
    field<&ims_poc_modify_request_s::value_2>("value_2"),
    field<&ims_poc_modify_request_s::int_set_1>("int_set_1"),
    field<&ims_poc_modify_request_s::int_set_2>("int_set_2"),
};

constexpr FieldRow kModifyStatusFields[] = {
    field<&ims_poc_modify_status_s::flag_1>("flag_1"),
    field<&ims_poc_modify_status_s::flag_2>("flag_2"),
    field<&ims_poc_modify_status_s::flag_3>("flag_3"),
    field<&ims_poc_modify_status_s::value_1>("value_1"),
    field<&ims_poc_modify_status_s::value_2>("value_2"),
    field<&ims_poc_modify_status_s::int_set_1>("int_set_1"),
    field<&ims_poc_modify_status_s::int_set_2>("int_set_2"),
};

constexpr FieldRow kAdvertisementFields[] = {
    field<&ims_poc_group_advertisement_s::value_1>("value_1"),
    pointed<&ims_poc_group_advertisement_s::group_adv>("group_adv"),
};

constexpr FieldRow kParticipantInfoFields[] = {
    field<&ims_poc_participant_info_s::value_1>("value_1"),
    field<&ims_poc_participant_info_s::text_1>("text_1"),
    field<&ims_poc_participant_info_s::text_2>("text_2"),
};

constexpr FieldRow kIncomingMsgFields[] = {
    field<&ims_poc_incoming_msg_s::value_1>("value_1"),
    pointed<&ims_poc_incoming_msg_s::peer_1>("peer_1"),
    field<&ims_poc_incoming_msg_s::text_1>("text_1"),
    field<&ims_poc_incoming_msg_s::value_2>("value_2"),
    field<&ims_poc_incoming_msg_s::text_2>("text_2"),
    field<&ims_poc_incoming_msg_s::text_3>("text_3"),
    {"route_headers", take_route},
    field<&ims_poc_incoming_msg_s::text_4>("text_4"),
    field<&ims_poc_incoming_msg_s::value_3>("value_3"),
    field<&ims_poc_incoming_msg_s::value_4>("value_4"),
    field<&ims_poc_incoming_msg_s::value_5>("value_5"),
    pointed<&ims_poc_incoming_msg_s::peer_2>("peer_2"),
};

constexpr FieldRow kMsgNotificationFields[] = {
    field<&ims_poc_msg_event_s::value_1>("value_1"),
    pointed<&ims_poc_msg_event_s::peer_1>("peer_1"),
    field<&ims_poc_msg_event_s::text_1>("text_1"),
    field<&ims_poc_msg_event_s::value_2>("value_2"),
    field<&ims_poc_msg_event_s::value_3>("value_3"),
    pointed<&ims_poc_msg_event_s::peer_2>("peer_2"),
};

constexpr FieldRow kIncomingFileFields[] = {
    field<&ims_poc_incoming_file_s::value_1>("value_1"),
    pointed<&ims_poc_incoming_file_s::peer_1>("peer_1"),
    pointed<&ims_poc_incoming_file_s::attributes>("attributes"),
    field<&ims_poc_incoming_file_s::value_2>("value_2"),
    pointed<&ims_poc_incoming_file_s::peer_2>("peer_2"),
};

constexpr FieldRow kFileProgressFields[] = {
    field<&ims_poc_file_progress_s::value_1>("value_1"),
    field<&ims_poc_file_progress_s::value_2>("value_2"),
    field<&ims_poc_file_progress_s::value_3>("value_3"),
    field<&ims_poc_file_progress_s::value_4>("value_4"),
};

constexpr FieldRow kFileTerminatedFields[] = {
    field<&ims_poc_file_terminated_s::value_1>("value_1"),
    field<&ims_poc_file_terminated_s::value_2>("value_2"),
    field<&ims_poc_file_terminated_s::value_3>("value_3"),
};

constexpr EventRow kPttEvents[] = {
    {IMS_NOTI_POC_CALL_INCOMING_IND, "poc-call-incoming-ind", "poc", kIncomingFields,
     summarise_ptt_incoming},
    {IMS_NOTI_POC_CALL_IN_PROGRESS, "poc-call-in-progress", "poc", kCallEventFields,
     summarise_ptt_in_progress},
    {IMS_NOTI_POC_CALL_ALERTING, "poc-call-alerting", "poc", kCallEventFields,
     summarise_ptt_alerting},
    {IMS_NOTI_POC_CALL_ESTABLISHED, "poc-call-established", "poc", kEstablishedFields,
     summarise_ptt_established},
    {IMS_NOTI_POC_CALL_ENDED, "poc-call-ended", "poc", kEndedFields, summarise_ptt_ended},
    {IMS_NOTI_POC_CALL_FLOOR_GRANTED, "poc-call-floor-granted", "poc", kFloorFields,
     summarise_floor_granted},
    {IMS_NOTI_POC_CALL_FLOOR_REJECTED, "poc-call-floor-rejected", "poc", kFloorFields,
     summarise_floor_refusal},
    {IMS_NOTI_POC_CALL_FLOOR_IDLE, "poc-call-floor-idle", "poc", kFloorFields,
     summarise_floor_idle},
    {IMS_NOTI_POC_CALL_FLOOR_QUEUE_POSITION, "poc-call-floor-queue-position", "poc", kFloorFields,
     summarise_floor_position},
    {IMS_NOTI_POC_CALL_FLOOR_CANCELED, "poc-call-floor-canceled", "poc", kFloorFields,
     summarise_floor_refusal},
    {IMS_NOTI_POC_CALL_FLOOR_TAKEN, "poc-call-floor-taken", "poc", kFloorFields,
     summarise_floor_taken},
    {IMS_NOTI_POC_CALL_MODIFY_REQUEST, "poc-call-modify-request", "poc", kModifyRequestFields,
     summarise_ptt_modify_request},
    {IMS_NOTI_POC_CALL_MODIFY_STATUS, "poc-call-modify-status", "poc", kModifyStatusFields,
     summarise_ptt_modify_status},
    {IMS_NOTI_POC_CALL_FLOOR_REQUEST_TIMEOUT, "poc-call-floor-request-timeout", "poc", kFloorFields,
     summarise_floor_refusal},
    {IMS_NOTI_POC_CALL_CRISIS_CALL_INITIATED, "poc-call-crisis-call-initiated", "poc",
     kCallEventFields, summarise_ptt_crisis},
    {IMS_NOTI_POC_GROUP_ADVERTISEMENT, "poc-group-advertisement", "poc", kAdvertisementFields,
     summarise_ptt_advertisement},
    {IMS_NOTI_POC_GROUP_CONF_PARTICIPANT_INFO, "poc-group-conf-participant-info", "poc",
     kParticipantInfoFields, summarise_ptt_participant},
    {IMS_NOTI_POC_INCOMING_MSG_INFO, "poc-incoming-msg-info", "poc", kIncomingMsgFields,
     summarise_ptt_message},
    {IMS_NOTI_POC_MSG_NOTIFICATION, "poc-msg-notification", "poc", kMsgNotificationFields,
     summarise_ptt_notice},
    {IMS_NOTI_POC_INCOMING_FILE_TRANSFER, "poc-incoming-file-transfer", "poc", kIncomingFileFields,
     summarise_ptt_file},
    {IMS_NOTI_POC_FILE_TRANSFER_PROGRESS, "poc-file-transfer-progress", "poc", kFileProgressFields,
     summarise_ptt_progress},
    {IMS_NOTI_POC_FILE_TRANSFER_TERMINATED, "poc-file-transfer-terminated", "poc",
     kFileTerminatedFields, summarise_ptt_terminated},
};

} // namespace

std::span<const EventRow> ptt_events() {
    return kPttEvents;
}

} // namespace imsctl
