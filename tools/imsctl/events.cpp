// SPDX-License-Identifier: Apache-2.0
#include "events.hpp"

#include "summaries.hpp"

#include <algorithm>
#include <cstdlib>
#include <ims.h>
#include <type_traits>

namespace imsctl {
namespace {

template <class Record, class Member>
Record record_of(Member Record::*);

template <auto Member>
using RecordOf = decltype(record_of(Member));

template <auto Member>
auto &member_of(void *record) {
    return static_cast<RecordOf<Member> *>(record)->*Member;
}

std::optional<std::string> take_text(char *text) {
    if (text == nullptr)
        return std::nullopt;
    std::string copy(text);
    std::free(text);
    return copy;
}

template <auto Member>
Value take_member(void *record) {
    auto &member = member_of<Member>(record);
    using Type = std::remove_reference_t<decltype(member)>;
    if constexpr (std::is_same_v<Type, char *>) {
        auto text = take_text(member);
        return text ? Value(*std::move(text)) : Value();
    } else if constexpr (std::is_same_v<Type, bool> || std::is_same_v<Type, std::uint8_t>) {
        return member;
    } else {
        static_assert(std::is_same_v<Type, std::int32_t> || std::is_same_v<Type, std::uint32_t>);
        return std::int64_t{member};
    }
}

// A boolean that the record holds as a number.
template <auto Member>
Value take_flag(void *record) {
    return member_of<Member>(record) != 0;
}

// The record's bytes are gone after the callback and are nobody's to free.
template <auto Data, auto Length>
Value take_bytes(void *record) {
    const std::uint8_t *data = member_of<Data>(record);
    const std::int32_t length = member_of<Length>(record);
    if (data == nullptr || length <= 0)
        return Bytes();
    return Bytes(data, data + length);
}

template <auto Data, auto Length>
Value take_tpdu(void *record) {
    const std::uint8_t *data = member_of<Data>(record);
    return Binary{data == nullptr ? Bytes() : Bytes(data, data + member_of<Length>(record))};
}

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

template <auto Member>
constexpr FieldRow field(std::string_view name) {
    return {name, take_member<Member>};
}

template <auto Member>
constexpr FieldRow flag(std::string_view name) {
    return {name, take_flag<Member>};
}

template <auto Data, auto Length>
constexpr FieldRow tpdu_bytes(std::string_view name) {
    return {name, take_tpdu<Data, Length>};
}

template <auto Data, auto Length>
constexpr FieldRow bytes(std::string_view name) {
    return {name, take_bytes<Data, Length>};
}

constexpr FieldRow kRegistration[] = {
    flag<&ims_registration_info_s::registered>("registered"),
    field<&ims_registration_info_s::value_1>("value_1"),
    field<&ims_registration_info_s::value_2>("value_2"),
    field<&ims_registration_info_s::value_3>("value_3"),
    field<&ims_registration_info_s::value_4>("value_4"),
    field<&ims_registration_info_s::value_5>("value_5"),
};

constexpr FieldRow kEmergencyRegistration[] = {
    flag<&ims_emergency_registration_info_s::registered>("registered"),
    field<&ims_emergency_registration_info_s::value_1>("value_1"),
    field<&ims_emergency_registration_info_s::value_2>("value_2"),
};

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

constexpr FieldRow kIncomingSms[] = {
    tpdu_bytes<&ims_sms_incoming_s::tpdu, &ims_sms_incoming_s::tpdu_length>("tpdu"),
    field<&ims_sms_incoming_s::member_3>("member_3"),
    field<&ims_sms_incoming_s::member_4>("member_4"),
};

constexpr FieldRow kSendSmsAck[] = {
    field<&ims_sms_send_ack_s::member_1>("member_1"),
    field<&ims_sms_send_ack_s::member_2>("member_2"),
    field<&ims_sms_send_ack_s::member_3>("member_3"),
    tpdu_bytes<&ims_sms_send_ack_s::tpdu, &ims_sms_send_ack_s::tpdu_length>("tpdu"),
    field<&ims_sms_send_ack_s::member_6>("member_6"),
};

constexpr FieldRow kDeliveryReportAck[] = {
    field<&ims_sms_delivery_report_ack_s::member_1>("member_1"),
    field<&ims_sms_delivery_report_ack_s::member_2>("member_2"),
};

constexpr FieldRow kLoginState[] = {
    field<&ims_login_state_s::value_1>("value_1"),
    field<&ims_login_state_s::value_2>("value_2"),
    field<&ims_login_state_s::value_3>("value_3"),
};

// In the order of their ids.
constexpr EventRow kEvents[] = {
    {IMS_NOTI_REG_REGISTRATION_STATUS, "reg-registration-status", "reg", kRegistration,
     summarise_registration},
    {IMS_NOTI_REG_EMERGENCY_REGISTRATION_STATUS, "reg-emergency-registration-status", "reg",
     kEmergencyRegistration, summarise_emergency_registration},
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
    {IMS_NOTI_SMS_INCOMING_SMS, "sms-incoming-sms", "sms", kIncomingSms, summarise_tpdu},
    {IMS_NOTI_SMS_SEND_SMS_ACK, "sms-send-sms-ack", "sms", kSendSmsAck, summarise_tpdu},
    {IMS_NOTI_SMS_DELIVERY_REPORT_ACK, "sms-delivery-report-ack", "sms", kDeliveryReportAck},
    {IMS_NOTI_LOGIN_STATE, "login-state", "login", kLoginState, summarise_login},
};

} // namespace

std::span<const EventRow> all_events() {
    return kEvents;
}

const EventRow *find_event(std::string_view name) {
    const auto *row = std::find_if(std::begin(kEvents), std::end(kEvents),
                                   [&](const EventRow &event) { return event.name == name; });
    return row == std::end(kEvents) ? nullptr : row;
}

const EventRow *find_event(int id) {
    const auto *row = std::find_if(std::begin(kEvents), std::end(kEvents),
                                   [&](const EventRow &event) { return event.id == id; });
    return row == std::end(kEvents) ? nullptr : row;
}

std::vector<std::string> event_names() {
    std::vector<std::string> names;
    for (const EventRow &event : kEvents)
        names.emplace_back(event.name);
    return names;
}

std::vector<std::string> event_modules() {
    std::vector<std::string> modules;
    for (const EventRow &event : kEvents)
        if (modules.empty() || modules.back() != event.module)
            modules.emplace_back(event.module);
    return modules;
}

Fields take_fields(const EventRow &row, void *record) {
    Fields fields;
    for (const FieldRow &field : row.fields)
        fields.push_back({field.name, field.take(record)});
    return fields;
}

} // namespace imsctl
