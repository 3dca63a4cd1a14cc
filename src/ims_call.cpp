// SPDX-License-Identifier: Apache-2.0
// Calls: requests, the call list, the decoder of the call signals.
#include "ims_call.h"

#include "frame.hpp"
#include "notifications.hpp"
#include "wire/dictionary.hpp"

#include <algorithm>
#include <vector>

using namespace ims;

namespace {

constexpr const char *kInterface = "org.kelvo.ims.Call";

// The service counts on a text that ends at its length; the caller's buffer has room for the zero.
void terminate(char *text, std::int32_t length) noexcept {
    if (text != nullptr && length >= 0)
        text[length] = '\0';
}

// The first `count` participants as an "as" inside a "v"; the list may end sooner.
Variant participants(const ims_call_participant_s *head, std::int32_t count) noexcept {
    TextArray texts;
    for (; head != nullptr && count > 0; head = head->next, --count)
        texts.add(head->text);
    return boxed(texts.finish());
}

} // namespace

int ims_call_make_call(ims_h handle, const ims_call_make_info_s *info, ims_response_cb callback,
                       void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(
        handle, kInterface, "MakeCall",
        pack<"(isissss)">(handle->app_id, info->number, info->call_type, info->text_1, info->text_2,
                          info->text_3, info->text_4),
        {answer<"on_response_call_make_call", "(ii)", kSecondByPointer>, callback, user_data});
}

int ims_call_send_ussd(ims_h handle, const ims_call_ussd_info_s *info, ims_response_cb callback,
                       void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    const char *text = nullptr;
    if (info->type != IMS_CALL_USSD_TYPE_WITHOUT_TEXT) {
        terminate(info->text, info->text_length);
        text = info->text;
    }
    return request(handle, kInterface, "SendUssd",
                   pack<"(iiis)">(handle->app_id, info->type, info->value_1, text),
                   {answer<"on_response_call_send_ussd">, callback, user_data});
}

int ims_call_answer_call(ims_h handle, const ims_call_id_info_s *info, ims_response_cb callback,
                         void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "AnswerCall",
                   pack<"(iiii)">(handle->app_id, info->session_id, info->value_1, info->value_2),
                   {answer<"on_response_call_answer_call">, callback, user_data});
}

int ims_call_end_call(ims_h handle, const ims_call_id_info_s *info, ims_response_cb callback,
                      void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "EndCall",
                   pack<"(iiii)">(handle->app_id, info->session_id, info->value_1, info->value_2),
                   {answer<"on_response_call_end_call">, callback, user_data});
}

int ims_call_reject_call(ims_h handle, const ims_call_pair_info_s *info, ims_response_cb callback,
                         void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "RejectCall",
                   pack<"(iii)">(handle->app_id, info->session_id, info->value_1),
                   {answer<"on_response_call_reject_call">, callback, user_data});
}

int ims_call_hold_call(ims_h handle, int32_t session_id, ims_response_cb callback,
                       void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "HoldCall", pack<"(ii)">(handle->app_id, session_id),
                   {answer<"on_response_call_hold_call">, callback, user_data});
}

int ims_call_resume_call(ims_h handle, int32_t session_id, ims_response_cb callback,
                         void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "ResumeCall", pack<"(ii)">(handle->app_id, session_id),
                   {answer<"on_response_call_resume_call">, callback, user_data});
}

int ims_call_swap_call(ims_h handle, ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "SwapCall", pack<"(i)">(handle->app_id),
                   {answer<"on_response_call_swap_call">, callback, user_data});
}

int ims_call_upgrade_call(ims_h handle, const ims_call_pair_info_s *info, ims_response_cb callback,
                          void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "UpgradeCall",
                   pack<"(iii)">(handle->app_id, info->session_id, info->value_1),
                   {answer<"on_response_call_upgrade_call">, callback, user_data});
}

