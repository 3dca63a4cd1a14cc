/*
 * SPDX-License-Identifier: Apache-2.0
 */
#ifndef KELVO_IMS_SS_H
#define KELVO_IMS_SS_H

/**
 * @file
 * @brief Supplementary services: call waiting, forwarding and barring.
 */

/**
 * @defgroup ims_ss Supplementary services
 * @brief Call waiting, call forwarding and call barring: `org.kelvo.ims.Ss`.
 *
 * @section ims_ss_life The life of a setting
 *
 * What is set is kept by the network for the subscription, and acts on its calls whether or not an
 * application runs. A set request changes it; its callback says whether the network has. A get
 * request asks for it: its callback receives a list of what is set for which service class. There
 * are no events.
 *
 * @code{.c}
 * #include <ims.h>
 * #include <stdio.h>
 *
 * void on_forwarding(ims_h handle, int result, void *data, void *user_data) {
 *     const ims_ss_status_list_s *list = data; // gone after this function
 *     for (uint32_t i = 0; list != NULL && i < list->count; ++i) {
 *         const ims_ss_cf_info_s *entry = &list->entries.call_forwarding[i];
 *         printf("class %d: status %d, to %s\n", (int)entry->ss_class, (int)entry->ss_status,
 *                entry->cf_uri != NULL ? entry->cf_uri : "nobody");
 *     }
 * }
 *
 * int ask(ims_h handle, int32_t ss_class, int32_t condition) {
 *     const ims_ss_query_s query = {.ss_class = ss_class, .type = condition};
 *     return ims_ss_get_call_forwarding(handle, &query, on_forwarding, NULL);
 * }
 * @endcode
 *
 * What all requests share is said in @ref ims_requests and @ref ims_errors; classes, statuses and
 * types are the service's, see @ref ims_values. Request records are the caller's and read during
 * the call only.
 *
 * Sent are the application id and then the argument, or the record's fields in their order. A set
 * request's reply is `(i)`, the result, and its callback's data is NULL. That of a get request is
 * `(iuaa{sv})`: the result, the count and one dictionary an entry, of the fields' names; its
 * callback's data is an #ims_ss_status_list_s, NULL when the result is not 0.
 *
 * @{
 */

#include "ims_types.h"

#ifdef __cplusplus
extern "C" {
#endif

/** Call waiting: what to set, and one entry of what is set. */
typedef struct ims_ss_cw_info_s {
    int32_t ss_class;  /**< the service class */
    int32_t ss_status; /**< the status */
} ims_ss_cw_info_s;

/** Call forwarding: what to set, and one entry of what is set. */
typedef struct ims_ss_cf_info_s {
    int32_t ss_class;      /**< the service class */
    int32_t ss_status;     /**< the status */
    int32_t cf_type;       /**< the condition */
    int32_t no_reply_time; /**< seconds before forwarding when nobody answers */
    int32_t cf_uri_length; /**< the target's length */
    int32_t cf_uri_type;   /**< the target's kind */
    /** The target. To be set: must not be NULL; the library sends an empty text rather than crash.
     * In an entry: gone after the callback, NULL when the service left it out. */
    const char *cf_uri;
} ims_ss_cf_info_s;

/** Call barring: one entry of what is set. */
typedef struct ims_ss_cb_info_s {
    int32_t ss_class;  /**< the service class */
    int32_t ss_status; /**< the status */
    int32_t cb_type;   /**< which calls */
} ims_ss_cb_info_s;

/** Call barring to set. */
typedef struct ims_ss_cb_set_s {
    int32_t ss_class;        /**< the service class */
    int32_t ss_status;       /**< the status */
    int32_t cb_type;         /**< which calls */
    const char *cb_password; /**< the password; must not be NULL; the library sends an empty text
                                  rather than crash */
} ims_ss_cb_set_s;

/** What to ask for. */
typedef struct ims_ss_query_s {
    int32_t ss_class; /**< the service class */
    int32_t type;     /**< the forwarding condition, or which calls are barred */
} ims_ss_query_s;

/**
 * What is set, as the callback of a get request receives it: a list of the requested service's
 * entries. The list and everything in it are gone after the callback. A field that the service left
 * out of an entry is 0.
 */
typedef struct ims_ss_status_list_s {
    uint32_t count; /**< how many entries; 0 also when the service's count was wrong */
    union {
        const ims_ss_cw_info_s *call_waiting;    /**< from ims_ss_get_call_waiting() */
        const ims_ss_cf_info_s *call_forwarding; /**< from ims_ss_get_call_forwarding() */
        const ims_ss_cb_info_s *call_barring;    /**< from ims_ss_get_call_barring() */
    } entries;                                   /**< count entries; NULL when there are none */
} ims_ss_status_list_s;

/**
 * Sets call waiting.
 *
 * D-Bus: `SetCallWaiting`, sends `(iii)`.
 *
 * @param handle  not checked: must not be NULL
 * @param info    what to set. Not checked: must not be NULL
 */
IMS_API int ims_ss_set_call_waiting(ims_h handle, const ims_ss_cw_info_s *info,
                                    ims_response_cb callback, void *user_data);

/**
 * Asks what is set for call waiting.
 *
 * D-Bus: `GetCallWaiting`, sends `(ii)`.
 *
 * @param handle    not checked: must not be NULL
 * @param ss_class  the service class
 */
IMS_API int ims_ss_get_call_waiting(ims_h handle, int32_t ss_class, ims_response_cb callback,
                                    void *user_data);

/**
 * Sets call forwarding.
 *
 * D-Bus: `SetCallForwarding`, sends `(iiiiiiis)`.
 *
 * @param info  what to set
 */
IMS_API int ims_ss_set_call_forwarding(ims_h handle, const ims_ss_cf_info_s *info,
                                       ims_response_cb callback, void *user_data);

/**
 * Asks what is set for call forwarding.
 *
 * D-Bus: `GetCallForwarding`, sends `(iii)`.
 *
 * @param query  what to ask for
 */
IMS_API int ims_ss_get_call_forwarding(ims_h handle, const ims_ss_query_s *query,
                                       ims_response_cb callback, void *user_data);

/**
 * Sets call barring.
 *
 * D-Bus: `SetCallBarring`, sends `(iiiis)`.
 *
 * @param info  what to set, with the password
 */
IMS_API int ims_ss_set_call_barring(ims_h handle, const ims_ss_cb_set_s *info,
                                    ims_response_cb callback, void *user_data);

/**
 * Asks what is set for call barring.
 *
 * D-Bus: `GetCallBarring`, sends `(iii)`.
 *
 * @param query  what to ask for
 */
IMS_API int ims_ss_get_call_barring(ims_h handle, const ims_ss_query_s *query,
                                    ims_response_cb callback, void *user_data);

/** @} */

#ifdef __cplusplus
}
#endif

#endif
