// SPDX-License-Identifier: Apache-2.0
#include "notifications.hpp"

namespace ims {
namespace {

constexpr const char *kRegistration = "org.kelvo.ims.Registration";
constexpr const char *kCall = "org.kelvo.ims.Call";
constexpr const char *kSms = "org.kelvo.ims.Sms";
constexpr const char *kPoc = "org.kelvo.ims.Poc";
constexpr const char *kLogin = "org.kelvo.ims.Login";

// The members are spelled as the service spells them, "Confernce" included.
constexpr Notification kNotifications[] = {
    {IMS_NOTI_REG_REGISTRATION_STATUS, kRegistration, "RegistrationStatus"},
    {IMS_NOTI_REG_EMERGENCY_REGISTRATION_STATUS, kRegistration, "EmergencyRegistrationStatus"},
    {IMS_NOTI_CALL_INCOMING_IND, kCall, "CallIncomingInd"},
    {IMS_NOTI_CALL_IN_PROGRESS, kCall, "CallInProgress"},
    {IMS_NOTI_CALL_ALERTING, kCall, "CallAlerting"},
    {IMS_NOTI_CALL_BUSY, kCall, "CallBusy"},
    {IMS_NOTI_CALL_ESTABLISHED, kCall, "CallEstablished"},
    {IMS_NOTI_CALL_HELD, kCall, "CallHeld"},
    {IMS_NOTI_CALL_RESUMED, kCall, "CallResumed"},
    {IMS_NOTI_CALL_FORWARDED, kCall, "CallForwarded"},
    {IMS_NOTI_CALL_ENDED, kCall, "CallEnded"},
    {IMS_NOTI_CALL_SWITCHED, kCall, "CallSwitched"},
    {IMS_NOTI_CALL_CHANGE_REQUEST, kCall, "CallChangeRequest"},
    {IMS_NOTI_CALL_CONF_NOTIFY_RECEIVED, kCall, "CallConfNotifyReceived"},
    {IMS_NOTI_CALL_EARLY_MEDIA_START, kCall, "CallEarlyMediaStart"},
    {IMS_NOTI_CALL_STOP_ALERT_TONE, kCall, "CallStopAlertTone"},
    {IMS_NOTI_CALL_ERROR, kCall, "CallError"},
    {IMS_NOTI_CALL_CONFERENCE_CALL_ESTABLISHED, kCall, "CallConfernceCallEstablished"},
    {IMS_NOTI_CALL_CONFERENCE_CALL_PARTICIPANT_ADDED, kCall, "CallConfernceCallParticipantAdded"},
    {IMS_NOTI_CALL_CONFERENCE_CALL_PARTICIPANT_REMOVED, kCall,
     "CallConfernceCallParticipantRemoved"},
    {IMS_NOTI_CALL_USSD_INDICATION, kCall, "CallUssdIndication"},
    {IMS_NOTI_CALL_DTMF_EVENT, kCall, "CallDtmfEvent"},
    {IMS_NOTI_SMS_INCOMING_SMS, kSms, "IncomingSms"},
    {IMS_NOTI_SMS_SEND_SMS_ACK, kSms, "SendSmsAck"},
    {IMS_NOTI_SMS_DELIVERY_REPORT_ACK, kSms, "DeliveryReportAck"},
    {IMS_NOTI_POC_CALL_INCOMING_IND, kPoc, "PocCallIncomingInd"},
    {IMS_NOTI_POC_CALL_IN_PROGRESS, kPoc, "PocCallInProgress"},
    {IMS_NOTI_POC_CALL_ALERTING, kPoc, "PocCallAlerting"},
    {IMS_NOTI_POC_CALL_ESTABLISHED, kPoc, "PocCallEstablished"},
    {IMS_NOTI_POC_CALL_ENDED, kPoc, "PocCallEnded"},
    {IMS_NOTI_POC_CALL_FLOOR_GRANTED, kPoc, "PocCallFloorGranted"},
    {IMS_NOTI_POC_CALL_FLOOR_REJECTED, kPoc, "PocCallFloorRejected"},
    {IMS_NOTI_POC_CALL_FLOOR_IDLE, kPoc, "PocCallFloorIdle"},
    {IMS_NOTI_POC_CALL_FLOOR_QUEUE_POSITION, kPoc, "PocCallFloorQueuePosition"},
    {IMS_NOTI_POC_CALL_FLOOR_CANCELED, kPoc, "PocCallFloorCanceled"},
    {IMS_NOTI_POC_CALL_FLOOR_TAKEN, kPoc, "PocCallFloorTaken"},
    {IMS_NOTI_POC_CALL_MODIFY_REQUEST, kPoc, "PocCallModifyRequest"},
    {IMS_NOTI_POC_CALL_MODIFY_STATUS, kPoc, "PocCallModifyStatus"},
    {IMS_NOTI_POC_CALL_FLOOR_REQUEST_TIMEOUT, kPoc, "PocCallFloorRequestTimeout"},
    {IMS_NOTI_POC_CALL_CRISIS_CALL_INITIATED, kPoc, "PocCallCrisisCallInitiated"},
    {IMS_NOTI_POC_GROUP_ADVERTISEMENT, kPoc, "PocGroupAdvertisement"},
    {IMS_NOTI_POC_GROUP_CONF_PARTICIPANT_INFO, kPoc, "PocGroupConfParticipantInfo"},
    {IMS_NOTI_POC_INCOMING_MSG_INFO, kPoc, "PocIncomingMsgInfo"},
    {IMS_NOTI_POC_MSG_NOTIFICATION, kPoc, "PocMsgNotification"},
    {IMS_NOTI_POC_INCOMING_FILE_TRANSFER, kPoc, "PocIncomingFileTransfer"},
    {IMS_NOTI_POC_FILE_TRANSFER_PROGRESS, kPoc, "PocFileTransferProgress"},
    {IMS_NOTI_POC_FILE_TRANSFER_TERMINATED, kPoc, "PocFileTransferTerminated"},
    {IMS_NOTI_LOGIN_STATE, kLogin, "LoginState"},
};
static_assert(std::size(kNotifications) == 48);

} // namespace

std::span<const Notification> notifications() noexcept {
    return kNotifications;
}

bool Event::drop(Site site, const char *expected) const noexcept {
    log_error(site, "Notification dropped - noti_id: [%d], signature %s where %s is expected",
              noti_id_, g_variant_get_type_string(parameters_), expected);
    return false;
}

} // namespace ims
