// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "sim/base/per_slot.hpp"
#include "sim/base/result.hpp"
#include "sim/call/sessions.hpp"

#include <map>
#include <string_view>

namespace sim {

struct ChangeOutcome {
    CallType in_force = CallType::kVoice;
    bool pending = false;
};

// Voice to video and back: what one side of a call asks for and the other has to agree to.
class CallChanges {
  public:
    CallChanges(CallSessions &sessions, Timers &timers, int slots)
        : sessions_(sessions), timers_(timers), pending_(slots) {}

    Status upgrade(int slot, int id, CallType wanted);
    Status downgrade(int slot, int id, CallType wanted);
    Answer<ChangeOutcome> change(int slot, int id, CallType wanted);
    Status accept(int slot, int id);
    Status reject(int slot, int id);

    // A party of the network asks, when the call is one that could change.
    void ask_video(const Session &session);
    // Nothing is asked any more, at neither end or at this one.
    void drop(const Session &session);
    void drop(SessionRef ref) { pending_[ref.slot].erase(ref.id); }

  private:
    // A change that one side has asked for and the other not answered.
    struct Pending {
        bool asked_here = false;
        CallType wanted = CallType::kVoice;
        Timer timer;
    };

    Answer<Session *> changeable(int slot, int id);
    Answer<Session *> asked_to_change(int slot, int id);
    bool is_pending(SessionRef ref) const { return pending_[ref.slot].contains(ref.id); }
    Pending &begin(SessionRef ref, bool asked_here, CallType wanted);
    Answer<ChangeOutcome> request(Session &session, CallType wanted);
    void switch_type(Session &session, CallType type);
    void refuse_change(const Session &asker, CallErrorCode code, std::string_view why);

    CallSessions &sessions_;
    Timers &timers_;
    PerSlot<std::map<int, Pending>> pending_; // by session
};

} // namespace sim
