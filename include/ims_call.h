/*
 * SPDX-License-Identifier: Apache-2.0
 */
#ifndef KELVO_IMS_CALL_H
#define KELVO_IMS_CALL_H

/**
 * @file
 * @brief Voice and video calls.
 */

/**
 * @defgroup ims_call Calls
 * @brief Voice and video calls, conferences, USSD: `org.kelvo.ims.Call`.
 *
 * @section ims_call_life The life of a call
 *
 * A call is a session of the slot, known by an id that the service gives. A placed call's id comes
 * with the callback of ims_call_make_call(); what becomes of the call comes as events:
 * #IMS_NOTI_CALL_IN_PROGRESS, #IMS_NOTI_CALL_ALERTING, #IMS_NOTI_CALL_ESTABLISHED, and on the way
 * perhaps #IMS_NOTI_CALL_EARLY_MEDIA_START, #IMS_NOTI_CALL_FORWARDED, #IMS_NOTI_CALL_BUSY or
 * #IMS_NOTI_CALL_ERROR. A call that comes in begins with #IMS_NOTI_CALL_INCOMING_IND and waits for
 * ims_call_answer_call() or ims_call_reject_call(). Both end with #IMS_NOTI_CALL_ENDED, whoever
 * hangs up. When the callback of ims_call_make_call() has a result other than 0 there is no call,
 * and no event will tell of one.
 *
 * So it is with all requests: the callback says whether the service has taken the request up, and
 * events say what has come of it, also when the other side began it. A call on hold is
 * #IMS_NOTI_CALL_HELD, another kind of call #IMS_NOTI_CALL_SWITCHED; when the peer asks for one,
 * #IMS_NOTI_CALL_CHANGE_REQUEST waits for an answer. ims_call_get_call_list_info() tells what is
 * there now. A conference is a session of its own.
 *
 * @code{.c}
 * #include <ims.h>
 * #include <stdio.h>
 * #include <stdlib.h>
 *
 * void on_made(ims_h handle, int result, void *data, void *user_data) {
 *     if (result == 0)
 *         printf("session %d\n", (int)*(int32_t *)data);
 *     else
 *         printf("no call: %d\n", result);
 * }
 *
 * void on_incoming(ims_h handle, int noti_id, void *event, void *user_data) {
 *     ims_call_incoming_s *call = event;
 *     char *texts[] = {call->number, call->text_1, call->text_2,
 *                      call->text_3, call->text_4, call->text_5};
 *     // the session and the kind of call, as the stand-in takes them
 *     ims_call_id_info_s answer = {.session_id = call->session_id, .value_1 = call->call_type};
 *     ims_call_answer_call(handle, &answer, NULL, NULL);
 *     for (size_t i = 0; i < sizeof texts / sizeof *texts; ++i)
 *         free(texts[i]); // the texts of an event are the application's
 * }
 *
 * int begin(ims_h handle) {
 *     const ims_call_make_info_s call = {.number = "+15550199"};
 *     int error = ims_set_notification_cb(handle, IMS_NOTI_CALL_INCOMING_IND, on_incoming, NULL);
 *     return error == IMS_ERROR_NONE ? ims_call_make_call(handle, &call, on_made, NULL) : error;
 * }
 * @endcode
 *
 * @{
 */

#include "ims_types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * @defgroup ims_call_records Request records
 * @brief Owned by the caller, read during the call only; a NULL text is sent as an empty one.
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
 * @defgroup ims_call_answers Response records
 * @brief What the callbacks of some requests receive, valid while the callback runs.
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
 * @defgroup ims_call_events Event records
 * @brief What an #ims_notification_cb receives, by id.
 *
 * The record is valid while the callback runs. Every `char *` in it is a copy that the application
 * takes over and releases with free(), whether it uses it or not. Decoded bytes are gone after the
 * callback.
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

