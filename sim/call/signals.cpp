// SPDX-License-Identifier: Apache-2.0
#include "sim/call/signals.hpp"

#include "sim/bus/tell.hpp"

namespace sim {

namespace {

auto change_request(const CallChangeRequest &e) {
    return std::tuple(e.session_id, e.type, wire::encode_base64(e.media));
}

auto conference_roster(const CallConfNotifyReceived &e) {
    return std::tuple(e.session_id, e.states, static_cast<std::int32_t>(e.states.size()), e.uris,
                      static_cast<std::int32_t>(e.uris.size()));
}

auto ussd_indication(const CallUssdIndication &e) {
    return std::tuple(e.type, e.coding_scheme, e.dialogue, wire::encode_base64(e.text));
}

constexpr SignalTable kSignals{
    SignalRow<CallIncomingInd>{"CallIncomingInd"},
    SignalRow<CallInProgress>{"CallInProgress"},
    SignalRow<CallAlerting>{"CallAlerting"},
    SignalRow<CallBusy>{"CallBusy"},
    SignalRow<CallEstablished>{"CallEstablished"},
    SignalRow<CallHeld>{"CallHeld"},
    SignalRow<CallResumed>{"CallResumed"},
    SignalRow<CallForwarded>{"CallForwarded"},
    SignalRow<CallEnded>{"CallEnded"},
    SignalRow<CallSwitched>{"CallSwitched"},
    SignalRow{"CallChangeRequest", change_request},
    SignalRow{"CallConfNotifyReceived", conference_roster},
    SignalRow<CallEarlyMediaStart>{"CallEarlyMediaStart"},
    SignalRow<CallStopAlertTone>{"CallStopAlertTone"},
    SignalRow<CallError>{"CallError"},
    SignalRow<ConferenceEstablished>{"CallConfernceCallEstablished"},
    SignalRow<ParticipantAdded>{"CallConfernceCallParticipantAdded"},
    SignalRow<ParticipantRemoved>{"CallConfernceCallParticipantRemoved"},
    SignalRow{"CallUssdIndication", ussd_indication},
    SignalRow<CallDtmfEvent>{"CallDtmfEvent"},
};

} // namespace

Signal to_signal(const CallEvent &event) {
    return kSignals.signal_of(event);
}

std::span<const SignalInfo> call_signals() {
    return kSignals.infos();
}

} // namespace sim
