/*
 * SPDX-License-Identifier: Apache-2.0
 */
#ifndef KELVO_IMS_REG_H
#define KELVO_IMS_REG_H

/**
 * @file ims_reg.h
 * @brief Registration with the IMS network.
 *
 * All methods and signals are on the D-Bus interface `org.kelvo.ims.Registration`. The service
 * defines what the values mean; the library passes them through unchanged.
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
 * @brief Reads the registration.
 *
 * Blocks for at most 60 s.
 *
 * D-Bus: `GetRegistrationInfo`, sends no parameters; expects `(buuiiii)`: the record's fields and,
 * last, the result.
 *
 * @param      handle  the handle
 * @param[out] info    receives the registration. Also written when the service reports a failure;
 *                     otherwise untouched on failure
 * @return see @ref requests
 */
IMS_API int ims_get_registration_info(ims_h handle, ims_registration_info_s *info);

/**
 * @brief Asks the service to enter flight mode.
 *
 * There is no argument that says on or off: the request itself means on.
 * ims_register_application() registers again.
 *
 * D-Bus: `EnableFlightMode`, sends no parameters; expects `(i)`: the result.
 *
 * @param handle     the handle. Not checked: must not be NULL
 * @param callback   receives the outcome with NULL as data, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_enable_flight_mode(ims_h handle, ims_response_cb callback, void *user_data);

/**
 * @brief Registers the application with the service again.
 *
 * D-Bus: `RegisterApplication`, sends no parameters; expects `(ii)`: the result and the application
 * id. The handle goes on using the id that ims_init() got.
 *
 * @param handle     the handle
 * @param callback   receives the outcome with an `int32_t *` to the application id as data, or NULL
 * @param user_data  handed to the callback
 * @return see @ref requests
 */
IMS_API int ims_register_application(ims_h handle, ims_response_cb callback, void *user_data);

#ifdef __cplusplus
}
#endif

#endif
