/*
 * SPDX-License-Identifier: Apache-2.0
 *
 * What a device's platform provides and the library only calls.
 */
#ifndef KELVO_IMS_PLATFORM_H
#define KELVO_IMS_PLATFORM_H

#include <stdbool.h>

#ifdef __cplusplus
extern "C" {
#endif

/* The key under which the platform says whether the device has the IMS feature. */
#define IMS_PLATFORM_FEATURE_KEY "kelvo.org/feature/network.telephony.ims"

/* The logger's system buffer, and the priorities that the library uses. */
#define IMS_PLATFORM_LOG_SYSTEM 2
#define IMS_PLATFORM_LOG_WARNING 5
#define IMS_PLATFORM_LOG_ERROR 6

#pragma GCC visibility push(default)

/* Stores whether the feature is there; a result other than 0 is a failure. */
int system_info_get_custom_bool(const char *key, bool *value);

/* Writes one line to a log buffer. */
int __dlog_print(int log_id, int priority, const char *tag, const char *format, ...)
    __attribute__((format(printf, 4, 5)));

#pragma GCC visibility pop

#ifdef __cplusplus
}
#endif

#endif