/**
 * @defgroup ims_call_list The call list
 * @brief What calls there are now: a query, see @ref ims_requests.
 * @{
 */

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
 * Reads the list of current calls.
 *
 * A list that is empty, or whose count is not the number of entries that came, is reported as
 * success with @p list->count 0. Of more than #IMS_CALL_LIST_CAPACITY calls the first ones are
 * kept. An entry keeps the value that the caller had in a field which the service left out; a text
 * that a field held before is overwritten, not freed.
 *
 * D-Bus: `CallListInfo`, sends `(i)`: the application id; expects `(iuaa{sv})`: the result, the
 * count and one dictionary a call.
 *
 * @param[in,out] list  receives the calls. On a failure of the service itself, its count is the
 *                      reply's and no entry was written; otherwise untouched on failure
 */
IMS_API int ims_call_get_call_list_info(ims_h handle, ims_call_list_info_s *list);

/**
 * Frees the texts in the entries of a call list and zeroes the whole record.
 *
 * Frees the text of every entry, also behind @p list->count. Needs no handle and no IMS feature.
 *
 * @param list  a list that was zeroed before its first use; NULL does nothing
 */
IMS_API void ims_call_list_info_clear(ims_call_list_info_s *list);

/** @} */

/**
 * @defgroup ims_call_requests Requests
 * @brief To place, answer, end and change calls.
 *
 * What all requests share is said in @ref ims_requests and @ref ims_errors. Where nothing else is
 * said here, what is sent is the application id and then the argument, or the record's fields in
 * their order; the reply is `(i)`, the result, and the callback's data is NULL. No request checks
 * what its record contains.
 * @{
 */

/**
 * Places a call.
 *
 * D-Bus: `MakeCall`, sends `(isissss)`; expects `(ii)`: the callback's data is an `int32_t *` to
 * the second member, the new session.
 *
 * @param info  the call
 */
IMS_API int ims_call_make_call(ims_h handle, const ims_call_make_info_s *info,
                               ims_response_cb callback, void *user_data);

/**
 * Sends an unstructured supplementary service request.
 *
 * D-Bus: `SendUssd`, sends `(iiis)`: the application id, the type, the value, and the text or an
 * empty one.
 *
 * @param info  the request. Unless its type is #IMS_CALL_USSD_TYPE_WITHOUT_TEXT, a zero byte is
 *              written into its text at index text_length (when that is not negative)
 */
IMS_API int ims_call_send_ussd(ims_h handle, const ims_call_ussd_info_s *info,
                               ims_response_cb callback, void *user_data);

/**
 * Answers an incoming call.
 *
 * D-Bus: `AnswerCall`, sends `(iiii)`.
 *
 * @param info  the session and two values
 */
IMS_API int ims_call_answer_call(ims_h handle, const ims_call_id_info_s *info,
                                 ims_response_cb callback, void *user_data);

/**
 * Ends a call.
 *
 * D-Bus: `EndCall`, sends `(iiii)`.
 *
 * @param info  the session and two values
 */
IMS_API int ims_call_end_call(ims_h handle, const ims_call_id_info_s *info,
                              ims_response_cb callback, void *user_data);

/**
 * Rejects an incoming call.
 *
 * D-Bus: `RejectCall`, sends `(iii)`.
 *
 * @param info  the session and a value
 */
IMS_API int ims_call_reject_call(ims_h handle, const ims_call_pair_info_s *info,
                                 ims_response_cb callback, void *user_data);

/**
 * Puts a call on hold.
 *
 * D-Bus: `HoldCall`, sends `(ii)`.
 *
 * @param session_id  the session
 */
IMS_API int ims_call_hold_call(ims_h handle, int32_t session_id, ims_response_cb callback,
                               void *user_data);

/**
 * Takes a call off hold.
 *
 * D-Bus: `ResumeCall`, sends `(ii)`.
 *
 * @param session_id  the session
 */
IMS_API int ims_call_resume_call(ims_h handle, int32_t session_id, ims_response_cb callback,
                                 void *user_data);

/**
 * Swaps the active and the held call.
 *
 * D-Bus: `SwapCall`, sends `(i)`.
 */
