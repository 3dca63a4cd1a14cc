/*
 * SPDX-License-Identifier: Apache-2.0
 *
 * Lines that tell what an application asks for and what it hears, with the time of day, so that the
 * output of several applications can be read side by side.
 */
#ifndef KELVO_IMS_EXAMPLE_TIMELINE_H
#define KELVO_IMS_EXAMPLE_TIMELINE_H

#include <glib.h>

#include <stdio.h>

/* "->" is a request, "<-" an answer or an event, "--" neither. */
G_GNUC_PRINTF(3, 4)
static inline void timeline(const char *who, const char *direction, const char *format, ...) {
    GDateTime *now = g_date_time_new_now_local();
    char *time = g_date_time_format(now, "%H:%M:%S.%f");
    va_list arguments;
    va_start(arguments, format);
    char *text = g_strdup_vprintf(format, arguments);
    va_end(arguments);
    printf("%.12s  %-6s %s %s\n", time, who, direction, text);
    fflush(stdout);
    g_free(text);
    g_free(time);
    g_date_time_unref(now);
}

#endif
