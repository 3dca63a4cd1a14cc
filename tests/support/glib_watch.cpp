// SPDX-License-Identifier: Apache-2.0
#include "tests/support/glib_watch.hpp"

#include <gio/gio.h>
#include <gtest/gtest.h>

#include <cstring>
#include <mutex>
#include <optional>

namespace test {
namespace {

std::mutex watch_mutex;
std::optional<std::string> expected_part;
int expected_seen = 0;

void judge(GLogLevelFlags level, const char *domain, const char *message) {
    if ((level & (G_LOG_LEVEL_ERROR | G_LOG_LEVEL_CRITICAL | G_LOG_LEVEL_WARNING)) == 0)
        return;
    {
        const std::lock_guard lock{watch_mutex};
        if (expected_part && (level & G_LOG_LEVEL_CRITICAL) != 0 &&
            std::strstr(message, expected_part->c_str())) {
            ++expected_seen;
            return;
        }
    }
    ADD_FAILURE() << "GLib reports (" << (domain ? domain : "no domain") << "): " << message;
}

void on_plain(const gchar *domain, GLogLevelFlags level, const gchar *message, gpointer) {
    judge(level, domain, message ? message : "");
}

GLogWriterOutput on_structured(GLogLevelFlags level, const GLogField *fields, gsize count,
                               gpointer) {
    const char *domain = nullptr;
    const char *message = "";
    for (gsize i = 0; i < count; ++i) {
        if (std::strcmp(fields[i].key, "MESSAGE") == 0)
            message = static_cast<const char *>(fields[i].value);
        else if (std::strcmp(fields[i].key, "GLIB_DOMAIN") == 0)
            domain = static_cast<const char *>(fields[i].value);
    }
    judge(level, domain, message);
    return G_LOG_WRITER_HANDLED;
}

} // namespace

void watch_glib() {
    g_log_set_default_handler(on_plain, nullptr);
    g_log_set_writer_func(on_structured, nullptr, nullptr);
}

ExpectGlibCritical::ExpectGlibCritical(std::string part) {
    const std::lock_guard lock{watch_mutex};
    expected_part = std::move(part);
    expected_seen = 0;
}

ExpectGlibCritical::~ExpectGlibCritical() {
    const std::lock_guard lock{watch_mutex};
    EXPECT_GT(expected_seen, 0) << "no critical that contains \"" << *expected_part << "\"";
    expected_part.reset();
}

} // namespace test