IMS_API int ims_call_swap_call(ims_h handle, ims_response_cb callback, void *user_data);

/**
 * Asks for a richer kind of call.
 *
 * D-Bus: `UpgradeCall`, sends `(iii)`.
 *
 * @param info  the session and a value
 */
IMS_API int ims_call_upgrade_call(ims_h handle, const ims_call_pair_info_s *info,
                                  ims_response_cb callback, void *user_data);

/**
 * Asks for a plainer kind of call.
 *
 * D-Bus: `DowngradeCall`, sends `(iii)`.
 *
 * @param info  the session and a value
 */
IMS_API int ims_call_downgrade_call(ims_h handle, const ims_call_pair_info_s *info,
                                    ims_response_cb callback, void *user_data);

/**
 * Asks for another kind of call.
 *
 * D-Bus: `ChangeCall`, sends `(iii)`; expects `(iis)`: the callback's data is an
 * #ims_call_change_result_s with the other two members.
 *
 * @param info  the session and a value
 */
IMS_API int ims_call_change_call(ims_h handle, const ims_call_pair_info_s *info,
                                 ims_response_cb callback, void *user_data);

/**
 * Accepts the peer's request for another kind of call.
 *
 * D-Bus: `AcceptChangeRequest`, sends `(ii)`.
 *
 * @param session_id  the session
 */
IMS_API int ims_call_accept_change_request(ims_h handle, int32_t session_id,
                                           ims_response_cb callback, void *user_data);

/**
 * Rejects the peer's request for another kind of call.
 *
 * D-Bus: `RejectChangeRequest`, sends `(ii)`.
 *
 * @param session_id  the session
 */
IMS_API int ims_call_reject_change_request(ims_h handle, int32_t session_id,
                                           ims_response_cb callback, void *user_data);

/**
 * Sends DTMF digits.
 *
 * D-Bus: `SendDtmf`, sends `(iis)`.
 *
 * @param info  the session and the digits
 */
IMS_API int ims_call_send_dtmf(ims_h handle, const ims_call_dtmf_info_s *info,
                               ims_response_cb callback, void *user_data);

/**
 * Starts one DTMF tone.
 *
 * D-Bus: `StartDtmf`, sends `(iiy)`.
 *
 * @param info  the session and the tone
 */
IMS_API int ims_call_start_dtmf(ims_h handle, const ims_call_dtmf_tone_s *info,
                                ims_response_cb callback, void *user_data);

/**
 * Stops the DTMF tone.
 *
 * D-Bus: `StopDtmf`, sends `(ii)`.
 *
 * @param session_id  the session
 */
IMS_API int ims_call_stop_dtmf(ims_h handle, int32_t session_id, ims_response_cb callback,
                               void *user_data);

/**
 * Starts or stops recording a call's voice.
 *
 * D-Bus: `VoiceRecord`, sends `(iiis)`.
 *
 * @param info  the session and what to do
 */
IMS_API int ims_call_voice_record(ims_h handle, const ims_call_record_info_s *info,
                                  ims_response_cb callback, void *user_data);

/**
 * Sends text telephony bytes.
 *
 * D-Bus: `SendTtyData`, sends `(iis)`: the application id, the session and the bytes as base64.
 *
 * @param info  the session and the bytes
 */
IMS_API int ims_call_send_tty_data(ims_h handle, const ims_call_tty_data_s *info,
                                   ims_response_cb callback, void *user_data);

/**
 * Sets the text telephony mode.
 *
 * D-Bus: `SetTtyMode`, sends `(ii)`.
 *
 * @param mode  the mode, defined by the service
 */
IMS_API int ims_call_set_tty_mode(ims_h handle, int32_t mode, ims_response_cb callback,
                                  void *user_data);

/**
 * Asks for the text telephony mode.
 *
 * D-Bus: `GetTtyMode`, sends no parameters; expects `(iiis)`: the callback's data is an
 * #ims_call_tty_mode_s: the second and third member, and the bytes of the base64 text.
 */
