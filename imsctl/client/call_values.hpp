// SPDX-License-Identifier: Apache-2.0
// Names for what the call list says of a call.
#pragma once

#include "imsctl/output/values.hpp"

namespace imsctl {

namespace call_state {
inline constexpr std::int32_t kDialing = 1;
inline constexpr std::int32_t kAlerting = 2;
inline constexpr std::int32_t kIncoming = 3;
inline constexpr std::int32_t kWaiting = 4;
inline constexpr std::int32_t kActive = 5;
inline constexpr std::int32_t kHeld = 6;
inline constexpr std::int32_t kHeldByPeer = 7;
} // namespace call_state

inline constexpr NamedValue kCallStates[] = {
    {"dialing", call_state::kDialing},         {"alerting", call_state::kAlerting},
    {"incoming", call_state::kIncoming},       {"waiting", call_state::kWaiting},
    {"active", call_state::kActive},           {"held", call_state::kHeld},
    {"held-by-peer", call_state::kHeldByPeer},
};
inline constexpr std::int32_t kVideo = 1;
inline constexpr NamedValue kCallTypes[] = {{"voice", 0}, {"video", kVideo}, {"emergency", 2}};

} // namespace imsctl
