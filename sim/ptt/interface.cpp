// SPDX-License-Identifier: Apache-2.0
// The table, and the requests about calls and the floor.
#include "sim/ptt/interface.hpp"

#include "sim/bus/replies.hpp"
#include "sim/ptt/signals.hpp"
#include "sim/ptt/wire.hpp"

namespace sim {

namespace {

using std::int32_t;
using std::string;
using enum Caller;

struct Sets {
    FourIntegers media;
    FourIntegers terms;
};

Answer<Sets> both_sets(const Variant &media_set, const Variant &terms_set) {
    const auto media = ptt_wire::four_integers(media_set);
    if (!media)
        return media.refusal();
    const auto terms = ptt_wire::four_integers(terms_set);
    if (!terms)
        return terms.refusal();
    return Sets{*media, *terms};
}

// (bbiivv): of an answer, an offer and an answer to that.
Answer<PttModifyRequest> media_request(const Request &request) {
    const auto [changes_media, changes_terms, session, reference, media_set, terms_set] =
        request.unpack<bool, bool, int32_t, int32_t, Variant, Variant>();
    const auto sets = both_sets(media_set, terms_set);
    if (!sets)
        return sets.refusal();
    return PttModifyRequest{changes_media, changes_terms, session,
                            reference,     sets->media,   sets->terms};
}

std::vector<PttPeer> peers_of(const std::vector<PttUser> &users) {
    std::vector<PttPeer> peers;
    for (const auto &user : users)
        peers.push_back(user.peer);
    return peers;
}

} // namespace

const MethodRow<PttInterface> PttInterface::kMethods[] = {
    {"PocMakeCall", "(bbbsisvvi)", "(ii)", kConnection, &PttInterface::make_call},
    {"PocMakeAdHocConfCall", "(vbvssbibivi)", "(ii)", kConnection, &PttInterface::make_ad_hoc_call},
    {"PocAddUsersToAdHocConfCall", "(iiiviv)", "(i)", kConnection, &PttInterface::add_users},
    {"PocRemoveUsersFromAdHocConfCall", "(iiiviv)", "(i)", kConnection,
     &PttInterface::remove_users},
    {"PocCallConvertToCrisisCall", "(i)", "(i)", kConnection, &PttInterface::convert_to_crisis},
    {"PocAnswerCall", "(bbiivv)", "(i)", kConnection, &PttInterface::answer_call},
    {"PocRejectCall", "(ii)", "(i)", kConnection, &PttInterface::reject_call},
    {"PocEndCall", "(ii)", "(i)", kConnection, &PttInterface::end_call},
    {"PocRequestFloor", "(iviis)", "(i)", kConnection, &PttInterface::request_floor},
    {"PocReleaseFloor", "(iv)", "(i)", kConnection, &PttInterface::release_floor},
    {"PocRequestFloorStatus", "(v)", "(iaa{sv})", kConnection, &PttInterface::request_floor_status},
    {"PocModifyCall", "(bbiivv)", "(i)", kConnection, &PttInterface::modify_call},
    {"PocAcceptModifyCall", "(bbiivv)", "(i)", kConnection, &PttInterface::accept_modify_call},
    {"PocRejectModifyCall", "(i)", "(i)", kConnection, &PttInterface::reject_modify_call},
    {"PocSetChannel", "(ii)", "(i)", kConnection, &PttInterface::set_channel},
    {"PocStartCallRecording", "(iiis)", "(ia{sv})", kConnection, &PttInterface::start_recording},
    {"PocPauseCallRecording", "(i)", "(i)", kConnection, &PttInterface::pause_recording},
    {"PocResumeCallRecording", "(i)", "(i)", kConnection, &PttInterface::resume_recording},
    {"PocStopCallRecording", "(i)", "(i)", kConnection, &PttInterface::stop_recording},
    {"PocCancelCallRecording", "(i)", "(i)", kConnection, &PttInterface::cancel_recording},
    {"PocSendMsg", "(isvissivi)", "(iiii)", kConnection, &PttInterface::send_message},
    {"PocSendReceivedMsgNoti", "(isvvsi)", "(iiii)", kConnection, &PttInterface::send_notice},
    {"PocTransferFile", "(ivvv)", "(iii)", kConnection, &PttInterface::transfer_file},
    {"PocAcceptFileTransfer", "(is)", "(iii)", kConnection, &PttInterface::accept_file},
    // Spelt so.
    {"PocARejectFileTransfer", "(is)", "(iii)", kConnection, &PttInterface::reject_file},
    {"PocCancelFileTransfer", "(i)", "(iii)", kConnection, &PttInterface::cancel_file},
    {"PocSendKeepAlive", "(i)", "(i)", kConnection, &PttInterface::send_keep_alive},
};

Interface PttInterface::describe() {
    return {kName, bind_methods<PttInterface>(*this, kMethods), ptt_signals()};
}

Answer<Variant> PttInterface::make_call(const Request &request) {
    const auto [crisis, automatic, takes_floor, called, type, name, media_set, terms_set,
                answer_time] =
        request.unpack<bool, bool, bool, string, int32_t, string, Variant, Variant, int32_t>();
    const auto sets = both_sets(media_set, terms_set);
    if (!sets)
        return sets.refusal();
    return result_with(calls_.make_call(request.slot, {{crisis, automatic, takes_floor, sets->media,
                                                        sets->terms, name, answer_time},
                                                       called,
                                                       PttCallType{type}}));
}

Answer<Variant> PttInterface::make_ad_hoc_call(const Request &request) {
    const auto [media_set, crisis, terms_set, subject, name, automatic, count, takes_floor,
                answer_time, user_list, no_effect] =
        request.unpack<Variant, bool, Variant, string, string, bool, int32_t, bool, int32_t,
                       Variant, int32_t>();
    const auto sets = both_sets(media_set, terms_set);
    if (!sets)
        return sets.refusal();
    const auto users = ptt_wire::users(user_list, count);
    if (!users)
        return users.refusal();
    return result_with(calls_.make_ad_hoc_call(
        request.slot,
        {{crisis, automatic, takes_floor, sets->media, sets->terms, name, answer_time},
         subject,
         *users}));
}

Answer<Variant> PttInterface::add_users(const Request &request) {
    const auto [session, count, automatic, user_list, answer_time, content] =
        request.unpack<int32_t, int32_t, int32_t, Variant, int32_t, Variant>();
    const auto users = ptt_wire::users(user_list, count);
    if (!users)
        return users.refusal();
    const auto contents = ptt_wire::contents(content);
    if (!contents)
        return contents.refusal();
    if (automatic != 0 && automatic != 1)
        return refuse(Result::kInvalidArgument, "users are asked (0) or not (1), not {}",
                      automatic);
    return result_of(
        calls_.add_users(request.slot, {session, automatic == 1, *users, answer_time, *contents}));
}

Answer<Variant> PttInterface::remove_users(const Request &request) {
    const auto [session, count, no_effect, user_list, nor_this, content] =
        request.unpack<int32_t, int32_t, int32_t, Variant, int32_t, Variant>();
    const auto users = ptt_wire::users(user_list, count);
    if (!users)
        return users.refusal();
    if (const auto contents = ptt_wire::contents(content); !contents)
        return contents.refusal();
    return result_of(calls_.remove_users(request.slot, session, peers_of(*users)));
}

Answer<Variant> PttInterface::convert_to_crisis(const Request &request) {
    const auto [session] = request.unpack<int32_t>();
    return result_of(calls_.convert_to_crisis(request.slot, session));
}

Answer<Variant> PttInterface::answer_call(const Request &request) {
    const auto media = media_request(request);
    return media ? result_of(calls_.answer(request.slot, *media)) : media.refusal();
}

Answer<Variant> PttInterface::reject_call(const Request &request) {
    const auto [session, reason] = request.unpack<int32_t, int32_t>();
    return result_of(calls_.reject(request.slot, session, PttRejectReason{reason}));
}

Answer<Variant> PttInterface::end_call(const Request &request) {
    const auto [session, scope] = request.unpack<int32_t, int32_t>();
    return result_of(calls_.end(request.slot, session, PttEndScope{scope}));
}

Answer<Variant> PttInterface::request_floor(const Request &request) {
    const auto [session, media_set, priority, patience, name] =
        request.unpack<int32_t, Variant, int32_t, int32_t, string>();
    const auto media = ptt_wire::four_integers(media_set);
    if (!media)
        return media.refusal();
    return result_of(
        calls_.request_floor(request.slot, {session, *media, priority, patience, name}));
}

Answer<Variant> PttInterface::release_floor(const Request &request) {
    const auto [session, media_set] = request.unpack<int32_t, Variant>();
    if (const auto media = ptt_wire::four_integers(media_set); !media)
        return media.refusal();
    return result_of(calls_.release_floor(request.slot, session));
}

Answer<Variant> PttInterface::request_floor_status(const Request &request) {
    const auto [session_list] = request.unpack<Variant>();
    const auto integers = ptt_wire::integers(session_list);
    if (!integers)
        return integers.refusal();
    // A list is filled up to four with this.
    constexpr int32_t kNoSession = -1;
    std::vector<int32_t> sessions;
    for (const int32_t session : *integers)
        if (session != kNoSession)
            sessions.push_back(session);
    const auto found = calls_.floor_status(request.slot, sessions);
    if (!found)
        return found.refusal();
    return wire::pack(Result::kOk, ptt_wire::floor_status(*found));
}

Answer<Variant> PttInterface::modify_call(const Request &request) {
    const auto media = media_request(request);
    return media ? result_of(calls_.modify(request.slot, *media)) : media.refusal();
}

Answer<Variant> PttInterface::accept_modify_call(const Request &request) {
    const auto media = media_request(request);
    return media ? result_of(calls_.accept_modify(request.slot, *media)) : media.refusal();
}

Answer<Variant> PttInterface::reject_modify_call(const Request &request) {
    const auto [session] = request.unpack<int32_t>();
    return result_of(calls_.reject_modify(request.slot, session));
}

Answer<Variant> PttInterface::set_channel(const Request &request) {
    const auto [channel, mode] = request.unpack<int32_t, int32_t>();
    return result_of(calls_.set_channel(request.slot, channel, PttChannelMode{mode}));
}

Answer<Variant> PttInterface::send_keep_alive(const Request &request) {
    const auto [seconds] = request.unpack<int32_t>();
    return result_of(calls_.keep_alive(request.slot, seconds));
}

} // namespace sim