IMS_API int ims_call_get_tty_mode(ims_h handle, ims_response_cb callback, void *user_data);

/**
 * Asks whether a call is muted.
 *
 * D-Bus: `IsMuted`, sends `(ii)`; expects `(ib)`: the callback's data is a `bool *`.
 *
 * @param session_id  the session
 */
IMS_API int ims_call_is_muted(ims_h handle, int32_t session_id, ims_response_cb callback,
                              void *user_data);

/**
 * Mutes a call, or unmutes it.
 *
 * D-Bus: `ToggleMute`, sends `(ii)`.
 *
 * @param session_id  the session
 */
IMS_API int ims_call_toggle_mute(ims_h handle, int32_t session_id, ims_response_cb callback,
                                 void *user_data);

/**
 * Sets a call's speaker mode.
 *
 * D-Bus: `SetSpeakerMode`, sends `(iii)`.
 *
 * @param info  the session and the mode
 */
IMS_API int ims_call_set_speaker_mode(ims_h handle, const ims_call_pair_info_s *info,
                                      ims_response_cb callback, void *user_data);

/**
 * Sets a call's volume.
 *
 * D-Bus: `SetVolume`, sends `(iii)`.
 *
 * @param info  the session and the volume
 */
IMS_API int ims_call_set_volume(ims_h handle, const ims_call_pair_info_s *info,
                                ims_response_cb callback, void *user_data);

/**
 * Asks for a call's greatest volume.
 *
 * D-Bus: `GetMaxVolume`, sends `(ii)`; expects `(ii)`: the callback's data is an `int32_t *` to the
 * second member, the volume.
 *
 * @param session_id  the session
 */
IMS_API int ims_call_get_max_volume(ims_h handle, int32_t session_id, ims_response_cb callback,
                                    void *user_data);

/**
 * Adds a party to a conference.
 *
 * D-Bus: `AddUserForConferenceCall`, sends `(iisi)`.
 *
 * @param info  the session and the party
 */
IMS_API int ims_call_add_user_for_conference_call(ims_h handle, const ims_call_conf_user_s *info,
                                                  ims_response_cb callback, void *user_data);

/**
 * Tells that a handover to circuit-switched voice has started.
 *
 * D-Bus: `IndicateSrvccHoStarted`, sends `(ii)`.
 *
 * @param value  defined by the service
 */
IMS_API int ims_call_indicate_srvcc_ho_started(ims_h handle, int32_t value,
                                               ims_response_cb callback, void *user_data);

/**
 * Tells that a handover to circuit-switched voice has failed.
 *
 * D-Bus: `IndicateSrvccHoFailed`, sends `(ii)`.
 *
 * @param value  defined by the service
 */
IMS_API int ims_call_indicate_srvcc_ho_failed(ims_h handle, int32_t value, ims_response_cb callback,
                                              void *user_data);

/**
 * Sets how incoming calls are responded to by themselves.
 *
 * D-Bus: `SetAutoResponse`, sends `(iii)`.
 *
 * @param info  two values, defined by the service
 */
IMS_API int ims_call_set_auto_response(ims_h handle, const ims_call_pair_info_s *info,
                                       ims_response_cb callback, void *user_data);

/**
 * Describes the packet data network for emergency calls.
 *
 * D-Bus: `SetEmergencyPdnInfo`, sends `(isivs)`: the application id, the first text, the count, a
 * variant that holds the texts as `as`, and the last text.
 *
 * @param info  the network
 */
IMS_API int ims_call_set_emergency_pdn_info(ims_h handle, const ims_call_emergency_pdn_s *info,
                                            ims_response_cb callback, void *user_data);

/**
 * Registers the emergency packet data network.
 *
 * D-Bus: `RegisterEmergencyPdn`, sends no parameters.
 */
IMS_API int ims_call_register_emergency_pdn(ims_h handle, ims_response_cb callback,
                                            void *user_data);

