// SPDX-License-Identifier: Apache-2.0
#include "sim/call/interface.hpp"

#include "sim/bus/ask.hpp"
#include "sim/call/signals.hpp"

namespace sim {

template <>
inline constexpr std::array wire::kKeys<CallInfo>{
    "session_id", "peer_uri", "call_type", "bmocall", "call_state", "bconfcall",
};

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

Answer<std::tuple<CallType, string>> change_call(CallChanges &changes, int slot, int32_t session,
                                                 CallType type) {
    const auto outcome = changes.change(slot, session, type);
    if (!outcome)
        return outcome.refusal();
    return std::tuple(outcome->in_force, string(outcome->pending ? "pending" : "switched"));
}

Status send_tty_data(CallMedia &media, int slot, int32_t session, const string &text) {
    const auto bytes = wire::decode_base64(text);
    if (!bytes)
        return refuse(Result::kInvalidArgument, "the text is no base64");
    return media.send_tty(slot, session, *bytes);
}

std::tuple<TtyMode, int32_t, string> get_tty_mode(const CallMedia &media, int slot) {
    const TtyState state = media.tty(slot);
    return {state.mode, static_cast<int32_t>(state.received.size()),
            wire::encode_base64(state.received)};
}

Status set_emergency_pdn_info(CallRadio &radio, int slot, const string &interface, int32_t count,
                              const wire::Texts &servers, const string &local) {
    const auto addresses = counted_texts(count, servers);
    if (!addresses)
        return addresses.refusal();
    return radio.set_emergency_pdn(slot, {interface, *addresses, local});
}

Answer<int> start_conference(CallModel &calls, int slot, CallType type, int32_t count,
                             const wire::Texts &called) {
    const auto participants = counted_texts(count, called);
    if (!participants)
        return participants.refusal();
    return calls.start_conference(slot, type, *participants);
}

Answer<int> modify_participants(CallModel &calls, int slot, int32_t conference,
                                ConferenceChange change, int32_t count, const wire::Texts &called) {
    const auto participants = counted_texts(count, called);
    if (!participants)
        return participants.refusal();
    return calls.modify_conference(slot, conference, change, *participants);
}

constexpr MethodRow<CallModel, CallMedia, CallChanges, CallRadio, UssdService> kMethods[] = {
    {"MakeCall", ask<&CallModel::make_call>, kFirstArgument},
    {"SendUssd", ask<&UssdService::send>, kFirstArgument},
    {"AnswerCall", ask<&CallModel::answer, int32_t>, kFirstArgument},
    {"EndCall", ask<&CallModel::end, int32_t, int32_t>, kFirstArgument},
    {"RejectCall", ask<&CallModel::reject>, kFirstArgument},
    {"HoldCall", ask<&CallModel::hold>, kFirstArgument},
    {"ResumeCall", ask<&CallModel::resume>, kFirstArgument},
    {"SwapCall", ask<&CallModel::swap>, kFirstArgument},
    {"UpgradeCall", ask<&CallChanges::upgrade>, kFirstArgument},
    {"DowngradeCall", ask<&CallChanges::downgrade>, kFirstArgument},
    {"ChangeCall", ask<change_call>, kFirstArgument},
    {"AcceptChangeRequest", ask<&CallChanges::accept>, kFirstArgument},
    {"RejectChangeRequest", ask<&CallChanges::reject>, kFirstArgument},
    {"SendDtmf", ask<&CallMedia::send_dtmf>, kFirstArgument},
    {"StartDtmf", ask<&CallMedia::start_dtmf>, kFirstArgument},
    {"StopDtmf", ask<&CallMedia::stop_dtmf>, kFirstArgument},
    {"VoiceRecord", ask<&CallMedia::record>, kFirstArgument},
    {"SendTtyData", ask<send_tty_data>, kFirstArgument},
    {"SetTtyMode", ask<&CallMedia::set_tty_mode>, kFirstArgument},
    {"GetTtyMode", ask<get_tty_mode>, kConnection},
    {"IsMuted", ask<&CallMedia::is_muted>, kFirstArgument},
    {"ToggleMute", ask<&CallMedia::toggle_mute>, kFirstArgument},
    {"SetSpeakerMode", ask<&CallMedia::set_speaker>, kFirstArgument},
    {"SetVolume", ask<&CallMedia::set_volume>, kFirstArgument},
    {"GetMaxVolume", ask<&CallMedia::max_volume>, kFirstArgument},
    {"AddUserForConferenceCall", ask<&CallModel::invite>, kFirstArgument},
    {"IndicateSrvccHoStarted", ask<&CallRadio::handover_started>, kFirstArgument},
    {"IndicateSrvccHoFailed", ask<&CallRadio::handover_failed>, kFirstArgument},
    {"SetAutoResponse", ask<&CallModel::set_auto_response>, kFirstArgument},
    {"SetEmergencyPdnInfo", ask<set_emergency_pdn_info>, kFirstArgument},
    {"RegisterEmergencyPdn", ask<&CallRadio::register_emergency_pdn>, kConnection},
    {"DeregisterEmergencyPdn", ask<&CallRadio::deregister_emergency_pdn>, kConnection},
    {"StartNwayConferenceCall", ask<&CallModel::start_nway>, kFirstArgument},
    {"MergeCalls", ask<&CallModel::merge>, kFirstArgument},
    {"AddParticipantToNwayConferenceCall", ask<&CallModel::add_participant>, kFirstArgument},
    {"RemoveParticipantFromNwayConferenceCall", ask<&CallModel::remove_participant>,
     kFirstArgument},
    {"IsInEpdgCall", ask<&CallRadio::in_epdg_call>, kFirstArgument},
    {"UpdateSsacInfo", ask<&CallRadio::set_ssac>, kFirstArgument},
    {"ChangeEpdgAudioPath", ask<&CallRadio::set_audio_path>, kFirstArgument},
    {"StartConference", ask<start_conference>, kConnection},
    {"ModifyParticipantsInConference", ask<modify_participants>, kConnection},
    {"CallListInfo", ask<&CallModel::list>, kFirstArgument},
};

} // namespace

Interface CallInterface::describe() {
    return {kName,
            bind_methods(kMethods, calls_, calls_.media(), calls_.changes(), calls_.radio(), ussd_),
            call_signals()};
}

} // namespace sim
