/*
 * SPDX-License-Identifier: Apache-2.0
 */
#ifndef KELVO_IMS_POC_H
#define KELVO_IMS_POC_H

/**
 * @file
 * @brief Push-to-talk: calls, the floor, recording, messages, file transfer and the events.
 */

/**
 * @defgroup ims_poc Push-to-talk
 * @brief Calls in which one speaks at a time, messages and files: `org.kelvo.ims.Poc`.
 *
 * @section ims_poc_life The life of a push-to-talk call
 *
 * A call is a session with an id that the service gives. A placed call's id comes with the callback
 * of ims_poc_call_make_call() or ims_poc_make_ad_hoc_call(), then come
 * #IMS_NOTI_POC_CALL_IN_PROGRESS, #IMS_NOTI_POC_CALL_ALERTING and #IMS_NOTI_POC_CALL_ESTABLISHED. A
 * call that comes in begins with #IMS_NOTI_POC_CALL_INCOMING_IND and waits for
 * ims_poc_call_answer_call() or ims_poc_call_reject_call(). #IMS_NOTI_POC_CALL_ENDED is the last
 * event of both.
 *
 * In an established call one participant has the floor, the right to talk.
 * ims_poc_call_request_floor() asks for it; the answer is an event:
 * #IMS_NOTI_POC_CALL_FLOOR_GRANTED, #IMS_NOTI_POC_CALL_FLOOR_REJECTED or, while others talk,
 * #IMS_NOTI_POC_CALL_FLOOR_QUEUE_POSITION and in the end perhaps
 * #IMS_NOTI_POC_CALL_FLOOR_REQUEST_TIMEOUT. Who has it talks until ims_poc_call_release_floor(), or
 * until #IMS_NOTI_POC_CALL_FLOOR_CANCELED takes it away. The others hear
 * #IMS_NOTI_POC_CALL_FLOOR_TAKEN, and all #IMS_NOTI_POC_CALL_FLOOR_IDLE when it is free.
 *
 * Other media are offered with ims_poc_modify_call(), which is #IMS_NOTI_POC_CALL_MODIFY_REQUEST at
 * the others; #IMS_NOTI_POC_CALL_MODIFY_STATUS says what became of the offer. Messages and files go
 * with a call or without one, by numbers of their own.
 *
 * @code{.c}
 * #include <ims.h>
 * #include <stdio.h>
 *
 * void on_floor(ims_h handle, int noti_id, void *event, void *user_data) {
 *     if (noti_id == IMS_NOTI_POC_CALL_FLOOR_GRANTED)
 *         printf("talk\n");
 * }
 *
 * void on_made(ims_h handle, int result, void *data, void *user_data) {
 *     if (result == 0)
 *         *(int32_t *)user_data = *(int32_t *)data; // the session, says the stand-in
 * }
 *
 * int call(ims_h handle, const char *group, int32_t *session) {
 *     // whom to call and the kind of call, as the stand-in takes them
 *     const ims_poc_make_call_s info = {.text_1 = group, .value_1 = 1};
 *     int error = ims_set_notification_cb(handle, IMS_NOTI_POC_CALL_FLOOR_GRANTED, on_floor, NULL);
 *     if (error == IMS_ERROR_NONE)
 *         error = ims_poc_call_make_call(handle, &info, on_made, session);
 *     return error;
 * }
 *
 * int press(ims_h handle, int32_t session) { // once the call is established
 *     const ims_poc_floor_s floor = {.session_id = session, .text = ""};
 *     return ims_poc_call_request_floor(handle, &floor, NULL, NULL);
 * }
 *
 * int let_go(ims_h handle, int32_t session) {
 *     const ims_poc_floor_s floor = {.session_id = session};
 *     return ims_poc_call_release_floor(handle, &floor, NULL, NULL);
 * }
 * @endcode
 *
 * @section ims_poc_wire Values, sets and dictionaries
 *
 * No request carries the application id: the service tells its callers by their connections. The
 * values are the service's, see @ref ims_values.
 *
 * A set of four integers crosses the bus as an `ai` inside a `v`; of an event's set that has more
 * or fewer integers the first four are kept, and what is missing is 0.
 *
 * Records cross the bus as dictionaries where the documentation says so: `a{sv}`, a list of them
 * `aa{sv}`, inside a `v`. In these an integer goes as a 64-bit `x` and comes back cut to 32 bits,
 * and a text that is NULL is left out. In a dictionary that comes in, unknown keys are ignored, and
 * a key that is missing, or whose value has another type, leaves its field 0 or NULL. A value may
 * be wrapped in any number of variants.
 *
 * Texts and lists in the records that a callback receives belong to the library and are gone after
 * the callback: copy what is to stay.
 *
 * @{
 */

#include "ims_types.h"

