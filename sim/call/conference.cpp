// SPDX-License-Identifier: Apache-2.0
// Conferences: a session of their own over member sessions that are ordinary calls.
#include "sim/call/model.hpp"

#include <algorithm>

namespace sim {

namespace {

ParticipantState participant_state(const Session &member) {
    switch (member.phase) {
    case Phase::kEstablished:
        return ParticipantState::kConnected;
    case Phase::kAlerting:
        return ParticipantState::kAlerting;
    default:
        return ParticipantState::kInvited;
    }
}

std::optional<Refusal> not_a_media_type(CallType type) {
    if (type == CallType::kVoice || type == CallType::kVideo)
        return std::nullopt;
    return refuse(Result::kInvalidArgument, "a conference is 0 (voice) or 1 (video), not {}", type);
}

} // namespace

Answer<Session *> CallModel::conference_of(int slot, int id) {
    auto session = sessions_.existing(slot, id);
    if (session && !(*session)->is_conference)
        return refuse(Result::kWrongState, "call {} is not a conference", id);
    return session;
}

Session &CallModel::add_conference(int slot, CallType type, Phase phase) {
    Session &conference = sessions_.add(slot, type, phase);
    conference.is_conference = true;
    conference.mobile_originated = true;
    conference.peer_uri = fmt::format("sip:conference-{}@slot{}.invalid", conference.ref.id, slot);
    return conference;
}

std::optional<Refusal> CallModel::cannot_join(const Session &conference,
                                              const Session &session) const {
    const int id = session.ref.id;
    if (session.is_conference)
        return refuse(Result::kWrongState, "call {} is a conference itself", id);
    if (session.conference != 0)
        return refuse(Result::kWrongState, "call {} takes part in conference {} already", id,
                      session.conference);
    if (session.type == CallType::kEmergency)
        return refuse(Result::kWrongState, "call {} is an emergency call", id);
    if (session.handover)
        return refuse(Result::kWrongState, "a handover of call {} is under way", id);
    return room_for(conference, 1);
}

std::optional<Refusal> CallModel::room_for(const Session &conference, std::size_t more) const {
    if (sessions_.members_of(conference).size() + more > kMaxParticipants)
        return refuse(Result::kTooMany, "a conference has at most {} participants",
                      kMaxParticipants);
    return std::nullopt;
}

void CallModel::join(Session &conference, Session &session) {
    changes_.drop(session);
    if (session.held_here != conference.held_here)
        set_hold(session, conference.held_here);
    session.conference = conference.ref.id;
    sessions_.emit(conference.ref.slot, ParticipantAdded{conference.ref.id, session.ref.id});
}

void CallModel::member_answered(Session &member) {
    Session *conference = sessions_.conference_of(member);
    if (!conference)
        return;
    const int slot = member.ref.slot;
    if (!conference->established()) {
        conference->phase = Phase::kEstablished;
        sessions_.emit(slot, ConferenceEstablished{conference->ref.id, conference->type});
    }
    if (conference->held_here) {
        member.held_here = true;
        hold_far_end(member, true);
    }
    sessions_.emit(slot, ParticipantAdded{conference->ref.id, member.ref.id});
    tell_roster(*conference);
}

void CallModel::tell_roster(const Session &conference, const Session *gone) {
    CallConfNotifyReceived roster{conference.ref.id, {}, {}};
    const auto add = [&](const Session &member, ParticipantState state) {
        roster.states.push_back(static_cast<std::int32_t>(state));
        roster.uris.push_back(member.peer_uri);
    };
    for (const SessionRef ref : sessions_.members_of(conference)) {
        const Session &member = *sessions_.find(ref);
        add(member, participant_state(member));
    }
    if (gone)
        add(*gone, ParticipantState::kGone);
    sessions_.emit(conference.ref.slot, roster);
}

void CallModel::leave_conference(const Session &session) {
    const Session *conference = sessions_.conference_of(session);
    if (!conference)
        return;
    if (session.established())
        sessions_.emit(session.ref.slot, ParticipantRemoved{conference->ref.id, session.ref.id});
    tell_roster(*conference, &session);
}

Answer<int> CallModel::confer(int slot, Session &first, Session &second, CallType type) {
    Session *conference = first.is_conference ? &first : second.is_conference ? &second : nullptr;
    if (conference) {
        Session &session = conference == &first ? second : first;
        if (auto refusal = cannot_join(*conference, session))
            return *refusal;
        if (conference->held_here)
            set_hold(*conference, false);
        join(*conference, session);
    } else {
        for (const Session *session : {&first, &second})
            if (auto refusal = cannot_join(Session{}, *session))
                return *refusal;
        conference = &add_conference(slot, type, Phase::kEstablished);
        sessions_.emit(slot, ConferenceEstablished{conference->ref.id, type});
        join(*conference, first);
        join(*conference, second);
    }
    tell_roster(*conference);
    return conference->ref.id;
}

Answer<int> CallModel::merge(int slot) {
    Session *active = sessions_.context(slot, false);
    Session *held = sessions_.context(slot, true);
    if (!active || !held)
        return refuse(Result::kWrongState,
                      "a merge needs an active and a held call; there is no {}",
                      active ? "held one" : "active one");
    const bool video = active->type == CallType::kVideo && held->type == CallType::kVideo;
    return confer(slot, *active, *held, video ? CallType::kVideo : CallType::kVoice);
}

Answer<int> CallModel::start_nway(int slot, int first, int second, CallType type) {
    if (auto refusal = not_a_media_type(type))
        return *refusal;
    if (first == second)
        return refuse(Result::kInvalidArgument, "a conference needs two calls, not call {} twice",
                      first);
    const auto one = sessions_.established(slot, first);
    if (!one)
        return one.refusal();
    const auto other = sessions_.established(slot, second);
    if (!other)
        return other.refusal();
    for (const Session *session : {*one, *other}) {
        if (session->is_conference)
            return refuse(Result::kWrongState, "call {} is a conference: add the other call to it",
                          session->ref.id);
        if (type == CallType::kVideo && session->type != CallType::kVideo)
            return refuse(Result::kWrongState, "call {} is not a video call", session->ref.id);
    }
    return confer(slot, **one, **other, type);
}

Status CallModel::add_participant(int slot, int conference, int id) {
    const auto to = conference_of(slot, conference);
    if (!to)
        return to.refusal();
    if (!(*to)->established())
        return refuse(Result::kWrongState, "conference {} is not established yet", conference);
    const auto session = sessions_.established(slot, id);
    if (!session)
        return session.refusal();
    if (auto refusal = cannot_join(**to, **session))
        return *refusal;
    join(**to, **session);
    tell_roster(**to);
    return Done{};
}

Status CallModel::remove_participant(int slot, int conference, int id) {
    const auto from = conference_of(slot, conference);
    if (!from)
        return from.refusal();
    const auto session = sessions_.existing(slot, id);
    if (!session)
        return session.refusal();
    if ((*session)->conference != conference)
        return refuse(Result::kWrongState, "call {} does not take part in conference {}", id,
                      conference);
    finish({slot, id}, EndReason::kRemovedFromConference, EndReason::kRemovedFromConference);
    return Done{};
}

Answer<std::vector<std::string>>
CallModel::new_participants(int slot, const Session &conference,
                            const std::vector<std::string> &called) const {
    if (called.empty())
        return refuse(Result::kInvalidArgument, "there is no participant in the list");
    if (auto refusal = room_for(conference, called.size()))
        return *refusal;
    std::vector<std::string> taken;
    for (const SessionRef ref : sessions_.members_of(conference))
        taken.push_back(sessions_[slot].sessions.at(ref.id).number);
    std::vector<std::string> numbers;
    for (const auto &text : called) {
        auto number = parse_number(text);
        if (!number)
            return number.refusal();
        if (is_emergency(*number) || same_number(*number, plan_.number_of(slot)))
            return refuse(Result::kInvalidArgument, "{} cannot take part", *number);
        const auto same = [&](const std::string &other) { return same_number(other, *number); };
        if (std::ranges::any_of(taken, same))
            return refuse(Result::kInvalidArgument, "{} takes part already", *number);
        taken.push_back(*number);
        numbers.push_back(*number);
    }
    return numbers;
}

void CallModel::invite_all(Session &conference, const std::vector<std::string> &numbers,
                           CallType type) {
    for (const auto &number : numbers)
        dial(conference.ref.slot, number, {number, type, {}}).conference = conference.ref.id;
    tell_roster(conference);
}

Status CallModel::invite(int slot, int conference, std::string_view called, CallType type) {
    if (auto refusal = not_a_media_type(type))
        return *refusal;
    const auto to = conference_of(slot, conference);
    if (!to)
        return to.refusal();
    const auto numbers = new_participants(slot, **to, {std::string(called)});
    if (!numbers)
        return numbers.refusal();
    if (auto refusal = cannot_dial_all(slot, *numbers, type))
        return *refusal;
    invite_all(**to, *numbers, type);
    return Done{};
}

Answer<int> CallModel::start_conference(int slot, CallType type,
                                        const std::vector<std::string> &called) {
    if (auto refusal = not_a_media_type(type))
        return *refusal;
    const auto numbers = new_participants(slot, Session{}, called);
    if (!numbers)
        return numbers.refusal();
    if (auto refusal = cannot_dial_all(slot, *numbers, type))
        return *refusal;
    if (auto refusal = line_in_use(slot))
        return *refusal;
    Session &conference = add_conference(slot, type, Phase::kDialing);
    invite_all(conference, *numbers, type);
    return conference.ref.id;
}

Answer<int> CallModel::modify_conference(int slot, int conference, ConferenceChange change,
                                         const std::vector<std::string> &called) {
    const auto target = conference_of(slot, conference);
    if (!target)
        return target.refusal();
    if (change == ConferenceChange::kAdd) {
        const auto numbers = new_participants(slot, **target, called);
        if (!numbers)
            return numbers.refusal();
        if (auto refusal = cannot_dial_all(slot, *numbers, (*target)->type))
            return *refusal;
        invite_all(**target, *numbers, (*target)->type);
        return conference;
    }
    if (change != ConferenceChange::kRemove)
        return refuse(Result::kInvalidArgument, "a change is 1 (add) or 2 (remove), not {}",
                      change);
    const auto leaving = participants(slot, **target, called);
    if (!leaving)
        return leaving.refusal();
    for (const SessionRef ref : *leaving)
        finish(ref, EndReason::kRemovedFromConference, EndReason::kRemovedFromConference);
    return conference;
}

Answer<std::vector<SessionRef>>
CallModel::participants(int slot, const Session &conference,
                        const std::vector<std::string> &called) const {
    if (called.empty())
        return refuse(Result::kInvalidArgument, "there is no participant in the list");
    std::vector<SessionRef> found;
    for (const auto &text : called) {
        const auto number = parse_number(text);
        if (!number)
            return number.refusal();
        const auto refs = sessions_.members_of(conference);
        const auto match = std::ranges::find_if(refs, [&](SessionRef ref) {
            const Session &member = sessions_[slot].sessions.at(ref.id);
            return same_number(member.number, *number) || same_number(member.route, *number);
        });
        if (match == refs.end())
            return refuse(Result::kInvalidArgument, "{} does not take part", *number);
        found.push_back(*match);
    }
    return found;
}

} // namespace sim
