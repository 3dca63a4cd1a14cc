// SPDX-License-Identifier: Apache-2.0
#include "sim/ptt/signals.hpp"

#include "sim/ptt/wire.hpp"

namespace sim {

namespace {

using wire::pack;

constexpr const char *kFloorSignature = "(ivisisiiis)";

constexpr SignalInfo kSignals[] = {
    {"PocCallIncomingInd", "(bbbbssssssiivv)"},
    {"PocCallInProgress", "(i)"},
    {"PocCallAlerting", "(i)"},
    {"PocCallEstablished", "(iibsbvbvv)"},
    {"PocCallEnded", "(ii)"},
    {"PocCallFloorGranted", kFloorSignature},
    {"PocCallFloorRejected", kFloorSignature},
    {"PocCallFloorIdle", kFloorSignature},
    {"PocCallFloorQueuePosition", kFloorSignature},
    {"PocCallFloorCanceled", kFloorSignature},
    {"PocCallFloorTaken", kFloorSignature},
    {"PocCallModifyRequest", "(bbiivv)"},
    {"PocCallModifyStatus", "(bbbiivv)"},
    {"PocCallFloorRequestTimeout", kFloorSignature},
    {"PocCallCrisisCallInitiated", "(i)"},
    {"PocGroupAdvertisement", "(ia{sv})"},
    {"PocGroupConfParticipantInfo", "(iss)"},
    {"PocIncomingMsgInfo", "(ivsissvsiiiv)"},
    {"PocMsgNotification", "(ivsiiv)"},
    {"PocIncomingFileTransfer", "(ivviv)"},
    {"PocFileTransferProgress", "(iiii)"},
    {"PocFileTransferTerminated", "(iii)"},
};

std::string_view member_of(PttFloorKind kind) {
    switch (kind) {
    case PttFloorKind::kGranted:
        return "PocCallFloorGranted";
    case PttFloorKind::kRejected:
        return "PocCallFloorRejected";
    case PttFloorKind::kIdle:
        return "PocCallFloorIdle";
    case PttFloorKind::kQueuePosition:
        return "PocCallFloorQueuePosition";
    case PttFloorKind::kCanceled:
        return "PocCallFloorCanceled";
    case PttFloorKind::kTaken:
        return "PocCallFloorTaken";
    case PttFloorKind::kTimeout:
        return "PocCallFloorRequestTimeout";
    }
    return {};
}

struct ToSignal {
    Signal operator()(const PttCallIncoming &e) const {
        return {"PocCallIncomingInd",
                pack(e.crisis, e.automatic, e.takes_floor, e.group, e.caller_uri, e.caller_name,
                     e.called_uri, e.group_uri, e.group_name, e.others, e.session, e.type, e.media,
                     e.terms)};
    }
    Signal operator()(const PttCallInProgress &e) const {
        return {"PocCallInProgress", pack(e.session)};
    }
    Signal operator()(const PttCallAlerting &e) const {
        return {"PocCallAlerting", pack(e.session)};
    }
    Signal operator()(const PttCallEstablished &e) const {
        return {"PocCallEstablished",
                pack(e.session, e.type, e.placed_here, e.uri, e.crisis, e.media, e.automatic,
                     e.terms, ptt_wire::carried(ptt_wire::peer(e.peer)))};
    }
    Signal operator()(const PttCallEnded &e) const {
        return {"PocCallEnded", pack(e.session, e.reason)};
    }
    Signal operator()(const PttFloorEvent &e) const {
        return {member_of(e.kind),
                pack(e.session, e.media, e.priority, e.speaker_uri, e.participants, e.speaker_name,
                     e.position, e.seconds, e.cause, e.text)};
    }
    Signal operator()(const PttModifyRequest &e) const {
        return {"PocCallModifyRequest",
                pack(e.changes_media, e.changes_terms, e.session, e.reference, e.media, e.terms)};
    }
    Signal operator()(const PttModifyStatus &e) const {
        return {"PocCallModifyStatus", pack(e.accepted, e.changes_media, e.changes_terms, e.session,
                                            e.reference, e.media, e.terms)};
    }
    Signal operator()(const PttCrisisInitiated &e) const {
        return {"PocCallCrisisCallInitiated", pack(e.session)};
    }
    Signal operator()(const PttGroupAdvertisement &e) const {
        return {"PocGroupAdvertisement", pack(e.number, ptt_wire::advertisement(e))};
    }
    Signal operator()(const PttParticipantInfo &e) const {
        return {"PocGroupConfParticipantInfo", pack(e.session, e.uri, e.status)};
    }
    Signal operator()(const PttIncomingMessage &e) const {
        return {"PocIncomingMsgInfo",
                pack(e.number, ptt_wire::carried(ptt_wire::peer(e.originator)), e.message_id,
                     e.notices, e.content_type, e.text, ptt_wire::carried(ptt_wire::route(e.route)),
                     e.group_uri, e.session, e.lifetime, e.reference,
                     ptt_wire::carried(ptt_wire::peer(e.target)))};
    }
    Signal operator()(const PttMessageNotice &e) const {
        return {"PocMsgNotification",
                pack(e.number, ptt_wire::carried(ptt_wire::peer(e.from)), e.message_id, e.notice,
                     e.code, ptt_wire::carried(ptt_wire::peer(e.originator)))};
    }
    Signal operator()(const PttIncomingFile &e) const {
        return {"PocIncomingFileTransfer",
                pack(e.number, ptt_wire::carried(ptt_wire::peer(e.originator)),
                     ptt_wire::carried(ptt_wire::attributes(e.attributes)), e.session,
                     ptt_wire::carried(ptt_wire::peer(e.target)))};
    }
    Signal operator()(const PttFileProgress &e) const {
        return {"PocFileTransferProgress", pack(e.number, e.bytes, e.total, e.party)};
    }
    Signal operator()(const PttFileTerminated &e) const {
        return {"PocFileTransferTerminated", pack(e.number, e.reason, e.party)};
    }
};

} // namespace

Signal to_signal(const PttEvent &event) {
    return std::visit(ToSignal{}, event);
}

std::span<const SignalInfo> ptt_signals() {
    return kSignals;
}

} // namespace sim
