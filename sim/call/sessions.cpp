// SPDX-License-Identifier: Apache-2.0
#include "sim/call/sessions.hpp"

#include <algorithm>
#include <utility>

namespace sim {

namespace {

std::string session_ids(const Line &line) {
    std::string ids;
    for (const auto &[id, session] : line.sessions)
        ids += fmt::format("{}{}", ids.empty() ? "" : ", ", id);
    return ids.empty() ? "there is no call" : "the calls are " + ids;
}

} // namespace

Session *CallSessions::find(SessionRef ref) {
    auto &sessions = lines_[ref.slot].sessions;
    const auto found = sessions.find(ref.id);
    return found == sessions.end() ? nullptr : &found->second;
}

Answer<Session *> CallSessions::existing(int slot, int id) {
    if (Session *session = find({slot, id}))
        return session;
    return refuse(Result::kUnknownSession, "there is no call {}: {}", id,
                  session_ids(lines_[slot]));
}

Answer<Session *> CallSessions::established(int slot, int id) {
    auto session = existing(slot, id);
    if (session && !(*session)->established())
        return refuse(Result::kWrongState, "call {} is not established yet", id);
    return session;
}

Answer<Session *> CallSessions::talking(int slot, int id) {
    auto session = established(slot, id);
    if (session && (*session)->held_here)
        return refuse(Result::kWrongState, "call {} is on hold", id);
    return session;
}

const Session *CallSessions::context(int slot, bool held) const {
    for (const auto &[id, session] : lines_[slot].sessions)
        if (session.established() && session.conference == 0 && session.held_here == held)
            return &session;
    return nullptr;
}

Session *CallSessions::context(int slot, bool held) {
    const Session *found = std::as_const(*this).context(slot, held);
    return found ? find(found->ref) : nullptr;
}

const Session *CallSessions::being_set_up(int slot) const {
    for (const auto &[id, session] : lines_[slot].sessions)
        if (!session.established())
            return &session;
    return nullptr;
}

CallState CallSessions::state_of(const Session &session) const {
    switch (session.phase) {
    case Phase::kDialing:
        return CallState::kDialing;
    case Phase::kAlerting:
        return CallState::kAlerting;
    case Phase::kIncoming:
        return has_established(session.ref.slot) ? CallState::kWaiting : CallState::kIncoming;
    case Phase::kEstablished:
        break;
    }
    if (session.held_here)
        return CallState::kHeld;
    return session.held_by_peer ? CallState::kHeldByPeer : CallState::kActive;
}

bool CallSessions::has_established(int slot) const {
    return std::ranges::any_of(lines_[slot].sessions,
                               [](const auto &entry) { return entry.second.established(); });
}

Session &CallSessions::add(int slot, CallType type, Phase phase) {
    Line &here = lines_[slot];
    const int id = here.next_session++;
    Session &session = here.sessions[id];
    session.ref = {slot, id};
    session.type = type;
    session.phase = phase;
    return session;
}

Session *CallSessions::peer_of(const Session &session) {
    return session.peer ? find(*session.peer) : nullptr;
}

Session *CallSessions::conference_of(const Session &member) {
    return member.conference == 0 ? nullptr : find({member.ref.slot, member.conference});
}

std::vector<SessionRef> CallSessions::members_of(const Session &conference) const {
    std::vector<SessionRef> found;
    if (conference.is_conference)
        for (const auto &[id, session] : lines_[conference.ref.slot].sessions)
            if (session.conference == conference.ref.id)
                found.push_back(session.ref);
    return found;
}

} // namespace sim
