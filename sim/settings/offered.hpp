// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/foreign_value.hpp"

#include <cstdint>
#include <string>
#include <variant>
#include <vector>

namespace sim {

// An entry of a dictionary as it came.
struct OfferedEntry {
    std::string key;
    std::variant<std::int32_t, bool, std::string, ForeignValue> value;
};
using OfferedEntries = std::vector<OfferedEntry>;

} // namespace sim
