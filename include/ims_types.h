/*
 * SPDX-License-Identifier: Apache-2.0
 */
#ifndef KELVO_IMS_TYPES_H
#define KELVO_IMS_TYPES_H

/**
 * @file
 * @brief What all functions share: the handle, the result codes, the callbacks, the event ids.
 */

/**
 * @defgroup ims_common What all functions share
 * @brief Requests, queries and events; errors, threads, ownership, log lines.
 *
 * What is said here is not said again with the functions.
 *
 * @section ims_requests Requests and queries
 *
 * A request or query is one method call on the IMS service: bus name `org.kelvo.ims` on the system
 * bus, object `/org/kelvo/ims/sub<slot>`, one interface per module. A function's documentation
 * names the method, the signature of what is sent, and that of the reply that is expected; a reply
 * of another shape is a failure. The application id that many methods take is the one that
 * ims_init() got: the library adds it.
 *
 * A **request** takes a callback and is asynchronous: it returns as soon as the call is queued, and
 * the outcome reaches the callback, once. The callback may be NULL: the request is sent all the
 * same and its outcome dropped. `user_data` is handed to the callback as it is; the library never
 * looks behind it. Nothing tells at once that a call could not be sent: a service that cannot be
 * reached shows only as #IMS_RESPONSE_FAILED in the callback, after at most 60 s. A request that is
 * pending cannot be cancelled.
 *
 * A **query** is synchronous: it blocks for at most 60 s and fills a record of the caller's.
 *
 * A bus that is not configured otherwise lets one process wait for 128 answers at a time.
 *
 * @section ims_errors Errors
 *
 * Every function, the ones that only clear a record excepted, first asks the platform whether the
 * device has the IMS feature. No argument is looked at before that. It returns
 *
 *  - #IMS_ERROR_NONE: a request was queued; a query has filled its record.
 *  - #IMS_ERROR_NOT_SUPPORTED: the device's IMS feature is switched off.
 *  - #IMS_ERROR_OPERATION_FAILED: the feature could not be queried. For a query also: the service
 *    could not be reached, did not answer in time, answered with something that is not the
 *    operation's reply, or reported a failure of its own.
 *  - #IMS_ERROR_INVALID_PARAMETER: the handle or a pointer to what the function reads or fills is
 *    NULL, a text is not valid UTF-8, or the request would be larger than 16 MiB. Nothing was sent.
 *    A pointer that is *not checked* is one that must not be NULL all the same.
 *  - #IMS_ERROR_PERMISSION_DENIED (queries and ims_init()): the bus or the service refused the
 *    caller. A request has #IMS_RESPONSE_ACCESS_DENIED in its callback instead.
 *
 * So a request is answered for twice: by what it returns, and, when that is #IMS_ERROR_NONE, by
 * what its callback receives.
 *
 * @code{.c}
 * #include <ims_types.h>
 * #include <stdio.h>
 *
 * void on_done(ims_h handle, int result, void *data, void *user_data) {
 *     const char *what = user_data;
 *     if (result == 0)
 *         printf("%s: done\n", what);
 *     else if (result == IMS_RESPONSE_FAILED)
 *         printf("%s: no answer\n", what);
 *     else if (result == IMS_RESPONSE_ACCESS_DENIED)
 *         printf("%s: not allowed\n", what);
 *     else
 *         printf("%s: the service says %d\n", what, result);
 * }
 * @endcode
 *
 * @section ims_values Values
 *
 * What is *defined by the service* the library passes through unchanged and checks in no way: ids,
 * kinds, reasons, states, units and ranges, and every field with a neutral name such as `value_1`,
 * `flag_1`, `text_1` or `member_1`. The definitions of the stand-in service, `ims-sim`, are in
 * docs/stand-in.md and the pages that it lists, in the order of the methods' and signals' members.
 * What a callback gets as its result is the service's too; only 0, 1 and 2 have a meaning here.
 *
 * @section ims_threads Threads
 *
 * The library starts no thread and takes no lock. Use a handle from one thread. Replies and events
 * are delivered in the GLib main context that was thread-default when the request or the
 * subscription was made; an application that iterates no main context receives none. A query blocks
 * the thread and never runs that context.
 *
 * @section ims_ownership Ownership
 *
 * Records and texts that the application passes in are read during the call only; the exceptions
 * are stated with the functions. Whatever a callback receives is valid while the callback runs,
 * unless its documentation says that the application takes it over: then free() releases it. Texts
 * that a query puts into a record are copies that the caller owns.
 *
 * @section ims_log Log lines
 *
 * What return codes and results do not explain is in the platform's log, in its system buffer, as
 * `file: function(line) > message`: the library's source file, the function that was called or took
 * the reply, and the line there. Errors are a feature that is off or cannot be queried, refused
 * arguments and callers, what the service fails to give to those who read from it, and parts of
 * records and events that are missing or cannot be read. Warnings are lists of calls, profiles and
 * supplementary services whose count is 0 or wrong. A call that failed otherwise, or was not
 * answered in time, leaves no line, and success none.
 *
 * @{
 */

