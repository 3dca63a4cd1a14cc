// SPDX-License-Identifier: Apache-2.0
#include "sim/ptt/interface.hpp"

#include "sim/bus/ask.hpp"
#include "sim/bus/tell.hpp"
#include "sim/ptt/wire.hpp"

namespace sim {

namespace {

using std::int32_t;
using std::string;
using enum Caller;

std::vector<PttPeer> peers_of(const std::vector<PttUser> &users) {
    std::vector<PttPeer> peers;
    peers.reserve(users.size());
    for (const auto &user : users)
        peers.push_back(user.peer);
    return peers;
}

Answer<int32_t> make_call(PttCalls &calls, int slot, bool crisis, bool automatic, bool takes_floor,
                          const string &called, PttCallType type, const string &name,
                          const FourIntegers &media, const FourIntegers &terms,
                          int32_t answer_time) {
    return calls.make_call(
        slot, {{crisis, automatic, takes_floor, media, terms, name, answer_time}, called, type});
}

Answer<int32_t> make_ad_hoc_call(PttCalls &calls, int slot, const FourIntegers &media, bool crisis,
                                 const FourIntegers &terms, const string &subject,
                                 const string &name, bool automatic, int32_t count,
                                 bool takes_floor, int32_t answer_time, const Variant &user_list) {
    const auto users = ptt_wire::users(user_list, count);
    if (!users)
        return users.refusal();
    return calls.make_ad_hoc_call(
        slot, {{crisis, automatic, takes_floor, media, terms, name, answer_time}, subject, *users});
}

Status add_users(PttCalls &calls, int slot, int32_t session, int32_t count, int32_t automatic,
                 const Variant &user_list, int32_t answer_time, const Variant &content) {
    const auto users = ptt_wire::users(user_list, count);
    if (!users)
        return users.refusal();
    const auto contents = ptt_wire::contents(content);
    if (!contents)
        return contents.refusal();
    if (automatic != 0 && automatic != 1)
        return refuse(Result::kInvalidArgument, "users are asked (0) or not (1), not {}",
                      automatic);
    return calls.add_users(slot, {session, automatic == 1, *users, answer_time, *contents});
}

// Only the users have an effect.
Status remove_users(PttCalls &calls, int slot, int32_t session, int32_t count, int32_t,
                    const Variant &user_list, int32_t, const Variant &content) {
    const auto users = ptt_wire::users(user_list, count);
    if (!users)
        return users.refusal();
    if (const auto contents = ptt_wire::contents(content); !contents)
        return contents.refusal();
    return calls.remove_users(slot, session, peers_of(*users));
}

Answer<std::vector<PttFloorStatus>> request_floor_status(PttFloorControl &floor, int slot,
                                                         const Variant &session_list) {
    const auto integers = ptt_wire::integers(session_list);
    if (!integers)
        return integers.refusal();
    // A list is filled up to four with this.
    constexpr int32_t kNoSession = -1;
    std::vector<int32_t> sessions;
    for (const int32_t session : *integers)
        if (session != kNoSession)
            sessions.push_back(session);
    return floor.status(slot, sessions);
}

Answer<std::tuple<int32_t, PttNotice, int32_t>>
send_notice(PttMessages &messages, int slot, int32_t number, const string &message_id,
            const PttPeer &originator, const Variant &party_list, const string &,
            PttNotice notice) {
    if (const auto parties = ptt_wire::names(party_list); !parties)
        return parties.refusal();
    const auto told = messages.notify(slot, {number, message_id, originator, notice});
    if (!told)
        return told.refusal();
    return std::tuple(number, notice, *told);
}

using PttMethod =
    MethodRow<PttCalls, PttFloorControl, PttChanges, PttRecorder, PttMessages, PttFiles>;

constexpr PttMethod kMethods[] = {
    {"PocMakeCall", ask<make_call>, kConnection},
    {"PocMakeAdHocConfCall", ask<make_ad_hoc_call, int32_t>, kConnection},
    {"PocAddUsersToAdHocConfCall", ask<add_users>, kConnection},
    {"PocRemoveUsersFromAdHocConfCall", ask<remove_users>, kConnection},
    {"PocCallConvertToCrisisCall", ask<&PttCalls::convert_to_crisis>, kConnection},
    {"PocAnswerCall", ask<&PttCalls::answer>, kConnection},
    {"PocRejectCall", ask<&PttCalls::reject>, kConnection},
    {"PocEndCall", ask<&PttCalls::end>, kConnection},
    {"PocRequestFloor", ask<&PttFloorControl::request>, kConnection},
    {"PocReleaseFloor", ask<&PttFloorControl::release, FourIntegers>, kConnection},
    {"PocRequestFloorStatus", ask<request_floor_status>, kConnection},
    {"PocModifyCall", ask<&PttChanges::modify>, kConnection},
    {"PocAcceptModifyCall", ask<&PttChanges::accept>, kConnection},
    {"PocRejectModifyCall", ask<&PttChanges::reject>, kConnection},
    {"PocSetChannel", ask<&PttCalls::set_channel>, kConnection},
    {"PocStartCallRecording", ask<&PttRecorder::start>, kConnection},
    {"PocPauseCallRecording", ask<&PttRecorder::pause>, kConnection},
    {"PocResumeCallRecording", ask<&PttRecorder::resume>, kConnection},
    {"PocStopCallRecording", ask<&PttRecorder::stop>, kConnection},
    {"PocCancelCallRecording", ask<&PttRecorder::cancel>, kConnection},
    {"PocSendMsg", ask<&PttMessages::send>, kConnection},
    {"PocSendReceivedMsgNoti", ask<send_notice>, kConnection},
    {"PocTransferFile", ask<&PttFiles::offer>, kConnection},
    {"PocAcceptFileTransfer", ask<&PttFiles::accept>, kConnection},
    // Spelt so.
    {"PocARejectFileTransfer", ask<&PttFiles::reject>, kConnection},
    {"PocCancelFileTransfer", ask<&PttFiles::cancel>, kConnection},
    {"PocSendKeepAlive", ask<&PttCalls::keep_alive>, kConnection},
};

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

Interface PttInterface::describe() {
    return {kName,
            bind_methods(kMethods, calls_, calls_.floor(), calls_.changes(), recorder_, messages_,
                         files_),
            kSignals.infos()};
}

Signal to_signal(const PttEvent &event) {
    return kSignals.signal_of(event);
}

} // namespace sim
