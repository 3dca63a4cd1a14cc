// SPDX-License-Identifier: Apache-2.0
// What the parts of the model stand on, and how calls and slots' parts in them end.
#include "sim/ptt/model.hpp"

#include "sim/ptt/media.hpp"

#include <algorithm>

namespace sim {

PttCalls::PttCalls(const PttDirectory &directory, Timers &timers,
                   const Registrations &registrations, Sink sink)
    : directory_(directory), timers_(timers), registrations_(registrations), sink_(std::move(sink)),
      lines_(directory.slots()) {}

void PttCalls::drop_calls(int slot) {
    leave_all(slot, PttEndReason::kEndedHere);
    lines_[slot].keep_alive.cancel();
}

PttCall *PttCalls::find(int call) {
    const auto found = calls_.find(call);
    return found == calls_.end() ? nullptr : &found->second;
}

PttParticipant *PttCalls::find(PttRef ref) {
    PttCall *call = find(ref.call);
    return call ? call->find(ref.who) : nullptr;
}

PttCall *PttCalls::running_call(std::string_view uri) {
    for (auto &[id, call] : calls_)
        if (call.is_group() && call.uri == uri)
            return &call;
    return nullptr;
}

Answer<PttCalls::Place> PttCalls::existing(int slot, std::int32_t session) {
    const auto found = lines_[slot].sessions.find(session);
    if (found != lines_[slot].sessions.end())
        return Place{*find(found->second.call), *find(found->second)};
    std::string ids;
    for (const auto &[id, ref] : lines_[slot].sessions)
        ids += fmt::format("{}{}", ids.empty() ? "" : ", ", id);
    return refuse(Result::kUnknownSession, "there is no push-to-talk session {}: {}", session,
                  ids.empty() ? "there is none" : "the sessions are " + ids);
}

Answer<PttCalls::Place> PttCalls::connected(int slot, std::int32_t session) {
    const auto place = existing(slot, session);
    if (place && !place->self.connected())
        return refuse(Result::kWrongState, "session {} is not established yet", session);
    return place;
}

void PttCalls::emit(const PttParticipant &participant, const PttEvent &event) const {
    if (participant.is_slot())
        sink_(participant.contact.slot, event);
}

void PttCalls::tell_status(const PttCall &call, const PttParticipant &participant,
                           std::string_view status) const {
    if (!call.is_group())
        return;
    for (const auto &[who, other] : call.participants)
        if (other.connected() && who != participant.ref.who)
            emit(other, PttParticipantInfo{other.session, participant.uri(), std::string(status)});
}

std::int32_t PttCalls::connected_count(const PttCall &call) const {
    return static_cast<std::int32_t>(std::ranges::count_if(
        call.participants, [](const auto &entry) { return entry.second.connected(); }));
}

std::string PttCalls::others_text(const PttCall &call, const PttParticipant &except) const {
    std::string text;
    for (const auto &[who, other] : call.participants)
        if (who != except.ref.who && who != call.owner)
            text += (text.empty() ? "" : " ") + other.uri();
    return text;
}

std::vector<PttRunningCall> PttCalls::running(int slot) const {
    std::vector<PttRunningCall> running;
    for (const auto &[session, ref] : lines_[slot].sessions) {
        const PttCall &call = calls_.at(ref.call);
        const PttParticipant &self = call.participants.at(ref.who);
        if (!call.is_group() || !self.connected())
            continue;
        const auto owner = call.participants.find(call.owner);
        PttRunningCall told{session, call.type,   call.uri,   call.name,
                            {},      call.crisis, self.media, {}};
        if (owner != call.participants.end())
            told.placed_by = owner->second.uri();
        for (const auto &[who, participant] : call.participants)
            told.participants.push_back(
                {participant.uri(), participant.name(), participant.connected()});
        running.push_back(std::move(told));
    }
    return running;
}

Status PttCalls::end(int slot, std::int32_t session, PttEndScope scope) {
    const auto place = existing(slot, session);
    if (!place)
        return place.refusal();
    auto &[call, self] = *place;
    if (scope != PttEndScope::kLeave && scope != PttEndScope::kForAll)
        return refuse(Result::kInvalidArgument,
                      "a call is ended for 0 (the one who asks) or 1 (everybody), not {}", scope);
    if (self.phase == PttPhase::kAlerting)
        return refuse(Result::kWrongState, "session {} rings here: reject it", session);
    if (scope == PttEndScope::kForAll && call.owner != self.ref.who)
        return refuse(Result::kWrongState,
                      "session {} was not placed here; 0 leaves it to the others", session);
    // A call that is not established ends with the one who placed it.
    if (scope == PttEndScope::kForAll)
        call.established = false;
    leave(self.ref, PttEndReason::kEndedHere, PttEndReason::kEndedByPeer);
    return Done{};
}

Status PttCalls::reject(int slot, std::int32_t session, PttRejectReason reason) {
    const auto place = existing(slot, session);
    if (!place)
        return place.refusal();
    if (place->self.phase != PttPhase::kAlerting)
        return refuse(Result::kWrongState, "session {} does not ring here", session);
    if (reason != PttRejectReason::kDecline && reason != PttRejectReason::kBusy)
        return refuse(Result::kInvalidArgument, "a reason is 0 (decline) or 1 (busy), not {}",
                      reason);
    const auto why =
        reason == PttRejectReason::kBusy ? PttEndReason::kBusy : PttEndReason::kDeclined;
    leave(place->self.ref, why, why);
    return Done{};
}

void PttCalls::leave(PttRef ref, PttEndReason here, PttEndReason there) {
    PttCall *call = find(ref.call);
    if (!call)
        return;
    const auto node = call->participants.extract(ref.who);
    if (node.empty())
        return;
    const PttParticipant &gone = node.mapped();
    const bool owner_left = call->owner == ref.who;
    if (gone.is_slot() && gone.session != 0) {
        lines_[gone.contact.slot].sessions.erase(gone.session);
        emit(gone, PttCallEnded{gone.session, here});
    }
    if (call->established)
        tell_status(*call, gone, "disconnected");
    const bool goes_on = call->participants.size() > 1 || call->type == PttCallType::kChannel;
    if (call->established && goes_on) {
        forget_speaker(*call, ref.who);
        settle_change(*call, ref.who, std::nullopt);
    }
    wind_up(ref.call, owner_left, there);
}

void PttCalls::wind_up(int id, bool owner_left, PttEndReason there) {
    PttCall *call = find(id);
    // Parties of the network do not talk among themselves.
    if (std::ranges::none_of(call->participants,
                             [](const auto &entry) { return entry.second.is_slot(); })) {
        calls_.erase(id);
        return;
    }
    const bool alone = call->participants.size() == 1;
    const PttRef first = call->participants.begin()->second.ref;
    if (!call->is_group())
        return leave(first, there, there);
    if (!call->established && owner_left)
        while (find(id))
            leave(find(id)->participants.begin()->second.ref, there, there);
    else if (!call->established && alone && call->owner == first.who)
        leave(first, there, there);
    else if (call->established && alone && call->type != PttCallType::kChannel)
        leave(first, PttEndReason::kOver, PttEndReason::kOver);
}

void PttCalls::leave_all(int slot, PttEndReason reason) {
    while (!lines_[slot].sessions.empty())
        leave(lines_[slot].sessions.begin()->second, reason, PttEndReason::kNetworkFailure);
}

Status PttCalls::keep_alive(int slot, std::int32_t seconds) {
    if (auto refusal = registrations_.radio_off(slot))
        return *refusal;
    if (auto refusal = bad_seconds(seconds, "the time until the next keep-alive"))
        return *refusal;
    lines_[slot].keep_alive.cancel();
    if (seconds > 0)
        lines_[slot].keep_alive =
            timers_.after_unscaled(std::chrono::seconds(seconds), [this, slot] {
                leave_all(slot, PttEndReason::kKeepAliveMissed);
            });
    return Done{};
}

Status PttCalls::convert_to_crisis(int slot, std::int32_t session) {
    const auto place = connected(slot, session);
    if (!place)
        return place.refusal();
    auto &[call, self] = *place;
    if (call.crisis)
        return refuse(Result::kWrongState, "session {} is a crisis call already", session);
    call.crisis = true;
    call.crisis_by = self.ref.who;
    for (const auto &[who, participant] : call.participants)
        if (participant.connected())
            emit(participant, PttCrisisInitiated{participant.session});
    return Done{};
}

Answer<std::vector<PttContact>> PttCalls::others(int slot, std::int32_t session, PttMedia media) {
    const auto place = connected(slot, session);
    if (!place)
        return place.refusal();
    if (place->self.media[media] == 0)
        return refuse(Result::kWrongState, "session {} has no {} among its media", session,
                      media == kPttMessages ? "messages" : "files");
    std::vector<PttContact> others;
    for (const auto &[who, participant] : place->call.participants)
        if (who != place->self.ref.who && participant.connected()) {
            PttContact &other = others.emplace_back(participant.contact);
            other.uri = participant.uri();
            other.display_name = participant.name();
            other.session = participant.session;
            other.group_uri = place->call.uri;
        }
    return others;
}

std::string PttCalls::uri_in(int slot, std::int32_t session) {
    const auto &sessions = lines_[slot].sessions;
    const auto found = sessions.find(session);
    return found == sessions.end() ? directory_.uri_of(slot) : find(found->second)->uri();
}

Answer<std::string> PttCalls::talking_to(int slot, std::int32_t session) {
    const auto place = connected(slot, session);
    if (!place)
        return place.refusal();
    if (place->call.is_group())
        return place->call.uri;
    for (const auto &[who, participant] : place->call.participants)
        if (who != place->self.ref.who)
            return participant.uri();
    return std::string();
}

} // namespace sim
