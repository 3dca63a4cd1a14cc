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
#include <vector>

namespace sim {

// A session's name across slots. Sessions come and go; this stays safe to keep.
struct SessionRef {
    int slot = -1;
    int id = 0;
    bool operator==(const SessionRef &) const = default;
};

enum class Phase { kDialing, kAlerting, kIncoming, kEstablished };

// A change of the call type that one side has asked for and the other not answered.
struct PendingChange {
    bool asked_here = false;
    CallType wanted = CallType::kVoice;
};

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
    std::optional<PendingChange> change;
    Timer change_timer;

    bool is_conference = false;
    int conference = 0; // the conference that this session takes part in

    bool muted = false;
    bool speaker = false;
    std::int32_t volume = kInitialVolume;
    std::optional<std::uint8_t> tone;
    bool recording = false;

    bool established() const { return phase == Phase::kEstablished; }
};

struct EmergencyPdn {
    std::string interface;
    std::vector<std::string> servers;
    std::string local_address;
};

// The access class barring that the cell announces for multimedia telephony. A factor is the
// percentage of attempts that get through.
struct Ssac {
    std::int32_t voice_factor = 100;
    std::int32_t voice_time = 0;
    std::int32_t video_factor = 100;
    std::int32_t video_time = 0;
};

struct Line {
    int next_session = 1;
    std::map<int, Session> sessions;
    Timer callback_timer;

    AutoResponse auto_response = AutoResponse::kOff;
    std::int32_t auto_response_delay = 0;
    TtyMode tty_mode = TtyMode::kOff;
    std::string tty_received;
    AudioPath audio_path = AudioPath::kCellular;
    std::optional<Ssac> ssac;
    std::optional<EmergencyPdn> emergency_pdn;
};

} // namespace sim