int ims_call_downgrade_call(ims_h handle, const ims_call_pair_info_s *info,
                            ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "DowngradeCall",
                   pack<"(iii)">(handle->app_id, info->session_id, info->value_1),
                   {answer<"on_response_call_downgrade_call">, callback, user_data});
}

constexpr auto kChange = [](const Completion &done, std::int32_t result, std::int32_t value,
                            const char *text) {
    if (!done.is_wanted())
        return;
    // The application takes the copy over.
    ims_call_change_result_s change{value, g_strdup(text)};
    done(result, &change);
};

int ims_call_change_call(ims_h handle, const ims_call_pair_info_s *info, ims_response_cb callback,
                         void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "ChangeCall",
                   pack<"(iii)">(handle->app_id, info->session_id, info->value_1),
                   {answer<"on_response_call_change_call", "(iis)", kChange>, callback, user_data});
}

int ims_call_accept_change_request(ims_h handle, int32_t session_id, ims_response_cb callback,
                                   void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "AcceptChangeRequest",
                   pack<"(ii)">(handle->app_id, session_id),
                   {answer<"on_response_call_accept_change_request">, callback, user_data});
}

int ims_call_reject_change_request(ims_h handle, int32_t session_id, ims_response_cb callback,
                                   void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "RejectChangeRequest",
                   pack<"(ii)">(handle->app_id, session_id),
                   {answer<"on_response_call_reject_change_request">, callback, user_data});
}

int ims_call_send_dtmf(ims_h handle, const ims_call_dtmf_info_s *info, ims_response_cb callback,
                       void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "SendDtmf",
                   pack<"(iis)">(handle->app_id, info->session_id, info->digits),
                   {answer<"on_response_call_send_dtmf">, callback, user_data});
}

int ims_call_start_dtmf(ims_h handle, const ims_call_dtmf_tone_s *info, ims_response_cb callback,
                        void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "StartDtmf",
                   pack<"(iiy)">(handle->app_id, info->session_id, info->tone),
                   {answer<"on_response_call_start_dtmf">, callback, user_data});
}

int ims_call_stop_dtmf(ims_h handle, int32_t session_id, ims_response_cb callback,
                       void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "StopDtmf", pack<"(ii)">(handle->app_id, session_id),
                   {answer<"on_response_call_stop_dtmf">, callback, user_data});
}

int ims_call_voice_record(ims_h handle, const ims_call_record_info_s *info,
                          ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "VoiceRecord",
                   pack<"(iiis)">(handle->app_id, info->session_id, info->value_1, info->text_1),
                   {answer<"on_response_call_voice_record">, callback, user_data});
}

int ims_call_send_tty_data(ims_h handle, const ims_call_tty_data_s *info, ims_response_cb callback,
                           void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    const Text data = base64_encode(info->data, info->length);
    return request(handle, kInterface, "SendTtyData",
                   pack<"(iis)">(handle->app_id, info->session_id, data.get()),
                   {answer<"on_response_call_send_tty_data">, callback, user_data});
}

int ims_call_set_tty_mode(ims_h handle, int32_t mode, ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "SetTtyMode", pack<"(ii)">(handle->app_id, mode),
                   {answer<"on_response_call_set_tty_mode">, callback, user_data});
}

constexpr auto kTtyMode = [](const Completion &done, std::int32_t result, std::int32_t value_1,
                             std::int32_t value_2, const char *text) {
    const Decoded data = base64_decode(text);
    ims_call_tty_mode_s mode{value_1, value_2, data.bytes.get(),
                             static_cast<std::int32_t>(data.count)};
    done(result, &mode);
};

int ims_call_get_tty_mode(ims_h handle, ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    // The service tells the caller by its connection: no application id.
    return request(
        handle, kInterface, "GetTtyMode", pack<"()">(),
        {answer<"on_response_call_get_tty_mode", "(iiis)", kTtyMode>, callback, user_data});
}

int ims_call_is_muted(ims_h handle, int32_t session_id, ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(
        handle, kInterface, "IsMuted", pack<"(ii)">(handle->app_id, session_id),
        {answer<"on_response_call_is_muted", "(ib)", kSecondByPointer>, callback, user_data});
}

