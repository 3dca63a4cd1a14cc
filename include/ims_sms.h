/*
 * SPDX-License-Identifier: Apache-2.0
 */
#ifndef KELVO_IMS_SMS_H
#define KELVO_IMS_SMS_H

/**
 * @file ims_sms.h
 * @brief Short messages over IMS.
 *
 * All methods and signals are on the D-Bus interface `org.kelvo.ims.Sms`. The library encodes no
 * messages: an application hands over a ready TPDU (3GPP TS 23.040) and receives TPDUs. The service
 * defines what the other values mean; the library passes them through unchanged.
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
 * @brief Sends a short message.
 *
 * D-Bus: `SendSms`, sends `(isisi)`: the application id, the TPDU as base64, its length as stored,
 * the service centre's address as base64, and the option; expects `(iiii)`: the result, and three
 * members that are not used.
 *
 * @param handle     the handle
 * @param info       the message. The first byte of its sca is rewritten and stays so
 * @param callback   receives the outcome with NULL as data, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_sms_send_sms(ims_h handle, const ims_sms_send_info_s *info,
                             ims_response_cb callback, void *user_data);

/**
 * @brief Sends the report on a received message.
 *
 * D-Bus: `SendDeliverReport`, sends `(iisii)`: the application id, the code, the TPDU as base64,
 * its length as stored, and the option; expects `(iiii)`: the result, and three members that are
 * not used.
 *
 * @param handle     the handle
 * @param report     the report
 * @param callback   receives the outcome with NULL as data, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_sms_send_deliver_report(ims_h handle, const ims_sms_deliver_report_s *report,
                                        ims_response_cb callback, void *user_data);

#ifdef __cplusplus
}
#endif

#endif
