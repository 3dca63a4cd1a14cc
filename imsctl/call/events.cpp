// SPDX-License-Identifier: Apache-2.0
// What tells of calls.
#include "imsctl/call/module.hpp"
#include "imsctl/output/event_fields.hpp"

namespace imsctl {
namespace {

Value take_conference_values(void *record) {
    const auto &event = *static_cast<ims_call_conf_notify_s *>(record);
    if (event.values == nullptr || event.value_count <= 0)
        return Numbers();
    return Numbers(event.values, event.values + event.value_count);
}

Value take_conference_texts(void *record) {
    const auto &event = *static_cast<ims_call_conf_notify_s *>(record);
    Texts texts;
    for (std::int32_t i = 0; event.texts != nullptr && i < event.text_count; ++i)
        texts.push_back(take_text(event.texts[i]));
    return texts;
}

constexpr FieldRow kIncomingFields[] = {
    field<&ims_call_incoming_s::session_id>("session_id"),
    field<&ims_call_incoming_s::number>("number"),
    field<&ims_call_incoming_s::call_type>("call_type"),
    field<&ims_call_incoming_s::text_1>("text_1"),
    field<&ims_call_incoming_s::text_2>("text_2"),
    field<&ims_call_incoming_s::text_3>("text_3"),
    field<&ims_call_incoming_s::text_4>("text_4"),
    field<&ims_call_incoming_s::text_5>("text_5"),
    field<&ims_call_incoming_s::flag_1>("flag_1"),
};

constexpr FieldRow kSessionFields[] = {field<&ims_call_session_s::session_id>("session_id")};

constexpr FieldRow kEstablishedFields[] = {
    field<&ims_call_established_s::session_id>("session_id"),
    field<&ims_call_established_s::call_type>("call_type"),
    field<&ims_call_established_s::flag_1>("flag_1"),
    field<&ims_call_established_s::text_1>("text_1"),
    field<&ims_call_established_s::flag_2>("flag_2"),
};

constexpr FieldRow kHeldFields[] = {
    field<&ims_call_held_s::session_id>("session_id"),
    field<&ims_call_held_s::flag_1>("flag_1"),
    field<&ims_call_held_s::value_1>("value_1"),
};

constexpr FieldRow kResumedFields[] = {
    field<&ims_call_resumed_s::session_id>("session_id"),
    field<&ims_call_resumed_s::flag_1>("flag_1"),
    field<&ims_call_resumed_s::flag_2>("flag_2"),
    field<&ims_call_resumed_s::value_1>("value_1"),
};

constexpr FieldRow kEndedFields[] = {
    field<&ims_call_ended_s::session_id>("session_id"),
    field<&ims_call_ended_s::reason>("reason"),
};

constexpr FieldRow kSwitchedFields[] = {
    field<&ims_call_switched_s::session_id>("session_id"),
    field<&ims_call_switched_s::call_type>("call_type"),
};

constexpr FieldRow kChangeRequestFields[] = {
    field<&ims_call_change_request_s::session_id>("session_id"),
    field<&ims_call_change_request_s::call_type>("call_type"),
    bytes<&ims_call_change_request_s::data, &ims_call_change_request_s::length>("data"),
};

constexpr FieldRow kConferenceNotifyFields[] = {
    field<&ims_call_conf_notify_s::session_id>("session_id"),
    {"values", take_conference_values},
    {"texts", take_conference_texts},
};

constexpr FieldRow kEarlyMediaFields[] = {
    field<&ims_call_early_media_s::session_id>("session_id"),
    field<&ims_call_early_media_s::text_1>("text_1"),
};

constexpr FieldRow kErrorFields[] = {
    field<&ims_call_error_s::session_id>("session_id"),
    field<&ims_call_error_s::error_code>("error_code"),
    field<&ims_call_error_s::text_1>("text_1"),
};

constexpr FieldRow kConferenceEventFields[] = {
    field<&ims_call_conference_event_s::session_id>("session_id"),
    field<&ims_call_conference_event_s::value_1>("value_1"),
};

constexpr FieldRow kUssdFields[] = {
    field<&ims_call_ussd_indication_s::value_1>("value_1"),
    field<&ims_call_ussd_indication_s::value_2>("value_2"),
    field<&ims_call_ussd_indication_s::value_3>("value_3"),
    bytes<&ims_call_ussd_indication_s::data, &ims_call_ussd_indication_s::length>("data"),
};

constexpr FieldRow kDtmfFields[] = {field<&ims_call_dtmf_event_s::tone>("tone")};

constexpr EventRow kCallEvents[] = {
    {IMS_NOTI_CALL_INCOMING_IND, "call-incoming-ind", "call", kIncomingFields},
    {IMS_NOTI_CALL_IN_PROGRESS, "call-in-progress", "call", kSessionFields},
    {IMS_NOTI_CALL_ALERTING, "call-alerting", "call", kSessionFields},
    {IMS_NOTI_CALL_BUSY, "call-busy", "call", kSessionFields},
    {IMS_NOTI_CALL_ESTABLISHED, "call-established", "call", kEstablishedFields},
    {IMS_NOTI_CALL_HELD, "call-held", "call", kHeldFields},
    {IMS_NOTI_CALL_RESUMED, "call-resumed", "call", kResumedFields},
    {IMS_NOTI_CALL_FORWARDED, "call-forwarded", "call", kSessionFields},
    {IMS_NOTI_CALL_ENDED, "call-ended", "call", kEndedFields},
    {IMS_NOTI_CALL_SWITCHED, "call-switched", "call", kSwitchedFields},
    {IMS_NOTI_CALL_CHANGE_REQUEST, "call-change-request", "call", kChangeRequestFields},
    {IMS_NOTI_CALL_CONF_NOTIFY_RECEIVED, "call-conf-notify-received", "call",
     kConferenceNotifyFields},
    {IMS_NOTI_CALL_EARLY_MEDIA_START, "call-early-media-start", "call", kEarlyMediaFields},
    {IMS_NOTI_CALL_STOP_ALERT_TONE, "call-stop-alert-tone", "call", kSessionFields},
    {IMS_NOTI_CALL_ERROR, "call-error", "call", kErrorFields},
    {IMS_NOTI_CALL_CONFERENCE_CALL_ESTABLISHED, "call-conference-call-established", "call",
     kConferenceEventFields},
    {IMS_NOTI_CALL_CONFERENCE_CALL_PARTICIPANT_ADDED, "call-conference-call-participant-added",
     "call", kConferenceEventFields},
    {IMS_NOTI_CALL_CONFERENCE_CALL_PARTICIPANT_REMOVED, "call-conference-call-participant-removed",
     "call", kConferenceEventFields},
    {IMS_NOTI_CALL_USSD_INDICATION, "call-ussd-indication", "call", kUssdFields},
    {IMS_NOTI_CALL_DTMF_EVENT, "call-dtmf-event", "call", kDtmfFields},
};

} // namespace

std::span<const EventRow> call_events() {
    return kCallEvents;
}

} // namespace imsctl
