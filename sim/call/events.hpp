// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/call/values.hpp"

#include <array>
#include <cstdint>
#include <string>
#include <variant>
#include <vector>

// What a slot is told about its calls: one record a signal, members in the signal's order.
namespace sim {

// The texts of a request that the service passes on to the called party as they came.
using PassedTexts = std::array<std::string, 4>;

// The media that a call type stands for, as early media and change requests name them.
inline std::string media_of(CallType type) {
    return type == CallType::kVideo ? "audio,video" : "audio";
}

struct CallIncomingInd {
    int session_id = 0;
    std::string peer_uri;
    CallType type = CallType::kVoice;
    std::string called_uri;
    PassedTexts texts;
    bool waiting = false;
    bool operator==(const CallIncomingInd &) const = default;
};
struct CallInProgress {
    int session_id = 0;
    bool operator==(const CallInProgress &) const = default;
};
struct CallAlerting {
    int session_id = 0;
    bool operator==(const CallAlerting &) const = default;
};
struct CallBusy {
    int session_id = 0;
    bool operator==(const CallBusy &) const = default;
};
struct CallEstablished {
    int session_id = 0;
    CallType type = CallType::kVoice;
    bool mobile_originated = false;
    std::string peer_uri;
    bool conference = false;
    bool operator==(const CallEstablished &) const = default;
};
struct CallHeld {
    int session_id = 0;
    bool here = false;
    CallType type = CallType::kVoice;
    bool operator==(const CallHeld &) const = default;
};
struct CallResumed {
    int session_id = 0;
    bool here = false;
    bool still_held = false; // by the other side
    CallType type = CallType::kVoice;
    bool operator==(const CallResumed &) const = default;
};
struct CallForwarded {
    int session_id = 0;
    bool operator==(const CallForwarded &) const = default;
};
struct CallEnded {
    int session_id = 0;
    EndReason reason = EndReason::kLocalHangUp;
    bool operator==(const CallEnded &) const = default;
};
struct CallSwitched {
    int session_id = 0;
    CallType type = CallType::kVoice;
    bool operator==(const CallSwitched &) const = default;
};
struct CallChangeRequest {
    int session_id = 0;
    CallType type = CallType::kVoice;
    std::string media;
    bool operator==(const CallChangeRequest &) const = default;
};
struct CallConfNotifyReceived {
    int session_id = 0;
    std::vector<std::int32_t> states;
    std::vector<std::string> uris;
    bool operator==(const CallConfNotifyReceived &) const = default;
};
struct CallEarlyMediaStart {
    int session_id = 0;
    std::string media;
    bool operator==(const CallEarlyMediaStart &) const = default;
};
struct CallStopAlertTone {
    int session_id = 0;
    bool operator==(const CallStopAlertTone &) const = default;
};
struct CallError {
    int session_id = 0;
    CallErrorCode code = CallErrorCode::kServiceUnavailable;
    std::string text;
    bool operator==(const CallError &) const = default;
};
// The members of the next three are spelt on the wire as "Confernce".
struct ConferenceEstablished {
    int session_id = 0;
    CallType type = CallType::kVoice;
    bool operator==(const ConferenceEstablished &) const = default;
};
struct ParticipantAdded {
    int conference_id = 0;
    int session_id = 0;
    bool operator==(const ParticipantAdded &) const = default;
};
struct ParticipantRemoved {
    int conference_id = 0;
    int session_id = 0;
    bool operator==(const ParticipantRemoved &) const = default;
};
struct CallUssdIndication {
    UssdAnswer type = UssdAnswer::kFinal;
    int coding_scheme = 0;
    int dialogue = 0; // counts the dialogues of the slot from 1
    std::string text;
    bool operator==(const CallUssdIndication &) const = default;
};
struct CallDtmfEvent {
    std::uint8_t tone = 0;
    bool operator==(const CallDtmfEvent &) const = default;
};

using CallEvent =
    std::variant<CallIncomingInd, CallInProgress, CallAlerting, CallBusy, CallEstablished, CallHeld,
                 CallResumed, CallForwarded, CallEnded, CallSwitched, CallChangeRequest,
                 CallConfNotifyReceived, CallEarlyMediaStart, CallStopAlertTone, CallError,
                 ConferenceEstablished, ParticipantAdded, ParticipantRemoved, CallUssdIndication,
                 CallDtmfEvent>;

} // namespace sim
