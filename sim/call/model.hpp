// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "sim/base/number_plan.hpp"
#include "sim/base/result.hpp"
#include "sim/call/change.hpp"
#include "sim/call/events.hpp"
#include "sim/call/media.hpp"
#include "sim/call/parties.hpp"
#include "sim/call/radio.hpp"
#include "sim/call/sessions.hpp"
#include "sim/registration/registrations.hpp"
#include "sim/ss/model.hpp"

#include <chrono>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace sim {

struct DialRequest {
    std::string called;
    CallType type = CallType::kVoice;
    PassedTexts texts;
};

struct CallInfo {
    int session_id = 0;
    std::string peer_uri;
    CallType type = CallType::kVoice;
    bool mobile_originated = false;
    CallState state = CallState::kDialing;
    bool conference = false;
    bool operator==(const CallInfo &) const = default;
};

// The calls of all slots: what may be asked of them when, what becomes of them, and who is told.
// A request that makes no sense in the present state is refused and changes nothing. What sessions
// are and what may be asked of them is the device's; where calls go (routing.cpp) and what far ends
// do (far_end.cpp) is the network's.
class CallModel {
  public:
    using Sink = CallSessions::Sink;

    // `ring_time`: how long a slot rings before the network gives up.
    CallModel(const NumberPlan &plan, Timers &timers, Registrations &registrations,
              const SupplementaryServices &services, std::chrono::nanoseconds ring_time, Sink sink);

    // The parts: what is done inside a call, what its sides negotiate, what the radio side tells.
    CallMedia &media() { return media_; }
    CallChanges &changes() { return changes_; }
    CallRadio &radio() { return radio_; }

    // Setting up and ending
    Answer<int> make_call(int slot, const DialRequest &request);
    Status answer(int slot, int id, CallType type);
    Status end(int slot, int id);
    Status reject(int slot, int id, RejectReason reason);
    Status set_auto_response(int slot, AutoResponse mode, std::int32_t delay_seconds);
    // A party of the network calls a slot. Refused when the slot cannot ring.
    Answer<int> call_from_network(int slot, std::string_view number, CallType type);
    std::vector<CallInfo> list(int slot) const;
    // The radio is off.
    void drop_calls(int slot);

    // Hold
    Status hold(int slot, int id);
    Status resume(int slot, int id);
    Status swap(int slot);

    // Conferences
    Answer<int> merge(int slot);
    Answer<int> start_nway(int slot, int first, int second, CallType type);
    Status add_participant(int slot, int conference, int id);
    Status remove_participant(int slot, int conference, int id);
    Status invite(int slot, int conference, std::string_view called, CallType type);
    Answer<int> start_conference(int slot, CallType type, const std::vector<std::string> &called);
    Answer<int> modify_conference(int slot, int conference, ConferenceChange change,
                                  const std::vector<std::string> &called);

  private:
    // What requests stand on: the session in the state that they need, or the refusal.
    Answer<Session *> conference_of(int slot, int id);
    std::optional<Refusal> cannot_dial(int slot, std::string_view number, CallType type) const;
    std::optional<Refusal> cannot_dial_all(int slot, const std::vector<std::string> &numbers,
                                           CallType type) const;
    std::optional<Refusal> line_in_use(int slot) const;
    std::optional<Refusal> cannot_ring(int slot, CallType type) const;
    std::optional<Refusal> out_of_reach(int slot, CallType type) const;
    std::optional<Refusal> cannot_hold(const Session &session) const;
    std::optional<Refusal> cannot_join(const Session &conference, const Session &session) const;
    std::optional<Refusal> room_for(const Session &conference, std::size_t more) const;
    Answer<std::vector<std::string>> new_participants(int slot, const Session &conference,
                                                      const std::vector<std::string> &called) const;
    Answer<std::vector<SessionRef>> participants(int slot, const Session &conference,
                                                 const std::vector<std::string> &called) const;

    // An emergency call gets the line, whatever is on it.
    void clear_line(int slot);
    Session &dial(int slot, std::string_view number, const DialRequest &request);
    Answer<Session *> offer(int slot, std::string_view from, CallType type, std::string_view called,
                            const PassedTexts &texts);
    void respond_automatically(SessionRef ref);
    void establish(Session &session);
    void mark_established(Session &session);
    void finish(SessionRef ref, EndReason here, EndReason there);

    // The far end's own doings
    void schedule_step(Session &session);
    void run_step(SessionRef ref);
    void perform(Session &session, const Step &step);
    void alert(Session &session);
    void turn_away(const Session &session);
    void fail(const Session &session, CallErrorCode code, std::string_view why, EndReason reason);
    void call_back(const Session &session, std::chrono::milliseconds later);

    // Where a call to a slot goes
    void ring_slot(Session &caller);
    bool forward_under(Session &caller, int slot, ForwardCondition condition);
    void forward(Session &caller, const std::string &target);
    void divert(SessionRef ringing, EndReason here, const std::string &target);
    void give_up_ringing(SessionRef ref);

    void set_hold(Session &session, bool held);
    void tell_hold(Session &session, bool held, bool here);
    void hold_far_end(const Session &session, bool held);

    Session &add_conference(int slot, CallType type, Phase phase);
    void join(Session &conference, Session &session);
    void invite_all(Session &conference, const std::vector<std::string> &numbers, CallType type);
    void member_answered(Session &member);
    void tell_roster(const Session &conference, const Session *gone = nullptr);
    void leave_conference(const Session &session);
    Answer<int> confer(int slot, Session &first, Session &second, CallType type);

    const NumberPlan &plan_;
    Timers &timers_;
    const Registrations &registrations_;
    const SupplementaryServices &services_;
    std::chrono::nanoseconds ring_time_;
    CallSessions sessions_;
    CallMedia media_;
    CallChanges changes_;
    CallRadio radio_;
};

} // namespace sim
