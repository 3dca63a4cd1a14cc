// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "sim/base/result.hpp"
#include "sim/ptt/call.hpp"
#include "sim/ptt/events.hpp"

#include <cstdint>
#include <optional>

namespace sim {

// Other media and other terms for a call that goes on: what one participant offers and the others
// answer.
class PttChanges {
  public:
    PttChanges(PttSessions &sessions, Timers &timers) : sessions_(sessions), timers_(timers) {}

    Status modify(int slot, const PttModifyRequest &request);
    Status accept(int slot, const PttModifyRequest &request);
    Status reject(int slot, std::int32_t session);

    // What one has answered, or has not and is gone.
    void settle(PttCall &call, int who, std::optional<FourIntegers> accepted);
    // A party of the network asks.
    void ask_video(PttRef ref);

  private:
    void offer(PttCall &call, PttParticipant &asker, const PttModifyRequest &request);
    void conclude(PttCall &call);
    void party_answers(PttRef ref);
    void tell(PttParticipant &participant, const PttModifyRequest &request, bool accepted);

    PttSessions &sessions_;
    Timers &timers_;
};

} // namespace sim
