// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/call_type.hpp"
#include "sim/base/enum_format.hpp"

#include <cstdint>

// The values that stand in the integers of org.kelvo.ims.Call as the stand-in defines them.
namespace sim {

enum class CallState : std::int32_t {
    kDialing = 1,
    kAlerting = 2,
    kIncoming = 3,
    kWaiting = 4,
    kActive = 5,
    kHeld = 6,
    kHeldByPeer = 7,
};

enum class EndReason : std::int32_t {
    kLocalHangUp = 0,
    kRemoteHangUp = 1,
    kBusy = 2,
    kDeclined = 3,
    kNoAnswer = 4,
    kMissed = 5,
    kUnreachable = 6,
    kNetworkFailure = 7,
    kRemovedFromConference = 8,
    kConferenceOver = 9,
};

enum class RejectReason : std::int32_t { kDecline = 0, kBusy = 1 };

// The codes of CallError are those of SIP.
enum class CallErrorCode : std::int32_t {
    kForbidden = 403,
    kNotFound = 404,
    kRequestTimeout = 408,
    kTemporarilyUnavailable = 480,
    kLoopDetected = 482,
    kNotAcceptable = 488,
    kServiceUnavailable = 503,
};

enum class AutoResponse : std::int32_t { kOff = 0, kAnswer = 1, kDecline = 2, kBusy = 3 };

enum class ParticipantState : std::int32_t {
    kInvited = 1,
    kAlerting = 2,
    kConnected = 3,
    kGone = 4
};

enum class ConferenceChange : std::int32_t { kAdd = 1, kRemove = 2 };

enum class TtyMode : std::int32_t {
    kOff = 0,
    kFull = 1,
    kHearingCarryOver = 2,
    kVoiceCarryOver = 3
};

enum class UssdRequest : std::int32_t { kStart = 1, kReply = 2, kCancel = 3 };

enum class UssdAnswer : std::int32_t {
    kFinal = 1,
    kReplyExpected = 2,
    kReleased = 3,
    kUnknownCode = 4
};

enum class RecordAction : std::int32_t { kStop = 0, kStart = 1 };

enum class AudioPath : std::int32_t { kCellular = 0, kEpdg = 1 };

constexpr std::int32_t kMaxVolume = 10;
constexpr std::int32_t kInitialVolume = 5;
constexpr std::int32_t kMaxParticipants = 5;

} // namespace sim
