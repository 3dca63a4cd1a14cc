// SPDX-License-Identifier: Apache-2.0
#include "sim/ptt/call.hpp"

#include <algorithm>

namespace sim {

std::int32_t PttCall::connected_count() const {
    return static_cast<std::int32_t>(std::ranges::count_if(
        participants, [](const auto &entry) { return entry.second.connected(); }));
}

PttCall *PttSessions::find(int call) {
    const auto found = calls_.find(call);
    return found == calls_.end() ? nullptr : &found->second;
}

PttParticipant *PttSessions::find(PttRef ref) {
    PttCall *call = find(ref.call);
    return call ? call->find(ref.who) : nullptr;
}

PttSessions::Place PttSessions::place_of(PttRef ref) {
    PttCall &call = calls_.at(ref.call);
    return {call, call.participants.at(ref.who)};
}

Answer<PttSessions::Place> PttSessions::existing(int slot, std::int32_t session) {
    const auto found = lines_[slot].sessions.find(session);
    if (found != lines_[slot].sessions.end())
        return place_of(found->second);
    std::string ids;
    for (const auto &[id, ref] : lines_[slot].sessions)
        ids += fmt::format("{}{}", ids.empty() ? "" : ", ", id);
    return refuse(Result::kUnknownSession, "there is no push-to-talk session {}: {}", session,
                  ids.empty() ? "there is none" : "the sessions are " + ids);
}

Answer<PttSessions::Place> PttSessions::connected(int slot, std::int32_t session) {
    auto place = existing(slot, session);
    if (place && !place->self.connected())
        return refuse(Result::kWrongState, "session {} is not established yet", session);
    return place;
}

void PttSessions::emit(const PttParticipant &participant, const PttEvent &event) const {
    if (participant.is_slot())
        emit(participant.contact.slot, event);
}

void PttSessions::tell_status(const PttCall &call, const PttParticipant &participant,
                              std::string_view status) const {
    if (!call.is_group())
        return;
    for (const auto &[who, other] : call.participants)
        if (other.connected() && who != participant.ref.who)
            emit(other, PttParticipantInfo{other.session, participant.uri(), std::string(status)});
}

} // namespace sim
