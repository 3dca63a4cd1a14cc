// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "sim/call/events.hpp"
#include "sim/call/parties.hpp"
#include "sim/call/values.hpp"

#include <cstdint>
#include <map>
#include <optional>
#include <string>

namespace sim {

// A session's name across slots. Sessions come and go; this stays safe to keep.
struct SessionRef {
    int slot = -1;
    int id = 0;
    bool operator==(const SessionRef &) const = default;
};

enum class Phase { kDialing, kAlerting, kIncoming, kEstablished };

// One call, or one conference, as one slot sees it.
struct Session {
    SessionRef ref;
    CallType type = CallType::kVoice;
    Phase phase = Phase::kDialing;
    bool mobile_originated = false;
    std::string number; // the other party's, as it was dialled; none for a conference
    std::string route;  // where the call goes: another number once it has been forwarded
    int diversions = 0;
    std::string peer_uri;
    PassedTexts texts;
    std::optional<SessionRef> peer; // the far end, when it is another slot

    const Party *party = nullptr; // the far end, when it is the network's
    std::size_t next_step = 0;
    Timer step_timer;
    Timer ring_timer;
    Timer auto_response_timer;

    bool held_here = false;
    bool held_by_peer = false;
    bool handover = false;

    bool is_conference = false;
    int conference = 0; // the conference that this session takes part in

    bool established() const { return phase == Phase::kEstablished; }
};

struct Line {
    int next_session = 1;
    std::map<int, Session> sessions;
    Timer callback_timer;

    AutoResponse auto_response = AutoResponse::kOff;
    std::int32_t auto_response_delay = 0;
};

} // namespace sim
