// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/store.hpp"
#include "sim/settings/model.hpp"

namespace sim {

// Gives the model what is kept there and keeps its changes there, one file a slot. What went wrong,
// or nothing. A file that cannot be used is left as it is.
std::optional<std::string> keep_settings(const std::shared_ptr<Store> &store, SettingsModel &model);

} // namespace sim
