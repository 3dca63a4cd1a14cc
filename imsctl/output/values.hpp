// SPDX-License-Identifier: Apache-2.0
// Names for values that the service defines. A number is taken and shown where there is none.
#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace imsctl {

struct NamedValue {
    std::string_view name;
    std::int32_t value;
};
using NamedValues = std::span<const NamedValue>;

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
inline constexpr NamedValue kEndReasons[] = {
    {"hung up", 0},        {"hung up by the peer", 1}, {"busy", 2},
    {"declined", 3},       {"no answer", 4},           {"missed", 5},
    {"unreachable", 6},    {"network failure", 7},     {"removed from the conference", 8},
    {"conference over", 9}};
inline constexpr NamedValue kRejectReasons[] = {{"decline", 0}, {"busy", 1}};
inline constexpr NamedValue kAutoResponses[] = {
    {"off", 0}, {"answer", 1}, {"decline", 2}, {"busy", 3}};
inline constexpr NamedValue kConferenceChanges[] = {{"add", 1}, {"remove", 2}};
inline constexpr NamedValue kTtyModes[] = {{"off", 0}, {"full", 1}, {"hco", 2}, {"vco", 3}};
inline constexpr NamedValue kUssdTypes[] = {{"start", 1}, {"reply", 2}, {"cancel", 3}};
inline constexpr NamedValue kRecordActions[] = {{"stop", 0}, {"start", 1}};
inline constexpr NamedValue kAudioPaths[] = {{"cellular", 0}, {"epdg", 1}};
inline constexpr NamedValue kSwitch[] = {{"off", 0}, {"on", 1}};
inline constexpr NamedValue kLoginKinds[] = {{"ims", 0}, {"push-to-talk", 1}};
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
inline constexpr std::int32_t kFrontCamera = 0;
inline constexpr NamedValue kCameras[] = {{"front", kFrontCamera}, {"back", 1}};
inline constexpr std::int32_t kFarEnd = 1;
inline constexpr NamedValue kVideoEnds[] = {{"near", 0}, {"far", kFarEnd}};
inline constexpr std::int32_t kMp4 = 1;
inline constexpr NamedValue kVideoFormats[] = {{"3gp", 0}, {"mp4", kMp4}};

// The value's name, or its number.
std::string name_of(NamedValues names, std::int32_t value);

std::vector<std::string> names_of(NamedValues values);

// "voice, video, emergency or a number"
std::string choices(NamedValues names);

// A whole number that fits; nothing else around it.
std::optional<std::int32_t> parse_number(std::string_view text);

// A name or a number.
std::optional<std::int32_t> parse_value(NamedValues names, std::string_view text);

} // namespace imsctl
