// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/group/model.hpp"

namespace sim {

// What is kept about groups, as the text of a file. Documents stand in it as they are answered.
std::string groups_to_json(const GroupState &state);

// Refused unless it is complete, of the right types and without a contradiction.
Answer<GroupState> groups_from_json(const std::string &text);

} // namespace sim
