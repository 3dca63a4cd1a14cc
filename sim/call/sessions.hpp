// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/per_slot.hpp"
#include "sim/base/result.hpp"
#include "sim/call/events.hpp"
#include "sim/call/session.hpp"

#include <functional>
#include <utility>
#include <vector>

namespace sim {

// The sessions of all slots as they stand, and who is told of them: what the parts of the call
// model share.
class CallSessions {
  public:
    using Sink = std::function<void(int slot, const CallEvent &event)>;

    CallSessions(int slots, Sink sink) : sink_(std::move(sink)), lines_(slots) {}

    Line &operator[](int slot) { return lines_[slot]; }
    const Line &operator[](int slot) const { return lines_[slot]; }
    Session &add(int slot, CallType type, Phase phase);
    Session *find(SessionRef ref);
    void emit(int slot, const CallEvent &event) const { sink_(slot, event); }

    // What requests stand on: the session in the state that they need, or the refusal.
    Answer<Session *> existing(int slot, int id);
    Answer<Session *> established(int slot, int id);
    Answer<Session *> talking(int slot, int id);

    // One active and one held call a slot; a conference counts as one, its members not at all.
    const Session *context(int slot, bool held) const;
    Session *context(int slot, bool held);
    bool has_established(int slot) const;
    const Session *being_set_up(int slot) const;
    CallState state_of(const Session &session) const;

    // The far end, when it is another slot.
    Session *peer_of(const Session &session);
    Session *conference_of(const Session &member);
    std::vector<SessionRef> members_of(const Session &conference) const;

  private:
    Sink sink_;
    PerSlot<Line> lines_;
};

} // namespace sim
