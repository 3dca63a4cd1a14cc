// SPDX-License-Identifier: Apache-2.0
// Names for push-to-talk values: those of the stand-in service.
#pragma once

#include "imsctl/output/values.hpp"

#include <ims.h>

namespace imsctl {

namespace ptt_type {
inline constexpr std::int32_t kOneToOne = 0;
inline constexpr std::int32_t kGroup = 1;
inline constexpr std::int32_t kChannel = 3;
} // namespace ptt_type

inline constexpr NamedValue kPttTypes[] = {{"one-to-one", ptt_type::kOneToOne},
                                           {"group", ptt_type::kGroup},
                                           {"ad hoc", 2},
                                           {"channel", ptt_type::kChannel}};
inline constexpr NamedValue kPttEndReasons[] = {
    {"ended here", 0},       {"ended by the peer", 1}, {"busy", 2},
    {"declined", 3},         {"no answer", 4},         {"missed", 5},
    {"unreachable", 6},      {"network failure", 7},   {"removed", 8},
    {"the call is over", 9}, {"no sign of life", 10}};
inline constexpr NamedValue kPttEndScopes[] = {{"leave", 0}, {"all", 1}};
inline constexpr NamedValue kPttChannelModes[] = {{"talk", 0}, {"listen", 1}};
inline constexpr NamedValue kPttFloorStates[] = {
    {"idle", 0}, {"granted", 1}, {"taken", 2}, {"waiting", 3}};
inline constexpr NamedValue kPttFloorCauses[] = {
    {"no cause", 0},    {"taken", 1},           {"the queue is full", 2}, {"listens only", 3},
    {"interrupted", 4}, {"talked too long", 5}, {"withdrawn", 6},         {"waited too long", 7}};
inline constexpr NamedValue kPttRecordSources[] = {{"all", 0}, {"own", 1}, {"others", 2}};
inline constexpr NamedValue kPttRecordStates[] = {{"recording", 1}};
inline constexpr NamedValue kPttNotices[] = {{"delivered", 1}, {"read", 2}, {"failed", 3}};
inline constexpr NamedValue kPttWantedNotices[] = {
    {"none", 0}, {"delivered", 1}, {"read", 2}, {"both", 3}};
inline constexpr NamedValue kPttFileEnds[] = {
    {"complete", 0},  {"rejected", 1},    {"cancelled here", 2}, {"cancelled by the peer", 3},
    {"no answer", 4}, {"unreachable", 5}, {"network failure", 6}};

// Which of these a media set has, in the order of its integers.
inline constexpr std::string_view kPttMedia[IMS_POC_INT_SET_SIZE] = {"voice", "video", "messages",
                                                                     "files"};

} // namespace imsctl
