/*
 * SPDX-License-Identifier: Apache-2.0
 */
#ifndef KELVO_IMS_SMS_H
#define KELVO_IMS_SMS_H

/**
 * @file
 * @brief Short messages over IMS.
 */

/**
 * @defgroup ims_sms Short messages
 * @brief Messages as TPDUs, their acknowledgements and reports: `org.kelvo.ims.Sms`.
 *
 * The library encodes no messages: an application hands over a ready TPDU (3GPP TS 23.040) and
 * receives TPDUs. On the bus they are base64.
 *
 * @section ims_sms_life The life of a message
 *
 * ims_sms_send_sms() hands an SMS-SUBMIT to the service, whose result comes with the callback. What
 * the network makes of it comes later, as #IMS_NOTI_SMS_SEND_SMS_ACK.
 *
 * A message that comes in is an #IMS_NOTI_SMS_INCOMING_SMS. The application stores it and says so,
 * or why not, with ims_sms_send_deliver_report(); #IMS_NOTI_SMS_DELIVERY_REPORT_ACK tells that the
 * report has arrived. To the network, a message that is not reported on has not arrived; how long
 * it waits is its own affair.
 *
 * @code{.c}
 * #include <ims.h>
 *
 * // "Hi" to +15550199, as an SMS-SUBMIT without a validity period
 * int send_hi(ims_h handle) {
 *     const uint8_t tpdu[] = {0x01, 0x00, 8,    0x91, 0x51, 0x55, 0x10,
 *                             0x99, 0x00, 0x00, 2,    0xC8, 0x34};
 *     uint8_t centre[] = {8, 0x91, 0x51, 0x55, 0x00, 0x00}; // +15550000; its first byte changes
 *     const ims_sms_send_info_s message = {
 *         .tpdu = tpdu, .tpdu_length = sizeof tpdu, .sca = centre, .send_option = 0};
 *     return ims_sms_send_sms(handle, &message, NULL, NULL);
 * }
 * @endcode
 *
 * What all requests share is said in @ref ims_requests and @ref ims_errors; the values in the
 * records are the service's, see @ref ims_values. Request records are the caller's and read during
 * the call only; event records are valid while the callback runs, with the bytes in them. The
 * callbacks' data is NULL. Both methods reply `(iiii)`: the result, and three members that are not
 * used.
 *
 * @{
 */

#include "ims_types.h"

#ifdef __cplusplus
extern "C" {
#endif

/** A message to send. */
typedef struct ims_sms_send_info_s {
    const uint8_t *tpdu; /**< the SMS-SUBMIT; NULL is sent as none */
    int32_t tpdu_length; /**< bytes in tpdu; a negative count is sent as none */
    /**
     * The service centre's address: the number of digits, the type of address, the digits as BCD,
     * two an octet: for d digits (d + 1) / 2 + 2 bytes are read. The first byte is rewritten to the
     * number of bytes that follow it and stays so, also when the message turns out to be too large
     * to be sent: to use the same buffer again, restore it. NULL is sent as an empty text.
     */
    uint8_t *sca;
    int32_t send_option; /**< defined by the service */
} ims_sms_send_info_s;

/** A report on a received message. */
typedef struct ims_sms_deliver_report_s {
    int32_t report_code;   /**< defined by the service */
    const uint8_t *tpdu;   /**< the SMS-DELIVER-REPORT; NULL is sent as none */
    int32_t tpdu_length;   /**< bytes in tpdu; a negative count is sent as none */
    int32_t report_option; /**< defined by the service */
} ims_sms_deliver_report_s;

/** #IMS_NOTI_SMS_INCOMING_SMS, `(isii)` with a base64 text: a message has come. */
typedef struct ims_sms_incoming_s {
    uint32_t tpdu_length; /**< bytes in tpdu, as decoded: the service's own length is not used */
    const uint8_t *tpdu;  /**< the SMS-DELIVER, gone after the callback */
    int32_t member_3;     /**< defined by the service */
    int32_t member_4;     /**< defined by the service */
} ims_sms_incoming_s;

/** #IMS_NOTI_SMS_SEND_SMS_ACK, `(iiisii)` with a base64 text: what became of a sent message. */
typedef struct ims_sms_send_ack_s {
    int32_t member_1;     /**< defined by the service */
    int32_t member_2;     /**< defined by the service */
    int32_t member_3;     /**< defined by the service */
    const uint8_t *tpdu;  /**< the acknowledgement's TPDU, gone after the callback */
    uint32_t tpdu_length; /**< bytes in tpdu, as decoded: the service's own length is not used */
    int32_t member_6;     /**< defined by the service */
} ims_sms_send_ack_s;

/** #IMS_NOTI_SMS_DELIVERY_REPORT_ACK, `(ii)`: what became of a report. */
typedef struct ims_sms_delivery_report_ack_s {
    int32_t member_1; /**< defined by the service */
    int32_t member_2; /**< defined by the service */
} ims_sms_delivery_report_ack_s;

/**
 * Sends a short message.
 *
 * D-Bus: `SendSms`, sends `(isisi)`: the application id, the TPDU as base64, its length as stored,
 * the service centre's address as base64, and the option.
 *
 * @param info  the message. The first byte of its sca is rewritten and stays so
 */
IMS_API int ims_sms_send_sms(ims_h handle, const ims_sms_send_info_s *info,
                             ims_response_cb callback, void *user_data);

/**
 * Sends the report on a received message.
 *
 * D-Bus: `SendDeliverReport`, sends `(iisii)`: the application id, the code, the TPDU as base64,
 * its length as stored, and the option.
 *
 * @param report  the report
 */
IMS_API int ims_sms_send_deliver_report(ims_h handle, const ims_sms_deliver_report_s *report,
                                        ims_response_cb callback, void *user_data);

/** @} */

#ifdef __cplusplus
}
#endif

#endif