int ims_call_toggle_mute(ims_h handle, int32_t session_id, ims_response_cb callback,
                         void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "ToggleMute", pack<"(ii)">(handle->app_id, session_id),
                   {answer<"on_response_call_toggle_mute">, callback, user_data});
}

int ims_call_set_speaker_mode(ims_h handle, const ims_call_pair_info_s *info,
                              ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "SetSpeakerMode",
                   pack<"(iii)">(handle->app_id, info->session_id, info->value_1),
                   {answer<"on_response_call_set_speaker_mode">, callback, user_data});
}

int ims_call_set_volume(ims_h handle, const ims_call_pair_info_s *info, ims_response_cb callback,
                        void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "SetVolume",
                   pack<"(iii)">(handle->app_id, info->session_id, info->value_1),
                   {answer<"on_response_call_set_volume">, callback, user_data});
}

int ims_call_get_max_volume(ims_h handle, int32_t session_id, ims_response_cb callback,
                            void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(
        handle, kInterface, "GetMaxVolume", pack<"(ii)">(handle->app_id, session_id),
        {answer<"on_response_call_get_max_volume", "(ii)", kSecondByPointer>, callback, user_data});
}

int ims_call_add_user_for_conference_call(ims_h handle, const ims_call_conf_user_s *info,
                                          ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "AddUserForConferenceCall",
                   pack<"(iisi)">(handle->app_id, info->session_id, info->number, info->value_1),
                   {answer<"on_response_call_add_user_for_conference_call">, callback, user_data});
}

int ims_call_indicate_srvcc_ho_started(ims_h handle, int32_t value, ims_response_cb callback,
                                       void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "IndicateSrvccHoStarted",
                   pack<"(ii)">(handle->app_id, value),
                   {answer<"on_response_call_indicate_srvcc_ho_started">, callback, user_data});
}

int ims_call_indicate_srvcc_ho_failed(ims_h handle, int32_t value, ims_response_cb callback,
                                      void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "IndicateSrvccHoFailed", pack<"(ii)">(handle->app_id, value),
                   {answer<"on_response_call_indicate_srvcc_ho_failed">, callback, user_data});
}

int ims_call_set_auto_response(ims_h handle, const ims_call_pair_info_s *info,
                               ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "SetAutoResponse",
                   pack<"(iii)">(handle->app_id, info->session_id, info->value_1),
                   {answer<"on_response_call_set_auto_response">, callback, user_data});
}

int ims_call_set_emergency_pdn_info(ims_h handle, const ims_call_emergency_pdn_s *info,
                                    ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    TextArray texts;
    for (std::int32_t at = 0; at < info->count && info->texts != nullptr; ++at)
        texts.add(info->texts[at]);
    return request(handle, kInterface, "SetEmergencyPdnInfo",
                   pack<"(isi@vs)">(handle->app_id, info->text_1, info->count,
                                    boxed(texts.finish()), info->text_2),
                   {answer<"on_response_call_set_emergency_pdn_info">, callback, user_data});
}

int ims_call_register_emergency_pdn(ims_h handle, ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    // The service tells the caller by its connection: no application id.
    return request(handle, kInterface, "RegisterEmergencyPdn", pack<"()">(),
                   {answer<"on_response_call_register_emergency_pdn">, callback, user_data});
}

int ims_call_deregister_emergency_pdn(ims_h handle, ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    // The service tells the caller by its connection: no application id.
    return request(handle, kInterface, "DeregisterEmergencyPdn", pack<"()">(),
                   {answer<"on_response_call_deregister_emergency_pdn">, callback, user_data});
}

int ims_call_start_nway_conference_call(ims_h handle, const ims_call_id_info_s *info,
                                        ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "StartNwayConferenceCall",
                   pack<"(iiii)">(handle->app_id, info->session_id, info->value_1, info->value_2),
                   {answer<"on_response_call_start_nway_conference_call", "(ii)", kSecondByPointer>,
                    callback, user_data});
}

