// SPDX-License-Identifier: Apache-2.0
#include "sim/call/change.hpp"

#include <string>

namespace sim {

namespace {

constexpr std::chrono::milliseconds kPartyDecides{500};
constexpr std::chrono::seconds kSlotDecides{15};
constexpr std::chrono::seconds kPartyWaits{15};

} // namespace

Answer<Session *> CallChanges::changeable(int slot, int id) {
    auto session = sessions_.talking(slot, id);
    if (!session)
        return session.refusal();
    if ((*session)->is_conference || (*session)->conference != 0)
        return refuse(Result::kWrongState, "the type of a conference cannot change");
    if ((*session)->type == CallType::kEmergency)
        return refuse(Result::kWrongState, "the type of an emergency call cannot change");
    if ((*session)->held_by_peer)
        return refuse(Result::kWrongState, "the other side has call {} on hold", id);
    if ((*session)->handover)
        return refuse(Result::kWrongState, "a handover of call {} is under way", id);
    if (is_pending({slot, id}))
        return refuse(Result::kWrongState, "call {} has a change request without an answer", id);
    return session;
}

CallChanges::Pending &CallChanges::begin(SessionRef ref, bool asked_here, CallType wanted) {
    Pending &pending = pending_[ref.slot][ref.id];
    pending.asked_here = asked_here;
    pending.wanted = wanted;
    return pending;
}

void CallChanges::drop(const Session &session) {
    drop(session.ref);
    if (session.peer)
        drop(*session.peer);
}

void CallChanges::switch_type(Session &session, CallType type) {
    drop(session);
    const auto apply = [&](Session &end) {
        end.type = type;
        sessions_.emit(end.ref.slot, CallSwitched{end.ref.id, type});
    };
    apply(session);
    if (Session *peer = sessions_.peer_of(session))
        apply(*peer);
}

void CallChanges::refuse_change(const Session &asker, CallErrorCode code, std::string_view why) {
    drop(asker);
    sessions_.emit(asker.ref.slot, CallError{asker.ref.id, code, std::string(why)});
}

Answer<ChangeOutcome> CallChanges::request(Session &session, CallType wanted) {
    if (wanted != CallType::kVoice && wanted != CallType::kVideo)
        return refuse(Result::kInvalidArgument, "a call changes to 0 (voice) or 1 (video), not {}",
                      wanted);
    if (wanted == session.type)
        return refuse(Result::kWrongState, "call {} is of type {} already", session.ref.id, wanted);
    // Nobody needs to agree to less.
    if (wanted == CallType::kVoice) {
        switch_type(session, wanted);
        return ChangeOutcome{wanted, false};
    }
    Timer &timer = begin(session.ref, true, wanted).timer;
    if (const Session *peer = sessions_.peer_of(session)) {
        begin(peer->ref, false, wanted);
        sessions_.emit(peer->ref.slot, CallChangeRequest{peer->ref.id, wanted, media_of(wanted)});
        timer = timers_.after_unscaled(kSlotDecides, [this, ref = session.ref] {
            if (const Session *asker = sessions_.find(ref))
                refuse_change(*asker, CallErrorCode::kRequestTimeout,
                              "the change request was not answered");
        });
    } else {
        timer = timers_.after(kPartyDecides, [this, ref = session.ref, wanted] {
            Session *asker = sessions_.find(ref);
            if (asker && (!asker->party || asker->party->accepts_changes))
                switch_type(*asker, wanted);
            else if (asker)
                refuse_change(*asker, CallErrorCode::kNotAcceptable,
                              "the change request was rejected");
        });
    }
    return ChangeOutcome{session.type, true};
}

Status CallChanges::upgrade(int slot, int id, CallType wanted) {
    if (wanted != CallType::kVideo)
        return refuse(Result::kInvalidArgument, "a call is upgraded to 1 (video), not {}", wanted);
    const auto session = changeable(slot, id);
    if (!session)
        return session.refusal();
    const auto outcome = request(**session, wanted);
    return outcome ? Status(Done{}) : Status(outcome.refusal());
}

Status CallChanges::downgrade(int slot, int id, CallType wanted) {
    if (wanted != CallType::kVoice)
        return refuse(Result::kInvalidArgument, "a call is downgraded to 0 (voice), not {}",
                      wanted);
    const auto session = changeable(slot, id);
    if (!session)
        return session.refusal();
    const auto outcome = request(**session, wanted);
    return outcome ? Status(Done{}) : Status(outcome.refusal());
}

Answer<ChangeOutcome> CallChanges::change(int slot, int id, CallType wanted) {
    const auto session = changeable(slot, id);
    if (!session)
        return session.refusal();
    return request(**session, wanted);
}

Answer<Session *> CallChanges::asked_to_change(int slot, int id) {
    auto session = sessions_.established(slot, id);
    if (session && (!is_pending({slot, id}) || pending_[slot].at(id).asked_here))
        return refuse(Result::kWrongState, "the other side of call {} has asked for no change", id);
    return session;
}

Status CallChanges::accept(int slot, int id) {
    const auto session = asked_to_change(slot, id);
    if (!session)
        return session.refusal();
    switch_type(**session, pending_[slot].at(id).wanted);
    return Done{};
}

Status CallChanges::reject(int slot, int id) {
    const auto session = asked_to_change(slot, id);
    if (!session)
        return session.refusal();
    if (const Session *asker = sessions_.peer_of(**session))
        refuse_change(*asker, CallErrorCode::kNotAcceptable, "the change request was rejected");
    else
        drop(**session);
    return Done{};
}

void CallChanges::ask_video(const Session &session) {
    const bool possible = session.type == CallType::kVoice && !is_pending(session.ref) &&
                          !session.held_here && session.conference == 0;
    if (!possible)
        return;
    Timer &timer = begin(session.ref, false, CallType::kVideo).timer;
    sessions_.emit(session.ref.slot,
                   CallChangeRequest{session.ref.id, CallType::kVideo, media_of(CallType::kVideo)});
    timer = timers_.after_unscaled(kPartyWaits, [this, ref = session.ref] {
        if (const Session *asked = sessions_.find(ref))
            drop(*asked);
    });
}

} // namespace sim
