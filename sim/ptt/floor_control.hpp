// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "sim/base/result.hpp"
#include "sim/ptt/call.hpp"
#include "sim/ptt/events.hpp"
#include "sim/ptt/floor.hpp"

#include <chrono>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace sim {

struct PttFloorRequest {
    std::int32_t session = 0;
    FourIntegers media{};
    std::int32_t priority = 0;
    std::int32_t patience = 0;
    std::string name;
};

struct PttFloorStatus {
    std::int32_t session = 0;
    PttFloorState state = PttFloorState::kIdle;
    std::int32_t participants = 0;
    std::string speaker_uri;
    bool operator==(const PttFloorStatus &) const = default;
};

// The floors of all calls: who may speak, who waits, who is interrupted, and who is told. The
// server's.
class PttFloorControl {
  public:
    PttFloorControl(PttSessions &sessions, Timers &timers) : sessions_(sessions), timers_(timers) {}

    Status request(int slot, const PttFloorRequest &request);
    Status release(int slot, std::int32_t session);
    // Of these sessions; of all when none is named.
    Answer<std::vector<PttFloorStatus>> status(int slot, const std::vector<std::int32_t> &sessions);

    void ask(PttCall &call, PttParticipant &participant, FloorWish wish,
             std::chrono::seconds patience);
    // From one who has it or waits for it; of others nothing is taken.
    void cancel(PttCall &call, const PttParticipant &speaker, PttFloorCause cause);
    // One who is no longer there.
    void forget(PttCall &call, int who);
    void tell(const PttCall &call, const PttParticipant &participant) const;

  private:
    std::optional<Refusal> cannot_speak(const PttSessions::Place &place,
                                        const PttFloorRequest &request) const;
    void grant(PttCall &call, FloorWish wish);
    void pass_on(PttCall &call);
    void cut_off(PttRef ref);
    void stop_waiting(PttRef ref);
    void party_talks(PttRef ref);
    void tell_positions(PttCall &call);
    PttFloorEvent event_of(PttFloorKind kind, const PttCall &call,
                           const PttParticipant &participant,
                           PttFloorCause cause = PttFloorCause::kNone) const;

    PttSessions &sessions_;
    Timers &timers_;
};

} // namespace sim
