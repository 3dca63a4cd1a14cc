// SPDX-License-Identifier: Apache-2.0
// Every notification and the signal behind it.
#pragma once

#include "ims.h"

#include <ostream>

namespace test {

struct NotificationRow {
    int id;
    int name; // the header's
    const char *interface;
    const char *member;
};

inline void PrintTo(const NotificationRow &row, std::ostream *out) {
    *out << row.interface << ":" << row.member;
}

inline constexpr const char *kReg = "org.kelvo.ims.Registration";
inline constexpr const char *kCall = "org.kelvo.ims.Call";
inline constexpr const char *kSms = "org.kelvo.ims.Sms";
inline constexpr const char *kPoc = "org.kelvo.ims.Poc";
inline constexpr const char *kLogin = "org.kelvo.ims.Login";

inline constexpr NotificationRow kNotifications[] = {
    {0x101, IMS_NOTI_REG_REGISTRATION_STATUS, kReg, "RegistrationStatus"},
    {0x102, IMS_NOTI_REG_EMERGENCY_REGISTRATION_STATUS, kReg, "EmergencyRegistrationStatus"},
    {0x201, IMS_NOTI_CALL_INCOMING_IND, kCall, "CallIncomingInd"},
    {0x202, IMS_NOTI_CALL_IN_PROGRESS, kCall, "CallInProgress"},
    {0x203, IMS_NOTI_CALL_ALERTING, kCall, "CallAlerting"},
    {0x204, IMS_NOTI_CALL_BUSY, kCall, "CallBusy"},
    {0x205, IMS_NOTI_CALL_ESTABLISHED, kCall, "CallEstablished"},
    {0x206, IMS_NOTI_CALL_HELD, kCall, "CallHeld"},
    {0x207, IMS_NOTI_CALL_RESUMED, kCall, "CallResumed"},
    {0x208, IMS_NOTI_CALL_FORWARDED, kCall, "CallForwarded"},
    {0x209, IMS_NOTI_CALL_ENDED, kCall, "CallEnded"},
    {0x20A, IMS_NOTI_CALL_SWITCHED, kCall, "CallSwitched"},
    {0x20B, IMS_NOTI_CALL_CHANGE_REQUEST, kCall, "CallChangeRequest"},
    {0x20C, IMS_NOTI_CALL_CONF_NOTIFY_RECEIVED, kCall, "CallConfNotifyReceived"},
    {0x20D, IMS_NOTI_CALL_EARLY_MEDIA_START, kCall, "CallEarlyMediaStart"},
    {0x20E, IMS_NOTI_CALL_STOP_ALERT_TONE, kCall, "CallStopAlertTone"},
    {0x20F, IMS_NOTI_CALL_ERROR, kCall, "CallError"},
    {0x210, IMS_NOTI_CALL_CONFERENCE_CALL_ESTABLISHED, kCall, "CallConfernceCallEstablished"},
    {0x211, IMS_NOTI_CALL_CONFERENCE_CALL_PARTICIPANT_ADDED, kCall,
     "CallConfernceCallParticipantAdded"},
    {0x212, IMS_NOTI_CALL_CONFERENCE_CALL_PARTICIPANT_REMOVED, kCall,
     "CallConfernceCallParticipantRemoved"},
    {0x213, IMS_NOTI_CALL_USSD_INDICATION, kCall, "CallUssdIndication"},
    {0x223, IMS_NOTI_CALL_DTMF_EVENT, kCall, "CallDtmfEvent"},
    {0x301, IMS_NOTI_SMS_INCOMING_SMS, kSms, "IncomingSms"},
    {0x302, IMS_NOTI_SMS_SEND_SMS_ACK, kSms, "SendSmsAck"},
    {0x303, IMS_NOTI_SMS_DELIVERY_REPORT_ACK, kSms, "DeliveryReportAck"},
    {0x401, IMS_NOTI_POC_CALL_INCOMING_IND, kPoc, "PocCallIncomingInd"},
    {0x402, IMS_NOTI_POC_CALL_IN_PROGRESS, kPoc, "PocCallInProgress"},
    {0x403, IMS_NOTI_POC_CALL_ALERTING, kPoc, "PocCallAlerting"},
    {0x404, IMS_NOTI_POC_CALL_ESTABLISHED, kPoc, "PocCallEstablished"},
    {0x405, IMS_NOTI_POC_CALL_ENDED, kPoc, "PocCallEnded"},
    {0x406, IMS_NOTI_POC_CALL_FLOOR_GRANTED, kPoc, "PocCallFloorGranted"},
    {0x407, IMS_NOTI_POC_CALL_FLOOR_REJECTED, kPoc, "PocCallFloorRejected"},
    {0x408, IMS_NOTI_POC_CALL_FLOOR_IDLE, kPoc, "PocCallFloorIdle"},
    {0x409, IMS_NOTI_POC_CALL_FLOOR_QUEUE_POSITION, kPoc, "PocCallFloorQueuePosition"},
    {0x40A, IMS_NOTI_POC_CALL_FLOOR_CANCELED, kPoc, "PocCallFloorCanceled"},
    {0x40B, IMS_NOTI_POC_CALL_FLOOR_TAKEN, kPoc, "PocCallFloorTaken"},
    {0x40C, IMS_NOTI_POC_CALL_MODIFY_REQUEST, kPoc, "PocCallModifyRequest"},
    {0x40D, IMS_NOTI_POC_CALL_MODIFY_STATUS, kPoc, "PocCallModifyStatus"},
    {0x40E, IMS_NOTI_POC_CALL_FLOOR_REQUEST_TIMEOUT, kPoc, "PocCallFloorRequestTimeout"},
    {0x40F, IMS_NOTI_POC_CALL_CRISIS_CALL_INITIATED, kPoc, "PocCallCrisisCallInitiated"},
    {0x410, IMS_NOTI_POC_GROUP_ADVERTISEMENT, kPoc, "PocGroupAdvertisement"},
    {0x411, IMS_NOTI_POC_GROUP_CONF_PARTICIPANT_INFO, kPoc, "PocGroupConfParticipantInfo"},
    {0x412, IMS_NOTI_POC_INCOMING_MSG_INFO, kPoc, "PocIncomingMsgInfo"},
    {0x413, IMS_NOTI_POC_MSG_NOTIFICATION, kPoc, "PocMsgNotification"},
    {0x414, IMS_NOTI_POC_INCOMING_FILE_TRANSFER, kPoc, "PocIncomingFileTransfer"},
    {0x415, IMS_NOTI_POC_FILE_TRANSFER_PROGRESS, kPoc, "PocFileTransferProgress"},
    {0x416, IMS_NOTI_POC_FILE_TRANSFER_TERMINATED, kPoc, "PocFileTransferTerminated"},
    {0x501, IMS_NOTI_LOGIN_STATE, kLogin, "LoginState"},
};

// Ids beside and between those.
inline constexpr int kUnknownIds[] = {0,     -1,    1,     0x100, 0x103, 0x1FF, 0x200, 0x214,
                                      0x215, 0x216, 0x217, 0x218, 0x219, 0x21A, 0x21B, 0x21C,
                                      0x21D, 0x21E, 0x21F, 0x220, 0x221, 0x222, 0x224, 0x230,
                                      0x300, 0x304, 0x400, 0x417, 0x500, 0x502, 0x601, 2147483647};

} // namespace test
