// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/settings/model.hpp"

namespace sim {

// What one slot keeps, as the text of a file. Keys stand in wire order.
std::string to_json(const SlotSettings &settings);

// Refused unless it is complete, of the right types and without a contradiction.
Answer<SlotSettings> from_json(const std::string &text);

} // namespace sim
