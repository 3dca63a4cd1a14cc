// SPDX-License-Identifier: Apache-2.0
// Push-to-talk: requests, the decoder of the push-to-talk signals. No request carries the
// application id.
#include "ims_poc.h"

#include "frame.hpp"
#include "notifications.hpp"
#include "poc_records.hpp"

#include <algorithm>
#include <vector>

using namespace ims;
using namespace ims::poc;

namespace {

constexpr const char *kInterface = "org.kelvo.ims.Poc";

Variant boxed_array(std::span<const std::int32_t> values) noexcept {
    return boxed(owned(g_variant_new_fixed_array(G_VARIANT_TYPE_INT32, values.data(), values.size(),
                                                 sizeof(std::int32_t))));
}

// The service counts on four values at least. Nothing for more than the record holds, or than the
// bus carries.
Variant floor_values(const ims_poc_floor_query_s &query) noexcept {
    const std::int64_t sent = std::max(query.count, 0);
    const std::int64_t padding = std::max<std::int64_t>(4 - std::int64_t{query.count}, 0);
    if (sent > IMS_POC_FLOOR_QUERY_CAPACITY ||
        static_cast<gsize>(padding) > kMaxTupleSize / sizeof(std::int32_t))
        return nullptr;
    std::vector<std::int32_t> values(static_cast<std::size_t>(sent + padding), -1);
    std::copy_n(query.values, sent, values.begin());
    return boxed_array(values);
}

Variant boxed_users(const ims_poc_user_s *head, std::int32_t count) noexcept {
    return boxed(write_chain(kUser, head, count));
}

Variant boxed_peers(const ims_poc_peer_info_s *head) noexcept {
    return boxed(write_chain(kPeer, head));
}

Variant boxed_peer(const ims_poc_peer_info_s *peer) noexcept {
    return boxed(write_record(kPeer, peer));
}

Variant pack_users(const ims_poc_users_s &info) noexcept {
    return pack<"(iii@vi@v)">(info.value_1, info.user_count, info.value_2,
                              boxed_users(info.user_list, info.user_count), info.value_3,
                              boxed(write_record(kContent, info.content)));
}

Variant pack_media(const ims_poc_call_media_s &info) noexcept {
    return pack<"(bbii@v@v)">(info.flag_1, info.flag_2, info.value_1, info.value_2,
                              boxed_array(info.int_set_1), boxed_array(info.int_set_2));
}

} // namespace

int ims_poc_call_make_call(ims_h handle, const ims_poc_make_call_s *info, ims_response_cb callback,
                           void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(
        handle, kInterface, "PocMakeCall",
        pack<"(bbbsis@v@vi)">(info->flag_1, info->flag_2, info->flag_3, info->text_1, info->value_1,
                              info->text_2, boxed_array(info->int_set_1),
                              boxed_array(info->int_set_2), info->value_2),
        {answer<"on_response_poc_call_make_call", "(ii)", kSecondByPointer>, callback, user_data});
}

int ims_poc_make_ad_hoc_call(ims_h handle, const ims_poc_ad_hoc_call_s *info,
                             ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    if (info->user_count < 1)
        return invalid_parameter();
    return request(
        handle, kInterface, "PocMakeAdHocConfCall",
        pack<"(@vb@vssbibi@vi)">(boxed_array(info->int_set_1), info->flag_1,
                                 boxed_array(info->int_set_2), info->text_1, info->text_2,
                                 info->flag_2, info->user_count, info->flag_3, info->value_1,
                                 boxed_users(info->user_list, info->user_count), info->value_2),
        {answer<"on_response_poc_make_ad_hoc_call", "(ii)", kSecondByPointer>, callback,
         user_data});
}

int ims_poc_add_users_to_ad_hoc_call(ims_h handle, const ims_poc_users_s *info,
                                     ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    if (info->user_count < 1)
        return invalid_parameter();
    return request(handle, kInterface, "PocAddUsersToAdHocConfCall", pack_users(*info),
                   {answer<"on_response_poc_add_users_to_ad_hoc_call">, callback, user_data});
}

int ims_poc_remove_users_from_ad_hoc_call(ims_h handle, const ims_poc_users_s *info,
                                          ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    if (info->user_count < 1)
        return invalid_parameter();
    return request(handle, kInterface, "PocRemoveUsersFromAdHocConfCall", pack_users(*info),
                   {answer<"on_response_poc_remove_users_from_ad_hoc_call">, callback, user_data});
}

