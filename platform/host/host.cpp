// SPDX-License-Identifier: Apache-2.0
// The feature query reads a key file; the logger writes to standard error or the journal.
#include "platform.h"

#include <glib.h>

#include <array>
#include <cstdarg>
#include <cstdio>
#include <memory>
#include <string_view>
#include <unistd.h>

namespace {

constexpr const char *kFeatureFileVariable = "KELVO_IMS_FEATURE_FILE";
constexpr const char *kFeatureGroup = "features";

struct Feature {
    bool is_readable;
    bool is_enabled;
};

template <auto Function>
struct Release {
    template <typename T>
    void operator()(T *held) const noexcept {
        Function(held);
    }
};
using KeyFile = std::unique_ptr<GKeyFile, Release<g_key_file_unref>>;
using Error = std::unique_ptr<GError, Release<g_error_free>>;
using Text = std::unique_ptr<char, Release<g_free>>;

Feature read_feature(const char *key) {
    const char *path = g_getenv(kFeatureFileVariable);
    if (path == nullptr)
        path = IMS_HOST_FEATURE_FILE;
    const KeyFile file{g_key_file_new()};
    GError *failure = nullptr;
    if (!g_key_file_load_from_file(file.get(), path, G_KEY_FILE_NONE, &failure)) {
        const Error error{failure};
        // A plain Linux has no such file, and everything is there.
        const bool is_absent = g_error_matches(failure, G_FILE_ERROR, G_FILE_ERROR_NOENT) != FALSE;
        if (!is_absent)
            std::fprintf(stderr, "%s: %s\n", path, failure->message);
        return {is_absent, is_absent};
    }
    if (!g_key_file_has_key(file.get(), kFeatureGroup, key, nullptr))
        return {true, true};
    const bool is_enabled = g_key_file_get_boolean(file.get(), kFeatureGroup, key, &failure);
    const Error error{failure};
    if (error)
        std::fprintf(stderr, "%s: %s\n", path, error->message);
    return {!error, is_enabled};
}

// The logger's priorities, from 2 (verbose) to 7 (fatal), as the system's.
struct Priority {
    const char *letter;
    const char *syslog;
};

Priority priority_of(int priority) {
    static constexpr std::array<Priority, 6> kPriorities{
        {{"V", "7"}, {"D", "7"}, {"I", "6"}, {"W", "4"}, {"E", "3"}, {"F", "2"}}};
    const auto at = static_cast<std::size_t>(priority < 2 ? 0 : priority > 7 ? 5 : priority - 2);
    return kPriorities[at];
}

GLogWriterOutput write_to_journal(const char *tag, const char *message, Priority priority) {
    const std::array<GLogField, 3> fields{{{"PRIORITY", priority.syslog, -1},
                                           {"SYSLOG_IDENTIFIER", tag, -1},
                                           {"MESSAGE", message, -1}}};
    return g_log_writer_journald(G_LOG_LEVEL_MESSAGE, fields.data(), fields.size(), nullptr);
}

} // namespace

// The file is read once: every function of the library asks.
int system_info_get_custom_bool(const char *key, bool *value) {
    if (key == nullptr || value == nullptr)
        return -1;
    if (std::string_view{key} != IMS_PLATFORM_FEATURE_KEY)
        return -1;
    static const Feature feature = read_feature(key);
    if (!feature.is_readable)
        return -1;
    *value = feature.is_enabled;
    return 0;
}

int __dlog_print(int, int priority, const char *tag, const char *format, ...) {
    std::va_list arguments;
    va_start(arguments, format);
    const Text message{g_strdup_vprintf(format, arguments)};
    va_end(arguments);
    static const bool is_journal = g_log_writer_is_journald(STDERR_FILENO);
    if (is_journal &&
        write_to_journal(tag, message.get(), priority_of(priority)) == G_LOG_WRITER_HANDLED)
        return 0;
    return std::fprintf(stderr, "%s/%s: %s\n", priority_of(priority).letter, tag, message.get());
}
