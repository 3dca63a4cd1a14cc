// SPDX-License-Identifier: Apache-2.0
// What parties of the network do by themselves once they take part.
#include "sim/ptt/model.hpp"

namespace sim {

namespace {

using namespace std::chrono_literals;

constexpr auto kStays = 3s;
constexpr auto kSilentAtFirst = 1s;
constexpr auto kTalks = 2s;

} // namespace

void PttCalls::practise_habit(PttCall &call, PttParticipant &participant) {
    const PttRef ref = participant.ref;
    switch (participant.contact.party->habit) {
    case PttHabit::kListens:
    case PttHabit::kRefusesChanges:
    case PttHabit::kEchoes:
        return;
    case PttHabit::kLeaves:
        participant.step = timers_.after(kStays, [this, ref] {
            leave(ref, PttEndReason::kEndedHere, PttEndReason::kEndedByPeer);
        });
        return;
    case PttHabit::kTalks:
        participant.step = timers_.after(kSilentAtFirst, [this, id = call.id, ref] {
            PttParticipant &self = *find(ref);
            ask_floor(*find(id), self, {ref.who, 0, {1, 0, 0, 0}, self.name()}, 0s);
        });
        return;
    case PttHabit::kAsksVideo:
        participant.step = timers_.after(kSilentAtFirst, [this, ref] { party_asks_video(ref); });
        return;
    }
}

void PttCalls::party_talks(PttRef ref) {
    find(ref)->step = timers_.after(kTalks, [this, ref] {
        PttCall &call = *find(ref.call);
        if (call.floor.held_by(ref.who))
            pass_floor_on(call);
    });
}

void PttCalls::party_asks_video(PttRef ref) {
    PttCall &call = *find(ref.call);
    PttParticipant &self = *call.find(ref.who);
    if (call.change)
        return;
    PttModifyRequest request;
    request.changes_media = true;
    request.media = self.media;
    request.media[kPttVideo] = 1;
    offer_change(call, self, request);
}

void PttCalls::party_answers_change(PttRef ref) {
    PttCall &call = *find(ref.call);
    PttParticipant &self = *call.find(ref.who);
    if (!call.change)
        return;
    if (self.contact.party->habit == PttHabit::kRefusesChanges)
        return settle_change(call, ref.who, std::nullopt);
    self.media = call.change->request.media;
    settle_change(call, ref.who, self.media);
}

} // namespace sim
