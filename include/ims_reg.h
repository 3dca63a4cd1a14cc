/*
 * SPDX-License-Identifier: Apache-2.0
 */
#ifndef KELVO_IMS_REG_H
#define KELVO_IMS_REG_H

/**
 * @file
 * @brief Registration with the IMS network.
 */

/**
 * @defgroup ims_reg Registration
 * @brief Whether the device is registered with the network, and flight mode:
 *        `org.kelvo.ims.Registration`.
 *
 * @section ims_reg_life The life of a registration
 *
 * Two things are registered. The application registers with the service, in ims_init(). The device
 * registers with the network: by itself, as long as flight mode is off.
 * #IMS_NOTI_REG_REGISTRATION_STATUS tells of each change, ims_get_registration_info() of the
 * present. Subscribe first and ask then, and no change is missed. The registration for emergency
 * calls is another one, which the application asks for (ims_call_register_emergency_pdn()) and
 * #IMS_NOTI_REG_EMERGENCY_REGISTRATION_STATUS tells of.
 *
 * ims_enable_flight_mode() takes the device off the network; ims_register_application() is the way
 * back.
 *
 * @code{.c}
 * #include <ims.h>
 * #include <stdio.h>
 *
 * void on_status(ims_h handle, int noti_id, void *event, void *user_data) {
 *     const ims_registration_info_s *info = event;
 *     printf("%s\n", info->registered ? "registered" : "not registered");
 * }
 *
 * int follow(ims_h handle) {
 *     ims_registration_info_s now;
 *     int error =
 *         ims_set_notification_cb(handle, IMS_NOTI_REG_REGISTRATION_STATUS, on_status, NULL);
 *     if (error == IMS_ERROR_NONE)
 *         error = ims_get_registration_info(handle, &now);
 *     if (error == IMS_ERROR_NONE)
 *         on_status(handle, IMS_NOTI_REG_REGISTRATION_STATUS, &now, NULL);
 *     return error;
 * }
 * @endcode
 *
 * What all functions share is said in @ref ims_requests and @ref ims_errors; the values in the
 * records are the service's, see @ref ims_values. None of the methods takes the application id.
 *
 * @{
 */

#include "ims_types.h"

#ifdef __cplusplus
extern "C" {
#endif

/** The registration: the answer to a query, and the event of #IMS_NOTI_REG_REGISTRATION_STATUS. */
typedef struct ims_registration_info_s {
    int32_t registered; /**< boolean: whether the device is registered */
    uint32_t value_1;   /**< defined by the service */
    uint32_t value_2;   /**< defined by the service */
    int32_t value_3;    /**< defined by the service */
    int32_t value_4;    /**< defined by the service */
    int32_t value_5;    /**< defined by the service */
} ims_registration_info_s;

/** The event of #IMS_NOTI_REG_EMERGENCY_REGISTRATION_STATUS, `(bui)`. */
typedef struct ims_emergency_registration_info_s {
    int32_t registered; /**< boolean: whether the device is registered for emergency calls */
    uint32_t value_1;   /**< defined by the service */
    int32_t value_2;    /**< defined by the service */
} ims_emergency_registration_info_s;

/**
 * Reads the registration.
 *
 * D-Bus: `GetRegistrationInfo`, sends no parameters; expects `(buuiiii)`: the record's fields and,
 * last, the result.
 *
 * @param[out] info  receives the registration. Also written when the service reports a failure;
 *                   otherwise untouched on failure
 */
IMS_API int ims_get_registration_info(ims_h handle, ims_registration_info_s *info);

/**
 * Asks the service to enter flight mode.
 *
 * There is no argument that says on or off: the request itself means on. ims_register_application()
 * registers again.
 *
 * D-Bus: `EnableFlightMode`, sends no parameters; expects `(i)`: the result. The callback's data
 * is NULL.
 *
 * @param handle  not checked: must not be NULL
 */
IMS_API int ims_enable_flight_mode(ims_h handle, ims_response_cb callback, void *user_data);

/**
 * Registers the application with the service again.
 *
 * The handle goes on using the application id that ims_init() got.
 *
 * D-Bus: `RegisterApplication`, sends no parameters; expects `(ii)`: the result and the application
 * id, to which the callback's data, an `int32_t *`, points.
 */
IMS_API int ims_register_application(ims_h handle, ims_response_cb callback, void *user_data);

/** @} */

#ifdef __cplusplus
}
#endif

#endif
