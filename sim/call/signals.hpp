// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/bus/interface.hpp"
#include "sim/call/events.hpp"

#include <span>

namespace sim {

Signal to_signal(const CallEvent &event);
std::span<const SignalInfo> call_signals();

} // namespace sim
