/*
 * SPDX-License-Identifier: Apache-2.0
 */
#ifndef KELVO_IMS_CALL_H
#define KELVO_IMS_CALL_H

/**
 * @file ims_call.h
 * @brief Voice and video calls: requests, the call list and the events.
 *
 * All methods and signals are on the D-Bus interface `org.kelvo.ims.Call`.
 *
 * The service defines what the values mean: call types, reasons, states, and every field with a
 * neutral name such as `value_1` or `text_1`. The library passes them through unchanged.
 */

#include "ims_types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * @name Request records
 * Owned by the caller and read during the call only. A NULL text is sent as an empty one.
 * @{
 */

/** A call to place. */
typedef struct ims_call_make_info_s {
    const char *number; /**< whom to call */
    int32_t call_type;  /**< the kind of call */
    const char *text_1; /**< defined by the service */
    const char *text_2; /**< defined by the service */
    const char *text_3; /**< defined by the service */
    const char *text_4; /**< defined by the service */
} ims_call_make_info_s;

/** The #ims_call_ussd_info_s::type whose text is never sent. */
#define IMS_CALL_USSD_TYPE_WITHOUT_TEXT 3

/** An unstructured supplementary service request. */
typedef struct ims_call_ussd_info_s {
    int32_t type; /**< the kind of request; with #IMS_CALL_USSD_TYPE_WITHOUT_TEXT no text is sent */
    int32_t value_1; /**< defined by the service */
    char *text;      /**< the text: a writable buffer of at least text_length + 1 bytes, or NULL */
    int32_t text_length; /**< bytes of text; a terminating zero is written behind them */
} ims_call_ussd_info_s;

/** A session with two values: answering, ending, starting an n-way conference. */
typedef struct ims_call_id_info_s {
    int32_t session_id; /**< the session */
    int32_t value_1;    /**< defined by the service for each request */
    int32_t value_2;    /**< defined by the service for each request */
} ims_call_id_info_s;

/** A session with one value. */
typedef struct ims_call_pair_info_s {
    int32_t session_id; /**< the session */
    int32_t value_1;    /**< defined by the service for each request */
} ims_call_pair_info_s;

/** DTMF digits to send. */
typedef struct ims_call_dtmf_info_s {
    int32_t session_id; /**< the session */
    const char *digits; /**< the digits, in sending order */
} ims_call_dtmf_info_s;

/** One DTMF tone to start. */
typedef struct ims_call_dtmf_tone_s {
    int32_t session_id; /**< the session */
    uint8_t tone;       /**< the tone's character */
} ims_call_dtmf_tone_s;

/** A voice recording to start or stop. */
typedef struct ims_call_record_info_s {
    int32_t session_id; /**< the session */
    int32_t value_1;    /**< defined by the service */
    const char *text_1; /**< defined by the service */
} ims_call_record_info_s;

/** Text telephony bytes to send. */
typedef struct ims_call_tty_data_s {
    int32_t session_id;  /**< the session */
    const uint8_t *data; /**< the bytes; NULL is sent as none */
    int32_t length;      /**< bytes in data; a negative count is sent as none */
} ims_call_tty_data_s;

/** A party to add to a conference. */
typedef struct ims_call_conf_user_s {
    int32_t session_id; /**< the session */
    const char *number; /**< whom to add */
    int32_t value_1;    /**< defined by the service */
} ims_call_conf_user_s;

/** Service-specific access control values. */
typedef struct ims_call_ssac_info_s {
    int32_t value_1; /**< defined by the service */
    int32_t value_2; /**< defined by the service */
    int32_t value_3; /**< defined by the service */
    int32_t value_4; /**< defined by the service */
    int32_t value_5; /**< defined by the service */
} ims_call_ssac_info_s;

/** The packet data network to use for emergency calls. */
typedef struct ims_call_emergency_pdn_s {
    const char *text_1;       /**< defined by the service */
    int32_t count;            /**< how many texts; sent as stored, 0 and less send none */
    const char *const *texts; /**< count texts, defined by the service */
    const char *text_2;       /**< defined by the service */
} ims_call_emergency_pdn_s;

/** One participant in a singly linked list. */
typedef struct ims_call_participant_s {
    const char *text;                          /**< the participant */
    const struct ims_call_participant_s *next; /**< the next one, NULL at the end */
} ims_call_participant_s;

/** A conference to start. */
typedef struct ims_call_conference_s {
    int32_t value_1;                            /**< defined by the service */
    int32_t count;                              /**< sent as stored; caps the list */
    const ims_call_participant_s *participants; /**< may be shorter than count */
} ims_call_conference_s;

/** A change of a conference's participants. */
typedef struct ims_call_conference_modify_s {
    int32_t session_id;                         /**< the session */
    int32_t value_1;                            /**< defined by the service */
    int32_t count;                              /**< sent as stored; caps the list */
    const ims_call_participant_s *participants; /**< may be shorter than count */
} ims_call_conference_modify_s;

/** @} */

/**
 * @name Response records
 * What the callbacks of some requests receive, valid while the callback runs.
 * @{
 */

/** The outcome of ims_call_change_call(). */
typedef struct ims_call_change_result_s {
    int32_t value_1; /**< defined by the service */
    char *text_1; /**< defined by the service; the application takes it over, free() releases it */
} ims_call_change_result_s;

/** The outcome of ims_call_get_tty_mode(). */
typedef struct ims_call_tty_mode_s {
    int32_t value_1;     /**< defined by the service */
    int32_t value_2;     /**< defined by the service */
    const uint8_t *data; /**< the decoded bytes, gone after the callback */
    int32_t length;      /**< bytes in data */
} ims_call_tty_mode_s;

/** @} */

/**
 * @name Event records
 * What an #ims_notification_cb receives, by id. The record is valid while the callback runs. Every
 * `char *` in it is a copy that the application takes over and releases with free(), whether it
 * uses it or not.
 * @{
 */

/** #IMS_NOTI_CALL_INCOMING_IND, `(isisssssb)`: a call comes in. */
typedef struct ims_call_incoming_s {
    int32_t session_id; /**< the session */
    char *number;       /**< who calls */
    int32_t call_type;  /**< the kind of call */
    char *text_1;       /**< defined by the service */
    char *text_2;       /**< defined by the service */
    char *text_3;       /**< defined by the service */
    char *text_4;       /**< defined by the service */
    char *text_5;       /**< defined by the service */
    bool flag_1;        /**< defined by the service */
} ims_call_incoming_s;

/**
 * #IMS_NOTI_CALL_IN_PROGRESS, #IMS_NOTI_CALL_ALERTING, #IMS_NOTI_CALL_BUSY,
 * #IMS_NOTI_CALL_FORWARDED and #IMS_NOTI_CALL_STOP_ALERT_TONE, `(i)`.
 */
typedef struct ims_call_session_s {
    int32_t session_id; /**< the session */
} ims_call_session_s;

/** #IMS_NOTI_CALL_ESTABLISHED, `(iibsb)`: the parties are connected. */
typedef struct ims_call_established_s {
    int32_t session_id; /**< the session */
    int32_t call_type;  /**< the kind of call */
    bool flag_1;        /**< defined by the service */
    char *text_1;       /**< defined by the service */
    bool flag_2;        /**< defined by the service */
} ims_call_established_s;

/** #IMS_NOTI_CALL_HELD, `(ibi)`: the call is on hold. */
typedef struct ims_call_held_s {
    int32_t session_id; /**< the session */
    bool flag_1;        /**< defined by the service */
    int32_t value_1;    /**< defined by the service */
} ims_call_held_s;

/** #IMS_NOTI_CALL_RESUMED, `(ibbi)`: the call is no longer on hold. */
typedef struct ims_call_resumed_s {
    int32_t session_id; /**< the session */
    bool flag_1;        /**< defined by the service */
    bool flag_2;        /**< defined by the service */
    int32_t value_1;    /**< defined by the service */
} ims_call_resumed_s;

/** #IMS_NOTI_CALL_ENDED, `(ii)`: the call is over. */
typedef struct ims_call_ended_s {
    int32_t session_id; /**< the session */
    int32_t reason;     /**< why it ended */
} ims_call_ended_s;

/** #IMS_NOTI_CALL_SWITCHED, `(ii)`: the kind of call has changed. */
typedef struct ims_call_switched_s {
    int32_t session_id; /**< the session */
    int32_t call_type;  /**< the kind of call that it is now */
} ims_call_switched_s;

/** #IMS_NOTI_CALL_CHANGE_REQUEST, `(iis)` with a base64 text: the peer wants another kind of call.
 */
typedef struct ims_call_change_request_s {
    int32_t session_id;  /**< the session */
    int32_t call_type;   /**< the kind of call that is asked for */
    const uint8_t *data; /**< the decoded bytes, gone after the callback */
    int32_t length;      /**< bytes in data */
} ims_call_change_request_s;

/**
 * #IMS_NOTI_CALL_CONF_NOTIFY_RECEIVED, `(ivivi)` with an `ai` and an `as`: news of a conference.
 *
 * The counts are the service's. Each array holds at least as many elements as its count says; the
 * ones that the service did not send are 0 and NULL. An event whose count is above 65,536 and more
 * than what came is dropped. Both arrays are gone after the callback; the
 * application takes over the texts that they point to.
 */
typedef struct ims_call_conf_notify_s {
    int32_t session_id;  /**< the session */
    int32_t *values;     /**< defined by the service */
    int32_t value_count; /**< how many values, as the service says */
    char **texts;        /**< defined by the service */
    int32_t text_count;  /**< how many texts, as the service says */
} ims_call_conf_notify_s;

/** #IMS_NOTI_CALL_EARLY_MEDIA_START, `(is)`: the network plays a tone or an announcement. */
typedef struct ims_call_early_media_s {
    int32_t session_id; /**< the session */
    char *text_1;       /**< defined by the service */
} ims_call_early_media_s;

/** #IMS_NOTI_CALL_ERROR, `(iis)`: something went wrong with the call. */
typedef struct ims_call_error_s {
    int32_t session_id; /**< the session */
    int32_t error_code; /**< what went wrong */
    char *text_1;       /**< defined by the service */
} ims_call_error_s;

/**
 * #IMS_NOTI_CALL_CONFERENCE_CALL_ESTABLISHED, #IMS_NOTI_CALL_CONFERENCE_CALL_PARTICIPANT_ADDED and
 * #IMS_NOTI_CALL_CONFERENCE_CALL_PARTICIPANT_REMOVED, `(ii)`.
 */
typedef struct ims_call_conference_event_s {
    int32_t session_id; /**< the session */
    int32_t value_1;    /**< defined by the service */
} ims_call_conference_event_s;

/** #IMS_NOTI_CALL_USSD_INDICATION, `(iiis)` with a base64 text: the network's USSD text. */
typedef struct ims_call_ussd_indication_s {
    int32_t value_1;     /**< defined by the service */
    int32_t value_2;     /**< defined by the service */
    int32_t value_3;     /**< defined by the service */
    const uint8_t *data; /**< the decoded bytes, gone after the callback */
    int32_t length;      /**< bytes in data */
} ims_call_ussd_indication_s;

/** #IMS_NOTI_CALL_DTMF_EVENT, `(y)`: the peer sent a tone. */
typedef struct ims_call_dtmf_event_s {
    uint8_t tone; /**< the tone's character */
} ims_call_dtmf_event_s;

/** @} */

/** How many calls an #ims_call_list_info_s holds. */
#define IMS_CALL_LIST_CAPACITY 64

/** One current call. */
typedef struct ims_call_info_s {
    int32_t session_id; /**< the session */
    char *peer_uri;     /**< the other party; a copy that the caller owns */
    int32_t call_type;  /**< the kind of call */
    bool bmocall;       /**< whether the call was made from this device */
    int32_t call_state; /**< the state */
    bool bconfcall;     /**< whether the call is a conference */
} ims_call_info_s;

/** The current calls. Zero it before its first use; ims_call_list_info_clear() releases it. */
typedef struct ims_call_list_info_s {
    uint32_t count;                                  /**< how many entries are filled */
    ims_call_info_s entries[IMS_CALL_LIST_CAPACITY]; /**< the calls, in the service's order */
} ims_call_list_info_s;

/**
 * @brief Reads the list of current calls.
 *
 * Blocks for at most 60 s. A list that is empty, or whose count is not the number of entries that
 * came, is reported as success with @p list->count 0. Of more than #IMS_CALL_LIST_CAPACITY calls
 * the first ones are kept. An entry keeps the value that the caller had in a field which the
 * service left out; a text that a field held before is overwritten, not freed.
 *
 * D-Bus: `CallListInfo`, sends `(i)`: the application id; expects `(iu\@aa{sv})`: the result, the
 * count and one dictionary a call.
 *
 * @param         handle  the handle
 * @param[in,out] list    receives the calls. On a failure of the service itself, its count is the
 *                        reply's and no entry was written; otherwise untouched on failure
 * @return see @ref requests
 */
IMS_API int ims_call_get_call_list_info(ims_h handle, ims_call_list_info_s *list);

/**
 * @brief Frees the texts in the entries of a call list and zeroes the whole record.
 *
 * Frees the text of every entry, also behind @p list->count. Needs no handle and no IMS feature.
 *
 * @param list  a list that was zeroed before its first use; NULL does nothing
 */
IMS_API void ims_call_list_info_clear(ims_call_list_info_s *list);

/**
 * @name Requests
 * All are asynchronous and return what @ref requests says. The callback may be NULL: the request is
 * sent all the same and its outcome dropped. Where nothing else is said the service's reply is
 * `(i)` and the callback's data NULL. No request checks what its record contains.
 * @{
 */

/**
 * @brief Places a call.
 *
 * D-Bus: `MakeCall`, sends `(isissss)`: the application id and the record's fields; expects
 * `(ii)`: the callback's data is an `int32_t *` to the second member, the new session.
 *
 * @param handle     the handle
 * @param info       the call
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_make_call(ims_h handle, const ims_call_make_info_s *info,
                               ims_response_cb callback, void *user_data);

/**
 * @brief Sends an unstructured supplementary service request.
 *
 * D-Bus: `SendUssd`, sends `(iiis)`: the application id, the type, the value, and the text or an
 * empty one.
 *
 * @param handle     the handle
 * @param info       the request. Unless its type is #IMS_CALL_USSD_TYPE_WITHOUT_TEXT, a zero byte
 *                   is written into its text at index text_length (when that is not negative)
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_send_ussd(ims_h handle, const ims_call_ussd_info_s *info,
                               ims_response_cb callback, void *user_data);

/**
 * @brief Answers an incoming call.
 *
 * D-Bus: `AnswerCall`, sends `(iiii)`: the application id and the record's fields.
 *
 * @param handle     the handle
 * @param info       the session and two values
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_answer_call(ims_h handle, const ims_call_id_info_s *info,
                                 ims_response_cb callback, void *user_data);

/**
 * @brief Ends a call.
 *
 * D-Bus: `EndCall`, sends `(iiii)`: the application id and the record's fields.
 *
 * @param handle     the handle
 * @param info       the session and two values
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_end_call(ims_h handle, const ims_call_id_info_s *info,
                              ims_response_cb callback, void *user_data);

/**
 * @brief Rejects an incoming call.
 *
 * D-Bus: `RejectCall`, sends `(iii)`: the application id and the record's fields.
 *
 * @param handle     the handle
 * @param info       the session and a value
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_reject_call(ims_h handle, const ims_call_pair_info_s *info,
                                 ims_response_cb callback, void *user_data);

/**
 * @brief Puts a call on hold.
 *
 * D-Bus: `HoldCall`, sends `(ii)`: the application id and the session.
 *
 * @param handle     the handle
 * @param session_id the session
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_hold_call(ims_h handle, int32_t session_id, ims_response_cb callback,
                               void *user_data);

/**
 * @brief Takes a call off hold.
 *
 * D-Bus: `ResumeCall`, sends `(ii)`: the application id and the session.
 *
 * @param handle     the handle
 * @param session_id the session
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_resume_call(ims_h handle, int32_t session_id, ims_response_cb callback,
                                 void *user_data);

/**
 * @brief Swaps the active and the held call.
 *
 * D-Bus: `SwapCall`, sends `(i)`: the application id.
 *
 * @param handle     the handle
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_swap_call(ims_h handle, ims_response_cb callback, void *user_data);

/**
 * @brief Asks for a richer kind of call.
 *
 * D-Bus: `UpgradeCall`, sends `(iii)`: the application id and the record's fields.
 *
 * @param handle     the handle
 * @param info       the session and a value
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_upgrade_call(ims_h handle, const ims_call_pair_info_s *info,
                                  ims_response_cb callback, void *user_data);

/**
 * @brief Asks for a plainer kind of call.
 *
 * D-Bus: `DowngradeCall`, sends `(iii)`: the application id and the record's fields.
 *
 * @param handle     the handle
 * @param info       the session and a value
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_downgrade_call(ims_h handle, const ims_call_pair_info_s *info,
                                    ims_response_cb callback, void *user_data);

/**
 * @brief Asks for another kind of call.
 *
 * D-Bus: `ChangeCall`, sends `(iii)`: the application id and the record's fields; expects `(iis)`:
 * the callback's data is an #ims_call_change_result_s with the other two members.
 *
 * @param handle     the handle
 * @param info       the session and a value
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_change_call(ims_h handle, const ims_call_pair_info_s *info,
                                 ims_response_cb callback, void *user_data);

/**
 * @brief Accepts the peer's request for another kind of call.
 *
 * D-Bus: `AcceptChangeRequest`, sends `(ii)`: the application id and the session.
 *
 * @param handle     the handle
 * @param session_id the session
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_accept_change_request(ims_h handle, int32_t session_id,
                                           ims_response_cb callback, void *user_data);

/**
 * @brief Rejects the peer's request for another kind of call.
 *
 * D-Bus: `RejectChangeRequest`, sends `(ii)`: the application id and the session.
 *
 * @param handle     the handle
 * @param session_id the session
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_reject_change_request(ims_h handle, int32_t session_id,
                                           ims_response_cb callback, void *user_data);

/**
 * @brief Sends DTMF digits.
 *
 * D-Bus: `SendDtmf`, sends `(iis)`: the application id and the record's fields.
 *
 * @param handle     the handle
 * @param info       the session and the digits
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_send_dtmf(ims_h handle, const ims_call_dtmf_info_s *info,
                               ims_response_cb callback, void *user_data);

/**
 * @brief Starts one DTMF tone.
 *
 * D-Bus: `StartDtmf`, sends `(iiy)`: the application id and the record's fields.
 *
 * @param handle     the handle
 * @param info       the session and the tone
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_start_dtmf(ims_h handle, const ims_call_dtmf_tone_s *info,
                                ims_response_cb callback, void *user_data);

/**
 * @brief Stops the DTMF tone.
 *
 * D-Bus: `StopDtmf`, sends `(ii)`: the application id and the session.
 *
 * @param handle     the handle
 * @param session_id the session
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_stop_dtmf(ims_h handle, int32_t session_id, ims_response_cb callback,
                               void *user_data);

/**
 * @brief Starts or stops recording a call's voice.
 *
 * D-Bus: `VoiceRecord`, sends `(iiis)`: the application id and the record's fields.
 *
 * @param handle     the handle
 * @param info       the session and what to do
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_voice_record(ims_h handle, const ims_call_record_info_s *info,
                                  ims_response_cb callback, void *user_data);

/**
 * @brief Sends text telephony bytes.
 *
 * D-Bus: `SendTtyData`, sends `(iis)`: the application id, the session and the bytes as base64.
 *
 * @param handle     the handle
 * @param info       the session and the bytes
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_send_tty_data(ims_h handle, const ims_call_tty_data_s *info,
                                   ims_response_cb callback, void *user_data);

/**
 * @brief Sets the text telephony mode.
 *
 * D-Bus: `SetTtyMode`, sends `(ii)`: the application id and the mode.
 *
 * @param handle     the handle
 * @param mode       the mode, defined by the service
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_set_tty_mode(ims_h handle, int32_t mode, ims_response_cb callback,
                                  void *user_data);

/**
 * @brief Asks for the text telephony mode.
 *
 * D-Bus: `GetTtyMode`, sends no parameters; expects `(iiis)`: the callback's data is an
 * #ims_call_tty_mode_s: the second and third member, and the bytes of the base64 text.
 *
 * @param handle     the handle
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_get_tty_mode(ims_h handle, ims_response_cb callback, void *user_data);

/**
 * @brief Asks whether a call is muted.
 *
 * D-Bus: `IsMuted`, sends `(ii)`: the application id and the session; expects `(ib)`: the
 * callback's data is a `bool *`.
 *
 * @param handle     the handle
 * @param session_id the session
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_is_muted(ims_h handle, int32_t session_id, ims_response_cb callback,
                              void *user_data);

/**
 * @brief Mutes a call, or unmutes it.
 *
 * D-Bus: `ToggleMute`, sends `(ii)`: the application id and the session.
 *
 * @param handle     the handle
 * @param session_id the session
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_toggle_mute(ims_h handle, int32_t session_id, ims_response_cb callback,
                                 void *user_data);

/**
 * @brief Sets a call's speaker mode.
 *
 * D-Bus: `SetSpeakerMode`, sends `(iii)`: the application id and the record's fields.
 *
 * @param handle     the handle
 * @param info       the session and the mode
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_set_speaker_mode(ims_h handle, const ims_call_pair_info_s *info,
                                      ims_response_cb callback, void *user_data);

/**
 * @brief Sets a call's volume.
 *
 * D-Bus: `SetVolume`, sends `(iii)`: the application id and the record's fields.
 *
 * @param handle     the handle
 * @param info       the session and the volume
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_set_volume(ims_h handle, const ims_call_pair_info_s *info,
                                ims_response_cb callback, void *user_data);

/**
 * @brief Asks for a call's greatest volume.
 *
 * D-Bus: `GetMaxVolume`, sends `(ii)`: the application id and the session; expects `(ii)`: the
 * callback's data is an `int32_t *` to the second member, the volume.
 *
 * @param handle     the handle
 * @param session_id the session
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_get_max_volume(ims_h handle, int32_t session_id, ims_response_cb callback,
                                    void *user_data);

/**
 * @brief Adds a party to a conference.
 *
 * D-Bus: `AddUserForConferenceCall`, sends `(iisi)`: the application id and the record's fields.
 *
 * @param handle     the handle
 * @param info       the session and the party
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_add_user_for_conference_call(ims_h handle, const ims_call_conf_user_s *info,
                                                  ims_response_cb callback, void *user_data);

/**
 * @brief Tells that a handover to circuit-switched voice has started.
 *
 * D-Bus: `IndicateSrvccHoStarted`, sends `(ii)`: the application id and the value.
 *
 * @param handle     the handle
 * @param value      defined by the service
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_indicate_srvcc_ho_started(ims_h handle, int32_t value,
                                               ims_response_cb callback, void *user_data);

/**
 * @brief Tells that a handover to circuit-switched voice has failed.
 *
 * D-Bus: `IndicateSrvccHoFailed`, sends `(ii)`: the application id and the value.
 *
 * @param handle     the handle
 * @param value      defined by the service
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_indicate_srvcc_ho_failed(ims_h handle, int32_t value, ims_response_cb callback,
                                              void *user_data);

/**
 * @brief Sets how incoming calls are responded to by themselves.
 *
 * D-Bus: `SetAutoResponse`, sends `(iii)`: the application id and the record's fields.
 *
 * @param handle     the handle
 * @param info       two values, defined by the service
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_set_auto_response(ims_h handle, const ims_call_pair_info_s *info,
                                       ims_response_cb callback, void *user_data);

/**
 * @brief Describes the packet data network for emergency calls.
 *
 * D-Bus: `SetEmergencyPdnInfo`, sends `(isi\@vs)`: the application id, the first text, the count,
 * a variant that holds the texts as `as`, and the last text.
 *
 * @param handle     the handle
 * @param info       the network
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_set_emergency_pdn_info(ims_h handle, const ims_call_emergency_pdn_s *info,
                                            ims_response_cb callback, void *user_data);

/**
 * @brief Registers the emergency packet data network.
 *
 * D-Bus: `RegisterEmergencyPdn`, sends no parameters.
 *
 * @param handle     the handle
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_register_emergency_pdn(ims_h handle, ims_response_cb callback,
                                            void *user_data);

/**
 * @brief Deregisters the emergency packet data network.
 *
 * D-Bus: `DeregisterEmergencyPdn`, sends no parameters.
 *
 * @param handle     the handle
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_deregister_emergency_pdn(ims_h handle, ims_response_cb callback,
                                              void *user_data);

/**
 * @brief Starts an n-way conference.
 *
 * D-Bus: `StartNwayConferenceCall`, sends `(iiii)`: the application id and the record's fields;
 * expects `(ii)`: the callback's data is an `int32_t *` to the second member.
 *
 * @param handle     the handle
 * @param info       the session and two values
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_start_nway_conference_call(ims_h handle, const ims_call_id_info_s *info,
                                                ims_response_cb callback, void *user_data);

/**
 * @brief Merges the active and the held call.
 *
 * D-Bus: `MergeCalls`, sends `(i)`: the application id; expects `(ii)`: the callback's data is an
 * `int32_t *` to the second member.
 *
 * @param handle     the handle
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_merge_calls(ims_h handle, ims_response_cb callback, void *user_data);

/**
 * @brief Adds a participant to an n-way conference.
 *
 * D-Bus: `AddParticipantToNwayConferenceCall`, sends `(iii)`: the application id and the record's
 * fields.
 *
 * @param handle     the handle
 * @param info       the session and a value
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_add_participant_to_nway_conference_call(ims_h handle,
                                                             const ims_call_pair_info_s *info,
                                                             ims_response_cb callback,
                                                             void *user_data);

/**
 * @brief Removes a participant from an n-way conference.
 *
 * D-Bus: `RemoveParticipantFromNwayConferenceCall`, sends `(iii)`: the application id and the
 * record's fields.
 *
 * @param handle     the handle
 * @param info       the session and a value
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_remove_participant_from_nway_conference_call(ims_h handle,
                                                                  const ims_call_pair_info_s *info,
                                                                  ims_response_cb callback,
                                                                  void *user_data);

/**
 * @brief Asks whether a call runs over the evolved packet data gateway.
 *
 * D-Bus: `IsInEpdgCall`, sends `(i)`: the application id; expects `(ib)`: the callback's data is a
 * `bool *`.
 *
 * @param handle     the handle
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_is_in_epdg_call(ims_h handle, ims_response_cb callback, void *user_data);

/**
 * @brief Passes on the cell's service-specific access control values.
 *
 * D-Bus: `UpdateSsacInfo`, sends `(iiiiii)`: the application id and the record's fields.
 *
 * @param handle     the handle
 * @param info       the values
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_update_ssac_info(ims_h handle, const ims_call_ssac_info_s *info,
                                      ims_response_cb callback, void *user_data);

/**
 * @brief Changes the audio path of a call over the evolved packet data gateway.
 *
 * D-Bus: `ChangeEpdgAudioPath`, sends `(ii)`: the application id and the value.
 *
 * @param handle     the handle
 * @param value      defined by the service
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_change_epdg_audio_path(ims_h handle, int32_t value, ims_response_cb callback,
                                            void *user_data);

/**
 * @brief Starts a conference with a list of participants.
 *
 * D-Bus: `StartConference`, sends `(ii\@v)`: the record's value, its count, and a variant that
 * holds the first count participants as `as`; no application id; expects `(ii)`: the callback's
 * data is the second member itself in the pointer's place: `(int)(intptr_t)data`.
 *
 * @param handle     the handle
 * @param info       the conference. Not checked: must not be NULL
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_start_conference(ims_h handle, const ims_call_conference_s *info,
                                      ims_response_cb callback, void *user_data);

/**
 * @brief Changes the participants of a conference.
 *
 * D-Bus: `ModifyParticipantsInConference`, sends `(iii\@v)`: the session, the value, the count,
 * and a variant that holds the first count participants as `as`; no application id; expects
 * `(ii)`: the callback's data is the second member itself in the pointer's place:
 * `(int)(intptr_t)data`.
 *
 * @param handle     the handle
 * @param info       the change. Not checked: must not be NULL
 * @param callback   receives the outcome, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_call_modify_participants_in_conference(ims_h handle,
                                                       const ims_call_conference_modify_s *info,
                                                       ims_response_cb callback, void *user_data);

/** @} */

#ifdef __cplusplus
}
#endif

#endif