int ims_poc_call_convert_normal_call_to_crisis_call(ims_h handle, const int32_t *value,
                                                    ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, value}))
        return refused;
    return request(
        handle, kInterface, "PocCallConvertToCrisisCall", pack<"(i)">(*value),
        {answer<"on_response_poc_call_convert_normal_call_to_crisis_call">, callback, user_data});
}

int ims_poc_call_answer_call(ims_h handle, const ims_poc_call_media_s *info,
                             ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "PocAnswerCall", pack_media(*info),
                   {answer<"on_response_poc_call_answer_call">, callback, user_data});
}

int ims_poc_call_reject_call(ims_h handle, const ims_poc_value_pair_s *info,
                             ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "PocRejectCall", pack<"(ii)">(info->value_1, info->value_2),
                   {answer<"on_response_poc_call_reject_call">, callback, user_data});
}

int ims_poc_call_end_call(ims_h handle, const ims_poc_value_pair_s *info, ims_response_cb callback,
                          void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "PocEndCall", pack<"(ii)">(info->value_1, info->value_2),
                   {answer<"on_response_poc_call_end_call">, callback, user_data});
}

int ims_poc_call_request_floor(ims_h handle, const ims_poc_floor_s *info, ims_response_cb callback,
                               void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "PocRequestFloor",
                   pack<"(i@viis)">(info->session_id, boxed_array(info->int_set), info->value_1,
                                    info->value_2, info->text),
                   {answer<"on_response_poc_call_request_floor">, callback, user_data});
}

int ims_poc_call_release_floor(ims_h handle, const ims_poc_floor_s *info, ims_response_cb callback,
                               void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "PocReleaseFloor",
                   pack<"(i@v)">(info->session_id, boxed_array(info->int_set)),
                   {answer<"on_response_poc_call_release_floor">, callback, user_data});
}

constexpr auto kFloorStatuses = [](const Completion &done, std::int32_t result,
                                   const Variant &sessions) {
    const ReceivedChain<kFloorStatus> status{sessions.get()};
    done(result, status.head);
};

int ims_poc_call_request_floor_status(ims_h handle, const ims_poc_floor_query_s *query,
                                      ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, query}))
        return refused;
    return request(
        handle, kInterface, "PocRequestFloorStatus", pack<"(@v)">(floor_values(*query)),
        {answer<"on_response_poc_call_request_floor_status", "(i@aa{sv})", kFloorStatuses>,
         callback, user_data});
}

int ims_poc_modify_call(ims_h handle, const ims_poc_call_media_s *info, ims_response_cb callback,
                        void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "PocModifyCall", pack_media(*info),
                   {answer<"on_response_poc_modify_call">, callback, user_data});
}

int ims_poc_accept_call_modify(ims_h handle, const ims_poc_call_media_s *info,
                               ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "PocAcceptModifyCall", pack_media(*info),
                   {answer<"on_response_poc_accept_call_modify">, callback, user_data});
}

int ims_poc_reject_call_modify(ims_h handle, int32_t value, ims_response_cb callback,
                               void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "PocRejectModifyCall", pack<"(i)">(value),
                   {answer<"on_response_poc_reject_call_modify">, callback, user_data});
}

int ims_poc_set_channel(ims_h handle, const ims_poc_value_pair_s *info, ims_response_cb callback,
                        void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "PocSetChannel", pack<"(ii)">(info->value_1, info->value_2),
                   {answer<"on_response_poc_set_channel">, callback, user_data});
}

constexpr auto kRecordingInfo = [](const Completion &done, std::int32_t result,
                                   const Variant &info) {
    Received<kRecording> recording{info.get()};
    done(result, &recording.record);
};

int ims_poc_start_call_recording(ims_h handle, const ims_poc_record_request_s *info,
                                 ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "PocStartCallRecording",
                   pack<"(iiis)">(info->value_1, info->value_2, info->value_3, info->text),
                   {answer<"on_response_poc_start_call_recording", "(i@a{sv})", kRecordingInfo>,
                    callback, user_data});
}

int ims_poc_pause_call_recording(ims_h handle, int32_t value, ims_response_cb callback,
                                 void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "PocPauseCallRecording", pack<"(i)">(value),
                   {answer<"on_response_poc_pause_call_recording">, callback, user_data});
}

