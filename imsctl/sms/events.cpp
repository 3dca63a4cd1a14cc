// SPDX-License-Identifier: Apache-2.0
// What tells of short messages.
#include "imsctl/output/event_fields.hpp"
#include "imsctl/sms/module.hpp"
#include "imsctl/sms/short_message.hpp"

namespace imsctl {
namespace {

std::string summarise_tpdu(const Fields &fields) {
    return describe(get<Binary>(fields, "tpdu").bytes);
}

constexpr FieldRow kIncomingSmsFields[] = {
    tpdu_bytes<&ims_sms_incoming_s::tpdu, &ims_sms_incoming_s::tpdu_length>("tpdu"),
    field<&ims_sms_incoming_s::member_3>("member_3"),
    field<&ims_sms_incoming_s::member_4>("member_4"),
};

constexpr FieldRow kSendSmsAckFields[] = {
    field<&ims_sms_send_ack_s::member_1>("member_1"),
    field<&ims_sms_send_ack_s::member_2>("member_2"),
    field<&ims_sms_send_ack_s::member_3>("member_3"),
    tpdu_bytes<&ims_sms_send_ack_s::tpdu, &ims_sms_send_ack_s::tpdu_length>("tpdu"),
    field<&ims_sms_send_ack_s::member_6>("member_6"),
};

constexpr FieldRow kDeliveryReportAckFields[] = {
    field<&ims_sms_delivery_report_ack_s::member_1>("member_1"),
    field<&ims_sms_delivery_report_ack_s::member_2>("member_2"),
};

constexpr EventRow kSmsEvents[] = {
    {IMS_NOTI_SMS_INCOMING_SMS, "sms-incoming-sms", "sms", kIncomingSmsFields, summarise_tpdu},
    {IMS_NOTI_SMS_SEND_SMS_ACK, "sms-send-sms-ack", "sms", kSendSmsAckFields, summarise_tpdu},
    {IMS_NOTI_SMS_DELIVERY_REPORT_ACK, "sms-delivery-report-ack", "sms", kDeliveryReportAckFields},
};

} // namespace

std::span<const EventRow> sms_events() {
    return kSmsEvents;
}

} // namespace imsctl
