/*
 * SPDX-License-Identifier: Apache-2.0
 */
#ifndef KELVO_IMS_H
#define KELVO_IMS_H

/**
 * @file ims.h
 * @brief The client side of a device's IMS service: includes every module.
 */

#include "ims_types.h"

#include "ims_call.h"
#include "ims_login.h"
#include "ims_poc.h"
#include "ims_reg.h"
#include "ims_settings.h"
#include "ims_sms.h"
#include "ims_ss.h"
#include "ims_vt.h"
#include "ims_xdm.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * @brief Connects to the IMS service for one subscription slot.
 *
 * Connects to the system bus and registers the calling process with the service. Blocks for at most
 * 6 s. Several handles may exist at once, also for the same slot; each registers separately and has
 * its own notifications. The connection is the process's shared one: when the bus closes it, GLib
 * ends the process with SIGTERM, unless g_dbus_connection_set_exit_on_close() says otherwise.
 *
 * D-Bus: `org.kelvo.ims.Registration.RegisterApplication`, sends `(is)`: the slot and the program's
 * invocation name; expects `(ii)`: the result and the application id.
 *
 * @param      slot    the subscription slot. Not checked: the service knows which slots exist. A
 *                     negative one makes GLib log a critical message and always fails
 * @param[out] handle  receives the handle, to be released with ims_deinit(). Untouched on failure
 * @return #IMS_ERROR_NONE; #IMS_ERROR_NOT_SUPPORTED; #IMS_ERROR_INVALID_PARAMETER when @p handle is
 *         NULL; #IMS_ERROR_PERMISSION_DENIED when the caller is refused;
 *         #IMS_ERROR_OPERATION_FAILED when the bus or the service cannot be reached, or the service
 *         reports a failure
 */
IMS_API int ims_init(int slot, ims_h *handle);

/**
 * @brief Releases a handle.
 *
 * Ends all its notifications. The service is not told, and requests that are still pending are not
 * cancelled: they complete later, with a handle value that is no longer valid. Wait for them first
 * when their callbacks use the handle. May be called inside a callback.
 *
 * @param handle  the handle; not to be used afterwards
 * @return #IMS_ERROR_NONE; #IMS_ERROR_INVALID_PARAMETER when @p handle is NULL;
 *         #IMS_ERROR_NOT_SUPPORTED or #IMS_ERROR_OPERATION_FAILED when the feature is off or cannot
 *         be queried: the handle is then not released
 */
IMS_API int ims_deinit(ims_h handle);

/**
 * @brief Asks for one kind of event.
 *
 * Subscribes to the D-Bus signal behind @p noti_id, sent by the service from the handle's object.
 * At most one callback per id and handle: a second one is refused and the first stays in force.
 * Events are delivered in the main context that is thread-default now, in the order in which the
 * service sent them. An event whose signature is not the one documented is dropped.
 *
 * @param handle     the handle
 * @param noti_id    one of #ims_noti_id_e
 * @param callback   called for each event
 * @param user_data  handed to the callback; must stay valid until the callback is unset or the
 *                   handle is released
 * @return #IMS_ERROR_NONE; #IMS_ERROR_INVALID_PARAMETER when @p handle or @p callback is NULL, the
 *         id is unknown or already has a callback; #IMS_ERROR_NOT_SUPPORTED;
 *         #IMS_ERROR_OPERATION_FAILED
 */
IMS_API int ims_set_notification_cb(ims_h handle, int noti_id, ims_notification_cb callback,
                                    void *user_data);

/**
 * @brief Ends one kind of event. The callback is not called any more once this has returned.
 *
 * May be called inside a notification callback, also for the event that is being delivered.
 *
 * @param handle   the handle
 * @param noti_id  one of #ims_noti_id_e
 * @return #IMS_ERROR_NONE; #IMS_ERROR_INVALID_PARAMETER when @p handle is NULL, the id is unknown
 *         or has no callback; #IMS_ERROR_NOT_SUPPORTED; #IMS_ERROR_OPERATION_FAILED
 */
IMS_API int ims_unset_notification_cb(ims_h handle, int noti_id);

#ifdef __cplusplus
}
#endif

#endif
