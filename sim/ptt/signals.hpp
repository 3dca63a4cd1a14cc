// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/bus/interface.hpp"
#include "sim/ptt/events.hpp"

#include <span>

namespace sim {

Signal to_signal(const PttEvent &event);
std::span<const SignalInfo> ptt_signals();

} // namespace sim
