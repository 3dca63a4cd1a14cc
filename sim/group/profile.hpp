// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/group/answers.hpp"

namespace sim {

// What the network says of the user of a slot.
UserProfile profile_of_slot(int slot, const std::string &uri);

} // namespace sim
