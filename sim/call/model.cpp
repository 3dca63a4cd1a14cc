// SPDX-License-Identifier: Apache-2.0
// Calls from their first number to their end.
#include "sim/call/model.hpp"

#include <utility>

namespace sim {

namespace {

constexpr std::chrono::seconds kNetworkRingTime{30};
constexpr std::int32_t kMaxAutoResponseDelay = 60;

} // namespace

CallModel::CallModel(const NumberPlan &plan, Timers &timers, Registrations &registrations,
                     const SupplementaryServices &services, std::chrono::nanoseconds ring_time,
                     Sink sink)
    : plan_(plan), timers_(timers), registrations_(registrations), services_(services),
      ring_time_(ring_time), sessions_(plan.slots(), std::move(sink)),
      media_(sessions_, plan.slots()), changes_(sessions_, timers, plan.slots()),
      radio_(sessions_, registrations, plan.slots()) {}

std::vector<CallInfo> CallModel::list(int slot) const {
    std::vector<CallInfo> calls;
    for (const auto &[id, session] : sessions_[slot].sessions)
        calls.push_back({id, session.peer_uri, session.type, session.mobile_originated,
                         sessions_.state_of(session),
                         session.is_conference || session.conference != 0});
    return calls;
}

std::optional<Refusal> CallModel::cannot_dial(int slot, std::string_view number,
                                              CallType type) const {
    if (type < CallType::kVoice || type > CallType::kEmergency)
        return refuse(Result::kInvalidArgument,
                      "a call is 0 (voice), 1 (video) or 2 (emergency), not {}", type);
    const bool emergency = is_emergency(number);
    if (type == CallType::kEmergency && !emergency)
        return refuse(Result::kInvalidArgument, "{} is no emergency number (112, 911 are)", number);
    if (auto refusal = registrations_.radio_off(slot))
        return refusal;
    if (!emergency) {
        if (auto refusal = radio_.bars(slot, type))
            return refusal;
        if (auto refusal = services_.bars_outgoing(slot, number, type))
            return refusal;
    }
    for (const auto &[id, session] : sessions_[slot].sessions)
        if (session.type == CallType::kEmergency)
            return refuse(Result::kLineInUse, "call {} is an emergency call", id);
    return std::nullopt;
}

std::optional<Refusal> CallModel::cannot_dial_all(int slot, const std::vector<std::string> &numbers,
                                                  CallType type) const {
    for (const auto &number : numbers)
        if (auto refusal = cannot_dial(slot, number, type))
            return refusal;
    return std::nullopt;
}

std::optional<Refusal> CallModel::line_in_use(int slot) const {
    if (const Session *other = sessions_.being_set_up(slot))
        return refuse(Result::kLineInUse, "call {} is still being set up", other->ref.id);
    if (const Session *active = sessions_.context(slot, false))
        return refuse(Result::kLineInUse, "call {} is active: hold or end it first",
                      active->ref.id);
    return std::nullopt;
}

Answer<int> CallModel::make_call(int slot, const DialRequest &request) {
    const auto number = parse_number(request.called);
    if (!number)
        return number.refusal();
    if (auto refusal = cannot_dial(slot, *number, request.type))
        return *refusal;
    if (is_emergency(*number))
        clear_line(slot);
    else if (auto refusal = line_in_use(slot))
        return *refusal;
    return dial(slot, *number, request).ref.id;
}

void CallModel::clear_line(int slot) {
    while (const Session *other = sessions_.being_set_up(slot))
        finish(other->ref, EndReason::kLocalHangUp, EndReason::kRemoteHangUp);
    if (Session *active = sessions_.context(slot, false)) {
        if (const Session *held = sessions_.context(slot, true))
            finish(held->ref, EndReason::kLocalHangUp, EndReason::kRemoteHangUp);
        set_hold(*active, true);
    }
}

Session &CallModel::dial(int slot, std::string_view number, const DialRequest &request) {
    const CallType type = is_emergency(number) ? CallType::kEmergency : request.type;
    Session &session = sessions_.add(slot, type, Phase::kDialing);
    session.mobile_originated = true;
    session.number = number;
    session.route = number;
    session.peer_uri = to_uri(number);
    session.texts = request.texts;
    session.party = &party_at(plan_, slot, number);
    schedule_step(session);
    return session;
}

std::optional<Refusal> CallModel::cannot_ring(int slot, CallType type) const {
    if (const Session *other = sessions_.being_set_up(slot))
        return refuse(Result::kLineInUse, "call {} of slot {} is still being set up", other->ref.id,
                      slot);
    if (sessions_.has_established(slot) && !services_.may_wait(slot, type))
        return refuse(Result::kLineInUse, "slot {} has a call, and call waiting is off", slot);
    return std::nullopt;
}

Answer<Session *> CallModel::offer(int slot, std::string_view from, CallType type,
                                   std::string_view called, const PassedTexts &texts) {
    if (auto refusal = cannot_ring(slot, type))
        return *refusal;
    Session &session = sessions_.add(slot, type, Phase::kIncoming);
    session.number = from;
    session.peer_uri = to_uri(from);
    const bool waiting = sessions_.state_of(session) == CallState::kWaiting;
    sessions_.emit(slot, CallIncomingInd{session.ref.id, session.peer_uri, type, to_uri(called),
                                         texts, waiting});
    const Line &here = sessions_[slot];
    const bool responds = here.auto_response != AutoResponse::kOff &&
                          !(waiting && here.auto_response == AutoResponse::kAnswer);
    if (responds)
        session.auto_response_timer =
            timers_.after(std::chrono::seconds(here.auto_response_delay),
                          [this, ref = session.ref] { respond_automatically(ref); });
    return &session;
}

void CallModel::respond_automatically(SessionRef ref) {
    const Session *session = sessions_.find(ref);
    // A call that has come to wait meanwhile is the user's to answer.
    if (!session || sessions_.state_of(*session) != CallState::kIncoming)
        return;
    switch (sessions_[ref.slot].auto_response) {
    case AutoResponse::kOff:
        return;
    case AutoResponse::kAnswer:
        return static_cast<void>(answer(ref.slot, ref.id, session->type));
    case AutoResponse::kDecline:
        return static_cast<void>(reject(ref.slot, ref.id, RejectReason::kDecline));
    case AutoResponse::kBusy:
        return static_cast<void>(reject(ref.slot, ref.id, RejectReason::kBusy));
    }
}

Answer<int> CallModel::call_from_network(int slot, std::string_view number, CallType type) {
    if (auto refusal = out_of_reach(slot, type))
        return *refusal;
    auto offered = offer(slot, number, type, plan_.number_of(slot), {});
    if (!offered)
        return offered.refusal();
    Session &session = **offered;
    session.ring_timer = timers_.after(kNetworkRingTime, [this, ref = session.ref] {
        finish(ref, EndReason::kMissed, EndReason::kNoAnswer);
    });
    return session.ref.id;
}

Status CallModel::answer(int slot, int id, CallType type) {
    const auto found = sessions_.existing(slot, id);
    if (!found)
        return found.refusal();
    Session &session = **found;
    if (session.phase != Phase::kIncoming)
        return refuse(Result::kWrongState, "call {} does not ring here", id);
    if (type != session.type && type != CallType::kVoice)
        return refuse(Result::kInvalidArgument,
                      "call {} is of type {}; it can be answered as that or as voice, not as {}",
                      id, session.type, type);
    for (const auto &[other, state] : sessions_[slot].sessions)
        if (other != id && !state.established() && state.conference == 0)
            return refuse(Result::kLineInUse, "call {} is still being set up", other);
    if (Session *active = sessions_.context(slot, false)) {
        if (const Session *held = sessions_.context(slot, true))
            return refuse(Result::kTooMany,
                          "call {} is active and call {} on hold: end one of them first",
                          active->ref.id, held->ref.id);
        if (auto refusal = cannot_hold(*active))
            return *refusal;
        set_hold(*active, true);
    }
    session.type = type;
    establish(session);
    return Done{};
}

Status CallModel::end(int slot, int id) {
    const auto session = sessions_.existing(slot, id);
    if (!session)
        return session.refusal();
    if ((*session)->phase == Phase::kIncoming)
        return refuse(Result::kWrongState, "call {} rings here: reject it", id);
    finish({slot, id}, EndReason::kLocalHangUp, EndReason::kRemoteHangUp);
    return Done{};
}

Status CallModel::reject(int slot, int id, RejectReason reason) {
    const auto session = sessions_.existing(slot, id);
    if (!session)
        return session.refusal();
    if ((*session)->phase != Phase::kIncoming)
        return refuse(Result::kWrongState, "call {} does not ring here", id);
    if (reason != RejectReason::kDecline && reason != RejectReason::kBusy)
        return refuse(Result::kInvalidArgument, "a reason is 0 (decline) or 1 (busy), not {}",
                      reason);
    const bool busy = reason == RejectReason::kBusy;
    const auto target = services_.forward_target(slot, ForwardCondition::kBusy, (*session)->type);
    if (busy && (*session)->peer && target) {
        divert({slot, id}, EndReason::kBusy, *target);
        return Done{};
    }
    if (busy && (*session)->peer)
        sessions_.emit((*session)->peer->slot, CallBusy{(*session)->peer->id});
    const auto why = busy ? EndReason::kBusy : EndReason::kDeclined;
    finish({slot, id}, why, why);
    return Done{};
}

Status CallModel::set_auto_response(int slot, AutoResponse mode, std::int32_t delay_seconds) {
    if (mode < AutoResponse::kOff || mode > AutoResponse::kBusy)
        return refuse(Result::kInvalidArgument,
                      "a mode is 0 (off), 1 (answer), 2 (decline) or 3 (busy), not {}", mode);
    if (delay_seconds < 0 || delay_seconds > kMaxAutoResponseDelay)
        return refuse(Result::kInvalidArgument, "a delay is 0 to {} seconds, not {}",
                      kMaxAutoResponseDelay, delay_seconds);
    sessions_[slot].auto_response = mode;
    sessions_[slot].auto_response_delay = delay_seconds;
    return Done{};
}

void CallModel::mark_established(Session &session) {
    session.ring_timer.cancel();
    session.auto_response_timer.cancel();
    session.phase = Phase::kEstablished;
    sessions_.emit(session.ref.slot,
                   CallEstablished{session.ref.id, session.type, session.mobile_originated,
                                   session.peer_uri, session.conference != 0});
    if (session.conference != 0)
        member_answered(session);
}

void CallModel::establish(Session &session) {
    mark_established(session);
    if (Session *peer = sessions_.peer_of(session)) {
        peer->type = session.type;
        mark_established(*peer);
    }
}

void CallModel::finish(SessionRef ref, EndReason here, EndReason there) {
    const auto node = sessions_[ref.slot].sessions.extract(ref.id);
    if (node.empty())
        return;
    const Session &session = node.mapped();
    changes_.drop(ref);
    for (const SessionRef member : sessions_.members_of(session))
        finish(member, EndReason::kConferenceOver, there);
    leave_conference(session);
    sessions_.emit(ref.slot, CallEnded{ref.id, here});
    if (session.peer)
        finish(*session.peer, there, here);
    if (Session *conference = sessions_.conference_of(session);
        conference && sessions_.members_of(*conference).empty())
        finish(conference->ref, EndReason::kConferenceOver, EndReason::kConferenceOver);
    media_.forget(ref);
}

} // namespace sim
