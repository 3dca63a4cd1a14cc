// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/store.hpp"

namespace sim {

// Gives `restore` what a file holds, when there is one. What went wrong, or nothing. A file that
// cannot be used is left as it is.
template <typename Parse, typename Restore>
std::optional<std::string> restore_file(const Store &store, const std::string &name, Parse parse,
                                        Restore restore) {
    const auto content = store.read(name);
    if (!content)
        return content.refusal().reason;
    if (!*content)
        return std::nullopt;
    auto parsed = parse(**content);
    if (!parsed)
        return fmt::format("cannot use {}: {}; mend it or move it away", store.path_of(name),
                           parsed.refusal().reason);
    restore(std::move(*parsed));
    return std::nullopt;
}

// What went wrong, or nothing.
inline std::optional<std::string> keep_file(const Store &store, const std::string &name,
                                            const std::string &content) {
    const auto written = store.write(name, content);
    return written ? std::nullopt : std::optional(written.refusal().reason);
}

} // namespace sim
