// SPDX-License-Identifier: Apache-2.0
// Placing and answering: until a participant takes part. Inviting is in ptt_invite.cpp.
#include "sim/ptt/model.hpp"

#include "sim/ptt/media.hpp"

namespace sim {

namespace {

constexpr std::int32_t kUsualAnswerTime = 30;

} // namespace

std::optional<Refusal> PttCalls::cannot_place(int slot, const PttOffer &offer) {
    if (auto refusal = registrations_.radio_off(slot))
        return refusal;
    if (auto refusal = bad_media(offer.media))
        return refusal;
    if (auto refusal = bad_terms(offer.terms))
        return refusal;
    if (auto refusal = bad_seconds(offer.answer_time, "the time to answer"))
        return refusal;
    if (lines_[slot].sessions.size() >= kMostSessions)
        return refuse(Result::kTooMany, "slot {} has {} push-to-talk sessions, and no more can be",
                      slot, kMostSessions);
    return std::nullopt;
}

PttCall &PttCalls::add_call(int slot, PttCallType type, const PttOffer &offer) {
    const int id = next_call_++;
    PttCall &call = calls_[id];
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
    Line &here = lines_[participant.contact.slot];
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
        const auto channel = lines_[slot].channel;
        if (channel == 0)
            return refuse(Result::kWrongState, "slot {} is on no channel: PocSetChannel tunes it",
                          slot);
        call.uri = channel_uri(channel);
        call.name = fmt::format("Channel {}", channel);
        std::vector<PttContact> tuned;
        for (int other = 0; other < directory_.slots(); ++other)
            if (other != slot && lines_[other].channel == channel)
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
        PttParticipant &self = *find(ref);
        emit(self, PttCallInProgress{self.session});
        self.step = timers_.after(kRouteTime, [this, ref] { connect(ref); });
    });
    return late.session;
}

void PttCalls::proceed(int id) {
    PttCall &call = *find(id);
    const PttParticipant &owner = call.participants.at(call.owner);
    emit(owner, PttCallInProgress{owner.session});
    call.step = timers_.after(kRouteTime, [this, id] { invite_all(id); });
}

Status PttCalls::answer(int slot, const PttModifyRequest &request) {
    const auto place = existing(slot, request.session);
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
    PttCall &call = *find(ref.call);
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
    emit(participant, PttCallEstablished{participant.session, call.type, participant.placed,
                                         peer.uri, call.crisis, participant.media,
                                         participant.automatic, participant.terms, peer});
    if (call.crisis)
        emit(participant, PttCrisisInitiated{participant.session});
    if (call.is_group())
        for (const auto &[who, other] : call.participants)
            if (who != participant.ref.who && other.phase != PttPhase::kInvited)
                emit(participant, PttParticipantInfo{participant.session, other.uri(),
                                                     other.connected() ? "connected" : "alerting"});
    tell_status(call, participant, "connected");
    if (participant.ref.who == call.owner && std::exchange(call.takes_floor, false))
        ask_floor(call, participant,
                  {participant.ref.who,
                   participant.terms[kPttPriority],
                   {1, 0, 0, 0},
                   participant.name()},
                  std::chrono::seconds(kPttUsualTalkTime));
    else
        tell_floor(call, participant);
    if (!participant.is_slot())
        practise_habit(call, participant);
}

} // namespace sim
