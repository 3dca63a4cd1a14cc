// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/per_slot.hpp"
#include "sim/base/result.hpp"
#include "sim/call/sessions.hpp"
#include "sim/registration/registrations.hpp"

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace sim {

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

// What the radio side tells the service, and the bearer for emergency calls. The device's.
class CallRadio {
  public:
    CallRadio(CallSessions &sessions, Registrations &registrations, int slots)
        : sessions_(sessions), registrations_(registrations), slots_(slots) {}

    Status handover_started(int slot, int id);
    Status handover_failed(int slot, int id);
    bool in_epdg_call(int slot) const;
    Status set_audio_path(int slot, AudioPath path);
    Status set_ssac(int slot, std::int32_t apply, const Ssac &ssac);
    // Why the cell lets no call of this type through, or nothing.
    std::optional<Refusal> bars(int slot, CallType type) const;
    Status set_emergency_pdn(int slot, EmergencyPdn info);
    Status register_emergency_pdn(int slot);
    Status deregister_emergency_pdn(int slot);

  private:
    struct Slot {
        AudioPath audio_path = AudioPath::kCellular;
        std::optional<Ssac> ssac;
        std::optional<EmergencyPdn> emergency_pdn;
    };

    CallSessions &sessions_;
    Registrations &registrations_;
    PerSlot<Slot> slots_;
};

} // namespace sim
