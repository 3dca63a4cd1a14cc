// SPDX-License-Identifier: Apache-2.0
#include "sim/ptt/floor_control.hpp"

#include "sim/ptt/media.hpp"

#include <utility>

namespace sim {

namespace {

constexpr std::int32_t kUsualPatience = 30;
constexpr FourIntegers kVoiceAlone{1, 0, 0, 0};
constexpr std::chrono::seconds kPartyTalks{2};

std::string_view text_of(PttFloorCause cause) {
    switch (cause) {
    case PttFloorCause::kNone:
        return "";
    case PttFloorCause::kTaken:
        return "somebody else speaks";
    case PttFloorCause::kQueueFull:
        return "too many wait";
    case PttFloorCause::kListensOnly:
        return "this participant listens only";
    case PttFloorCause::kInterrupted:
        return "interrupted by a request of top priority";
    case PttFloorCause::kTalkedTooLong:
        return "the talk time is over";
    case PttFloorCause::kWithdrawn:
        return "withdrawn";
    case PttFloorCause::kWaitedTooLong:
        return "waited too long";
    }
    return "";
}

} // namespace

PttFloorEvent PttFloorControl::event_of(PttFloorKind kind, const PttCall &call,
                                        const PttParticipant &participant,
                                        PttFloorCause cause) const {
    PttFloorEvent event;
    event.kind = kind;
    event.session = participant.session;
    event.participants = call.connected_count();
    event.position = call.floor.position(participant.ref.who);
    event.cause = cause;
    event.text = text_of(cause);
    const auto &holder = call.floor.holder();
    const auto speaker = holder ? call.participants.find(holder->who) : call.participants.end();
    if (speaker == call.participants.end())
        return event;
    event.media = holder->media;
    event.priority = holder->priority;
    event.speaker_uri = speaker->second.uri();
    event.speaker_name = holder->name;
    if (kind == PttFloorKind::kGranted)
        event.seconds = static_cast<std::int32_t>(
            seconds_or(participant.terms[kPttTalkTime], kPttUsualTalkTime).count());
    return event;
}

void PttFloorControl::tell(const PttCall &call, const PttParticipant &participant) const {
    const auto kind = call.floor.holder() ? PttFloorKind::kTaken : PttFloorKind::kIdle;
    sessions_.emit(participant, event_of(kind, call, participant));
}

std::optional<Refusal> PttFloorControl::cannot_speak(const PttSessions::Place &place,
                                                     const PttFloorRequest &request) const {
    const auto &[call, self] = place;
    if (auto refusal = bad_media(request.media))
        return refusal;
    if (auto refusal = bad_priority(request.priority))
        return refusal;
    if (auto refusal = bad_seconds(request.patience, "the time to wait"))
        return refusal;
    if (common_media(request.media, self.media) != request.media)
        return refuse(Result::kInvalidArgument, "session {} does not have all of these media",
                      request.session);
    if (call.floor.held_by(self.ref.who))
        return refuse(Result::kWrongState, "session {} has the floor already", request.session);
    if (call.floor.position(self.ref.who) != 0)
        return refuse(Result::kWrongState, "session {} waits for the floor already",
                      request.session);
    return std::nullopt;
}

Status PttFloorControl::request(int slot, const PttFloorRequest &request) {
    const auto place = sessions_.connected(slot, request.session);
    if (!place)
        return place.refusal();
    if (auto refusal = cannot_speak(*place, request))
        return *refusal;
    auto &[call, self] = *place;
    FloorWish wish{self.ref.who, request.priority, request.media, request.name};
    if (wish.priority == 0)
        wish.priority = self.terms[kPttPriority];
    if (call.crisis && call.crisis_by == self.ref.who)
        wish.priority = kPttTopPriority;
    if (wish.media == FourIntegers{})
        wish.media = kVoiceAlone;
    if (wish.name.empty())
        wish.name = self.name();
    ask(call, self, std::move(wish), seconds_or(request.patience, kUsualPatience));
    return Done{};
}

void PttFloorControl::ask(PttCall &call, PttParticipant &participant, FloorWish wish,
                          std::chrono::seconds patience) {
    const auto reject = [&](PttFloorCause cause) {
        sessions_.emit(participant, event_of(PttFloorKind::kRejected, call, participant, cause));
    };
    if (participant.listens_only)
        return reject(PttFloorCause::kListensOnly);
    if (!call.floor.holder())
        return grant(call, std::move(wish));
    if (call.floor.interrupted_by(wish)) {
        const PttParticipant &holder = call.participants.at(call.floor.holder()->who);
        sessions_.emit(
            holder, event_of(PttFloorKind::kCanceled, call, holder, PttFloorCause::kInterrupted));
        return grant(call, std::move(wish));
    }
    if (participant.terms[kPttDoNotWait] == 1)
        return reject(PttFloorCause::kTaken);
    if (call.floor.full())
        return reject(PttFloorCause::kQueueFull);
    call.floor.wait(std::move(wish));
    if (participant.is_slot())
        participant.patience =
            timers_.after_unscaled(patience, [this, ref = participant.ref] { stop_waiting(ref); });
    tell_positions(call);
}

void PttFloorControl::grant(PttCall &call, FloorWish wish) {
    PttParticipant &holder = call.participants.at(wish.who);
    call.floor.grant(std::move(wish));
    holder.told_position = 0;
    holder.patience.cancel();
    call.talk_limit =
        timers_.after_unscaled(seconds_or(holder.terms[kPttTalkTime], kPttUsualTalkTime),
                               [this, ref = holder.ref] { cut_off(ref); });
    sessions_.emit(holder, event_of(PttFloorKind::kGranted, call, holder));
    for (const auto &[who, other] : call.participants)
        if (other.connected() && who != holder.ref.who)
            tell(call, other);
    if (!holder.is_slot())
        party_talks(holder.ref);
}

void PttFloorControl::pass_on(PttCall &call) {
    call.floor.free();
    call.talk_limit.cancel();
    if (auto next = call.floor.next()) {
        grant(call, *std::move(next));
        return tell_positions(call);
    }
    for (const auto &[who, participant] : call.participants)
        if (participant.connected())
            tell(call, participant);
}

void PttFloorControl::tell_positions(PttCall &call) {
    for (const auto &wish : call.floor.queue()) {
        PttParticipant &waiting = call.participants.at(wish.who);
        const auto position = call.floor.position(wish.who);
        if (std::exchange(waiting.told_position, position) != position)
            sessions_.emit(waiting, event_of(PttFloorKind::kQueuePosition, call, waiting));
    }
}

Status PttFloorControl::release(int slot, std::int32_t session) {
    const auto place = sessions_.connected(slot, session);
    if (!place)
        return place.refusal();
    auto &[call, self] = *place;
    if (call.floor.held_by(self.ref.who)) {
        pass_on(call);
        return Done{};
    }
    if (call.floor.position(self.ref.who) == 0)
        return refuse(Result::kWrongState, "session {} neither has the floor nor waits for it",
                      session);
    cancel(call, self, PttFloorCause::kWithdrawn);
    return Done{};
}

void PttFloorControl::cut_off(PttRef ref) {
    PttCall &call = *sessions_.find(ref.call);
    cancel(call, *call.find(ref.who), PttFloorCause::kTalkedTooLong);
}

void PttFloorControl::cancel(PttCall &call, const PttParticipant &speaker, PttFloorCause cause) {
    const auto tell_speaker = [&] {
        sessions_.emit(speaker, event_of(PttFloorKind::kCanceled, call, speaker, cause));
    };
    if (call.floor.held_by(speaker.ref.who)) {
        tell_speaker(); // while the event still names the speaker
        pass_on(call);
    } else if (call.floor.position(speaker.ref.who) != 0) {
        forget(call, speaker.ref.who);
        tell_speaker();
    }
}

void PttFloorControl::stop_waiting(PttRef ref) {
    PttCall &call = *sessions_.find(ref.call);
    const PttParticipant &waiting = *call.find(ref.who);
    forget(call, ref.who);
    sessions_.emit(waiting,
                   event_of(PttFloorKind::kTimeout, call, waiting, PttFloorCause::kWaitedTooLong));
}

void PttFloorControl::forget(PttCall &call, int who) {
    if (PttParticipant *participant = call.find(who)) {
        participant->told_position = 0;
        participant->patience.cancel();
    }
    if (call.floor.position(who) != 0) {
        call.floor.withdraw(who);
        return tell_positions(call);
    }
    if (call.floor.held_by(who))
        pass_on(call);
}

Answer<std::vector<PttFloorStatus>>
PttFloorControl::status(int slot, const std::vector<std::int32_t> &sessions) {
    std::vector<std::int32_t> wanted = sessions;
    if (wanted.empty())
        for (const auto &[session, ref] : sessions_[slot].sessions)
            wanted.push_back(session);
    std::vector<PttFloorStatus> found;
    for (const std::int32_t session : wanted) {
        const auto place = sessions_.existing(slot, session);
        if (!place)
            return place.refusal();
        const auto &[call, self] = *place;
        PttFloorStatus told{session, PttFloorState::kIdle, call.connected_count(), {}};
        if (const auto &holder = call.floor.holder()) {
            told.speaker_uri = call.participants.at(holder->who).uri();
            told.state =
                holder->who == self.ref.who ? PttFloorState::kGranted : PttFloorState::kTaken;
        }
        if (call.floor.position(self.ref.who) != 0)
            told.state = PttFloorState::kWaiting;
        found.push_back(std::move(told));
    }
    return found;
}

void PttFloorControl::party_talks(PttRef ref) {
    sessions_.find(ref)->step = timers_.after(kPartyTalks, [this, ref] {
        PttCall &call = *sessions_.find(ref.call);
        if (call.floor.held_by(ref.who))
            pass_on(call);
    });
}

} // namespace sim
