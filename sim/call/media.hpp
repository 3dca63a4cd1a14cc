// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/per_slot.hpp"
#include "sim/base/result.hpp"
#include "sim/call/sessions.hpp"

#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace sim {

struct TtyState {
    TtyMode mode = TtyMode::kOff;
    std::string received;
};

// What is done inside a call: sound, tones, text telephony, recording. The device's, but for what
// the far ends hear and read.
class CallMedia {
  public:
    CallMedia(CallSessions &sessions, int slots) : sessions_(sessions), slots_(slots) {}

    Answer<bool> is_muted(int slot, int id);
    Status toggle_mute(int slot, int id);
    Status set_volume(int slot, int id, std::int32_t volume);
    Answer<std::int32_t> max_volume(int slot, int id);
    Status set_speaker(int slot, int id, std::int32_t on);
    Status record(int slot, int id, RecordAction action, const std::string &path);
    Status send_dtmf(int slot, int id, std::string_view tones);
    Status start_dtmf(int slot, int id, std::uint8_t tone);
    Status stop_dtmf(int slot, int id);
    Status set_tty_mode(int slot, TtyMode mode);
    TtyState tty(int slot) const { return slots_[slot].tty; }
    Status send_tty(int slot, int id, const std::string &bytes);

    // The session is gone.
    void forget(SessionRef ref);

  private:
    // Of one session.
    struct Sound {
        bool muted = false;
        bool speaker = false;
        std::int32_t volume = kInitialVolume;
        std::optional<std::uint8_t> tone;
        bool recording = false;
    };
    struct Slot {
        std::map<int, Sound> sounds;
        TtyState tty;
    };

    Answer<Sound *> sound(int slot, int id);
    // Of a session that talks and sends no tone.
    Answer<Sound *> silent(int slot, int id);
    std::vector<SessionRef> far_ends(SessionRef ref);

    CallSessions &sessions_;
    PerSlot<Slot> slots_;
};

} // namespace sim