int ims_poc_resume_call_recording(ims_h handle, int32_t value, ims_response_cb callback,
                                  void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "PocResumeCallRecording", pack<"(i)">(value),
                   {answer<"on_response_poc_resume_call_recording">, callback, user_data});
}

int ims_poc_stop_call_recording(ims_h handle, int32_t value, ims_response_cb callback,
                                void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "PocStopCallRecording", pack<"(i)">(value),
                   {answer<"on_response_poc_stop_call_recording">, callback, user_data});
}

int ims_poc_cancel_call_recording(ims_h handle, int32_t value, ims_response_cb callback,
                                  void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "PocCancelCallRecording", pack<"(i)">(value),
                   {answer<"on_response_poc_cancel_call_recording">, callback, user_data});
}

int ims_poc_send_msg(ims_h handle, const ims_poc_message_s *message, ims_response_cb callback,
                     void *user_data) {
    if (const int refused = admit({handle, message}))
        return refused;
    return request(
        handle, kInterface, "PocSendMsg",
        pack<"(is@vissi@vi)">(message->value_1, message->text_1, boxed_peers(message->targets),
                              message->value_2, message->text_2, message->text_3, message->value_3,
                              boxed_peer(message->originator), message->value_4),
        {answer<"on_response_poc_send_msg", "(iiii)", kRestAsRecord<ims_poc_msg_result_s>>,
         callback, user_data});
}

int ims_poc_send_received_msg_notification(ims_h handle,
                                           const ims_poc_msg_notification_s *notification,
                                           ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, notification}))
        return refused;
    return request(
        handle, kInterface, "PocSendReceivedMsgNoti",
        pack<"(is@v@vsi)">(notification->value_1, notification->text_1,
                           boxed_peer(notification->originator),
                           boxed(write_chain(kNames<ims_poc_name_node_s>, notification->parties)),
                           notification->text_2, notification->value_2),
        {answer<"on_response_poc_send_received_msg_notification", "(iiii)",
                kRestAsRecord<ims_poc_msg_result_s>>,
         callback, user_data});
}

int ims_poc_transfer_file(ims_h handle, const ims_poc_file_transfer_s *transfer,
                          ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, transfer}))
        return refused;
    return request(
        handle, kInterface, "PocTransferFile",
        pack<"(i@v@v@v)">(transfer->session_id, boxed_peers(transfer->targets),
                          boxed(write_record(kFileAttributes, transfer->attributes)),
                          boxed_peer(transfer->originator)),
        {answer<"on_response_poc_transfer_file", "(iii)", kRestAsRecord<ims_poc_transfer_result_s>>,
         callback, user_data});
}

int ims_poc_accept_file_transfer(ims_h handle, const ims_poc_transfer_answer_s *answer,
                                 ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, answer}))
        return refused;
    return request(handle, kInterface, "PocAcceptFileTransfer",
                   pack<"(is)">(answer->session_id, answer->transfer_id),
                   {ims::answer<"on_response_poc_accept_file_transfer", "(iii)",
                                kRestAsRecord<ims_poc_transfer_result_s>>,
                    callback, user_data});
}

int ims_poc_reject_file_transfer(ims_h handle, const ims_poc_transfer_answer_s *answer,
                                 ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, answer}))
        return refused;
    // The service has the method under this name.
    return request(handle, kInterface, "PocARejectFileTransfer",
                   pack<"(is)">(answer->session_id, answer->transfer_id),
                   {ims::answer<"on_response_poc_reject_file_transfer", "(iii)",
                                kRestAsRecord<ims_poc_transfer_result_s>>,
                    callback, user_data});
}

int ims_poc_cancel_file_transfer(ims_h handle, int32_t value, ims_response_cb callback,
                                 void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "PocCancelFileTransfer", pack<"(i)">(value),
                   {answer<"on_response_poc_cancel_file_transfer", "(iii)",
                           kRestAsRecord<ims_poc_transfer_result_s>>,
                    callback, user_data});
}

int ims_poc_send_keep_alive(ims_h handle, int32_t value, ims_response_cb callback,
                            void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "PocSendKeepAlive", pack<"(i)">(value),
                   {answer<"on_response_poc_send_keep_alive">, callback, user_data});
}

