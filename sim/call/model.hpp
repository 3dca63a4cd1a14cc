// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "sim/base/number_plan.hpp"
#include "sim/base/per_slot.hpp"
#include "sim/base/result.hpp"
#include "sim/call/events.hpp"
#include "sim/call/session.hpp"
#include "sim/registration/registrations.hpp"
#include "sim/ss/model.hpp"

#include <cstdint>
#include <functional>
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

struct ChangeOutcome {
    CallType in_force = CallType::kVoice;
    bool pending = false;
};

struct TtyState {
    TtyMode mode = TtyMode::kOff;
    std::string received;
};

// The calls of all slots: what may be asked of them when, what becomes of them, and who is told.
// A request that makes no sense in the present state is refused and changes nothing.
class CallModel {
  public:
    using Sink = std::function<void(int slot, const CallEvent &event)>;

    // `ring_time`: how long a slot rings before the network gives up.
    CallModel(const NumberPlan &plan, Timers &timers, Registrations &registrations,
              const SupplementaryServices &services, std::chrono::nanoseconds ring_time, Sink sink);

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

    // Change of the call type
    Status upgrade(int slot, int id, CallType wanted);
    Status downgrade(int slot, int id, CallType wanted);
    Answer<ChangeOutcome> change(int slot, int id, CallType wanted);
    Status accept_change(int slot, int id);
    Status reject_change(int slot, int id);

    // Conferences
    Answer<int> merge(int slot);
    Answer<int> start_nway(int slot, int first, int second, CallType type);
    Status add_participant(int slot, int conference, int id);
    Status remove_participant(int slot, int conference, int id);
    Status invite(int slot, int conference, std::string_view called, CallType type);
    Answer<int> start_conference(int slot, CallType type, const std::vector<std::string> &called);
    Answer<int> modify_conference(int slot, int conference, ConferenceChange change,
                                  const std::vector<std::string> &called);

    // Media
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
    TtyState tty(int slot) const;
    Status send_tty(int slot, int id, const std::string &bytes);

    // Radio and access
    Status handover_started(int slot, int id);
    Status handover_failed(int slot, int id);
    bool in_epdg_call(int slot) const;
    Status set_audio_path(int slot, AudioPath path);
    Status set_ssac(int slot, std::int32_t apply, const Ssac &ssac);
    Status set_emergency_pdn(int slot, EmergencyPdn info);
    Status register_emergency_pdn(int slot);
    Status deregister_emergency_pdn(int slot);

  private:
    Session *find(SessionRef ref);
    void emit(int slot, const CallEvent &event) const { sink_(slot, event); }

    // What requests stand on: the session in the state that they need, or the refusal.
    Answer<Session *> existing(int slot, int id);
    Answer<Session *> established(int slot, int id);
    Answer<Session *> talking(int slot, int id);
    Answer<Session *> silent(int slot, int id);
    Answer<Session *> changeable(int slot, int id);
    Answer<Session *> asked_to_change(int slot, int id);
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

    // One active and one held call a slot; a conference counts as one, its members not at all.
    const Session *context(int slot, bool held) const;
    Session *context(int slot, bool held);
    bool has_established(int slot) const;
    const Session *being_set_up(int slot) const;
    CallState state_of(const Session &session) const;

    Session &add_session(int slot, CallType type, Phase phase);
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
    void ask_video(Session &session);
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

    Answer<ChangeOutcome> request_change(Session &session, CallType wanted);
    void switch_type(Session &session, CallType type);
    void drop_change(Session &session);
    void refuse_change(Session &asker, CallErrorCode code, std::string_view why);

    Session &add_conference(int slot, CallType type, Phase phase);
    Session *conference_session(const Session &member);
    std::vector<SessionRef> member_refs(const Session &conference) const;
    void join(Session &conference, Session &session);
    void invite_all(Session &conference, const std::vector<std::string> &numbers, CallType type);
    void member_answered(Session &member);
    void tell_roster(const Session &conference, const Session *gone = nullptr);
    void leave_conference(const Session &session);
    Answer<int> confer(int slot, Session &first, Session &second, CallType type);

    std::vector<SessionRef> far_ends(const Session &session) const;

    const NumberPlan &plan_;
    Timers &timers_;
    Registrations &registrations_;
    const SupplementaryServices &services_;
    std::chrono::nanoseconds ring_time_;
    Sink sink_;
    PerSlot<Line> lines_;
};

} // namespace sim
