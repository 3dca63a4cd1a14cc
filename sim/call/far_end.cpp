// SPDX-License-Identifier: Apache-2.0
// What the far end does by itself.
#include "sim/call/model.hpp"

namespace sim {

void CallModel::schedule_step(Session &session) {
    if (session.party && session.next_step < session.party->steps.size())
        session.step_timer = timers_.after(session.party->steps[session.next_step].after,
                                           [this, ref = session.ref] { run_step(ref); });
}

void CallModel::run_step(SessionRef ref) {
    Session *session = sessions_.find(ref);
    if (!session)
        return;
    perform(*session, session->party->steps[session->next_step++]);
    // The step may have ended the call.
    if (Session *left = sessions_.find(ref))
        schedule_step(*left);
}

void CallModel::perform(Session &session, const Step &step) {
    const auto [slot, id] = session.ref;
    switch (step.action) {
    case Action::kProceed:
        return sessions_.emit(slot, CallInProgress{id});
    case Action::kAlert:
        return alert(session);
    case Action::kRingSlot:
        return ring_slot(session);
    case Action::kForward:
        return sessions_.emit(slot, CallForwarded{id});
    case Action::kEarlyMedia:
        return sessions_.emit(slot, CallEarlyMediaStart{id, media_of(session.type)});
    case Action::kStopTone:
        return sessions_.emit(slot, CallStopAlertTone{id});
    case Action::kAnswer:
        return establish(session);
    case Action::kBusy:
        return turn_away(session);
    case Action::kDecline:
        return finish(session.ref, EndReason::kDeclined, EndReason::kDeclined);
    case Action::kNoAnswer:
        return finish(session.ref, EndReason::kNoAnswer, EndReason::kMissed);
    case Action::kUnreachable:
        return fail(session, CallErrorCode::kNotFound, "nobody has this number",
                    EndReason::kUnreachable);
    case Action::kFail:
        return fail(session, CallErrorCode::kServiceUnavailable, "the network failed",
                    EndReason::kNetworkFailure);
    case Action::kHangUp:
        return finish(session.ref, EndReason::kRemoteHangUp, EndReason::kLocalHangUp);
    case Action::kHold:
        return tell_hold(session, true, false);
    case Action::kResume:
        return tell_hold(session, false, false);
    case Action::kAskVideo:
        return changes_.ask_video(session);
    case Action::kTone:
        return sessions_.emit(slot, CallDtmfEvent{static_cast<std::uint8_t>(step.value)});
    case Action::kCallBack:
        return call_back(session, std::chrono::milliseconds(step.value));
    }
}

void CallModel::alert(Session &session) {
    session.phase = Phase::kAlerting;
    sessions_.emit(session.ref.slot, CallAlerting{session.ref.id});
    if (const Session *conference = sessions_.conference_of(session))
        tell_roster(*conference);
}

void CallModel::turn_away(const Session &session) {
    sessions_.emit(session.ref.slot, CallBusy{session.ref.id});
    finish(session.ref, EndReason::kBusy, EndReason::kBusy);
}

void CallModel::fail(const Session &session, CallErrorCode code, std::string_view why,
                     EndReason reason) {
    sessions_.emit(session.ref.slot, CallError{session.ref.id, code, std::string(why)});
    finish(session.ref, reason, reason);
}

void CallModel::call_back(const Session &session, std::chrono::milliseconds later) {
    const auto slot = session.ref.slot;
    sessions_[slot].callback_timer =
        timers_.after(later, [this, slot, number = session.route, type = session.type] {
            static_cast<void>(call_from_network(slot, number, type));
        });
    finish(session.ref, EndReason::kRemoteHangUp, EndReason::kLocalHangUp);
}

} // namespace sim
