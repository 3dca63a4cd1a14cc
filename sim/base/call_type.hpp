// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/enum_format.hpp"

#include <cstdint>

namespace sim {

enum class CallType : std::int32_t { kVoice = 0, kVideo = 1, kEmergency = 2 };

} // namespace sim
