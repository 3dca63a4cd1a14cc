// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/enum_format.hpp"

#include <array>
#include <cstdint>
#include <string>

// The values that stand in the members of org.kelvo.ims.Poc as the stand-in defines them.
namespace sim {

using FourIntegers = std::array<std::int32_t, 4>;

// A media set says for each of these whether a call has it: 1 or 0.
enum PttMedia : std::size_t { kPttVoice, kPttVideo, kPttMessages, kPttFiles };
// All zeros stand for this one.
constexpr FourIntegers kUsualMedia{1, 0, 1, 1};

// On which terms a participant takes the floor. The fourth integer has no meaning.
enum PttTerm : std::size_t { kPttPriority, kPttDoNotWait, kPttTalkTime };

constexpr std::int32_t kPttTopPriority = 7; // interrupts those below it
constexpr std::int32_t kPttUsualTalkTime = 30;
constexpr std::int32_t kPttLongestTime = 3600; // of anything that is counted in seconds

enum class PttCallType : std::int32_t { kOneToOne = 0, kGroup = 1, kAdHoc = 2, kChannel = 3 };

enum class PttEndReason : std::int32_t {
    kEndedHere = 0,
    kEndedByPeer = 1,
    kBusy = 2,
    kDeclined = 3,
    kNoAnswer = 4,
    kMissed = 5,
    kUnreachable = 6,
    kNetworkFailure = 7,
    kRemoved = 8,
    kOver = 9,
    kKeepAliveMissed = 10,
};

enum class PttRejectReason : std::int32_t { kDecline = 0, kBusy = 1 };
enum class PttEndScope : std::int32_t { kLeave = 0, kForAll = 1 };
enum class PttChannelMode : std::int32_t { kTalkAndListen = 0, kListenOnly = 1 };
constexpr std::int32_t kPttChannels = 16;

enum class PttFloorState : std::int32_t { kIdle = 0, kGranted = 1, kTaken = 2, kWaiting = 3 };

// Why the floor is not, or no longer, whose it was asked for.
enum class PttFloorCause : std::int32_t {
    kNone = 0,
    kTaken = 1,
    kQueueFull = 2,
    kListensOnly = 3,
    kInterrupted = 4,
    kTalkedTooLong = 5,
    kWithdrawn = 6,
    kWaitedTooLong = 7,
};

enum class PttRecordState : std::int32_t { kRecording = 1 };
enum class PttRecordSource : std::int32_t { kAll = 0, kOwn = 1, kOthers = 2 };

// What is told of a message: the first two can be asked for, added up.
enum class PttNotice : std::int32_t { kDelivered = 1, kRead = 2, kFailed = 3 };

enum class PttFileEnd : std::int32_t {
    kComplete = 0,
    kRejected = 1,
    kCancelledHere = 2,
    kCancelledByPeer = 3,
    kNoAnswer = 4,
    kUnreachable = 5,
    kNetworkFailure = 6,
};

// A party as requests and events name it.
struct PttPeer {
    std::int32_t uri_type = 0; // 0 tel: or a plain number, 1 sip:
    std::string uri;
    std::string display_name;
    bool is_group = false;
    bool operator==(const PttPeer &) const = default;
};

inline PttPeer to_peer(const std::string &uri, const std::string &name, bool is_group = false) {
    return {uri.starts_with("sip:") ? 1 : 0, uri, name, is_group};
}

} // namespace sim
