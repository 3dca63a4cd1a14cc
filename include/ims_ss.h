/*
 * SPDX-License-Identifier: Apache-2.0
 */
#ifndef KELVO_IMS_SS_H
#define KELVO_IMS_SS_H

/**
 * @file ims_ss.h
 * @brief Supplementary services: call waiting, forwarding and barring.
 *
 * All methods are on the D-Bus interface `org.kelvo.ims.Ss`. The service defines what classes,
 * statuses and types mean; the library passes them through unchanged.
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
 * @brief Sets call waiting.
 *
 * D-Bus: `SetCallWaiting`, sends `(iii)`: the application id and the record's fields; expects
 * `(i)`: the result.
 *
 * @param handle     the handle. Not checked: must not be NULL
 * @param info       what to set. Not checked: must not be NULL
 * @param callback   receives the outcome with NULL as data, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_ss_set_call_waiting(ims_h handle, const ims_ss_cw_info_s *info,
                                    ims_response_cb callback, void *user_data);

/**
 * @brief Asks what is set for call waiting.
 *
 * D-Bus: `GetCallWaiting`, sends `(ii)`: the application id and the class; expects `(iu\@aa{sv})`:
 * the result, the count and one dictionary an entry.
 *
 * @param handle     the handle. Not checked: must not be NULL
 * @param ss_class   the service class
 * @param callback   receives the outcome with an #ims_ss_status_list_s as data, NULL when the
 *                   result is not 0; or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_ss_get_call_waiting(ims_h handle, int32_t ss_class, ims_response_cb callback,
                                    void *user_data);

/**
 * @brief Sets call forwarding.
 *
 * D-Bus: `SetCallForwarding`, sends `(iiiiiiis)`: the application id and the record's fields;
 * expects `(i)`: the result.
 *
 * @param handle     the handle
 * @param info       what to set
 * @param callback   receives the outcome with NULL as data, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_ss_set_call_forwarding(ims_h handle, const ims_ss_cf_info_s *info,
                                       ims_response_cb callback, void *user_data);

/**
 * @brief Asks what is set for call forwarding.
 *
 * D-Bus: `GetCallForwarding`, sends `(iii)`: the application id and the record's fields; expects
 * `(iu\@aa{sv})`: the result, the count and one dictionary an entry.
 *
 * @param handle     the handle
 * @param query      what to ask for
 * @param callback   receives the outcome with an #ims_ss_status_list_s as data, NULL when the
 *                   result is not 0; or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_ss_get_call_forwarding(ims_h handle, const ims_ss_query_s *query,
                                       ims_response_cb callback, void *user_data);

/**
 * @brief Sets call barring.
 *
 * D-Bus: `SetCallBarring`, sends `(iiiis)`: the application id and the record's fields; expects
 * `(i)`: the result.
 *
 * @param handle     the handle
 * @param info       what to set, with the password
 * @param callback   receives the outcome with NULL as data, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_ss_set_call_barring(ims_h handle, const ims_ss_cb_set_s *info,
                                    ims_response_cb callback, void *user_data);

/**
 * @brief Asks what is set for call barring.
 *
 * D-Bus: `GetCallBarring`, sends `(iii)`: the application id and the record's fields; expects
 * `(iu\@aa{sv})`: the result, the count and one dictionary an entry.
 *
 * @param handle     the handle
 * @param query      what to ask for
 * @param callback   receives the outcome with an #ims_ss_status_list_s as data, NULL when the
 *                   result is not 0; or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_ss_get_call_barring(ims_h handle, const ims_ss_query_s *query,
                                    ims_response_cb callback, void *user_data);

#ifdef __cplusplus
}
#endif

#endif
