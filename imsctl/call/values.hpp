// SPDX-License-Identifier: Apache-2.0
// Names for the values that requests about calls take and events about calls bring.
#pragma once

#include "imsctl/client/call_values.hpp"

namespace imsctl {

inline constexpr NamedValue kEndReasons[] = {
    {"hung up", 0},        {"hung up by the peer", 1}, {"busy", 2},
    {"declined", 3},       {"no answer", 4},           {"missed", 5},
    {"unreachable", 6},    {"network failure", 7},     {"removed from the conference", 8},
    {"conference over", 9}};
inline constexpr NamedValue kAutoResponses[] = {
    {"off", 0}, {"answer", 1}, {"decline", 2}, {"busy", 3}};
inline constexpr NamedValue kConferenceChanges[] = {{"add", 1}, {"remove", 2}};
inline constexpr NamedValue kTtyModes[] = {{"off", 0}, {"full", 1}, {"hco", 2}, {"vco", 3}};
inline constexpr NamedValue kUssdTypes[] = {{"start", 1}, {"reply", 2}, {"cancel", 3}};
inline constexpr NamedValue kRecordActions[] = {{"stop", 0}, {"start", 1}};
inline constexpr NamedValue kAudioPaths[] = {{"cellular", 0}, {"epdg", 1}};

} // namespace imsctl