#include <stdbool.h>
#include <stddef.h>
#include <stdint.h>

#ifdef __GNUC__
/** Marks what the library exports. */
#define IMS_API __attribute__((visibility("default")))
#else
#define IMS_API
#endif

#ifdef __cplusplus
extern "C" {
#endif

/** A client of one subscription slot. Made by ims_init(), released by ims_deinit(). */
typedef struct ims_client_s *ims_h;

/** What the functions of the library return; see @ref ims_errors. */
typedef enum ims_error_e {
    /** Success. For an asynchronous request: the call was handed to D-Bus. */
    IMS_ERROR_NONE = 0,
    /** A required pointer or argument is missing or out of range. */
    IMS_ERROR_INVALID_PARAMETER = -22,
    /** The caller was refused. */
    IMS_ERROR_PERMISSION_DENIED = -13,
    /** The platform's IMS feature is switched off (0xC0000002). */
    IMS_ERROR_NOT_SUPPORTED = -1073741822,
    /** The feature query, the bus or the service failed (0xEFFB0001). */
    IMS_ERROR_OPERATION_FAILED = -268763135
} ims_error_e;

/** The results that the library itself gives to an #ims_response_cb. */
enum {
    /** The D-Bus call failed: no service, no answer within 60 s, or an answer of another shape. */
    IMS_RESPONSE_FAILED = 1,
    /** The bus or the service refused the caller. */
    IMS_RESPONSE_ACCESS_DENIED = 2
};

/**
 * Receives the outcome of one request, once.
 *
 * It is not called when the request's D-Bus call was cancelled.
 *
 * @param handle     the handle that the request was made on
 * @param result     the service's result, where 0 is success and every other value is the
 *                   service's own; #IMS_RESPONSE_FAILED or #IMS_RESPONSE_ACCESS_DENIED when the
 *                   service's answer never came
 * @param data       what the request's documentation says, otherwise NULL; NULL on every failure
 *                   of the D-Bus call. Valid while the callback runs
 * @param user_data  the pointer that was given with the request
 */
typedef void (*ims_response_cb)(ims_h handle, int result, void *data, void *user_data);

/**
 * Receives one kind of event, every time it happens.
 *
 * ims_unset_notification_cb() and ims_deinit() may be called from here.
 *
 * @param handle     the handle that the callback was set on
 * @param noti_id    the #ims_noti_id_e of the event
 * @param event      the event record of that id, valid while the callback runs
 * @param user_data  the pointer that was given to ims_set_notification_cb()
 */
typedef void (*ims_notification_cb)(ims_h handle, int noti_id, void *event, void *user_data);

/**
 * The events that ims_set_notification_cb() takes. Each is one D-Bus signal of the service on
 * `org.kelvo.ims.<Module>`, spelled as here, and comes with the record that is named.
 */
typedef enum ims_noti_id_e {
    IMS_NOTI_REG_REGISTRATION_STATUS =
        0x101, /**< Registration.RegistrationStatus: #ims_registration_info_s */
    IMS_NOTI_REG_EMERGENCY_REGISTRATION_STATUS =
        0x102, /**< Registration.EmergencyRegistrationStatus: #ims_emergency_registration_info_s */

    IMS_NOTI_CALL_INCOMING_IND = 0x201,   /**< Call.CallIncomingInd: #ims_call_incoming_s */
    IMS_NOTI_CALL_IN_PROGRESS = 0x202,    /**< Call.CallInProgress: #ims_call_session_s */
    IMS_NOTI_CALL_ALERTING = 0x203,       /**< Call.CallAlerting: #ims_call_session_s */
    IMS_NOTI_CALL_BUSY = 0x204,           /**< Call.CallBusy: #ims_call_session_s */
    IMS_NOTI_CALL_ESTABLISHED = 0x205,    /**< Call.CallEstablished: #ims_call_established_s */
    IMS_NOTI_CALL_HELD = 0x206,           /**< Call.CallHeld: #ims_call_held_s */
    IMS_NOTI_CALL_RESUMED = 0x207,        /**< Call.CallResumed: #ims_call_resumed_s */
    IMS_NOTI_CALL_FORWARDED = 0x208,      /**< Call.CallForwarded: #ims_call_session_s */
    IMS_NOTI_CALL_ENDED = 0x209,          /**< Call.CallEnded: #ims_call_ended_s */
    IMS_NOTI_CALL_SWITCHED = 0x20A,       /**< Call.CallSwitched: #ims_call_switched_s */
    IMS_NOTI_CALL_CHANGE_REQUEST = 0x20B, /**< Call.CallChangeRequest: #ims_call_change_request_s */
    IMS_NOTI_CALL_CONF_NOTIFY_RECEIVED =
        0x20C, /**< Call.CallConfNotifyReceived: #ims_call_conf_notify_s */
    IMS_NOTI_CALL_EARLY_MEDIA_START =
        0x20D,                             /**< Call.CallEarlyMediaStart: #ims_call_early_media_s */
    IMS_NOTI_CALL_STOP_ALERT_TONE = 0x20E, /**< Call.CallStopAlertTone: #ims_call_session_s */
    IMS_NOTI_CALL_ERROR = 0x20F,           /**< Call.CallError: #ims_call_error_s */
    IMS_NOTI_CALL_CONFERENCE_CALL_ESTABLISHED =
        0x210, /**< Call.CallConfernceCallEstablished: #ims_call_conference_event_s */
    IMS_NOTI_CALL_CONFERENCE_CALL_PARTICIPANT_ADDED =
        0x211, /**< Call.CallConfernceCallParticipantAdded: #ims_call_conference_event_s */
    IMS_NOTI_CALL_CONFERENCE_CALL_PARTICIPANT_REMOVED =
        0x212, /**< Call.CallConfernceCallParticipantRemoved: #ims_call_conference_event_s */
    IMS_NOTI_CALL_USSD_INDICATION =
        0x213,                        /**< Call.CallUssdIndication: #ims_call_ussd_indication_s */
    IMS_NOTI_CALL_DTMF_EVENT = 0x223, /**< Call.CallDtmfEvent: #ims_call_dtmf_event_s */

    IMS_NOTI_SMS_INCOMING_SMS = 0x301, /**< Sms.IncomingSms: #ims_sms_incoming_s */
    IMS_NOTI_SMS_SEND_SMS_ACK = 0x302, /**< Sms.SendSmsAck: #ims_sms_send_ack_s */
    IMS_NOTI_SMS_DELIVERY_REPORT_ACK =
        0x303, /**< Sms.DeliveryReportAck: #ims_sms_delivery_report_ack_s */

    IMS_NOTI_POC_CALL_INCOMING_IND = 0x401, /**< Poc.PocCallIncomingInd: #ims_poc_call_incoming_s */
    IMS_NOTI_POC_CALL_IN_PROGRESS = 0x402,  /**< Poc.PocCallInProgress: #ims_poc_call_event_s */
    IMS_NOTI_POC_CALL_ALERTING = 0x403,     /**< Poc.PocCallAlerting: #ims_poc_call_event_s */
    IMS_NOTI_POC_CALL_ESTABLISHED =
        0x404,                       /**< Poc.PocCallEstablished: #ims_poc_call_established_s */
    IMS_NOTI_POC_CALL_ENDED = 0x405, /**< Poc.PocCallEnded: #ims_poc_call_ended_s */
    IMS_NOTI_POC_CALL_FLOOR_GRANTED = 0x406, /**< Poc.PocCallFloorGranted: #ims_poc_floor_event_s */
    IMS_NOTI_POC_CALL_FLOOR_REJECTED =
        0x407,                            /**< Poc.PocCallFloorRejected: #ims_poc_floor_event_s */
    IMS_NOTI_POC_CALL_FLOOR_IDLE = 0x408, /**< Poc.PocCallFloorIdle: #ims_poc_floor_event_s */
    IMS_NOTI_POC_CALL_FLOOR_QUEUE_POSITION =
        0x409, /**< Poc.PocCallFloorQueuePosition: #ims_poc_floor_event_s */
    IMS_NOTI_POC_CALL_FLOOR_CANCELED =
        0x40A,                             /**< Poc.PocCallFloorCanceled: #ims_poc_floor_event_s */
    IMS_NOTI_POC_CALL_FLOOR_TAKEN = 0x40B, /**< Poc.PocCallFloorTaken: #ims_poc_floor_event_s */
    IMS_NOTI_POC_CALL_MODIFY_REQUEST =
        0x40C, /**< Poc.PocCallModifyRequest: #ims_poc_modify_request_s */
    IMS_NOTI_POC_CALL_MODIFY_STATUS =
        0x40D, /**< Poc.PocCallModifyStatus: #ims_poc_modify_status_s */
    IMS_NOTI_POC_CALL_FLOOR_REQUEST_TIMEOUT =
        0x40E, /**< Poc.PocCallFloorRequestTimeout: #ims_poc_floor_event_s */
    IMS_NOTI_POC_CALL_CRISIS_CALL_INITIATED =
        0x40F, /**< Poc.PocCallCrisisCallInitiated: #ims_poc_call_event_s */
    IMS_NOTI_POC_GROUP_ADVERTISEMENT =
        0x410, /**< Poc.PocGroupAdvertisement: #ims_poc_group_advertisement_s */
    IMS_NOTI_POC_GROUP_CONF_PARTICIPANT_INFO =
        0x411, /**< Poc.PocGroupConfParticipantInfo: #ims_poc_participant_info_s */
    IMS_NOTI_POC_INCOMING_MSG_INFO = 0x412, /**< Poc.PocIncomingMsgInfo: #ims_poc_incoming_msg_s */
    IMS_NOTI_POC_MSG_NOTIFICATION = 0x413,  /**< Poc.PocMsgNotification: #ims_poc_msg_event_s */
    IMS_NOTI_POC_INCOMING_FILE_TRANSFER =
        0x414, /**< Poc.PocIncomingFileTransfer: #ims_poc_incoming_file_s */
    IMS_NOTI_POC_FILE_TRANSFER_PROGRESS =
        0x415, /**< Poc.PocFileTransferProgress: #ims_poc_file_progress_s */
    IMS_NOTI_POC_FILE_TRANSFER_TERMINATED =
        0x416, /**< Poc.PocFileTransferTerminated: #ims_poc_file_terminated_s */

    IMS_NOTI_LOGIN_STATE = 0x501 /**< Login.LoginState: #ims_login_state_s */
} ims_noti_id_e;

/** @} */

#ifdef __cplusplus
}
#endif

#endif
