// SPDX-License-Identifier: Apache-2.0
// Short messages: two requests, the decoder of the message signals.
#include "ims_sms.h"

#include "frame.hpp"
#include "notifications.hpp"

using namespace ims;

namespace {

constexpr const char *kInterface = "org.kelvo.ims.Sms";

// The address arrives with its number of digits in front and goes out with its number of octets:
// two digits an octet, and one octet for the type of address. The caller's buffer keeps the new
// value.
Text encode_service_centre(std::uint8_t *sca) noexcept {
    if (sca == nullptr)
        return base64_encode(nullptr, 0);
    sca[0] = static_cast<std::uint8_t>(((sca[0] + 1) >> 1) + 1);
    return base64_encode(sca, sca[0] + 1);
}

} // namespace

int ims_sms_send_sms(ims_h handle, const ims_sms_send_info_s *info, ims_response_cb callback,
                     void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    const Text tpdu = base64_encode(info->tpdu, info->tpdu_length);
    const Text sca = encode_service_centre(info->sca);
    return request(
        handle, kInterface, "SendSms",
        pack<"(isisi)">(handle->app_id, tpdu.get(), info->tpdu_length, sca.get(),
                        info->send_option),
        {answer<"on_response_sms_send_sms", "(iiii)", kResultOnly>, callback, user_data});
}

int ims_sms_send_deliver_report(ims_h handle, const ims_sms_deliver_report_s *report,
                                ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, report}))
        return refused;
    const Text tpdu = base64_encode(report->tpdu, report->tpdu_length);
    return request(handle, kInterface, "SendDeliverReport",
                   pack<"(iisii)">(handle->app_id, report->report_code, tpdu.get(),
                                   report->tpdu_length, report->report_option),
                   {answer<"on_response_sms_send_deliver_report", "(iiii)", kResultOnly>, callback,
                    user_data});
}

namespace {

// Puts a decoded TPDU into the event's record and delivers it; no event without a TPDU. The record
// has its own length field: the service's is not to be trusted with it.
template <typename Record>
void emit_tpdu(const Event &event, Record &record, const char *text) noexcept {
    const Decoded tpdu = base64_decode(text);
    if (tpdu.count == 0) {
        log_error(event.site(), "base64 decoding of TPDU failed");
        return;
    }
    record.tpdu = tpdu.bytes.get();
    record.tpdu_length = static_cast<std::uint32_t>(tpdu.count);
    event.deliver(&record);
}

void emit_incoming(const Event &event) noexcept {
    ims_sms_incoming_s incoming{};
    Skipped length;
    const char *text = nullptr;
    if (event.read<"(isii)">(length, text, incoming.member_3, incoming.member_4))
        emit_tpdu(event, incoming, text);
}

void emit_send_ack(const Event &event) noexcept {
    ims_sms_send_ack_s ack{};
    const char *text = nullptr;
    Skipped length;
    if (event.read<"(iiisii)">(ack.member_1, ack.member_2, ack.member_3, text, length,
                               ack.member_6))
        emit_tpdu(event, ack, text);
}

constexpr Notification kEvents[] = {
    {IMS_NOTI_SMS_INCOMING_SMS, "IncomingSms", emit_incoming},
    {IMS_NOTI_SMS_SEND_SMS_ACK, "SendSmsAck", emit_send_ack},
    {IMS_NOTI_SMS_DELIVERY_REPORT_ACK, "DeliveryReportAck",
     emit<"(ii)", ims_sms_delivery_report_ack_s>},
};

} // namespace

constexpr Module ims::kSmsModule{kInterface, on_sms_signal_emit_handler, kEvents};

void ims::on_sms_signal_emit_handler(ims_h handle, int noti_id, GVariant *parameters,
                                     const ims_noti_cb_info_s *subscription) {
    if (is_handle(handle))
        emit_row(kSmsModule, {handle, noti_id, parameters, subscription});
}
