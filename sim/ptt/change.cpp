// SPDX-License-Identifier: Apache-2.0
#include "sim/ptt/change.hpp"

#include "sim/ptt/media.hpp"

#include <utility>

namespace sim {

namespace {

constexpr std::chrono::seconds kChangePatience{15};
constexpr std::chrono::milliseconds kPartyDecidesChange{500};

} // namespace

Status PttChanges::modify(int slot, const PttModifyRequest &request) {
    const auto place = sessions_.connected(slot, request.session);
    if (!place)
        return place.refusal();
    auto &[call, self] = *place;
    if (!request.changes_media && !request.changes_terms)
        return refuse(Result::kInvalidArgument,
                      "neither of the flags is set: nothing is to change");
    if (auto refusal = bad_media(request.media))
        return *refusal;
    if (auto refusal = bad_terms(request.terms))
        return *refusal;
    if (call.change)
        return refuse(Result::kWrongState, "another change of session {} waits for its answer",
                      request.session);
    if (request.changes_media)
        offer(call, self, request);
    else {
        // Terms are between the participant and the network.
        self.terms = request.terms;
        tell(self, request, true);
    }
    return Done{};
}

void PttChanges::offer(PttCall &call, PttParticipant &asker, const PttModifyRequest &request) {
    PttChange &change = call.change.emplace();
    change.asker = asker.ref.who;
    change.request = request;
    change.request.media = or_usual(request.media);
    change.patience = timers_.after_unscaled(
        kChangePatience, [this, id = call.id] { conclude(*sessions_.find(id)); });
    for (auto &[who, other] : call.participants) {
        if (!other.connected() || who == asker.ref.who)
            continue;
        change.waiting.insert(who);
        PttModifyRequest offer = change.request;
        offer.session = other.session;
        sessions_.emit(other, offer);
        if (!other.is_slot())
            other.patience =
                timers_.after(kPartyDecidesChange, [this, ref = other.ref] { party_answers(ref); });
    }
    if (change.waiting.empty()) {
        change.accepted = true;
        change.common = change.request.media;
        conclude(call);
    }
}

Status PttChanges::accept(int slot, const PttModifyRequest &request) {
    const auto place = sessions_.connected(slot, request.session);
    if (!place)
        return place.refusal();
    auto &[call, self] = *place;
    if (!call.change || !call.change->waiting.contains(self.ref.who))
        return refuse(Result::kWrongState, "nobody has offered a change of session {}",
                      request.session);
    if (auto refusal = bad_media(request.media))
        return *refusal;
    if (auto refusal = bad_terms(request.terms))
        return *refusal;
    FourIntegers media = call.change->request.media;
    if (request.changes_media)
        media = common_media(media, or_usual(request.media));
    if (media == FourIntegers{})
        return refuse(Result::kInvalidArgument, "none of these media was offered");
    self.media = media;
    if (request.changes_terms)
        self.terms = request.terms;
    PttModifyRequest told = call.change->request;
    told.changes_terms = request.changes_terms;
    tell(self, told, true);
    settle(call, self.ref.who, media);
    return Done{};
}

Status PttChanges::reject(int slot, std::int32_t session) {
    const auto place = sessions_.connected(slot, session);
    if (!place)
        return place.refusal();
    auto &[call, self] = *place;
    if (!call.change || !call.change->waiting.contains(self.ref.who))
        return refuse(Result::kWrongState, "nobody has offered a change of session {}", session);
    settle(call, self.ref.who, std::nullopt);
    return Done{};
}

void PttChanges::settle(PttCall &call, int who, std::optional<FourIntegers> accepted) {
    if (!call.change)
        return;
    PttChange &change = *call.change;
    if (change.asker == who)
        return call.change.reset();
    if (change.waiting.erase(who) == 0)
        return;
    if (accepted) {
        change.accepted = true;
        for (std::size_t i = 0; i < change.common.size(); ++i)
            change.common[i] |= (*accepted)[i];
    }
    if (change.waiting.empty())
        conclude(call);
}

void PttChanges::conclude(PttCall &call) {
    const PttChange change = std::move(*call.change);
    call.change.reset();
    PttParticipant &asker = call.participants.at(change.asker);
    if (change.accepted) {
        asker.media = change.common;
        call.media = change.common;
        if (change.request.changes_terms)
            asker.terms = change.request.terms;
    }
    tell(asker, change.request, change.accepted);
}

void PttChanges::tell(PttParticipant &participant, const PttModifyRequest &request, bool accepted) {
    sessions_.emit(participant,
                   PttModifyStatus{accepted, request.changes_media, request.changes_terms,
                                   participant.session, request.reference, participant.media,
                                   participant.terms});
}

void PttChanges::ask_video(PttRef ref) {
    PttCall &call = *sessions_.find(ref.call);
    PttParticipant &self = *call.find(ref.who);
    if (call.change)
        return;
    PttModifyRequest request;
    request.changes_media = true;
    request.media = self.media;
    request.media[kPttVideo] = 1;
    offer(call, self, request);
}

void PttChanges::party_answers(PttRef ref) {
    PttCall &call = *sessions_.find(ref.call);
    PttParticipant &self = *call.find(ref.who);
    if (!call.change)
        return;
    if (self.contact.party->habit == PttHabit::kRefusesChanges)
        return settle(call, ref.who, std::nullopt);
    self.media = call.change->request.media;
    settle(call, ref.who, self.media);
}

} // namespace sim
