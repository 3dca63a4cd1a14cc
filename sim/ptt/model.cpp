// SPDX-License-Identifier: Apache-2.0
// Calls from being placed to their end, and channels. Inviting is in invite.cpp.
#include "sim/ptt/model.hpp"

#include "sim/ptt/media.hpp"

#include <algorithm>
#include <utility>

namespace sim {

namespace {

constexpr std::int32_t kUsualAnswerTime = 30;

} // namespace

PttCalls::PttCalls(const PttDirectory &directory, Timers &timers,
                   const Registrations &registrations, Sink sink)
    : directory_(directory), timers_(timers), registrations_(registrations),
      sessions_(directory.slots(), std::move(sink)), floor_(sessions_, timers),
      changes_(sessions_, timers) {}

std::optional<Refusal> PttCalls::cannot_place(int slot, const PttOffer &offer) {
    if (auto refusal = registrations_.radio_off(slot))
        return refusal;
    if (auto refusal = bad_media(offer.media))
        return refusal;
    if (auto refusal = bad_terms(offer.terms))
        return refusal;
    if (auto refusal = bad_seconds(offer.answer_time, "the time to answer"))
        return refusal;
    if (sessions_[slot].sessions.size() >= kMostSessions)
        return refuse(Result::kTooMany, "slot {} has {} push-to-talk sessions, and no more can be",
                      slot, kMostSessions);
    return std::nullopt;
}

PttCall &PttCalls::add_call(int slot, PttCallType type, const PttOffer &offer) {
    const int id = next_call_++;
    PttCall &call = sessions_.calls()[id];
    call.id = id;
    call.type = type;
    call.crisis = offer.crisis;
    call.automatic = offer.automatic || type == PttCallType::kChannel;
    call.takes_floor = offer.takes_floor;
    call.media = or_usual(offer.media);
    call.terms = offer.terms;
    call.answer_time = seconds_or(offer.answer_time, kUsualAnswerTime);
    PttContact caller{directory_.uri_of(slot), offer.caller_name, slot, nullptr, {}, false, 0};
    PttParticipant &owner = add_participant(call, caller);
    owner.placed = true;
    owner.phase = PttPhase::kConnecting;
    open_session(call, owner);
    call.owner = owner.ref.who;
    if (call.crisis)
        call.crisis_by = call.owner;
    call.step = timers_.after(kAcceptTime, [this, id] { proceed(id); });
    return call;
}

PttParticipant &PttCalls::add_participant(PttCall &call, const PttContact &contact) {
    const int who = call.next_participant++;
    PttParticipant &participant = call.participants[who];
    participant.ref = {call.id, who};
    participant.contact = contact;
    participant.automatic = call.automatic;
    participant.answer_time = call.answer_time;
    participant.media = call.media;
    // The rank of the one who calls is not the others'.
    participant.terms = call.terms;
    if (who != 1)
        participant.terms[kPttPriority] = 0;
    return participant;
}

void PttCalls::open_session(PttCall &call, PttParticipant &participant) {
    PttLine &here = sessions_[participant.contact.slot];
    participant.session = here.next_session++;
    participant.listens_only =
        call.type == PttCallType::kChannel && here.channel_mode == PttChannelMode::kListenOnly;
    here.sessions[participant.session] = participant.ref;
}

Answer<std::int32_t> PttCalls::make_call(int slot, const PttCallRequest &request) {
    if (auto refusal = cannot_place(slot, request.offer))
        return *refusal;
    PttCall plan;
    const auto called = called_by(slot, request, plan);
    if (!called)
        return called.refusal();
    if (PttCall *running = plan.uri.empty() ? nullptr : running_call(plan.uri)) {
        for (const auto &[who, participant] : running->participants)
            if (participant.contact.slot == slot)
                return refuse(Result::kLineInUse, "this call goes on: it is session {}",
                              participant.session);
        if (common_media(or_usual(request.offer.media), running->media) == FourIntegers{})
            return refuse(Result::kInvalidArgument,
                          "the call goes on, and has none of these media");
        return join(*running, slot, request.offer);
    }
    PttCall &call = add_call(slot, request.type, request.offer);
    call.uri = plan.uri;
    call.name = plan.name;
    for (const auto &contact : *called)
        add_participant(call, contact);
    return call.participants.at(call.owner).session;
}

Answer<std::vector<PttContact>> PttCalls::called_by(int slot, const PttCallRequest &request,
                                                    PttCall &call) {
    switch (request.type) {
    case PttCallType::kOneToOne:
        return directory_.resolve(slot, {{0, request.called, {}, false}});
    case PttCallType::kGroup: {
        call.uri = request.called;
        auto members = directory_.members(slot, request.called);
        if (members && members->empty())
            return refuse(Result::kInvalidArgument, "group \"{}\" has no other members",
                          request.called);
        return members;
    }
    case PttCallType::kChannel: {
        const auto channel = sessions_[slot].channel;
        if (channel == 0)
            return refuse(Result::kWrongState, "slot {} is on no channel: PocSetChannel tunes it",
                          slot);
        call.uri = channel_uri(channel);
        call.name = fmt::format("Channel {}", channel);
        std::vector<PttContact> tuned;
        for (int other = 0; other < directory_.slots(); ++other)
            if (other != slot && sessions_[other].channel == channel)
                tuned.push_back({directory_.uri_of(other), {}, other, nullptr, call.uri, false, 0});
        return tuned;
    }
    case PttCallType::kAdHoc:
        break;
    }
    return refuse(Result::kInvalidArgument,
                  "a call is of type 0 (one to one), 1 (group) or 3 (channel), not {}",
                  request.type);
}

std::int32_t PttCalls::join(PttCall &call, int slot, const PttOffer &offer) {
    PttParticipant &late = add_participant(
        call, {directory_.uri_of(slot), offer.caller_name, slot, nullptr, call.uri, false, 0});
    late.placed = true;
    late.phase = PttPhase::kConnecting;
    late.media = common_media(or_usual(offer.media), call.media);
    late.terms = offer.terms;
    open_session(call, late);
    late.step = timers_.after(kAcceptTime, [this, ref = late.ref] {
        PttParticipant &self = *sessions_.find(ref);
        sessions_.emit(self, PttCallInProgress{self.session});
        self.step = timers_.after(kRouteTime, [this, ref] { connect(ref); });
    });
    return late.session;
}

void PttCalls::proceed(int id) {
    PttCall &call = *sessions_.find(id);
    const PttParticipant &owner = call.participants.at(call.owner);
    sessions_.emit(owner, PttCallInProgress{owner.session});
    call.step = timers_.after(kRouteTime, [this, id] { invite_all(id); });
}

Status PttCalls::answer(int slot, const PttModifyRequest &request) {
    const auto place = sessions_.existing(slot, request.session);
    if (!place)
        return place.refusal();
    auto &[call, self] = *place;
    if (self.phase != PttPhase::kAlerting)
        return refuse(Result::kWrongState, "session {} does not ring here", request.session);
    if (auto refusal = bad_media(request.media))
        return *refusal;
    if (auto refusal = bad_terms(request.terms))
        return *refusal;
    if (request.changes_media) {
        const auto common = common_media(or_usual(request.media), call.media);
        if (common == FourIntegers{})
            return refuse(Result::kInvalidArgument, "session {} has none of these media",
                          request.session);
        self.media = common;
    }
    if (request.changes_terms)
        self.terms = request.terms;
    connect(self.ref);
    return Done{};
}

void PttCalls::connect(PttRef ref) {
    PttCall &call = *sessions_.find(ref.call);
    PttParticipant &participant = *call.find(ref.who);
    PttParticipant *owner = call.find(call.owner);
    if (!std::exchange(call.established, true) && owner && owner != &participant)
        enter(call, *owner);
    enter(call, participant);
}

void PttCalls::enter(PttCall &call, PttParticipant &participant) {
    participant.step.cancel();
    participant.patience.cancel();
    participant.phase = PttPhase::kConnected;
    PttPeer peer = to_peer(call.uri, call.name, true);
    if (!call.is_group())
        for (const auto &[who, other] : call.participants)
            if (who != participant.ref.who)
                peer = to_peer(other.uri(), other.name());
    sessions_.emit(participant,
                   PttCallEstablished{participant.session, call.type, participant.placed, peer.uri,
                                      call.crisis, participant.media, participant.automatic,
                                      participant.terms, peer});
    if (call.crisis)
        sessions_.emit(participant, PttCrisisInitiated{participant.session});
    if (call.is_group())
        for (const auto &[who, other] : call.participants)
            if (who != participant.ref.who && other.phase != PttPhase::kInvited)
                sessions_.emit(participant,
                               PttParticipantInfo{participant.session, other.uri(),
                                                  other.connected() ? "connected" : "alerting"});
    sessions_.tell_status(call, participant, "connected");
    if (participant.ref.who == call.owner && std::exchange(call.takes_floor, false))
        floor_.ask(call, participant,
                   {participant.ref.who,
                    participant.terms[kPttPriority],
                    {1, 0, 0, 0},
                    participant.name()},
                   std::chrono::seconds(kPttUsualTalkTime));
    else
        floor_.tell(call, participant);
    if (!participant.is_slot())
        practise_habit(call, participant);
}

void PttCalls::drop_calls(int slot) {
    leave_all(slot, PttEndReason::kEndedHere);
    sessions_[slot].keep_alive.cancel();
}

PttCall *PttCalls::running_call(std::string_view uri) {
    for (auto &[id, call] : sessions_.calls())
        if (call.is_group() && call.uri == uri)
            return &call;
    return nullptr;
}

std::string PttCalls::others_text(const PttCall &call, const PttParticipant &except) const {
    std::string text;
    for (const auto &[who, other] : call.participants)
        if (who != except.ref.who && who != call.owner)
            text += (text.empty() ? "" : " ") + other.uri();
    return text;
}

Status PttCalls::end(int slot, std::int32_t session, PttEndScope scope) {
    const auto place = sessions_.existing(slot, session);
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
    const auto place = sessions_.existing(slot, session);
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
    PttCall *call = sessions_.find(ref.call);
    if (!call)
        return;
    const auto node = call->participants.extract(ref.who);
    if (node.empty())
        return;
    const PttParticipant &gone = node.mapped();
    const bool owner_left = call->owner == ref.who;
    if (gone.is_slot() && gone.session != 0) {
        sessions_[gone.contact.slot].sessions.erase(gone.session);
        sessions_.emit(gone, PttCallEnded{gone.session, here});
    }
    if (call->established)
        sessions_.tell_status(*call, gone, "disconnected");
    const bool goes_on = call->participants.size() > 1 || call->type == PttCallType::kChannel;
    if (call->established && goes_on) {
        floor_.forget(*call, ref.who);
        changes_.settle(*call, ref.who, std::nullopt);
    }
    wind_up(ref.call, owner_left, there);
}

void PttCalls::wind_up(int id, bool owner_left, PttEndReason there) {
    PttCall *call = sessions_.find(id);
    // Parties of the network do not talk among themselves.
    if (std::ranges::none_of(call->participants,
                             [](const auto &entry) { return entry.second.is_slot(); })) {
        sessions_.calls().erase(id);
        return;
    }
    const bool alone = call->participants.size() == 1;
    const PttRef first = call->participants.begin()->second.ref;
    if (!call->is_group())
        return leave(first, there, there);
    if (!call->established && owner_left)
        while (sessions_.find(id))
            leave(sessions_.find(id)->participants.begin()->second.ref, there, there);
    else if (!call->established && alone && call->owner == first.who)
        leave(first, there, there);
    else if (call->established && alone && call->type != PttCallType::kChannel)
        leave(first, PttEndReason::kOver, PttEndReason::kOver);
}

void PttCalls::leave_all(int slot, PttEndReason reason) {
    while (!sessions_[slot].sessions.empty())
        leave(sessions_[slot].sessions.begin()->second, reason, PttEndReason::kNetworkFailure);
}

Status PttCalls::keep_alive(int slot, std::int32_t seconds) {
    if (auto refusal = registrations_.radio_off(slot))
        return *refusal;
    if (auto refusal = bad_seconds(seconds, "the time until the next keep-alive"))
        return *refusal;
    sessions_[slot].keep_alive.cancel();
    if (seconds > 0)
        sessions_[slot].keep_alive =
            timers_.after_unscaled(std::chrono::seconds(seconds), [this, slot] {
                leave_all(slot, PttEndReason::kKeepAliveMissed);
            });
    return Done{};
}

Status PttCalls::convert_to_crisis(int slot, std::int32_t session) {
    const auto place = sessions_.connected(slot, session);
    if (!place)
        return place.refusal();
    auto &[call, self] = *place;
    if (call.crisis)
        return refuse(Result::kWrongState, "session {} is a crisis call already", session);
    call.crisis = true;
    call.crisis_by = self.ref.who;
    for (const auto &[who, participant] : call.participants)
        if (participant.connected())
            sessions_.emit(participant, PttCrisisInitiated{participant.session});
    return Done{};
}

Answer<std::vector<PttContact>> PttCalls::others(int slot, std::int32_t session, PttMedia media) {
    const auto place = sessions_.connected(slot, session);
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
    const auto &sessions = sessions_[slot].sessions;
    const auto found = sessions.find(session);
    return found == sessions.end() ? directory_.uri_of(slot) : sessions_.find(found->second)->uri();
}

Answer<std::string> PttCalls::talking_to(int slot, std::int32_t session) {
    const auto place = sessions_.connected(slot, session);
    if (!place)
        return place.refusal();
    if (place->call.is_group())
        return place->call.uri;
    for (const auto &[who, participant] : place->call.participants)
        if (who != place->self.ref.who)
            return participant.uri();
    return std::string();
}

// Channels: whoever is tuned to one takes part in what goes on there.
Status PttCalls::set_channel(int slot, std::int32_t channel, PttChannelMode mode) {
    if (auto refusal = registrations_.radio_off(slot))
        return *refusal;
    if (channel < 0 || channel > kPttChannels)
        return refuse(Result::kInvalidArgument, "a channel is 1 to {}, or 0 for none, not {}",
                      kPttChannels, channel);
    if (mode != PttChannelMode::kTalkAndListen && mode != PttChannelMode::kListenOnly)
        return refuse(Result::kInvalidArgument,
                      "a mode is 0 (talk and listen) or 1 (listen), not {}", mode);
    PttLine &here = sessions_[slot];
    here.channel_mode = mode;
    if (channel == here.channel) {
        for (const auto &[session, ref] : here.sessions)
            if (PttCall &call = *sessions_.find(ref.call); call.type == PttCallType::kChannel) {
                PttParticipant &self = *sessions_.find(ref);
                self.listens_only = mode == PttChannelMode::kListenOnly;
                if (self.listens_only)
                    floor_.cancel(call, self, PttFloorCause::kListensOnly);
            }
        return Done{};
    }
    leave_channel(slot);
    here.channel = channel;
    for (auto &[id, call] : sessions_.calls()) {
        if (call.type != PttCallType::kChannel || !call.established ||
            call.uri != channel_uri(channel))
            continue;
        PttParticipant &late =
            add_participant(call, {directory_.uri_of(slot), {}, slot, nullptr, call.uri, false, 0});
        invite_slot(call, late);
        break;
    }
    return Done{};
}

void PttCalls::leave_channel(int slot) {
    for (const auto &[session, ref] : sessions_[slot].sessions)
        if (sessions_.find(ref.call)->type == PttCallType::kChannel)
            return leave(ref, PttEndReason::kEndedHere, PttEndReason::kEndedByPeer);
}

std::string PttCalls::channel_uri(std::int32_t channel) {
    return fmt::format("sip:channel-{}@{}", channel, PttDirectory::kGroupHost);
}

} // namespace sim