namespace {

// What was read into memory of its own, for as long as the scope lasts.
template <const auto &Table>
using Record = tree::RecordOf<Table>;
template <const auto &Table>
void release_record(Record<Table> *record) noexcept {
    release_new(Table, record);
}
template <const auto &Table>
void release_list(Record<Table> *head) noexcept {
    release_chain(Table, head);
}

// A dictionary, or nothing when the service left it out: an empty one, or something else.
template <const auto &Table>
Record<Table> *read_unless_empty(GVariant *value) noexcept {
    const Variant content = peeled(value);
    const bool has_entries = g_variant_is_of_type(content.get(), G_VARIANT_TYPE_VARDICT) &&
                             g_variant_n_children(content.get()) > 0;
    return has_entries ? read_new(content.get(), Table) : nullptr;
}

constexpr auto &kRouteHeader = kNames<ims_poc_route_header_s>;

using Peer = Owned<ims_poc_peer_info_s, release_record<kPeer>>;
using FileAttributes = Owned<ims_poc_file_attributes_s, release_record<kFileAttributes>>;
using RouteHeaders = Owned<ims_poc_route_header_s, release_list<kRouteHeader>>;

// The line is the same for whatever is missing.
template <typename Part>
Part or_log(Part part, Site site) noexcept {
    if (!part)
        log_error(site, "user_list is NULL");
    return part;
}

Peer fetch_peer(GVariant *value) noexcept {
    return or_log(Peer{read_unless_empty<kPeer>(value)}, named("__fetch_peer_info"));
}

FileAttributes fetch_file_attributes(GVariant *value) noexcept {
    return or_log(FileAttributes{read_unless_empty<kFileAttributes>(value)},
                  named("__fetch_file_attributes"));
}

RouteHeaders fetch_route_headers(GVariant *value) noexcept {
    return or_log(RouteHeaders{read_chain(value, kRouteHeader)}, named("__fetch_route_header"));
}

void free_group_adv(ims_poc_group_adv_s *adv) noexcept {
    const Site site = named("__free_group_adv");
    if (adv == nullptr) {
        log_error(site, "No Group Adv Present");
        return;
    }
    if (adv->group_advertisement_content == nullptr)
        log_error(site, "No Group Content Info Present");
    release_new(kGroupAdv, adv);
}

void emit_established(const Event &event) noexcept {
    ims_poc_call_established_s call{};
    Variant peer;
    if (!event.read<"(iibsb@vb@v@v)">(call.value_1, call.value_2, call.flag_1, call.text_1,
                                      call.flag_2, call.int_set_1, call.flag_3, call.int_set_2,
                                      peer))
        return;
    const Received<kPeer> party{peer.get()};
    call.peer = party.record;
    event.deliver(&call);
}

void emit_group_advertisement(const Event &event) noexcept {
    ims_poc_group_advertisement_s advertisement{};
    Variant adv;
    if (!event.read<"(i@a{sv})">(advertisement.value_1, adv))
        return;
    ims_poc_group_adv_s *group_adv = read_unless_empty<kGroupAdv>(adv.get());
    advertisement.group_adv = group_adv;
    event.deliver(&advertisement);
    free_group_adv(group_adv);
}

void emit_incoming_msg(const Event &event) noexcept {
    ims_poc_incoming_msg_s message{};
    Variant first;
    Variant headers;
    Variant second;
    if (!event.read<"(i@vsiss@vsiii@v)">(message.value_1, first, message.text_1, message.value_2,
                                         message.text_2, message.text_3, headers, message.text_4,
                                         message.value_3, message.value_4, message.value_5, second))
        return;
    const Peer peer_1 = fetch_peer(first.get());
    const RouteHeaders route_headers = fetch_route_headers(headers.get());
    const Peer peer_2 = fetch_peer(second.get());
    message.peer_1 = peer_1.get();
    message.route_headers = route_headers.get();
    message.peer_2 = peer_2.get();
    event.deliver(&message);
}

void emit_msg_notification(const Event &event) noexcept {
    ims_poc_msg_event_s notification{};
    Variant first;
    Variant second;
    if (!event.read<"(i@vsii@v)">(notification.value_1, first, notification.text_1,
                                  notification.value_2, notification.value_3, second))
        return;
    const Peer peer_1 = fetch_peer(first.get());
    const Peer peer_2 = fetch_peer(second.get());
    notification.peer_1 = peer_1.get();
    notification.peer_2 = peer_2.get();
    event.deliver(&notification);
}

void emit_incoming_file(const Event &event) noexcept {
    ims_poc_incoming_file_s file{};
    Variant first;
    Variant described;
    Variant second;
    if (!event.read<"(i@v@vi@v)">(file.value_1, first, described, file.value_2, second))
        return;
    const Peer peer_1 = fetch_peer(first.get());
    const FileAttributes attributes = fetch_file_attributes(described.get());
    const Peer peer_2 = fetch_peer(second.get());
    file.peer_1 = peer_1.get();
    file.attributes = attributes.get();
    file.peer_2 = peer_2.get();
    event.deliver(&file);
}

constexpr auto emit_call = emit<"(i)", ims_poc_call_event_s>;
constexpr auto emit_floor = emit<"(i@visisiiis)", ims_poc_floor_event_s>;

constexpr Notification kEvents[] = {
    {IMS_NOTI_POC_CALL_INCOMING_IND, "PocCallIncomingInd",
     emit<"(bbbbssssssii@v@v)", ims_poc_call_incoming_s>},
    {IMS_NOTI_POC_CALL_IN_PROGRESS, "PocCallInProgress", emit_call},
    {IMS_NOTI_POC_CALL_ALERTING, "PocCallAlerting", emit_call},
    {IMS_NOTI_POC_CALL_ESTABLISHED, "PocCallEstablished", emit_established},
    {IMS_NOTI_POC_CALL_ENDED, "PocCallEnded", emit<"(ii)", ims_poc_call_ended_s>},
    {IMS_NOTI_POC_CALL_FLOOR_GRANTED, "PocCallFloorGranted", emit_floor},
    {IMS_NOTI_POC_CALL_FLOOR_REJECTED, "PocCallFloorRejected", emit_floor},
    {IMS_NOTI_POC_CALL_FLOOR_IDLE, "PocCallFloorIdle", emit_floor},
    {IMS_NOTI_POC_CALL_FLOOR_QUEUE_POSITION, "PocCallFloorQueuePosition", emit_floor},
    {IMS_NOTI_POC_CALL_FLOOR_CANCELED, "PocCallFloorCanceled", emit_floor},
    {IMS_NOTI_POC_CALL_FLOOR_TAKEN, "PocCallFloorTaken", emit_floor},
    {IMS_NOTI_POC_CALL_MODIFY_REQUEST, "PocCallModifyRequest",
     emit<"(bbii@v@v)", ims_poc_modify_request_s>},
    {IMS_NOTI_POC_CALL_MODIFY_STATUS, "PocCallModifyStatus",
     emit<"(bbbii@v@v)", ims_poc_modify_status_s>},
    {IMS_NOTI_POC_CALL_FLOOR_REQUEST_TIMEOUT, "PocCallFloorRequestTimeout", emit_floor},
    {IMS_NOTI_POC_CALL_CRISIS_CALL_INITIATED, "PocCallCrisisCallInitiated", emit_call},
    {IMS_NOTI_POC_GROUP_ADVERTISEMENT, "PocGroupAdvertisement", emit_group_advertisement},
    {IMS_NOTI_POC_GROUP_CONF_PARTICIPANT_INFO, "PocGroupConfParticipantInfo",
     emit<"(iss)", ims_poc_participant_info_s>},
    {IMS_NOTI_POC_INCOMING_MSG_INFO, "PocIncomingMsgInfo", emit_incoming_msg},
    {IMS_NOTI_POC_MSG_NOTIFICATION, "PocMsgNotification", emit_msg_notification},
    {IMS_NOTI_POC_INCOMING_FILE_TRANSFER, "PocIncomingFileTransfer", emit_incoming_file},
    {IMS_NOTI_POC_FILE_TRANSFER_PROGRESS, "PocFileTransferProgress",
     emit<"(iiii)", ims_poc_file_progress_s>},
    {IMS_NOTI_POC_FILE_TRANSFER_TERMINATED, "PocFileTransferTerminated",
     emit<"(iii)", ims_poc_file_terminated_s>},
};

} // namespace

constexpr Module ims::kPocModule{kInterface, on_poc_signal_emit_handler, kEvents};

void ims::on_poc_signal_emit_handler(ims_h handle, int noti_id, GVariant *parameters,
                                     const ims_noti_cb_info_s *subscription) {
    if (is_handle(handle))
        emit_row(kPocModule, {handle, noti_id, parameters, subscription});
}
