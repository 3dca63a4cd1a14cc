// SPDX-License-Identifier: Apache-2.0
// Voice to video and back.
#include "sim/call/model.hpp"

namespace sim {

namespace {

constexpr std::chrono::milliseconds kPartyDecides{500};
constexpr std::chrono::seconds kSlotDecides{15};

} // namespace

Answer<Session *> CallModel::changeable(int slot, int id) {
    auto session = talking(slot, id);
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
    if ((*session)->change)
        return refuse(Result::kWrongState, "call {} has a change request without an answer", id);
    return session;
}

void CallModel::switch_type(Session &session, CallType type) {
    const auto apply = [&](Session &end) {
        end.type = type;
        end.change.reset();
        end.change_timer.cancel();
        emit(end.ref.slot, CallSwitched{end.ref.id, type});
    };
    apply(session);
    if (Session *peer = session.peer ? find(*session.peer) : nullptr)
        apply(*peer);
}

void CallModel::drop_change(Session &session) {
    const auto drop = [](Session &end) {
        end.change.reset();
        end.change_timer.cancel();
    };
    drop(session);
    if (Session *peer = session.peer ? find(*session.peer) : nullptr)
        drop(*peer);
}

void CallModel::refuse_change(Session &asker, CallErrorCode code, std::string_view why) {
    drop_change(asker);
    emit(asker.ref.slot, CallError{asker.ref.id, code, std::string(why)});
}

Answer<ChangeOutcome> CallModel::request_change(Session &session, CallType wanted) {
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
    session.change = PendingChange{true, wanted};
    if (Session *peer = session.peer ? find(*session.peer) : nullptr) {
        peer->change = PendingChange{false, wanted};
        emit(peer->ref.slot, CallChangeRequest{peer->ref.id, wanted, media_of(wanted)});
        session.change_timer = timers_.after_unscaled(kSlotDecides, [this, ref = session.ref] {
            if (Session *asker = find(ref))
                refuse_change(*asker, CallErrorCode::kRequestTimeout,
                              "the change request was not answered");
        });
    } else {
        session.change_timer = timers_.after(kPartyDecides, [this, ref = session.ref] {
            Session *asker = find(ref);
            if (asker && (!asker->party || asker->party->accepts_changes))
                switch_type(*asker, asker->change->wanted);
            else if (asker)
                refuse_change(*asker, CallErrorCode::kNotAcceptable,
                              "the change request was rejected");
        });
    }
    return ChangeOutcome{session.type, true};
}

Status CallModel::upgrade(int slot, int id, CallType wanted) {
    if (wanted != CallType::kVideo)
        return refuse(Result::kInvalidArgument, "a call is upgraded to 1 (video), not {}", wanted);
    const auto session = changeable(slot, id);
    if (!session)
        return session.refusal();
    const auto outcome = request_change(**session, wanted);
    return outcome ? Status(Done{}) : Status(outcome.refusal());
}

Status CallModel::downgrade(int slot, int id, CallType wanted) {
    if (wanted != CallType::kVoice)
        return refuse(Result::kInvalidArgument, "a call is downgraded to 0 (voice), not {}",
                      wanted);
    const auto session = changeable(slot, id);
    if (!session)
        return session.refusal();
    const auto outcome = request_change(**session, wanted);
    return outcome ? Status(Done{}) : Status(outcome.refusal());
}

Answer<ChangeOutcome> CallModel::change(int slot, int id, CallType wanted) {
    const auto session = changeable(slot, id);
    if (!session)
        return session.refusal();
    return request_change(**session, wanted);
}

Answer<Session *> CallModel::asked_to_change(int slot, int id) {
    auto session = established(slot, id);
    if (session && (!(*session)->change || (*session)->change->asked_here))
        return refuse(Result::kWrongState, "the other side of call {} has asked for no change", id);
    return session;
}

Status CallModel::accept_change(int slot, int id) {
    const auto session = asked_to_change(slot, id);
    if (!session)
        return session.refusal();
    switch_type(**session, (*session)->change->wanted);
    return Done{};
}

Status CallModel::reject_change(int slot, int id) {
    const auto session = asked_to_change(slot, id);
    if (!session)
        return session.refusal();
    Session *asker = (*session)->peer ? find(*(*session)->peer) : nullptr;
    if (asker)
        refuse_change(*asker, CallErrorCode::kNotAcceptable, "the change request was rejected");
    else
        drop_change(**session);
    return Done{};
}

} // namespace sim
