/*
 * SPDX-License-Identifier: Apache-2.0
 */
#ifndef KELVO_IMS_PLATFORM_H
#define KELVO_IMS_PLATFORM_H

/**
 * @file
 * @brief What a device's platform provides and the library only calls.
 */

/**
 * @defgroup ims_platform The platform
 * @brief The two functions that the library needs of a device; applications call neither.
 *
 * A device's own libraries provide them. On a plain Linux `libkelvo-ims-host.so` does, in which the
 * feature is there unless a file says otherwise, and log lines go to standard error or the journal.
 * Both are called in the thread of the application that calls the library.
 *
 * @code{.c}
 * #include <platform.h>
 *
 * // a platform of a test's own: the feature is there, and nothing is logged
 * int system_info_get_custom_bool(const char *key, bool *value) {
 *     *value = true;
 *     return 0;
 * }
 *
 * int __dlog_print(int log_id, int priority, const char *tag, const char *format, ...) {
 *     return 0;
 * }
 * @endcode
 *
 * @{
 */

#include <stdbool.h>

#ifdef __cplusplus
extern "C" {
#endif

/** The key under which the platform says whether the device has the IMS feature. */
#define IMS_PLATFORM_FEATURE_KEY "kelvo.org/feature/network.telephony.ims"

/** The logger's system buffer. */
#define IMS_PLATFORM_LOG_SYSTEM 2
/** The logger's priority of a warning. */
#define IMS_PLATFORM_LOG_WARNING 5
/** The logger's priority of an error, the highest that the library uses. */
#define IMS_PLATFORM_LOG_ERROR 6

#pragma GCC visibility push(default)

/**
 * Says whether the device has a feature. Asked once by every function of the library that may fail.
 *
 * @param      key    the feature: #IMS_PLATFORM_FEATURE_KEY. Valid during the call
 * @param[out] value  receives whether it is there
 * @return 0; every other value is a failure, and the value is not looked at
 */
int system_info_get_custom_bool(const char *key, bool *value);

/**
 * Writes one line to a log buffer.
 *
 * @param log_id    the buffer: #IMS_PLATFORM_LOG_SYSTEM
 * @param priority  #IMS_PLATFORM_LOG_WARNING or #IMS_PLATFORM_LOG_ERROR
 * @param tag       whose line it is. Valid during the call, as all texts
 * @param format    the line as for printf(), with what it names behind it
 * @return not looked at
 */
/* NOLINTNEXTLINE(bugprone-reserved-identifier): the name is the device's. */
int __dlog_print(int log_id, int priority, const char *tag, const char *format, ...)
    __attribute__((format(printf, 4, 5)));

#pragma GCC visibility pop

/** @} */

#ifdef __cplusplus
}
#endif

#endif
