// SPDX-License-Identifier: Apache-2.0
#include "sim/call/signals.hpp"

namespace sim {

namespace {

using wire::pack;

constexpr SignalInfo kSignals[] = {
    {"CallIncomingInd", "(isisssssb)"},
    {"CallInProgress", "(i)"},
    {"CallAlerting", "(i)"},
    {"CallBusy", "(i)"},
    {"CallEstablished", "(iibsb)"},
    {"CallHeld", "(ibi)"},
    {"CallResumed", "(ibbi)"},
    {"CallForwarded", "(i)"},
    {"CallEnded", "(ii)"},
    {"CallSwitched", "(ii)"},
    {"CallChangeRequest", "(iis)"},
    {"CallConfNotifyReceived", "(ivivi)"},
    {"CallEarlyMediaStart", "(is)"},
    {"CallStopAlertTone", "(i)"},
    {"CallError", "(iis)"},
    {"CallConfernceCallEstablished", "(ii)"},
    {"CallConfernceCallParticipantAdded", "(ii)"},
    {"CallConfernceCallParticipantRemoved", "(ii)"},
    {"CallUssdIndication", "(iiis)"},
    {"CallDtmfEvent", "(y)"},
};

struct ToSignal {
    Signal operator()(const CallIncomingInd &e) const {
        return {"CallIncomingInd", pack(e.session_id, e.peer_uri, e.type, e.called_uri, e.texts[0],
                                        e.texts[1], e.texts[2], e.texts[3], e.waiting)};
    }
    Signal operator()(const CallInProgress &e) const {
        return {"CallInProgress", pack(e.session_id)};
    }
    Signal operator()(const CallAlerting &e) const { return {"CallAlerting", pack(e.session_id)}; }
    Signal operator()(const CallBusy &e) const { return {"CallBusy", pack(e.session_id)}; }
    Signal operator()(const CallEstablished &e) const {
        return {"CallEstablished",
                pack(e.session_id, e.type, e.mobile_originated, e.peer_uri, e.conference)};
    }
    Signal operator()(const CallHeld &e) const {
        return {"CallHeld", pack(e.session_id, e.here, e.type)};
    }
    Signal operator()(const CallResumed &e) const {
        return {"CallResumed", pack(e.session_id, e.here, e.still_held, e.type)};
    }
    Signal operator()(const CallForwarded &e) const {
        return {"CallForwarded", pack(e.session_id)};
    }
    Signal operator()(const CallEnded &e) const {
        return {"CallEnded", pack(e.session_id, e.reason)};
    }
    Signal operator()(const CallSwitched &e) const {
        return {"CallSwitched", pack(e.session_id, e.type)};
    }
    Signal operator()(const CallChangeRequest &e) const {
        return {"CallChangeRequest", pack(e.session_id, e.type, wire::encode_base64(e.media))};
    }
    Signal operator()(const CallConfNotifyReceived &e) const {
        return {"CallConfNotifyReceived",
                pack(e.session_id, e.states, static_cast<std::int32_t>(e.states.size()), e.uris,
                     static_cast<std::int32_t>(e.uris.size()))};
    }
    Signal operator()(const CallEarlyMediaStart &e) const {
        return {"CallEarlyMediaStart", pack(e.session_id, e.media)};
    }
    Signal operator()(const CallStopAlertTone &e) const {
        return {"CallStopAlertTone", pack(e.session_id)};
    }
    Signal operator()(const CallError &e) const {
        return {"CallError", pack(e.session_id, e.code, e.text)};
    }
    Signal operator()(const ConferenceEstablished &e) const {
        return {"CallConfernceCallEstablished", pack(e.session_id, e.type)};
    }
    Signal operator()(const ParticipantAdded &e) const {
        return {"CallConfernceCallParticipantAdded", pack(e.conference_id, e.session_id)};
    }
    Signal operator()(const ParticipantRemoved &e) const {
        return {"CallConfernceCallParticipantRemoved", pack(e.conference_id, e.session_id)};
    }
    Signal operator()(const CallUssdIndication &e) const {
        return {"CallUssdIndication",
                pack(e.type, e.coding_scheme, e.dialogue, wire::encode_base64(e.text))};
    }
    Signal operator()(const CallDtmfEvent &e) const { return {"CallDtmfEvent", pack(e.tone)}; }
};

} // namespace

Signal to_signal(const CallEvent &event) {
    return std::visit(ToSignal{}, event);
}

std::span<const SignalInfo> call_signals() {
    return kSignals;
}

} // namespace sim