#ifdef __cplusplus
extern "C" {
#endif

/** How many integers a set has. */
#define IMS_POC_INT_SET_SIZE 4

/**
 * @defgroup ims_poc_parties Records of both directions
 * @brief Parties and files.
 *
 * In a request they are owned by the caller and read during the call only. In an event they are the
 * library's and valid while the callback runs.
 * @{
 */

/** An addressed party. A dictionary of `uri_type`, `uri`, `display_name` and `is_group_uri`. */
typedef struct ims_poc_peer_info_s {
    int32_t uri_type;         /**< the kind of URI, defined by the service */
    const char *uri;          /**< the address, or NULL */
    const char *display_name; /**< the name to show, or NULL */
    bool is_group_uri;        /**< whether the address is a group's */
    /** The next party where the record is part of a list, NULL at the end; otherwise ignored, and
     * NULL in events. */
    const struct ims_poc_peer_info_s *next;
} ims_poc_peer_info_s;

/** What is to know about a file. A dictionary with the fields' names as keys, in their order. */
typedef struct ims_poc_file_attributes_s {
    const char *file_name;        /**< the name, or NULL */
    const char *file_description; /**< a description, or NULL */
    int32_t file_size;            /**< the size in bytes */
    bool push;                    /**< whether the sender pushes the file */
    int32_t start;                /**< the first byte that is transferred */
    int32_t end;                  /**< the last byte that is transferred */
    const char *transfer_id;      /**< names the transfer, or NULL */
    const char *content_type;     /**< the media type, or NULL */
    const char *file_type;        /**< defined by the service, or NULL */
} ims_poc_file_attributes_s;

/** @} */

/**
 * @defgroup ims_poc_records Request records
 * @brief Owned by the caller and read during the call only.
 *
 * A NULL text is sent as an empty one, unless a text is part of a dictionary: there it is left out.
 * Texts that are said to be required should be there; NULL is sent as an empty text there too.
 * @{
 */

/** A call to place. */
typedef struct ims_poc_make_call_s {
    bool flag_1;                             /**< defined by the service */
    bool flag_2;                             /**< defined by the service */
    bool flag_3;                             /**< defined by the service */
    const char *text_1;                      /**< defined by the service; may be NULL */
    int32_t value_1;                         /**< defined by the service */
    const char *text_2;                      /**< defined by the service; may be NULL */
    int32_t int_set_1[IMS_POC_INT_SET_SIZE]; /**< defined by the service */
    int32_t int_set_2[IMS_POC_INT_SET_SIZE]; /**< defined by the service */
    int32_t value_2;                         /**< defined by the service */
} ims_poc_make_call_s;

/** The media of a call: answering, modifying, accepting a modification. */
typedef struct ims_poc_call_media_s {
    bool flag_1;                             /**< defined by the service */
    bool flag_2;                             /**< defined by the service */
    int32_t value_1;                         /**< defined by the service */
    int32_t value_2;                         /**< defined by the service */
    int32_t int_set_1[IMS_POC_INT_SET_SIZE]; /**< defined by the service */
    int32_t int_set_2[IMS_POC_INT_SET_SIZE]; /**< defined by the service */
} ims_poc_call_media_s;

/**
 * One user of a list. A dictionary of `uri_gv`, which holds the address as a dictionary of its own,
 * like that of an #ims_poc_peer_info_s, inside a second variant; `is_anonymous`,
 * `participant_state` and `uri_usage_type`.
 */
typedef struct ims_poc_user_s {
    int32_t uri_type;                  /**< the kind of URI, defined by the service */
    const char *uri;                   /**< the address, or NULL */
    const char *display_name;          /**< the name to show, or NULL */
    bool is_group_uri;                 /**< whether the address is a group's */
    bool is_anonymous;                 /**< whether the user's identity is hidden from the others */
    int32_t participant_state;         /**< defined by the service */
    int32_t uri_usage_type;            /**< defined by the service */
    const struct ims_poc_user_s *next; /**< the next user, NULL at the end */
} ims_poc_user_s;

/** A conference of users who are no group yet. */
typedef struct ims_poc_ad_hoc_call_s {
    int32_t int_set_1[IMS_POC_INT_SET_SIZE]; /**< defined by the service */
    bool flag_1;                             /**< defined by the service */
    int32_t int_set_2[IMS_POC_INT_SET_SIZE]; /**< defined by the service */
    const char *text_1;                      /**< defined by the service; required */
    const char *text_2;                      /**< defined by the service; required */
    bool flag_2;                             /**< defined by the service */
    int32_t user_count;                      /**< at least 1; sent as stored, and caps the list */
    bool flag_3;                             /**< defined by the service */
    int32_t value_1;                         /**< defined by the service */
    const ims_poc_user_s *user_list;         /**< may be shorter than user_count, or NULL */
    int32_t value_2;                         /**< defined by the service */
} ims_poc_ad_hoc_call_s;

/** What goes with a change of users. A dictionary with the fields' names as keys. */
typedef struct ims_poc_content_s {
    const char *content_type;          /**< the media type, or NULL */
    const char *content_disposition;   /**< how the content is to be presented, or NULL */
    const char *content_id;            /**< names the content, or NULL */
    const char *content_encoding_type; /**< how the content is encoded, or NULL */
    const char *content_description;   /**< a description, or NULL */
    const char *content;               /**< the content as text, or NULL */
} ims_poc_content_s;

/** Users to add to an ad hoc conference or to remove from it. */
typedef struct ims_poc_users_s {
    int32_t value_1;                  /**< defined by the service */
    int32_t user_count;               /**< at least 1; sent as stored, and caps the list */
    int32_t value_2;                  /**< defined by the service */
    const ims_poc_user_s *user_list;  /**< may be shorter than user_count, or NULL */
    int32_t value_3;                  /**< defined by the service */
    const ims_poc_content_s *content; /**< NULL is sent as an empty dictionary */
} ims_poc_users_s;

/** Two values: rejecting and ending a call, selecting a channel. */
typedef struct ims_poc_value_pair_s {
    int32_t value_1; /**< defined by the service for each request */
    int32_t value_2; /**< defined by the service for each request */
} ims_poc_value_pair_s;

/** The floor to request or to release. */
typedef struct ims_poc_floor_s {
    int32_t session_id;                    /**< the session */
    int32_t int_set[IMS_POC_INT_SET_SIZE]; /**< defined by the service */
    int32_t value_1;                       /**< defined by the service; not sent on release */
    int32_t value_2;                       /**< defined by the service; not sent on release */
    const char *text; /**< defined by the service; required; not sent on release */
} ims_poc_floor_s;

/** How many values an #ims_poc_floor_query_s holds. */
#define IMS_POC_FLOOR_QUERY_CAPACITY 64

/** Whose floor is asked for. */
typedef struct ims_poc_floor_query_s {
    /** How many values are sent, at most #IMS_POC_FLOOR_QUERY_CAPACITY. Of fewer than four the
     * service gets four, filled up with -1; of a negative count 4 - count times -1. */
    int32_t count;
    int32_t values[IMS_POC_FLOOR_QUERY_CAPACITY]; /**< defined by the service */
} ims_poc_floor_query_s;

/** A recording to start. */
typedef struct ims_poc_record_request_s {
    int32_t value_1;  /**< defined by the service */
    int32_t value_2;  /**< defined by the service */
    int32_t value_3;  /**< defined by the service */
    const char *text; /**< defined by the service; may be NULL */
} ims_poc_record_request_s;

/** A message to send. */
typedef struct ims_poc_message_s {
    int32_t value_1;                       /**< defined by the service */
    const char *text_1;                    /**< defined by the service; required */
    const ims_poc_peer_info_s *targets;    /**< whom to send to: a list, NULL for an empty one */
    int32_t value_2;                       /**< defined by the service */
    const char *text_2;                    /**< defined by the service; required */
    const char *text_3;                    /**< defined by the service; required */
    int32_t value_3;                       /**< defined by the service */
    const ims_poc_peer_info_s *originator; /**< NULL is sent as an empty dictionary */
    int32_t value_4;                       /**< defined by the service */
} ims_poc_message_s;

/** A party of which only the names are told. A dictionary of `uri` and `display_name`. */
typedef struct ims_poc_name_node_s {
    const char *uri;                        /**< the address, or NULL */
    const char *display_name;               /**< the name to show, or NULL */
    const struct ims_poc_name_node_s *next; /**< the next party, NULL at the end */
} ims_poc_name_node_s;

/** A notice that a received message was delivered or read. */
typedef struct ims_poc_msg_notification_s {
    int32_t value_1;                       /**< defined by the service */
    const char *text_1;                    /**< defined by the service; required */
    const ims_poc_peer_info_s *originator; /**< NULL is sent as an empty dictionary */
    const ims_poc_name_node_s *parties;    /**< a list, NULL for an empty one */
    const char *text_2;                    /**< defined by the service; required */
    int32_t value_2;                       /**< defined by the service */
} ims_poc_msg_notification_s;

/** A file to offer. */
typedef struct ims_poc_file_transfer_s {
    int32_t session_id;                          /**< the session */
    const ims_poc_peer_info_s *targets;          /**< whom to offer it: a list, NULL if empty */
    const ims_poc_file_attributes_s *attributes; /**< NULL is sent as an empty dictionary */
    const ims_poc_peer_info_s *originator;       /**< NULL is sent as an empty dictionary */
} ims_poc_file_transfer_s;

/** A file transfer to accept or to reject. */
typedef struct ims_poc_transfer_answer_s {
    int32_t session_id;      /**< the session */
    const char *transfer_id; /**< names the transfer; required */
} ims_poc_transfer_answer_s;

/** @} */

/**
 * @defgroup ims_poc_answers Response records
 * @brief What the callbacks of some requests receive, valid while the callback runs with everything
 *        in them.
 * @{
 */

/**
 * Who has the floor of one session: a list, as the callback of
 * ims_poc_call_request_floor_status() receives it.
 */
typedef struct ims_poc_floor_status_s {
    int32_t session_id;                        /**< the session */
    int32_t status;                            /**< the floor's state, defined by the service */
    int32_t participant_count;                 /**< how many take part */
    const char *floor_taken_uri;               /**< who has the floor, or NULL */
    const struct ims_poc_floor_status_s *next; /**< the next session, NULL at the end */
} ims_poc_floor_status_s;

/** A recording, as the callback of ims_poc_start_call_recording() receives it. */
typedef struct ims_poc_recording_info_s {
    int32_t session_id;           /**< the session */
    int32_t record_state;         /**< the recording's state, defined by the service */
    int32_t record_error;         /**< what went wrong, defined by the service */
    const char *record_file_path; /**< where it is recorded, or NULL */
} ims_poc_recording_info_s;

/** The outcome of sending a message or a notice. */
typedef struct ims_poc_msg_result_s {
    int32_t value_1; /**< defined by the service */
    int32_t value_2; /**< defined by the service */
    int32_t value_3; /**< defined by the service */
} ims_poc_msg_result_s;

/** The outcome of a request about a file transfer. */
typedef struct ims_poc_transfer_result_s {
    int32_t value_1; /**< defined by the service */
    int32_t value_2; /**< defined by the service */
} ims_poc_transfer_result_s;

/** @} */

/**
 * @defgroup ims_poc_events Event records
 * @brief What an #ims_notification_cb receives, by id.
 *
 * The record and everything in it is valid while the callback runs; the application releases
 * nothing.
 *
 * A nested value that the service left out, an empty dictionary or list or a value of another type,
 * does not hold up its event: a pointer to it is NULL, an embedded record or a set is all 0.
 * @{
 */

/** #IMS_NOTI_POC_CALL_INCOMING_IND, `(bbbbssssssiivv)`: a call comes in. */
typedef struct ims_poc_call_incoming_s {
    bool flag_1;                             /**< defined by the service */
    bool flag_2;                             /**< defined by the service */
    bool flag_3;                             /**< defined by the service */
    bool flag_4;                             /**< defined by the service */
    const char *text_1;                      /**< defined by the service */
    const char *text_2;                      /**< defined by the service */
    const char *text_3;                      /**< defined by the service */
    const char *text_4;                      /**< defined by the service */
    const char *text_5;                      /**< defined by the service */
    const char *text_6;                      /**< defined by the service */
    int32_t value_1;                         /**< defined by the service */
    int32_t value_2;                         /**< defined by the service */
    int32_t int_set_1[IMS_POC_INT_SET_SIZE]; /**< defined by the service */
    int32_t int_set_2[IMS_POC_INT_SET_SIZE]; /**< defined by the service */
} ims_poc_call_incoming_s;

/**
 * #IMS_NOTI_POC_CALL_IN_PROGRESS, #IMS_NOTI_POC_CALL_ALERTING and
 * #IMS_NOTI_POC_CALL_CRISIS_CALL_INITIATED, `(i)`.
 */
typedef struct ims_poc_call_event_s {
    int32_t value_1; /**< defined by the service */
} ims_poc_call_event_s;

/** #IMS_NOTI_POC_CALL_ESTABLISHED, `(iibsbvbvv)`: the parties are connected. */
typedef struct ims_poc_call_established_s {
    int32_t value_1;                         /**< defined by the service */
    int32_t value_2;                         /**< defined by the service */
    bool flag_1;                             /**< defined by the service */
    const char *text_1;                      /**< defined by the service */
    bool flag_2;                             /**< defined by the service */
    int32_t int_set_1[IMS_POC_INT_SET_SIZE]; /**< defined by the service */
    bool flag_3;                             /**< defined by the service */
    int32_t int_set_2[IMS_POC_INT_SET_SIZE]; /**< defined by the service */
    ims_poc_peer_info_s peer;                /**< a party; all 0 when the service left it out */
} ims_poc_call_established_s;

/** #IMS_NOTI_POC_CALL_ENDED, `(ii)`: the call is over. */
typedef struct ims_poc_call_ended_s {
    int32_t value_1; /**< defined by the service */
    int32_t value_2; /**< defined by the service */
} ims_poc_call_ended_s;

/**
 * #IMS_NOTI_POC_CALL_FLOOR_GRANTED, #IMS_NOTI_POC_CALL_FLOOR_REJECTED,
 * #IMS_NOTI_POC_CALL_FLOOR_IDLE, #IMS_NOTI_POC_CALL_FLOOR_QUEUE_POSITION,
 * #IMS_NOTI_POC_CALL_FLOOR_CANCELED, #IMS_NOTI_POC_CALL_FLOOR_TAKEN and
 * #IMS_NOTI_POC_CALL_FLOOR_REQUEST_TIMEOUT, `(ivisisiiis)`: news of the floor. The callback's
 * noti_id tells which.
 */
typedef struct ims_poc_floor_event_s {
    int32_t value_1;                         /**< defined by the service */
    int32_t int_set_1[IMS_POC_INT_SET_SIZE]; /**< defined by the service */
    int32_t value_2;                         /**< defined by the service */
    const char *text_1;                      /**< defined by the service */
    int32_t value_3;                         /**< defined by the service */
    const char *text_2;                      /**< defined by the service */
    int32_t value_4;                         /**< defined by the service */
    int32_t value_5;                         /**< defined by the service */
    int32_t value_6;                         /**< defined by the service */
    const char *text_3;                      /**< defined by the service */
} ims_poc_floor_event_s;

/** #IMS_NOTI_POC_CALL_MODIFY_REQUEST, `(bbiivv)`: a party wants other media. */
typedef struct ims_poc_modify_request_s {
    bool flag_1;                             /**< defined by the service */
    bool flag_2;                             /**< defined by the service */
    int32_t value_1;                         /**< defined by the service */
    int32_t value_2;                         /**< defined by the service */
    int32_t int_set_1[IMS_POC_INT_SET_SIZE]; /**< defined by the service */
    int32_t int_set_2[IMS_POC_INT_SET_SIZE]; /**< defined by the service */
} ims_poc_modify_request_s;

/** #IMS_NOTI_POC_CALL_MODIFY_STATUS, `(bbbiivv)`: what became of a modification. */
typedef struct ims_poc_modify_status_s {
    bool flag_1;                             /**< defined by the service */
    bool flag_2;                             /**< defined by the service */
    bool flag_3;                             /**< defined by the service */
    int32_t value_1;                         /**< defined by the service */
    int32_t value_2;                         /**< defined by the service */
    int32_t int_set_1[IMS_POC_INT_SET_SIZE]; /**< defined by the service */
    int32_t int_set_2[IMS_POC_INT_SET_SIZE]; /**< defined by the service */
} ims_poc_modify_status_s;

/**
 * One content of a group advertisement. A dictionary of `content_byte`, base64 text, `content_type`
 * and `content_disposition`.
 */
typedef struct ims_poc_group_content_s {
    const uint8_t *content_byte;                /**< the decoded bytes, or NULL */
    const char *content_type;                   /**< the media type, or NULL */
    const char *content_disposition;            /**< how it is to be presented, or NULL */
    uint32_t content_length;                    /**< bytes in content_byte */
    const struct ims_poc_group_content_s *next; /**< the next content, NULL at the end */
} ims_poc_group_content_s;

/** A group that is made known. A dictionary with the fields' names as keys. */
typedef struct ims_poc_group_adv_s {
    const char *subject;            /**< the subject, or NULL */
    const char *call_info;          /**< about the call, or NULL */
    ims_poc_peer_info_s remote_uri; /**< who makes it known; all 0 when left out */
    const ims_poc_group_content_s *group_advertisement_content; /**< a list, or NULL */
} ims_poc_group_adv_s;

/** #IMS_NOTI_POC_GROUP_ADVERTISEMENT, `(ia{sv})`: a group is made known. */
typedef struct ims_poc_group_advertisement_s {
    int32_t value_1;                      /**< defined by the service */
    const ims_poc_group_adv_s *group_adv; /**< the advertisement, or NULL */
} ims_poc_group_advertisement_s;

/** #IMS_NOTI_POC_GROUP_CONF_PARTICIPANT_INFO, `(iss)`: news of a conference's participants. */
typedef struct ims_poc_participant_info_s {
    int32_t value_1;    /**< defined by the service */
    const char *text_1; /**< defined by the service */
    const char *text_2; /**< defined by the service */
} ims_poc_participant_info_s;

/** One entry of an intermediate route header. A dictionary of `uri` and `display_name`. */
typedef struct ims_poc_route_header_s {
    const char *uri;                           /**< the address, or NULL */
    const char *display_name;                  /**< the name to show, or NULL */
    const struct ims_poc_route_header_s *next; /**< the next entry, NULL at the end */
} ims_poc_route_header_s;

/** #IMS_NOTI_POC_INCOMING_MSG_INFO, `(ivsissvsiiiv)`: a message comes in. */
typedef struct ims_poc_incoming_msg_s {
    int32_t value_1;                             /**< defined by the service */
    const ims_poc_peer_info_s *peer_1;           /**< a party, or NULL */
    const char *text_1;                          /**< defined by the service */
    int32_t value_2;                             /**< defined by the service */
    const char *text_2;                          /**< defined by the service */
    const char *text_3;                          /**< defined by the service */
    const ims_poc_route_header_s *route_headers; /**< the intermediate route header, or NULL */
    const char *text_4;                          /**< defined by the service */
    int32_t value_3;                             /**< defined by the service */
    int32_t value_4;                             /**< defined by the service */
    int32_t value_5;                             /**< defined by the service */
    const ims_poc_peer_info_s *peer_2;           /**< a party, or NULL */
} ims_poc_incoming_msg_s;

/** #IMS_NOTI_POC_MSG_NOTIFICATION, `(ivsiiv)`: a notice about a message that was sent. */
typedef struct ims_poc_msg_event_s {
    int32_t value_1;                   /**< defined by the service */
    const ims_poc_peer_info_s *peer_1; /**< a party, or NULL */
    const char *text_1;                /**< defined by the service */
    int32_t value_2;                   /**< defined by the service */
    int32_t value_3;                   /**< defined by the service */
    const ims_poc_peer_info_s *peer_2; /**< a party, or NULL */
} ims_poc_msg_event_s;

/** #IMS_NOTI_POC_INCOMING_FILE_TRANSFER, `(ivviv)`: a file is offered. */
typedef struct ims_poc_incoming_file_s {
    int32_t value_1;                             /**< defined by the service */
    const ims_poc_peer_info_s *peer_1;           /**< a party, or NULL */
    const ims_poc_file_attributes_s *attributes; /**< the file, or NULL */
    int32_t value_2;                             /**< defined by the service */
    const ims_poc_peer_info_s *peer_2;           /**< a party, or NULL */
} ims_poc_incoming_file_s;

/** #IMS_NOTI_POC_FILE_TRANSFER_PROGRESS, `(iiii)`: how far a file transfer is. */
typedef struct ims_poc_file_progress_s {
    int32_t value_1; /**< defined by the service */
    int32_t value_2; /**< defined by the service */
    int32_t value_3; /**< defined by the service */
    int32_t value_4; /**< defined by the service */
} ims_poc_file_progress_s;

/** #IMS_NOTI_POC_FILE_TRANSFER_TERMINATED, `(iii)`: a file transfer is over. */
typedef struct ims_poc_file_terminated_s {
    int32_t value_1; /**< defined by the service */
    int32_t value_2; /**< defined by the service */
    int32_t value_3; /**< defined by the service */
} ims_poc_file_terminated_s;

/** @} */

/**
 * @defgroup ims_poc_requests Requests
 * @brief Calls and the floor, recordings, messages and files.
 *
 * What all requests share is said in @ref ims_requests and @ref ims_errors. Where nothing else is
 * said here, what is sent is the argument, or the record's fields in their order; the reply is
 * `(i)`, the result, and the callback's data is NULL. What a callback's data is made of is what
 * comes in the reply after the result; it is there whatever the result.
 *
 * Users go as an `aa{sv}`: of a list that is longer than its count the first ones, a shorter one as
 * it is. A count below 1 is refused, whatever the list holds.
 * @{
 */

/**
 * Places a call.
 *
 * D-Bus: `PocMakeCall`, sends `(bbbsisvvi)`; expects `(ii)`: the callback's data is an `int32_t *`
 * to the second member, defined by the service.
 *
 * @param info  the call
 */
IMS_API int ims_poc_call_make_call(ims_h handle, const ims_poc_make_call_s *info,
                                   ims_response_cb callback, void *user_data);

/**
 * Starts a conference of users who are no group yet.
 *
 * D-Bus: `PocMakeAdHocConfCall`, sends `(vbvssbibivi)`: the record's fields, the users as an
 * `aa{sv}` inside a `v`; expects `(ii)`: the callback's data is an `int32_t *` to the second
 * member, defined by the service.
 *
 * @param info  the conference
 * @return #IMS_ERROR_INVALID_PARAMETER also when the count is below 1
 */
IMS_API int ims_poc_make_ad_hoc_call(ims_h handle, const ims_poc_ad_hoc_call_s *info,
                                     ims_response_cb callback, void *user_data);

/**
 * Adds users to an ad hoc conference.
 *
 * D-Bus: `PocAddUsersToAdHocConfCall`, sends `(iiiviv)`: the record's fields, the users as an
 * `aa{sv}` and the content as an `a{sv}`, each inside a `v`.
 *
 * @param info  the users
 * @return #IMS_ERROR_INVALID_PARAMETER also when the count is below 1
 */
IMS_API int ims_poc_add_users_to_ad_hoc_call(ims_h handle, const ims_poc_users_s *info,
                                             ims_response_cb callback, void *user_data);

/**
 * Removes users from an ad hoc conference.
 *
 * D-Bus: `PocRemoveUsersFromAdHocConfCall`, sends `(iiiviv)`: the record's fields, the users as an
 * `aa{sv}` and the content as an `a{sv}`, each inside a `v`.
 *
 * @param info  the users
 * @return #IMS_ERROR_INVALID_PARAMETER also when the count is below 1
 */
IMS_API int ims_poc_remove_users_from_ad_hoc_call(ims_h handle, const ims_poc_users_s *info,
                                                  ims_response_cb callback, void *user_data);

/**
 * Makes a call a crisis call.
 *
 * D-Bus: `PocCallConvertToCrisisCall`, sends `(i)`.
 *
 * @param value  defined by the service; read during the call only
 */
IMS_API int ims_poc_call_convert_normal_call_to_crisis_call(ims_h handle, const int32_t *value,
                                                            ims_response_cb callback,
                                                            void *user_data);

/**
 * Answers an incoming call.
 *
 * D-Bus: `PocAnswerCall`, sends `(bbiivv)`.
 *
 * @param info  the call and its media
 */
IMS_API int ims_poc_call_answer_call(ims_h handle, const ims_poc_call_media_s *info,
                                     ims_response_cb callback, void *user_data);

/**
 * Rejects an incoming call.
 *
 * D-Bus: `PocRejectCall`, sends `(ii)`.
 *
 * @param info  defined by the service
 */
IMS_API int ims_poc_call_reject_call(ims_h handle, const ims_poc_value_pair_s *info,
                                     ims_response_cb callback, void *user_data);

/**
 * Ends a call.
 *
 * D-Bus: `PocEndCall`, sends `(ii)`.
 *
 * @param info  defined by the service
 */
IMS_API int ims_poc_call_end_call(ims_h handle, const ims_poc_value_pair_s *info,
                                  ims_response_cb callback, void *user_data);

/**
 * Requests the floor: the right to talk.
 *
 * What becomes of the request arrives as an #ims_poc_floor_event_s.
 *
 * D-Bus: `PocRequestFloor`, sends `(iviis)`.
 *
 * @param info  the session and the request
 */
IMS_API int ims_poc_call_request_floor(ims_h handle, const ims_poc_floor_s *info,
                                       ims_response_cb callback, void *user_data);

/**
 * Releases the floor.
 *
 * D-Bus: `PocReleaseFloor`, sends `(iv)`: the session and the set.
 *
 * @param info  the session and its set; the other fields are not looked at
 */
IMS_API int ims_poc_call_release_floor(ims_h handle, const ims_poc_floor_s *info,
                                       ims_response_cb callback, void *user_data);

/**
 * Asks who has the floor.
 *
 * A count above #IMS_POC_FLOOR_QUERY_CAPACITY is refused, and so is one so far below 0 that the
 * request would be larger than 16 MiB.
 *
 * The callback's data is the first #ims_poc_floor_status_s, NULL when there is none, whatever the
 * result.
 *
 * D-Bus: `PocRequestFloorStatus`, sends `(v)`: the values as an `ai`; expects `(iaa{sv})`: the
 * result and one dictionary a session, of `session_id`, `status`, `participant_count` and
 * `floor_taken_uri`.
 *
 * @param query  what to ask for
 * @return #IMS_ERROR_INVALID_PARAMETER also for a count out of range
 */
IMS_API int ims_poc_call_request_floor_status(ims_h handle, const ims_poc_floor_query_s *query,
                                              ims_response_cb callback, void *user_data);

/**
 * Asks for other media in a call.
 *
 * D-Bus: `PocModifyCall`, sends `(bbiivv)`.
 *
 * @param info  the call and its media
 */
IMS_API int ims_poc_modify_call(ims_h handle, const ims_poc_call_media_s *info,
                                ims_response_cb callback, void *user_data);

/**
 * Accepts the other media that a party asked for.
 *
 * D-Bus: `PocAcceptModifyCall`, sends `(bbiivv)`.
 *
 * @param info  the call and its media
 */
IMS_API int ims_poc_accept_call_modify(ims_h handle, const ims_poc_call_media_s *info,
                                       ims_response_cb callback, void *user_data);

/**
 * Rejects the other media that a party asked for.
 *
 * D-Bus: `PocRejectModifyCall`, sends `(i)`.
 *
 * @param value  defined by the service
 */
IMS_API int ims_poc_reject_call_modify(ims_h handle, int32_t value, ims_response_cb callback,
                                       void *user_data);

/**
 * Selects a channel.
 *
 * D-Bus: `PocSetChannel`, sends `(ii)`.
 *
 * @param info  defined by the service
 */
IMS_API int ims_poc_set_channel(ims_h handle, const ims_poc_value_pair_s *info,
                                ims_response_cb callback, void *user_data);

/**
 * Starts to record a call.
 *
 * The callback's data is an #ims_poc_recording_info_s, whatever the result.
 *
 * D-Bus: `PocStartCallRecording`, sends `(iiis)`; expects `(ia{sv})`: the result and a dictionary
 * of `session_id`, `record_state`, `record_error` and `record_file_path`.
 *
 * @param info  what to record
 */
IMS_API int ims_poc_start_call_recording(ims_h handle, const ims_poc_record_request_s *info,
                                         ims_response_cb callback, void *user_data);

/**
 * Pauses a recording.
 *
 * D-Bus: `PocPauseCallRecording`, sends `(i)`.
 *
 * @param value  defined by the service
 */
IMS_API int ims_poc_pause_call_recording(ims_h handle, int32_t value, ims_response_cb callback,
                                         void *user_data);

/**
 * Resumes a paused recording.
 *
 * D-Bus: `PocResumeCallRecording`, sends `(i)`.
 *
 * @param value  defined by the service
 */
IMS_API int ims_poc_resume_call_recording(ims_h handle, int32_t value, ims_response_cb callback,
                                          void *user_data);

/**
 * Ends a recording.
 *
 * D-Bus: `PocStopCallRecording`, sends `(i)`.
 *
 * @param value  defined by the service
 */
IMS_API int ims_poc_stop_call_recording(ims_h handle, int32_t value, ims_response_cb callback,
                                        void *user_data);

/**
 * Ends a recording of which nothing is to stay.
 *
 * D-Bus: `PocCancelCallRecording`, sends `(i)`.
 *
 * @param value  defined by the service
 */
IMS_API int ims_poc_cancel_call_recording(ims_h handle, int32_t value, ims_response_cb callback,
                                          void *user_data);

/**
 * Sends a message.
 *
 * D-Bus: `PocSendMsg`, sends `(isvissivi)`: the record's fields, the targets as an `aa{sv}` and the
 * originator as an `a{sv}`, each inside a `v`; expects `(iiii)`; the callback's data is an
 * #ims_poc_msg_result_s.
 *
 * @param message  the message
 */
IMS_API int ims_poc_send_msg(ims_h handle, const ims_poc_message_s *message,
                             ims_response_cb callback, void *user_data);

/**
 * Tells that a received message was delivered or read.
 *
 * D-Bus: `PocSendReceivedMsgNoti`, sends `(isvvsi)`: the record's fields, the originator as an
 * `a{sv}` and the parties as an `aa{sv}`, each inside a `v`; expects `(iiii)`; the callback's data
 * is an #ims_poc_msg_result_s.
 *
 * @param notification  the notice
 */
IMS_API int ims_poc_send_received_msg_notification(ims_h handle,
                                                   const ims_poc_msg_notification_s *notification,
                                                   ims_response_cb callback, void *user_data);

/**
 * Offers a file.
 *
 * D-Bus: `PocTransferFile`, sends `(ivvv)`: the record's fields, the targets as an `aa{sv}`, the
 * attributes and the originator as an `a{sv}`, each inside a `v`; expects `(iii)`; the callback's
 * data is an #ims_poc_transfer_result_s.
 *
 * @param transfer  the file
 */
IMS_API int ims_poc_transfer_file(ims_h handle, const ims_poc_file_transfer_s *transfer,
                                  ims_response_cb callback, void *user_data);

/**
 * Accepts a file that is offered.
 *
 * D-Bus: `PocAcceptFileTransfer`, sends `(is)`; expects `(iii)`; the callback's data is an
 * #ims_poc_transfer_result_s.
 *
 * @param answer  the transfer
 */
IMS_API int ims_poc_accept_file_transfer(ims_h handle, const ims_poc_transfer_answer_s *answer,
                                         ims_response_cb callback, void *user_data);

/**
 * Rejects a file that is offered.
 *
 * D-Bus: `PocARejectFileTransfer`, spelled so, sends `(is)`; expects `(iii)`; the callback's data
 * is an #ims_poc_transfer_result_s.
 *
 * @param answer  the transfer
 */
IMS_API int ims_poc_reject_file_transfer(ims_h handle, const ims_poc_transfer_answer_s *answer,
                                         ims_response_cb callback, void *user_data);

/**
 * Ends a file transfer before its time.
 *
 * D-Bus: `PocCancelFileTransfer`, sends `(i)`; expects `(iii)`; the callback's data is an
 * #ims_poc_transfer_result_s.
 *
 * @param value  defined by the service
 */
IMS_API int ims_poc_cancel_file_transfer(ims_h handle, int32_t value, ims_response_cb callback,
                                         void *user_data);

/**
 * Keeps a session alive.
 *
 * D-Bus: `PocSendKeepAlive`, sends `(i)`.
 *
 * @param value  defined by the service
 */
IMS_API int ims_poc_send_keep_alive(ims_h handle, int32_t value, ims_response_cb callback,
                                    void *user_data);

/** @} */

/** @} */

#ifdef __cplusplus
}
#endif

#endif
