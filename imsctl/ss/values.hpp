// SPDX-License-Identifier: Apache-2.0
// Names for the values of the supplementary services.
#pragma once

#include "imsctl/output/values.hpp"

namespace imsctl {

inline constexpr std::int32_t kAllClasses = 3;
inline constexpr NamedValue kServiceClasses[] = {{"voice", 1}, {"video", 2}, {"all", kAllClasses}};
inline constexpr std::int32_t kAllConditions = 4;
inline constexpr NamedValue kForwardingConditions[] = {
    {"unconditional", 0},    {"busy", 1},           {"no-reply", 2}, {"not-reachable", 3},
    {"all", kAllConditions}, {"all-conditional", 5}};
inline constexpr std::int32_t kAllBarring = 5;
inline constexpr NamedValue kBarringTypes[] = {
    {"outgoing", 0}, {"outgoing-international", 1}, {"outgoing-international-not-home", 2},
    {"incoming", 3}, {"incoming-roaming", 4},       {"all", kAllBarring}};

} // namespace imsctl
