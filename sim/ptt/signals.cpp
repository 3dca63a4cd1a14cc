// SPDX-License-Identifier: Apache-2.0
#include "sim/ptt/signals.hpp"

#include "sim/bus/tell.hpp"
#include "sim/ptt/wire.hpp"

namespace sim {

namespace {

auto floor_members(const PttFloorEvent &e) {
    return std::tie(e.session, e.media, e.priority, e.speaker_uri, e.participants, e.speaker_name,
                    e.position, e.seconds, e.cause, e.text);
}

// Of the events of one kind alone.
template <PttFloorKind kKind>
auto floor(const PttFloorEvent &e) {
    return e.kind == kKind ? std::optional(floor_members(e)) : std::nullopt;
}

auto advertised(const PttGroupAdvertisement &e) {
    return std::tuple(e.number, wire::Dictionary{ptt_wire::advertisement(e)});
}

constexpr SignalTable kSignals{
    SignalRow<PttCallIncoming>{"PocCallIncomingInd"},
    SignalRow<PttCallInProgress>{"PocCallInProgress"},
    SignalRow<PttCallAlerting>{"PocCallAlerting"},
    SignalRow<PttCallEstablished>{"PocCallEstablished"},
    SignalRow<PttCallEnded>{"PocCallEnded"},
    SignalRow{"PocCallFloorGranted", &floor<PttFloorKind::kGranted>},
    SignalRow{"PocCallFloorRejected", &floor<PttFloorKind::kRejected>},
    SignalRow{"PocCallFloorIdle", &floor<PttFloorKind::kIdle>},
    SignalRow{"PocCallFloorQueuePosition", &floor<PttFloorKind::kQueuePosition>},
    SignalRow{"PocCallFloorCanceled", &floor<PttFloorKind::kCanceled>},
    SignalRow{"PocCallFloorTaken", &floor<PttFloorKind::kTaken>},
    SignalRow<PttModifyRequest>{"PocCallModifyRequest"},
    SignalRow<PttModifyStatus>{"PocCallModifyStatus"},
    SignalRow{"PocCallFloorRequestTimeout", &floor<PttFloorKind::kTimeout>},
    SignalRow<PttCrisisInitiated>{"PocCallCrisisCallInitiated"},
    SignalRow{"PocGroupAdvertisement", advertised},
    SignalRow<PttParticipantInfo>{"PocGroupConfParticipantInfo"},
    SignalRow<PttIncomingMessage>{"PocIncomingMsgInfo"},
    SignalRow<PttMessageNotice>{"PocMsgNotification"},
    SignalRow<PttIncomingFile>{"PocIncomingFileTransfer"},
    SignalRow<PttFileProgress>{"PocFileTransferProgress"},
    SignalRow<PttFileTerminated>{"PocFileTransferTerminated"},
};

} // namespace

Signal to_signal(const PttEvent &event) {
    return kSignals.signal_of(event);
}

std::span<const SignalInfo> ptt_signals() {
    return kSignals.infos();
}

} // namespace sim