int ims_call_merge_calls(ims_h handle, ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(
        handle, kInterface, "MergeCalls", pack<"(i)">(handle->app_id),
        {answer<"on_response_call_merge_calls", "(ii)", kSecondByPointer>, callback, user_data});
}

int ims_call_add_participant_to_nway_conference_call(ims_h handle, const ims_call_pair_info_s *info,
                                                     ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(
        handle, kInterface, "AddParticipantToNwayConferenceCall",
        pack<"(iii)">(handle->app_id, info->session_id, info->value_1),
        {answer<"on_response_call_add_participant_to_nway_conference_call">, callback, user_data});
}

int ims_call_remove_participant_from_nway_conference_call(ims_h handle,
                                                          const ims_call_pair_info_s *info,
                                                          ims_response_cb callback,
                                                          void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "RemoveParticipantFromNwayConferenceCall",
                   pack<"(iii)">(handle->app_id, info->session_id, info->value_1),
                   {answer<"on_response_call_remove_participant_from_nway_conference_call">,
                    callback, user_data});
}

int ims_call_is_in_epdg_call(ims_h handle, ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "IsInEpdgCall", pack<"(i)">(handle->app_id),
                   {answer<"on_response_call_is_in_epdg_call", "(ib)", kSecondByPointer>, callback,
                    user_data});
}

int ims_call_update_ssac_info(ims_h handle, const ims_call_ssac_info_s *info,
                              ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "UpdateSsacInfo",
                   pack<"(iiiiii)">(handle->app_id, info->value_1, info->value_2, info->value_3,
                                    info->value_4, info->value_5),
                   {answer<"on_response_call_update_ssac_info">, callback, user_data});
}

int ims_call_change_epdg_audio_path(ims_h handle, int32_t value, ims_response_cb callback,
                                    void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "ChangeEpdgAudioPath", pack<"(ii)">(handle->app_id, value),
                   {answer<"on_response_call_change_epdg_audio_path">, callback, user_data});
}

int ims_call_start_conference(ims_h handle, const ims_call_conference_s *info,
                              ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    // The participants take the place of the application: no application id goes with them.
    return request(
        handle, kInterface, "StartConference",
        pack<"(ii@v)">(info->value_1, info->count, participants(info->participants, info->count)),
        {answer<"on_response_start_conference", "(ii)", kSecondInPlace>, callback, user_data});
}

int ims_call_modify_participants_in_conference(ims_h handle,
                                               const ims_call_conference_modify_s *info,
                                               ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(
        handle, kInterface, "ModifyParticipantsInConference",
        pack<"(iii@v)">(info->session_id, info->value_1, info->count,
                        participants(info->participants, info->count)),
        {answer<"on_response_modify_participants_into_conference", "(ii)", kSecondInPlace>,
         callback, user_data});
}

constexpr auto kCallFields = field_table({
    IMS_FIELD(ims_call_info_s, session_id),
    IMS_FIELD(ims_call_info_s, peer_uri),
    IMS_FIELD(ims_call_info_s, call_type),
    IMS_FIELD(ims_call_info_s, bmocall),
    IMS_FIELD(ims_call_info_s, call_state),
    IMS_FIELD(ims_call_info_s, bconfcall),
});

int ims_call_get_call_list_info(ims_h handle, ims_call_list_info_s *list) {
    if (const int refused = admit({handle, list}))
        return refused;
    Variant reply;
    if (const int failed =
            query(handle, kInterface, "CallListInfo", pack<"(i)">(handle->app_id), reply))
        return failed;
    std::int32_t result = 1;
    Variant calls;
    if (!unpack<"(iu@aa{sv})">(reply.get(), result, list->count, calls))
        return IMS_ERROR_OPERATION_FAILED;
    if (result != 0)
        return operation_failed(here(), "Failed to get Call Info: %d", result);
    list->count = checked_count("Call", list->count, calls.get(), IMS_CALL_LIST_CAPACITY, here());
    read_list(calls.get(), kCallFields, std::span{list->entries, list->count});
    return IMS_ERROR_NONE;
}

