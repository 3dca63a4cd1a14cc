// SPDX-License-Identifier: Apache-2.0
// What tells of calls.
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

constexpr FieldRow kIncoming[] = {
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

constexpr FieldRow kSession[] = {field<&ims_call_session_s::session_id>("session_id")};

constexpr FieldRow kEstablished[] = {
    field<&ims_call_established_s::session_id>("session_id"),
    field<&ims_call_established_s::call_type>("call_type"),
    field<&ims_call_established_s::flag_1>("flag_1"),
    field<&ims_call_established_s::text_1>("text_1"),
    field<&ims_call_established_s::flag_2>("flag_2"),
};

constexpr FieldRow kHeld[] = {
    field<&ims_call_held_s::session_id>("session_id"),
    field<&ims_call_held_s::flag_1>("flag_1"),
    field<&ims_call_held_s::value_1>("value_1"),
};

constexpr FieldRow kResumed[] = {
    field<&ims_call_resumed_s::session_id>("session_id"),
    field<&ims_call_resumed_s::flag_1>("flag_1"),
    field<&ims_call_resumed_s::flag_2>("flag_2"),
    field<&ims_call_resumed_s::value_1>("value_1"),
};

constexpr FieldRow kEnded[] = {
    field<&ims_call_ended_s::session_id>("session_id"),
    field<&ims_call_ended_s::reason>("reason"),
};

constexpr FieldRow kSwitched[] = {
    field<&ims_call_switched_s::session_id>("session_id"),
    field<&ims_call_switched_s::call_type>("call_type"),
};

constexpr FieldRow kChangeRequest[] = {
    field<&ims_call_change_request_s::session_id>("session_id"),
    field<&ims_call_change_request_s::call_type>("call_type"),
    bytes<&ims_call_change_request_s::data, &ims_call_change_request_s::length>("data"),
};

constexpr FieldRow kConferenceNotify[] = {
    field<&ims_call_conf_notify_s::session_id>("session_id"),
    {"values", take_conference_values},
    {"texts", take_conference_texts},
};

constexpr FieldRow kEarlyMedia[] = {
    field<&ims_call_early_media_s::session_id>("session_id"),
    field<&ims_call_early_media_s::text_1>("text_1"),
};

constexpr FieldRow kError[] = {
    field<&ims_call_error_s::session_id>("session_id"),
    field<&ims_call_error_s::error_code>("error_code"),
    field<&ims_call_error_s::text_1>("text_1"),
};

constexpr FieldRow kConferenceEvent[] = {
    field<&ims_call_conference_event_s::session_id>("session_id"),
    field<&ims_call_conference_event_s::value_1>("value_1"),
};

constexpr FieldRow kUssd[] = {
    field<&ims_call_ussd_indication_s::value_1>("value_1"),
    field<&ims_call_ussd_indication_s::value_2>("value_2"),
    field<&ims_call_ussd_indication_s::value_3>("value_3"),
    bytes<&ims_call_ussd_indication_s::data, &ims_call_ussd_indication_s::length>("data"),
};

constexpr FieldRow kDtmf[] = {field<&ims_call_dtmf_event_s::tone>("tone")};

constexpr EventRow kEvents[] = {
    {IMS_NOTI_CALL_INCOMING_IND, "call-incoming-ind", "call", kIncoming},
    {IMS_NOTI_CALL_IN_PROGRESS, "call-in-progress", "call", kSession},
    {IMS_NOTI_CALL_ALERTING, "call-alerting", "call", kSession},
    {IMS_NOTI_CALL_BUSY, "call-busy", "call", kSession},
    {IMS_NOTI_CALL_ESTABLISHED, "call-established", "call", kEstablished},
    {IMS_NOTI_CALL_HELD, "call-held", "call", kHeld},
    {IMS_NOTI_CALL_RESUMED, "call-resumed", "call", kResumed},
    {IMS_NOTI_CALL_FORWARDED, "call-forwarded", "call", kSession},
    {IMS_NOTI_CALL_ENDED, "call-ended", "call", kEnded},
    {IMS_NOTI_CALL_SWITCHED, "call-switched", "call", kSwitched},
    {IMS_NOTI_CALL_CHANGE_REQUEST, "call-change-request", "call", kChangeRequest},
    {IMS_NOTI_CALL_CONF_NOTIFY_RECEIVED, "call-conf-notify-received", "call", kConferenceNotify},
    {IMS_NOTI_CALL_EARLY_MEDIA_START, "call-early-media-start", "call", kEarlyMedia},
    {IMS_NOTI_CALL_STOP_ALERT_TONE, "call-stop-alert-tone", "call", kSession},
    {IMS_NOTI_CALL_ERROR, "call-error", "call", kError},
    {IMS_NOTI_CALL_CONFERENCE_CALL_ESTABLISHED, "call-conference-call-established", "call",
     kConferenceEvent},
    {IMS_NOTI_CALL_CONFERENCE_CALL_PARTICIPANT_ADDED, "call-conference-call-participant-added",
     "call", kConferenceEvent},
    {IMS_NOTI_CALL_CONFERENCE_CALL_PARTICIPANT_REMOVED, "call-conference-call-participant-removed",
     "call", kConferenceEvent},
    {IMS_NOTI_CALL_USSD_INDICATION, "call-ussd-indication", "call", kUssd},
    {IMS_NOTI_CALL_DTMF_EVENT, "call-dtmf-event", "call", kDtmf},
};

} // namespace

std::span<const EventRow> call_events() {
    return kEvents;
}

} // namespace imsctl
