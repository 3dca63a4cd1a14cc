// SPDX-License-Identifier: Apache-2.0
// The log line that every unit writes: "file: function(line) > message".
#pragma once

#include "platform.h"

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

void log_error(Site site, const char *format, ...) noexcept __attribute__((format(printf, 2, 3)));
void log_warning(Site site, const char *format, ...) noexcept __attribute__((format(printf, 2, 3)));

} // namespace ims
