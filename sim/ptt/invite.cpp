// SPDX-License-Identifier: Apache-2.0
// Asking slots and parties of the network to take part, and what parties do by themselves once they
// do.
#include "sim/ptt/model.hpp"

namespace sim {

namespace {

using namespace std::chrono_literals;

constexpr auto kPartyAnswersCall = 500ms;
constexpr auto kPartyDeclines = 2s;
constexpr auto kStays = 3s;
constexpr auto kSilentAtFirst = 1s;

} // namespace

void PttCalls::invite_all(int id) {
    // The call may end on the way: each is looked up anew.
    std::vector<PttRef> invited;
    for (const auto &[who, participant] : sessions_.find(id)->participants)
        if (participant.phase == PttPhase::kInvited)
            invited.push_back(participant.ref);
    for (const PttRef ref : invited)
        invite(ref);
    // On a channel there may be nobody else.
    PttCall *call = sessions_.find(id);
    if (call && call->type == PttCallType::kChannel && !call->established)
        connect({id, call->owner});
}

void PttCalls::invite(PttRef ref) {
    PttCall *call = sessions_.find(ref.call);
    PttParticipant *participant = sessions_.find(ref);
    if (!participant || participant->phase != PttPhase::kInvited)
        return;
    if (participant->is_slot())
        invite_slot(*call, *participant);
    else
        invite_party(*call, *participant);
}

void PttCalls::invite_slot(PttCall &call, PttParticipant &participant) {
    const int slot = participant.contact.slot;
    if (!registrations_.registered(slot))
        return leave(participant.ref, PttEndReason::kUnreachable, PttEndReason::kUnreachable);
    if (sessions_[slot].sessions.size() >= kMostSessions)
        return leave(participant.ref, PttEndReason::kBusy, PttEndReason::kBusy);
    open_session(call, participant);
    const PttParticipant *owner = call.find(call.owner);
    if (call.type == PttCallType::kAdHoc)
        advertise(slot, advertisement_of(call, participant));
    sessions_.emit(participant,
                   PttCallIncoming{call.crisis, participant.automatic, call.takes_floor,
                                   call.is_group(), owner ? owner->uri() : "",
                                   owner ? owner->name() : "", participant.contact.uri, call.uri,
                                   call.name, others_text(call, participant), participant.session,
                                   call.type, call.media, call.terms});
    alert(call, participant);
    if (participant.automatic)
        connect(participant.ref);
    else
        expect_answer(participant);
}

void PttCalls::invite_party(PttCall &call, PttParticipant &participant) {
    const PttRef ref = participant.ref;
    const auto leave_later = [&](Timers::Duration delay, PttEndReason why) {
        participant.step = timers_.after(delay, [this, ref, why] { leave(ref, why, why); });
    };
    switch (participant.contact.party->welcome) {
    case PttWelcome::kTakes:
        alert(call, participant);
        participant.step = timers_.after(kPartyAnswersCall, [this, ref] { connect(ref); });
        return;
    case PttWelcome::kBusy:
        return leave(ref, PttEndReason::kBusy, PttEndReason::kBusy);
    case PttWelcome::kDeclines:
        alert(call, participant);
        return leave_later(kPartyDeclines, PttEndReason::kDeclined);
    case PttWelcome::kNeverAnswers:
        alert(call, participant);
        return expect_answer(participant);
    case PttWelcome::kNobody:
        return leave(ref, PttEndReason::kUnreachable, PttEndReason::kUnreachable);
    case PttWelcome::kFails:
        return leave(ref, PttEndReason::kNetworkFailure, PttEndReason::kNetworkFailure);
    }
}

void PttCalls::alert(PttCall &call, PttParticipant &participant) {
    participant.phase = PttPhase::kAlerting;
    const PttParticipant *owner = call.find(call.owner);
    if (owner && !std::exchange(call.alerted, true))
        sessions_.emit(*owner, PttCallAlerting{owner->session});
    if (call.established)
        sessions_.tell_status(call, participant, "alerting");
}

void PttCalls::expect_answer(PttParticipant &participant) {
    participant.patience =
        timers_.after_unscaled(participant.answer_time, [this, ref = participant.ref] {
            leave(ref, PttEndReason::kMissed, PttEndReason::kNoAnswer);
        });
}

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
            PttParticipant &self = *sessions_.find(ref);
            floor_.ask(*sessions_.find(id), self, {ref.who, 0, {1, 0, 0, 0}, self.name()}, 0s);
        });
        return;
    case PttHabit::kAsksVideo:
        participant.step = timers_.after(kSilentAtFirst, [this, ref] { changes_.ask_video(ref); });
        return;
    }
}

} // namespace sim
