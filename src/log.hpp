// SPDX-License-Identifier: Apache-2.0
// The log line that every unit writes: "file: function(line) > message".
#pragma once

#include "ims_types.h"
#include "platform.h"

#include <string_view>

namespace ims {

// Where a line comes from. As the default argument of a function, here() names that function's
// caller: the shared helpers log under the name of the exported function that they serve.
struct Site {
    const char *file;
    const char *function;
    int line;
};

constexpr Site here(const char *file = __builtin_FILE(),
                    const char *function = __builtin_FUNCTION(),
                    int line = __builtin_LINE()) noexcept {
    return {file, function, line};
}

// The same place under the name that its lines are known by.
constexpr Site named(const char *function, Site site = here()) noexcept {
    return {site.file, function, site.line};
}

// The file's own name, without its directories.
constexpr const char *file_name(const char *path) noexcept {
    return path + (std::string_view{path}.rfind('/') + 1); // npos + 1 is 0
}

void log_error(Site site, const char *format, ...) noexcept __attribute__((format(printf, 2, 3)));
void log_warning(Site site, const char *format, ...) noexcept __attribute__((format(printf, 2, 3)));

// An error, and what a function returns that failed with it.
int operation_failed(Site site, const char *format, ...) noexcept
    __attribute__((format(printf, 2, 3)));

} // namespace ims
