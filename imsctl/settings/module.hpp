// SPDX-License-Identifier: Apache-2.0
// Settings sets, profiles and the network environment.
#pragma once

#include "imsctl/line/modules.hpp"

namespace imsctl {

Module settings_module();

// Its tables, one a file.
std::span<const Verb> settings_verbs();
std::span<const Verb> profile_verbs();

} // namespace imsctl
