// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/result.hpp"
#include "sim/settings/fields.hpp"
#include "sim/settings/offered.hpp"

#include <cstdint>
#include <optional>
#include <string_view>
#include <utility>
#include <vector>

namespace sim {

// What a dictionary changes: each place once.
using SettingsChanges = std::vector<std::pair<std::size_t, SettingValue>>;

// Every entry must be a key of these fields, in the form that `direction` has for it.
Answer<SettingsChanges> check_entries(const SettingsFields &fields, Form SettingsField::*direction,
                                      const OfferedEntries &entries);

// The decimal text of a number, and nothing else.
std::optional<std::int32_t> parse_decimal(std::string_view text);

} // namespace sim
