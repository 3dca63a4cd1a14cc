// SPDX-License-Identifier: Apache-2.0
#include "sim/call/interface.hpp"

#include "sim/bus/replies.hpp"
#include "sim/call/signals.hpp"

namespace sim {

namespace {

using std::int32_t;
using std::string;
using enum Caller;

Answer<std::vector<string>> counted_texts(int32_t count, const wire::Texts &texts) {
    if (!texts)
        return refuse(Result::kInvalidArgument, "the variant does not hold \"as\"");
    if (count < 0 || static_cast<std::size_t>(count) != texts->size())
        return refuse(Result::kInvalidArgument, "the count says {}, and {} texts came", count,
                      texts->size());
    return *texts;
}

} // namespace

const MethodRow<CallInterface> CallInterface::kMethods[] = {
    {"MakeCall", "(isissss)", "(ii)", kFirstArgument, &CallInterface::make_call},
    {"SendUssd", "(iiis)", "(i)", kFirstArgument, &CallInterface::send_ussd},
    {"AnswerCall", "(iiii)", "(i)", kFirstArgument, &CallInterface::answer_call},
    {"EndCall", "(iiii)", "(i)", kFirstArgument, &CallInterface::end_call},
    {"RejectCall", "(iii)", "(i)", kFirstArgument, &CallInterface::reject_call},
    {"HoldCall", "(ii)", "(i)", kFirstArgument, &CallInterface::hold_call},
    {"ResumeCall", "(ii)", "(i)", kFirstArgument, &CallInterface::resume_call},
    {"SwapCall", "(i)", "(i)", kFirstArgument, &CallInterface::swap_call},
    {"UpgradeCall", "(iii)", "(i)", kFirstArgument, &CallInterface::upgrade_call},
    {"DowngradeCall", "(iii)", "(i)", kFirstArgument, &CallInterface::downgrade_call},
    {"ChangeCall", "(iii)", "(iis)", kFirstArgument, &CallInterface::change_call},
    {"AcceptChangeRequest", "(ii)", "(i)", kFirstArgument, &CallInterface::accept_change_request},
    {"RejectChangeRequest", "(ii)", "(i)", kFirstArgument, &CallInterface::reject_change_request},
    {"SendDtmf", "(iis)", "(i)", kFirstArgument, &CallInterface::send_dtmf},
    {"StartDtmf", "(iiy)", "(i)", kFirstArgument, &CallInterface::start_dtmf},
    {"StopDtmf", "(ii)", "(i)", kFirstArgument, &CallInterface::stop_dtmf},
    {"VoiceRecord", "(iiis)", "(i)", kFirstArgument, &CallInterface::voice_record},
    {"SendTtyData", "(iis)", "(i)", kFirstArgument, &CallInterface::send_tty_data},
    {"SetTtyMode", "(ii)", "(i)", kFirstArgument, &CallInterface::set_tty_mode},
    {"GetTtyMode", "()", "(iiis)", kConnection, &CallInterface::get_tty_mode},
    {"IsMuted", "(ii)", "(ib)", kFirstArgument, &CallInterface::is_muted},
    {"ToggleMute", "(ii)", "(i)", kFirstArgument, &CallInterface::toggle_mute},
    {"SetSpeakerMode", "(iii)", "(i)", kFirstArgument, &CallInterface::set_speaker_mode},
    {"SetVolume", "(iii)", "(i)", kFirstArgument, &CallInterface::set_volume},
    {"GetMaxVolume", "(ii)", "(ii)", kFirstArgument, &CallInterface::get_max_volume},
    {"AddUserForConferenceCall", "(iisi)", "(i)", kFirstArgument,
     &CallInterface::add_user_for_conference_call},
    {"IndicateSrvccHoStarted", "(ii)", "(i)", kFirstArgument,
     &CallInterface::indicate_srvcc_ho_started},
    {"IndicateSrvccHoFailed", "(ii)", "(i)", kFirstArgument,
     &CallInterface::indicate_srvcc_ho_failed},
    {"SetAutoResponse", "(iii)", "(i)", kFirstArgument, &CallInterface::set_auto_response},
    {"SetEmergencyPdnInfo", "(isivs)", "(i)", kFirstArgument,
     &CallInterface::set_emergency_pdn_info},
    {"RegisterEmergencyPdn", "()", "(i)", kConnection, &CallInterface::register_emergency_pdn},
    {"DeregisterEmergencyPdn", "()", "(i)", kConnection, &CallInterface::deregister_emergency_pdn},
    {"StartNwayConferenceCall", "(iiii)", "(ii)", kFirstArgument,
     &CallInterface::start_nway_conference_call},
    {"MergeCalls", "(i)", "(ii)", kFirstArgument, &CallInterface::merge_calls},
    {"AddParticipantToNwayConferenceCall", "(iii)", "(i)", kFirstArgument,
     &CallInterface::add_participant},
    {"RemoveParticipantFromNwayConferenceCall", "(iii)", "(i)", kFirstArgument,
     &CallInterface::remove_participant},
    {"IsInEpdgCall", "(i)", "(ib)", kFirstArgument, &CallInterface::is_in_epdg_call},
    {"UpdateSsacInfo", "(iiiiii)", "(i)", kFirstArgument, &CallInterface::update_ssac_info},
    {"ChangeEpdgAudioPath", "(ii)", "(i)", kFirstArgument, &CallInterface::change_epdg_audio_path},
    {"StartConference", "(iiv)", "(ii)", kConnection, &CallInterface::start_conference},
    {"ModifyParticipantsInConference", "(iiiv)", "(ii)", kConnection,
     &CallInterface::modify_participants},
    {"CallListInfo", "(i)", "(iuaa{sv})", kFirstArgument, &CallInterface::call_list_info},
};

Interface CallInterface::describe() {
    return {kName, bind_methods<CallInterface>(*this, kMethods), call_signals()};
}

Answer<Variant> CallInterface::make_call(const Request &request) {
    const auto [app, called, type, text_2, text_3, text_4, text_5] =
        request.unpack<int32_t, string, int32_t, string, string, string, string>();
    return result_with(
        calls_.make_call(request.slot, {called, CallType{type}, {text_2, text_3, text_4, text_5}}));
}

Answer<Variant> CallInterface::send_ussd(const Request &request) {
    const auto [app, type, coding_scheme, text] =
        request.unpack<int32_t, int32_t, int32_t, string>();
    return result_of(ussd_.send(request.slot, UssdRequest{type}, coding_scheme, text));
}

Answer<Variant> CallInterface::answer_call(const Request &request) {
    const auto [app, session, type, option] = request.unpack<int32_t, int32_t, int32_t, int32_t>();
    return result_of(calls_.answer(request.slot, session, CallType{type}));
}

Answer<Variant> CallInterface::end_call(const Request &request) {
    const auto [app, session, reason, option] =
        request.unpack<int32_t, int32_t, int32_t, int32_t>();
    return result_of(calls_.end(request.slot, session));
}

Answer<Variant> CallInterface::reject_call(const Request &request) {
    const auto [app, session, reason] = request.unpack<int32_t, int32_t, int32_t>();
    return result_of(calls_.reject(request.slot, session, RejectReason{reason}));
}

Answer<Variant> CallInterface::hold_call(const Request &request) {
    const auto [app, session] = request.unpack<int32_t, int32_t>();
    return result_of(calls_.hold(request.slot, session));
}

Answer<Variant> CallInterface::resume_call(const Request &request) {
    const auto [app, session] = request.unpack<int32_t, int32_t>();
    return result_of(calls_.resume(request.slot, session));
}

Answer<Variant> CallInterface::swap_call(const Request &request) {
    return result_of(calls_.swap(request.slot));
}

Answer<Variant> CallInterface::upgrade_call(const Request &request) {
    const auto [app, session, type] = request.unpack<int32_t, int32_t, int32_t>();
    return result_of(calls_.upgrade(request.slot, session, CallType{type}));
}

Answer<Variant> CallInterface::downgrade_call(const Request &request) {
    const auto [app, session, type] = request.unpack<int32_t, int32_t, int32_t>();
    return result_of(calls_.downgrade(request.slot, session, CallType{type}));
}

Answer<Variant> CallInterface::change_call(const Request &request) {
    const auto [app, session, type] = request.unpack<int32_t, int32_t, int32_t>();
    const auto outcome = calls_.change(request.slot, session, CallType{type});
    if (!outcome)
        return outcome.refusal();
    return wire::pack(Result::kOk, outcome->in_force,
                      string(outcome->pending ? "pending" : "switched"));
}

Answer<Variant> CallInterface::accept_change_request(const Request &request) {
    const auto [app, session] = request.unpack<int32_t, int32_t>();
    return result_of(calls_.accept_change(request.slot, session));
}

Answer<Variant> CallInterface::reject_change_request(const Request &request) {
    const auto [app, session] = request.unpack<int32_t, int32_t>();
    return result_of(calls_.reject_change(request.slot, session));
}

Answer<Variant> CallInterface::send_dtmf(const Request &request) {
    const auto [app, session, tones] = request.unpack<int32_t, int32_t, string>();
    return result_of(calls_.send_dtmf(request.slot, session, tones));
}

Answer<Variant> CallInterface::start_dtmf(const Request &request) {
    const auto [app, session, tone] = request.unpack<int32_t, int32_t, std::uint8_t>();
    return result_of(calls_.start_dtmf(request.slot, session, tone));
}

Answer<Variant> CallInterface::stop_dtmf(const Request &request) {
    const auto [app, session] = request.unpack<int32_t, int32_t>();
    return result_of(calls_.stop_dtmf(request.slot, session));
}

Answer<Variant> CallInterface::voice_record(const Request &request) {
    const auto [app, session, action, path] = request.unpack<int32_t, int32_t, int32_t, string>();
    return result_of(calls_.record(request.slot, session, RecordAction{action}, path));
}

Answer<Variant> CallInterface::send_tty_data(const Request &request) {
    const auto [app, session, text] = request.unpack<int32_t, int32_t, string>();
    const auto bytes = wire::decode_base64(text);
    if (!bytes)
        return refuse(Result::kInvalidArgument, "the text is no base64");
    return result_of(calls_.send_tty(request.slot, session, *bytes));
}

Answer<Variant> CallInterface::set_tty_mode(const Request &request) {
    const auto [app, mode] = request.unpack<int32_t, int32_t>();
    return result_of(calls_.set_tty_mode(request.slot, TtyMode{mode}));
}

Answer<Variant> CallInterface::get_tty_mode(const Request &request) {
    const TtyState state = calls_.tty(request.slot);
    return wire::pack(Result::kOk, state.mode, static_cast<int32_t>(state.received.size()),
                      wire::encode_base64(state.received));
}

Answer<Variant> CallInterface::is_muted(const Request &request) {
    const auto [app, session] = request.unpack<int32_t, int32_t>();
    return result_with(calls_.is_muted(request.slot, session));
}

Answer<Variant> CallInterface::toggle_mute(const Request &request) {
    const auto [app, session] = request.unpack<int32_t, int32_t>();
    return result_of(calls_.toggle_mute(request.slot, session));
}

Answer<Variant> CallInterface::set_speaker_mode(const Request &request) {
    const auto [app, session, on] = request.unpack<int32_t, int32_t, int32_t>();
    return result_of(calls_.set_speaker(request.slot, session, on));
}

Answer<Variant> CallInterface::set_volume(const Request &request) {
    const auto [app, session, volume] = request.unpack<int32_t, int32_t, int32_t>();
    return result_of(calls_.set_volume(request.slot, session, volume));
}

Answer<Variant> CallInterface::get_max_volume(const Request &request) {
    const auto [app, session] = request.unpack<int32_t, int32_t>();
    return result_with(calls_.max_volume(request.slot, session));
}

Answer<Variant> CallInterface::add_user_for_conference_call(const Request &request) {
    const auto [app, conference, called, type] =
        request.unpack<int32_t, int32_t, string, int32_t>();
    return result_of(calls_.invite(request.slot, conference, called, CallType{type}));
}

Answer<Variant> CallInterface::indicate_srvcc_ho_started(const Request &request) {
    const auto [app, session] = request.unpack<int32_t, int32_t>();
    return result_of(calls_.handover_started(request.slot, session));
}

Answer<Variant> CallInterface::indicate_srvcc_ho_failed(const Request &request) {
    const auto [app, session] = request.unpack<int32_t, int32_t>();
    return result_of(calls_.handover_failed(request.slot, session));
}

Answer<Variant> CallInterface::set_auto_response(const Request &request) {
    const auto [app, mode, delay] = request.unpack<int32_t, int32_t, int32_t>();
    return result_of(calls_.set_auto_response(request.slot, AutoResponse{mode}, delay));
}

Answer<Variant> CallInterface::set_emergency_pdn_info(const Request &request) {
    const auto [app, interface, count, servers, local] =
        request.unpack<int32_t, string, int32_t, wire::Texts, string>();
    const auto addresses = counted_texts(count, servers);
    if (!addresses)
        return addresses.refusal();
    return result_of(calls_.set_emergency_pdn(request.slot, {interface, *addresses, local}));
}

Answer<Variant> CallInterface::register_emergency_pdn(const Request &request) {
    return result_of(calls_.register_emergency_pdn(request.slot));
}

Answer<Variant> CallInterface::deregister_emergency_pdn(const Request &request) {
    return result_of(calls_.deregister_emergency_pdn(request.slot));
}

Answer<Variant> CallInterface::start_nway_conference_call(const Request &request) {
    const auto [app, first, second, type] = request.unpack<int32_t, int32_t, int32_t, int32_t>();
    return result_with(calls_.start_nway(request.slot, first, second, CallType{type}));
}

Answer<Variant> CallInterface::merge_calls(const Request &request) {
    return result_with(calls_.merge(request.slot));
}

Answer<Variant> CallInterface::add_participant(const Request &request) {
    const auto [app, conference, session] = request.unpack<int32_t, int32_t, int32_t>();
    return result_of(calls_.add_participant(request.slot, conference, session));
}

Answer<Variant> CallInterface::remove_participant(const Request &request) {
    const auto [app, conference, session] = request.unpack<int32_t, int32_t, int32_t>();
    return result_of(calls_.remove_participant(request.slot, conference, session));
}

Answer<Variant> CallInterface::is_in_epdg_call(const Request &request) {
    return wire::pack(Result::kOk, calls_.in_epdg_call(request.slot));
}

Answer<Variant> CallInterface::update_ssac_info(const Request &request) {
    const auto [app, apply, voice_factor, voice_time, video_factor, video_time] =
        request.unpack<int32_t, int32_t, int32_t, int32_t, int32_t, int32_t>();
    return result_of(
        calls_.set_ssac(request.slot, apply, {voice_factor, voice_time, video_factor, video_time}));
}

Answer<Variant> CallInterface::change_epdg_audio_path(const Request &request) {
    const auto [app, path] = request.unpack<int32_t, int32_t>();
    return result_of(calls_.set_audio_path(request.slot, AudioPath{path}));
}

Answer<Variant> CallInterface::start_conference(const Request &request) {
    const auto [type, count, called] = request.unpack<int32_t, int32_t, wire::Texts>();
    const auto participants = counted_texts(count, called);
    if (!participants)
        return participants.refusal();
    return result_with(calls_.start_conference(request.slot, CallType{type}, *participants));
}

Answer<Variant> CallInterface::modify_participants(const Request &request) {
    const auto [conference, change, count, called] =
        request.unpack<int32_t, int32_t, int32_t, wire::Texts>();
    const auto participants = counted_texts(count, called);
    if (!participants)
        return participants.refusal();
    return result_with(calls_.modify_conference(request.slot, conference, ConferenceChange{change},
                                                *participants));
}

Answer<Variant> CallInterface::call_list_info(const Request &request) {
    const auto calls = calls_.list(request.slot);
    return list_of(calls, [](const CallInfo &call, const auto &add) {
        add("session_id", call.session_id);
        add("peer_uri", call.peer_uri);
        add("call_type", call.type);
        add("bmocall", call.mobile_originated);
        add("call_state", call.state);
        add("bconfcall", call.conference);
    });
}

} // namespace sim
