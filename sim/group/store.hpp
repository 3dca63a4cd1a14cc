// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/store.hpp"
#include "sim/group/model.hpp"

namespace sim {

// Gives the model the groups that are kept there and keeps its changes there, all in one file. What
// went wrong, or nothing. A file that cannot be used is left as it is.
std::optional<std::string> keep_groups(const std::shared_ptr<Store> &store, GroupModel &model);

} // namespace sim
