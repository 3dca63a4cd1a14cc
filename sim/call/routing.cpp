// SPDX-License-Identifier: Apache-2.0
// Where a call to a slot goes: it rings there, goes on to another number, or comes back.
#include "sim/call/model.hpp"

#include <algorithm>

namespace sim {

namespace {

constexpr int kMaxDiversions = 5;
// A party's first step is the network's, which has the call already.
constexpr std::size_t kStepAfterProceeding = 1;

} // namespace

void CallModel::ring_slot(Session &caller) {
    const int slot = *plan_.slot_of(caller.route);
    if (services_.bars_incoming(slot, caller.type))
        return fail(caller, CallErrorCode::kForbidden, "incoming calls are barred there",
                    EndReason::kDeclined);
    if (forward_under(caller, slot, ForwardCondition::kUnconditional))
        return;
    if (!registrations_.registered(slot)) {
        if (!forward_under(caller, slot, ForwardCondition::kNotReachable))
            fail(caller, CallErrorCode::kTemporarilyUnavailable, "the party cannot be reached",
                 EndReason::kUnreachable);
        return;
    }
    const auto offered =
        offer(slot, plan_.number_of(caller.ref.slot), caller.type, caller.number, caller.texts);
    if (!offered) {
        if (!forward_under(caller, slot, ForwardCondition::kBusy))
            turn_away(caller);
        return;
    }
    Session &callee = **offered;
    callee.peer = caller.ref;
    caller.peer = callee.ref;
    const auto until_forwarded = services_.no_reply_time(slot, caller.type);
    const auto patience = until_forwarded
                              ? std::min<std::chrono::nanoseconds>(ring_time_, *until_forwarded)
                              : ring_time_;
    callee.ring_timer =
        timers_.after_unscaled(patience, [this, ref = callee.ref] { give_up_ringing(ref); });
    alert(caller);
}

// Why a party of the network does not get through to a slot.
std::optional<Refusal> CallModel::out_of_reach(int slot, CallType type) const {
    if (services_.bars_incoming(slot, type))
        return refuse(Result::kBarred, "incoming calls of slot {} are barred", slot);
    if (const auto target = services_.forward_target(slot, ForwardCondition::kUnconditional, type))
        return refuse(Result::kWrongState, "calls of slot {} go to {}", slot, *target);
    if (!registrations_.registered(slot))
        return refuse(Result::kWrongState, "slot {} is not registered", slot);
    return std::nullopt;
}

bool CallModel::forward_under(Session &caller, int slot, ForwardCondition condition) {
    const auto target = services_.forward_target(slot, condition, caller.type);
    if (target)
        forward(caller, *target);
    return target.has_value();
}

void CallModel::forward(Session &caller, const std::string &target) {
    if (++caller.diversions > kMaxDiversions)
        return fail(caller, CallErrorCode::kLoopDetected, "the call was forwarded too often",
                    EndReason::kUnreachable);
    sessions_.emit(caller.ref.slot, CallForwarded{caller.ref.id});
    caller.route = target;
    caller.peer_uri = to_uri(target);
    caller.party = &party_at(plan_, caller.ref.slot, target);
    caller.next_step = kStepAfterProceeding;
    schedule_step(caller);
}

// A call that rings here goes on to another number.
void CallModel::divert(SessionRef ringing, EndReason here, const std::string &target) {
    Session *callee = sessions_.find(ringing);
    const auto caller_ref = callee->peer;
    callee->peer.reset();
    finish(ringing, here, here);
    Session *caller = caller_ref ? sessions_.find(*caller_ref) : nullptr;
    if (!caller)
        return;
    caller->peer.reset();
    forward(*caller, target);
}

void CallModel::give_up_ringing(SessionRef ref) {
    const Session *ringing = sessions_.find(ref);
    if (!ringing)
        return;
    const auto target =
        services_.forward_target(ref.slot, ForwardCondition::kNoReply, ringing->type);
    if (target)
        divert(ref, EndReason::kMissed, *target);
    else
        finish(ref, EndReason::kMissed, EndReason::kNoAnswer);
}

void CallModel::drop_calls(int slot) {
    Line &here = sessions_[slot];
    here.callback_timer.cancel();
    const auto is_conference = [](const auto &entry) { return entry.second.is_conference; };
    while (!here.sessions.empty()) {
        // A conference takes its calls with it.
        auto next = std::ranges::find_if(here.sessions, is_conference);
        if (next == here.sessions.end())
            next = here.sessions.begin();
        finish(next->second.ref, EndReason::kLocalHangUp, EndReason::kNetworkFailure);
    }
}

} // namespace sim
