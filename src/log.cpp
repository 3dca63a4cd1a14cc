// SPDX-License-Identifier: Apache-2.0
#include "log.hpp"

#include "wire/glib.hpp"

#include <cstdarg>

namespace ims {
namespace {

constexpr const char *kTag = "MEGORE";

__attribute__((format(printf, 3, 0))) void write(int priority, Site site, const char *format,
                                                 std::va_list arguments) noexcept {
    const Text message{g_strdup_vprintf(format, arguments)};
    __dlog_print(IMS_PLATFORM_LOG_SYSTEM, priority, kTag, "%s: %s(%d) > %s", file_name(site.file),
                 site.function, site.line, message.get());
}

} // namespace

void log_error(Site site, const char *format, ...) noexcept {
    std::va_list arguments;
    va_start(arguments, format);
    write(IMS_PLATFORM_LOG_ERROR, site, format, arguments);
    va_end(arguments);
}

void log_warning(Site site, const char *format, ...) noexcept {
    std::va_list arguments;
    va_start(arguments, format);
    write(IMS_PLATFORM_LOG_WARNING, site, format, arguments);
    va_end(arguments);
}

int operation_failed(Site site, const char *format, ...) noexcept {
    std::va_list arguments;
    va_start(arguments, format);
    write(IMS_PLATFORM_LOG_ERROR, site, format, arguments);
    va_end(arguments);
    return IMS_ERROR_OPERATION_FAILED;
}

} // namespace ims
