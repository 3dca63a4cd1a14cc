/*
 * SPDX-License-Identifier: Apache-2.0
 */
#ifndef KELVO_IMS_LOGIN_H
#define KELVO_IMS_LOGIN_H

/**
 * @file ims_login.h
 * @brief Logging a user in to the IMS service.
 *
 * All methods and signals are on the D-Bus interface `org.kelvo.ims.Login`. The service defines
 * what the values mean; the library passes them through unchanged.
 */

#include "ims_types.h"

#ifdef __cplusplus
extern "C" {
#endif

/** The login state: the answer to a query, and the event of #IMS_NOTI_LOGIN_STATE. */
typedef struct ims_login_state_s {
    int32_t value_1;  /**< defined by the service */
    uint32_t value_2; /**< defined by the service */
    int32_t value_3;  /**< defined by the service */
} ims_login_state_s;

/**
 * @brief Logs a user in.
 *
 * D-Bus: `Login`, sends `(ssii)`: both texts, the value and, last, the application id; expects
 * `(i)`: the result.
 *
 * @param handle     the handle
 * @param text_1     defined by the service; must not be NULL; the library sends an empty text
 * rather than crash
 * @param text_2     defined by the service; must not be NULL; the library sends an empty text
 * rather than crash
 * @param value_1    defined by the service
 * @param callback   receives the outcome with NULL as data, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_login(ims_h handle, const char *text_1, const char *text_2, int32_t value_1,
                      ims_response_cb callback, void *user_data);

/**
 * @brief Logs the user out.
 *
 * D-Bus: `Logout`, sends `(i)`: the application id; expects `(i)`: the result.
 *
 * @param handle     the handle
 * @param callback   receives the outcome with NULL as data, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_logout(ims_h handle, ims_response_cb callback, void *user_data);

/**
 * @brief Reads the login state.
 *
 * Blocks for at most 60 s.
 *
 * D-Bus: `GetLoginState`, sends `(ii)`: the value and, second, the application id; expects
 * `(iiui)`: the result and the record's fields.
 *
 * @param      handle   the handle
 * @param      value_1  defined by the service
 * @param[out] state    receives the state. Also written when the service reports a failure;
 *                      otherwise untouched on failure
 * @return see @ref requests
 */
IMS_API int ims_get_login_state(ims_h handle, int32_t value_1, ims_login_state_s *state);

#ifdef __cplusplus
}
#endif

#endif
