// SPDX-License-Identifier: Apache-2.0
// Holding, resuming and swapping calls.
#include "sim/call/model.hpp"

namespace sim {

std::optional<Refusal> CallModel::cannot_hold(const Session &session) const {
    if (session.conference != 0)
        return refuse(Result::kWrongState, "call {} takes part in conference {}: hold that",
                      session.ref.id, session.conference);
    if (session.type == CallType::kEmergency)
        return refuse(Result::kWrongState, "call {} is an emergency call", session.ref.id);
    if (session.handover)
        return refuse(Result::kWrongState, "a handover of call {} is under way", session.ref.id);
    return std::nullopt;
}

void CallModel::tell_hold(Session &session, bool held, bool here) {
    (here ? session.held_here : session.held_by_peer) = held;
    if (held)
        sessions_.emit(session.ref.slot, CallHeld{session.ref.id, here, session.type});
    else
        sessions_.emit(session.ref.slot,
                       CallResumed{session.ref.id, here,
                                   here ? session.held_by_peer : session.held_here, session.type});
}

void CallModel::hold_far_end(const Session &session, bool held) {
    if (Session *peer = sessions_.peer_of(session); peer && peer->established())
        tell_hold(*peer, held, false);
}

void CallModel::set_hold(Session &session, bool held) {
    tell_hold(session, held, true);
    hold_far_end(session, held);
    for (const SessionRef ref : sessions_.members_of(session)) {
        Session &member = *sessions_.find(ref);
        member.held_here = held;
        hold_far_end(member, held);
    }
}

Status CallModel::hold(int slot, int id) {
    const auto session = sessions_.established(slot, id);
    if (!session)
        return session.refusal();
    if ((*session)->held_here)
        return refuse(Result::kWrongState, "call {} is on hold already", id);
    if (auto refusal = cannot_hold(**session))
        return *refusal;
    if (const Session *held = sessions_.context(slot, true))
        return refuse(Result::kTooMany, "call {} is on hold already: swap or end one of them",
                      held->ref.id);
    set_hold(**session, true);
    return Done{};
}

Status CallModel::resume(int slot, int id) {
    const auto session = sessions_.established(slot, id);
    if (!session)
        return session.refusal();
    if (!(*session)->held_here)
        return refuse(Result::kWrongState, "call {} is not on hold here", id);
    if (auto refusal = cannot_hold(**session))
        return *refusal;
    // A call that rings here can wait, and one into a conference joins whatever state it is in.
    for (const auto &[other, state] : sessions_[slot].sessions)
        if (!state.established() && state.mobile_originated && state.conference == 0)
            return refuse(Result::kLineInUse, "call {} is still being set up", other);
    if (const Session *active = sessions_.context(slot, false))
        return refuse(Result::kLineInUse, "call {} is active: swap, or end it first",
                      active->ref.id);
    set_hold(**session, false);
    return Done{};
}

Status CallModel::swap(int slot) {
    Session *active = sessions_.context(slot, false);
    Session *held = sessions_.context(slot, true);
    if (!active || !held)
        return refuse(Result::kWrongState, "a swap needs an active and a held call; there is no {}",
                      active ? "held one" : "active one");
    for (const Session *session : {active, held})
        if (auto refusal = cannot_hold(*session))
            return *refusal;
    set_hold(*active, true);
    set_hold(*held, false);
    return Done{};
}

} // namespace sim