void ims_call_list_info_clear(ims_call_list_info_s *list) {
    if (list == nullptr)
        return;
    for (ims_call_info_s &call : list->entries)
        clear_record(kCallFields, &call, sizeof call);
    list->count = 0;
}

namespace {

// More elements than this must really have come; a count that only claims them is not believed.
constexpr std::int32_t kMaxClaimedCount = 65536;

// How many elements to make room for, so that neither the count nor the elements overrun them.
gsize room_for(std::int32_t claimed, gsize arrived) noexcept {
    return std::max(arrived, claimed > 0 ? static_cast<gsize>(claimed) : 0);
}

bool is_believable(std::int32_t claimed, gsize arrived) noexcept {
    return claimed <= kMaxClaimedCount || static_cast<gsize>(claimed) <= arrived;
}

void emit_conf_notify(const Event &event) noexcept {
    ims_call_conf_notify_s notify{};
    Variant values;
    Variant texts;
    if (!event.is_wanted() ||
        !event.read<"(i@vi@vi)">(notify.session_id, values, notify.value_count, texts,
                                 notify.text_count))
        return;
    if (!wire::has_type(values.get(), "ai") || !wire::has_type(texts.get(), "as")) {
        event.drop("(i<ai>i<as>i)");
        return;
    }
    gsize arrived_values = 0;
    const auto *first = static_cast<const std::int32_t *>(
        g_variant_get_fixed_array(values.get(), &arrived_values, sizeof(std::int32_t)));
    const gsize arrived_texts = g_variant_n_children(texts.get());
    if (!is_believable(notify.value_count, arrived_values) ||
        !is_believable(notify.text_count, arrived_texts)) {
        log_error(event.site(),
                  "Notification dropped - noti_id: [%d], counts %d and %d for %zu and %zu",
                  event.id(), notify.value_count, notify.text_count, arrived_values, arrived_texts);
        return;
    }
    std::vector<std::int32_t> value_array(room_for(notify.value_count, arrived_values));
    std::copy_n(first, arrived_values, value_array.begin());
    std::vector<char *> text_array(room_for(notify.text_count, arrived_texts));
    for (gsize at = 0; at < arrived_texts; ++at) {
        const Variant text{g_variant_get_child_value(texts.get(), at)};
        text_array[at] = g_variant_dup_string(text.get(), nullptr);
    }
    notify.values = value_array.data();
    notify.texts = text_array.data();
    event.deliver(&notify);
}

// Delivers a record whose bytes came as base64 text. They are gone after the callback.
template <typename Record>
void deliver_decoded(const Event &event, Record &record, const char *text) noexcept {
    const Decoded data = base64_decode(text);
    record.data = data.bytes.get();
    record.length = static_cast<std::int32_t>(data.count);
    event.deliver(&record);
}

void emit_change_request(const Event &event) noexcept {
    ims_call_change_request_s change{};
    const char *text = nullptr;
    if (event.is_wanted() && event.read<"(iis)">(change.session_id, change.call_type, text))
        deliver_decoded(event, change, text);
}

void emit_ussd_indication(const Event &event) noexcept {
    ims_call_ussd_indication_s ussd{};
    const char *text = nullptr;
    if (event.is_wanted() && event.read<"(iiis)">(ussd.value_1, ussd.value_2, ussd.value_3, text))
        deliver_decoded(event, ussd, text);
}

// The ids 0x214 to 0x222: the service has shapes for them, and no signal.
constexpr const char *kNoSignal = nullptr;
struct FlagEvent {
    std::int32_t session_id;
    bool flag_1;
};
struct FlagTextEvent {
    std::int32_t session_id;
    bool flag_1;
    char *text_1;
};

constexpr auto emit_session = emit<"(i)", ims_call_session_s>;
constexpr auto emit_conference = emit<"(ii)", ims_call_conference_event_s>;

// The members are spelled as the service spells them, "Confernce" included.
constexpr Notification kEvents[] = {
    {IMS_NOTI_CALL_INCOMING_IND, "CallIncomingInd", emit<"(isisssssb)", ims_call_incoming_s>},
    {IMS_NOTI_CALL_IN_PROGRESS, "CallInProgress", emit_session},
    {IMS_NOTI_CALL_ALERTING, "CallAlerting", emit_session},
    {IMS_NOTI_CALL_BUSY, "CallBusy", emit_session},
    {IMS_NOTI_CALL_ESTABLISHED, "CallEstablished", emit<"(iibsb)", ims_call_established_s>},
    {IMS_NOTI_CALL_HELD, "CallHeld", emit<"(ibi)", ims_call_held_s>},
    {IMS_NOTI_CALL_RESUMED, "CallResumed", emit<"(ibbi)", ims_call_resumed_s>},
    {IMS_NOTI_CALL_FORWARDED, "CallForwarded", emit_session},
    {IMS_NOTI_CALL_ENDED, "CallEnded", emit<"(ii)", ims_call_ended_s>},
    {IMS_NOTI_CALL_SWITCHED, "CallSwitched", emit<"(ii)", ims_call_switched_s>},
    {IMS_NOTI_CALL_CHANGE_REQUEST, "CallChangeRequest", emit_change_request},
    {IMS_NOTI_CALL_CONF_NOTIFY_RECEIVED, "CallConfNotifyReceived", emit_conf_notify},
    {IMS_NOTI_CALL_EARLY_MEDIA_START, "CallEarlyMediaStart", emit<"(is)", ims_call_early_media_s>},
    {IMS_NOTI_CALL_STOP_ALERT_TONE, "CallStopAlertTone", emit_session},
    {IMS_NOTI_CALL_ERROR, "CallError", emit<"(iis)", ims_call_error_s>},
    {IMS_NOTI_CALL_CONFERENCE_CALL_ESTABLISHED, "CallConfernceCallEstablished", emit_conference},
    {IMS_NOTI_CALL_CONFERENCE_CALL_PARTICIPANT_ADDED, "CallConfernceCallParticipantAdded",
     emit_conference},
    {IMS_NOTI_CALL_CONFERENCE_CALL_PARTICIPANT_REMOVED, "CallConfernceCallParticipantRemoved",
     emit_conference},
    {IMS_NOTI_CALL_USSD_INDICATION, "CallUssdIndication", emit_ussd_indication},
    {0x214, kNoSignal, emit_conference},
    {0x215, kNoSignal, emit_session},
    {0x216, kNoSignal, emit_session},
    {0x217, kNoSignal, emit_conference},
    {0x218, kNoSignal, emit<"(ibi)", ims_call_held_s>},
    {0x219, kNoSignal, emit_session},
    {0x21A, kNoSignal, emit_session},
    {0x21B, kNoSignal, emit<"(ibs)", FlagTextEvent>},
    {0x21C, kNoSignal, emit<"(ib)", FlagEvent>},
    {0x21D, kNoSignal, emit_session},
    {0x21E, kNoSignal, emit_session},
    {0x21F, kNoSignal, emit_session},
    {0x220, kNoSignal, emit_conference},
    {0x221, kNoSignal, emit_conference},
    {0x222, kNoSignal, emit_session},
    {IMS_NOTI_CALL_DTMF_EVENT, "CallDtmfEvent", emit<"(y)", ims_call_dtmf_event_s>},
};

} // namespace

constexpr Module ims::kCallModule{kInterface, on_call_signal_emit_handler, kEvents};

void ims::on_call_signal_emit_handler(ims_h handle, int noti_id, GVariant *parameters,
                                      const ims_noti_cb_info_s *subscription) {
    if (is_handle(handle))
        emit_row(kCallModule, {handle, noti_id, parameters, subscription});
}
