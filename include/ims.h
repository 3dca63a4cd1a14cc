/*
 * SPDX-License-Identifier: Apache-2.0
 */
#ifndef KELVO_IMS_H
#define KELVO_IMS_H

/**
 * @file
 * @brief The whole interface: the handle and its events here, and every module.
 */

/**
 * @mainpage kelvo-ims
 *
 * The client side of a device's IMS service, which is a daemon on the system D-Bus and owns the
 * network. The library does no signalling and no media: each function is one method call, each
 * event one signal, decoded into a plain record.
 *
 * Begin with @ref ims_common and @ref ims_client; then the modules:
 *
 *  - @ref ims_reg, @ref ims_login
 *  - @ref ims_call, @ref ims_vt
 *  - @ref ims_sms, @ref ims_ss
 *  - @ref ims_settings
 *  - @ref ims_poc, @ref ims_xdm
 *
 * @ref ims_platform is what the library needs of a device.
 */

/**
 * @defgroup ims_client The client
 * @brief Handles, and the events that are asked for on them.
 *
 * @section ims_client_life The life of a handle
 *
 * ims_init() connects and registers the process for one subscription slot; the handle that it makes
 * goes into every other function. Subscribe to events with ims_set_notification_cb() before making
 * the requests that cause them. Several handles may exist at once, also for the same slot; each
 * registers separately and has its own events. ims_deinit() ends all this; the service is not told.
 *
 * @code{.c}
 * #include <glib.h>
 * #include <ims.h>
 * #include <stdio.h>
 *
 * static void on_status(ims_h handle, int noti_id, void *event, void *user_data) {
 *     const ims_registration_info_s *info = event; // gone after this function
 *     printf("%s\n", info->registered ? "registered" : "not registered");
 * }
 *
 * static void on_answer(ims_h handle, int result, void *data, void *user_data) {
 *     printf("result %d\n", result);
 *     g_main_loop_quit(user_data);
 * }
 *
 * int main(void) {
 *     ims_h handle;
 *     if (ims_init(0, &handle) != IMS_ERROR_NONE)
 *         return 1;
 *     GMainLoop *loop = g_main_loop_new(NULL, FALSE);
 *     ims_set_notification_cb(handle, IMS_NOTI_REG_REGISTRATION_STATUS, on_status, NULL);
 *     if (ims_register_application(handle, on_answer, loop) == IMS_ERROR_NONE)
 *         g_main_loop_run(loop); // answers and events are delivered here
 *     ims_deinit(handle);
 *     g_main_loop_unref(loop);
 *     return 0;
 * }
 * @endcode
 *
 * Beyond what is said with the functions they return what @ref ims_errors says.
 *
 * @{
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
 * Connects to the IMS service for one subscription slot.
 *
 * Connects to the system bus and registers the calling process with the service. Blocks for at most
 * 6 s. The connection is the process's shared one: when the bus closes it, GLib ends the process
 * with SIGTERM, unless g_dbus_connection_set_exit_on_close() says otherwise.
 *
 * D-Bus: `org.kelvo.ims.Registration.RegisterApplication`, sends `(is)`: the slot and the program's
 * invocation name; expects `(ii)`: the result and the application id.
 *
 * @param      slot    the subscription slot. Not checked: the service knows which slots exist. A
 *                     negative one makes GLib log a critical message and always fails
 * @param[out] handle  receives the handle, to be released with ims_deinit(). Untouched on failure
 * @return as a query
 */
IMS_API int ims_init(int slot, ims_h *handle);

/**
 * Releases a handle and ends all its events.
 *
 * The service is not told, and requests that are still pending are not cancelled: they complete
 * later, with a handle value that is no longer valid. Wait for them first when their callbacks use
 * the handle. May be called inside a callback.
 *
 * @param handle  the handle; not to be used afterwards
 * @return with any code but #IMS_ERROR_NONE the handle is not released
 */
IMS_API int ims_deinit(ims_h handle);

/**
 * Asks for one kind of event.
 *
 * Subscribes to the D-Bus signal behind the id, sent by the service from the handle's object. At
 * most one callback per id and handle: a second one is refused and the first stays in force. Events
 * are delivered in the main context that is thread-default now, in the order in which the service
 * sent them. An event whose signature is not the one documented is dropped.
 *
 * @param handle     the handle
 * @param noti_id    one of #ims_noti_id_e
 * @param callback   called for each event
 * @param user_data  handed to the callback; must stay valid until the callback is unset or the
 *                   handle is released
 * @return #IMS_ERROR_INVALID_PARAMETER also when the callback is NULL, the id is unknown or already
 *         has a callback
 */
IMS_API int ims_set_notification_cb(ims_h handle, int noti_id, ims_notification_cb callback,
                                    void *user_data);

/**
 * Ends one kind of event. The callback is not called any more once this has returned.
 *
 * May be called inside a notification callback, also for the event that is being delivered.
 *
 * @param handle   the handle
 * @param noti_id  one of #ims_noti_id_e
 * @return #IMS_ERROR_INVALID_PARAMETER also when the id is unknown or has no callback
 */
IMS_API int ims_unset_notification_cb(ims_h handle, int noti_id);

/** @} */

#ifdef __cplusplus
}
#endif

#endif