/**
 * Deregisters the emergency packet data network.
 *
 * D-Bus: `DeregisterEmergencyPdn`, sends no parameters.
 */
IMS_API int ims_call_deregister_emergency_pdn(ims_h handle, ims_response_cb callback,
                                              void *user_data);

/**
 * Starts an n-way conference.
 *
 * D-Bus: `StartNwayConferenceCall`, sends `(iiii)`; expects `(ii)`: the callback's data is an
 * `int32_t *` to the second member.
 *
 * @param info  the session and two values
 */
IMS_API int ims_call_start_nway_conference_call(ims_h handle, const ims_call_id_info_s *info,
                                                ims_response_cb callback, void *user_data);

/**
 * Merges the active and the held call.
 *
 * D-Bus: `MergeCalls`, sends `(i)`; expects `(ii)`: the callback's data is an `int32_t *` to the
 * second member.
 */
IMS_API int ims_call_merge_calls(ims_h handle, ims_response_cb callback, void *user_data);

/**
 * Adds a participant to an n-way conference.
 *
 * D-Bus: `AddParticipantToNwayConferenceCall`, sends `(iii)`.
 *
 * @param info  the session and a value
 */
IMS_API int ims_call_add_participant_to_nway_conference_call(ims_h handle,
                                                             const ims_call_pair_info_s *info,
                                                             ims_response_cb callback,
                                                             void *user_data);

/**
 * Removes a participant from an n-way conference.
 *
 * D-Bus: `RemoveParticipantFromNwayConferenceCall`, sends `(iii)`.
 *
 * @param info  the session and a value
 */
IMS_API int ims_call_remove_participant_from_nway_conference_call(ims_h handle,
                                                                  const ims_call_pair_info_s *info,
                                                                  ims_response_cb callback,
                                                                  void *user_data);

/**
 * Asks whether a call runs over the evolved packet data gateway.
 *
 * D-Bus: `IsInEpdgCall`, sends `(i)`; expects `(ib)`: the callback's data is a `bool *`.
 */
IMS_API int ims_call_is_in_epdg_call(ims_h handle, ims_response_cb callback, void *user_data);

/**
 * Passes on the cell's service-specific access control values.
 *
 * D-Bus: `UpdateSsacInfo`, sends `(iiiiii)`.
 *
 * @param info  the values
 */
IMS_API int ims_call_update_ssac_info(ims_h handle, const ims_call_ssac_info_s *info,
                                      ims_response_cb callback, void *user_data);

/**
 * Changes the audio path of a call over the evolved packet data gateway.
 *
 * D-Bus: `ChangeEpdgAudioPath`, sends `(ii)`.
 *
 * @param value  defined by the service
 */
IMS_API int ims_call_change_epdg_audio_path(ims_h handle, int32_t value, ims_response_cb callback,
                                            void *user_data);

/**
 * Starts a conference with a list of participants.
 *
 * D-Bus: `StartConference`, sends `(iiv)`: the record's value, its count, and a variant that holds
 * the first count participants as `as`; no application id; expects `(ii)`: the callback's data is
 * the second member itself in the pointer's place: `(int)(intptr_t)data`.
 *
 * @param info  the conference. Not checked: must not be NULL
 */
IMS_API int ims_call_start_conference(ims_h handle, const ims_call_conference_s *info,
                                      ims_response_cb callback, void *user_data);

/**
 * Changes the participants of a conference.
 *
 * D-Bus: `ModifyParticipantsInConference`, sends `(iiiv)`: the session, the value, the count, and a
 * variant that holds the first count participants as `as`; no application id; expects `(ii)`: the
 * callback's data is the second member itself in the pointer's place: `(int)(intptr_t)data`.
 *
 * @param info  the change. Not checked: must not be NULL
 */
IMS_API int ims_call_modify_participants_in_conference(ims_h handle,
                                                       const ims_call_conference_modify_s *info,
                                                       ims_response_cb callback, void *user_data);

/** @} */

/** @} */

#ifdef __cplusplus
}
#endif

#endif
