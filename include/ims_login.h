/*
 * SPDX-License-Identifier: Apache-2.0
 */
#ifndef KELVO_IMS_LOGIN_H
#define KELVO_IMS_LOGIN_H

/**
 * @file
 * @brief Logging a user in to the IMS service.
 */

/**
 * @defgroup ims_login Login
 * @brief Logging a user in to the service and out: `org.kelvo.ims.Login`.
 *
 * @section ims_login_life The life of a login
 *
 * ims_login() asks for it, and its callback says whether the service has taken it up. The login
 * then goes from state to state; #IMS_NOTI_LOGIN_STATE tells of each, ims_get_login_state() of the
 * present one. ims_logout() ends it, and the service may. The texts that name and prove the user,
 * and what the numbers of a state mean, are the service's, see @ref ims_values.
 *
 * @code{.c}
 * #include <ims.h>
 * #include <stdio.h>
 *
 * void on_state(ims_h handle, int noti_id, void *event, void *user_data) {
 *     const ims_login_state_s *state = event;
 *     printf("state %d\n", (int)state->value_1);
 * }
 *
 * int log_in(ims_h handle, const char *user, const char *password) {
 *     int error = ims_set_notification_cb(handle, IMS_NOTI_LOGIN_STATE, on_state, NULL);
 *     return error == IMS_ERROR_NONE ? ims_login(handle, user, password, 0, NULL, NULL) : error;
 * }
 * @endcode
 *
 * What all functions share is said in @ref ims_requests and @ref ims_errors. The callbacks' data is
 * NULL, and the replies are `(i)`, the result, where nothing else is said.
 *
 * @{
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
 * Logs a user in.
 *
 * D-Bus: `Login`, sends `(ssii)`: both texts, the value and, last, the application id.
 *
 * @param text_1   defined by the service; must not be NULL, for which the library sends an empty
 *                 text rather than crash
 * @param text_2   as text_1
 * @param value_1  defined by the service
 */
IMS_API int ims_login(ims_h handle, const char *text_1, const char *text_2, int32_t value_1,
                      ims_response_cb callback, void *user_data);

/**
 * Logs the user out.
 *
 * D-Bus: `Logout`, sends `(i)`: the application id.
 */
IMS_API int ims_logout(ims_h handle, ims_response_cb callback, void *user_data);

/**
 * Reads the login state.
 *
 * D-Bus: `GetLoginState`, sends `(ii)`: the value and, second, the application id; expects
 * `(iiui)`: the result and the record's fields.
 *
 * @param      value_1  defined by the service
 * @param[out] state    receives the state. Also written when the service reports a failure;
 *                      otherwise untouched on failure
 */
IMS_API int ims_get_login_state(ims_h handle, int32_t value_1, ims_login_state_s *state);

/** @} */

#ifdef __cplusplus
}
#endif

#endif
