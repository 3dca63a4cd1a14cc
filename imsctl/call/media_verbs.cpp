// SPDX-License-Identifier: Apache-2.0
// Sound, tones, recording and text telephony inside a call.
#include "imsctl/call/module.hpp"
#include "imsctl/call/session_value.hpp"
#include "imsctl/call/values.hpp"
#include "imsctl/line/requests.hpp"

namespace imsctl {
namespace {

struct DtmfArguments {
    SessionChoice session;
    Argument<std::string> digits;
    Argument<std::string> tone;
    Argument<bool> stop;
};

void send_digits(Invocation &run, std::int32_t session_id, const std::string &digits) {
    const ims_call_dtmf_info_s info{session_id, digits.c_str()};
    run.request(session_id_field(session_id), with_record(ims_call_send_dtmf, info));
}

void start_tone(Invocation &run, std::int32_t session_id, const std::string &tone) {
    const ims_call_dtmf_tone_s info{session_id, static_cast<std::uint8_t>(tone.front())};
    run.request(session_id_field(session_id), with_record(ims_call_start_dtmf, info));
}

void stop_tone(Invocation &run, std::int32_t session_id) {
    const auto start = [&](ims_h handle, ims_response_cb callback, void *user_data) {
        return ims_call_stop_dtmf(handle, session_id, callback, user_data);
    };
    run.request(session_id_field(session_id), start);
}

void run_dtmf(Invocation &run, const DtmfArguments &given) {
    const int asked =
        (given.digits->empty() ? 0 : 1) + (given.tone->empty() ? 0 : 1) + (*given.stop ? 1 : 0);
    if (asked != 1)
        throw Failure(FailureKind::kUsage, "one of DIGITS, --start and --stop is needed",
                      "try: imsctl call dtmf 1234");
    if (given.tone->size() > 1)
        throw Failure(FailureKind::kUsage, "--start takes one tone, not " + quote(*given.tone),
                      "try: imsctl call dtmf --start 5");
    const std::int32_t session_id = given.session.resolve(run.client());
    if (*given.stop)
        stop_tone(run, session_id);
    else if (!given.tone->empty())
        start_tone(run, session_id, *given.tone);
    else
        send_digits(run, session_id, *given.digits);
}

Action prepare_dtmf(Arguments &arguments) {
    DtmfArguments given{arguments.session_option(kInConversation),
                        arguments.text_or("DIGITS", "the digits to send, in this order", ""),
                        arguments.text_or("--start", "start this one tone", ""),
                        arguments.flag("--stop", "stop the tone")};
    return [given](Invocation &run) { run_dtmf(run, given); };
}

Action prepare_record(Arguments &arguments) {
    const auto action = arguments.choice("ACTION", "what to do", kRecordActions);
    const auto file = arguments.text_or("--file", "where to, as the service understands it", "");
    const auto session = arguments.session_option(kEstablished);
    return [=](Invocation &run) {
        const ims_call_record_info_s info{session.resolve(run.client()), *action, file->c_str()};
        run.request(session_id_field(info.session_id), with_record(ims_call_voice_record, info));
    };
}

Action prepare_tty_send(Arguments &arguments) {
    const auto text = arguments.text("TEXT", "what to send");
    const auto session = arguments.session_option(kInConversation);
    return [=](Invocation &run) {
        const ims_call_tty_data_s info{session.resolve(run.client()),
                                       reinterpret_cast<const std::uint8_t *>(text->data()),
                                       static_cast<std::int32_t>(text->size())};
        run.request(session_id_field(info.session_id), with_record(ims_call_send_tty_data, info));
    };
}

Fields decode_tty_mode(void *data) {
    if (data == nullptr)
        return {};
    const auto &mode = *static_cast<const ims_call_tty_mode_s *>(data);
    Bytes bytes;
    if (mode.data != nullptr && mode.length > 0)
        bytes.assign(mode.data, mode.data + mode.length);
    return {{"value_1", std::int64_t{mode.value_1}},
            {"value_2", std::int64_t{mode.value_2}},
            {"data", bytes}};
}

Action prepare_volume(Arguments &arguments) {
    const auto volume = arguments.number("VOLUME", "from 0 to what 'call volume max' says");
    return on_session(arguments.session_option(kEstablished), volume, ims_call_set_volume);
}

Action prepare_speaker(Arguments &arguments) {
    const auto mode = arguments.choice("MODE", "the speaker", kSwitch);
    return on_session(arguments.session_option(kEstablished), mode, ims_call_set_speaker_mode);
}

constexpr Verb kMediaVerbs[] = {
    {"call dtmf", "send DTMF digits, or start and stop one tone", "call dtmf 1234", prepare_dtmf},
    {"call record", "start or stop recording the voice", "call record start --file call.wav",
     prepare_record},
    {"call tty send", "send a text over text telephony", "call tty send hello", prepare_tty_send},
    {"call tty mode get", "show the text telephony mode", "call tty mode get",
     [](Arguments &) { return plain(ims_call_get_tty_mode, decode_tty_mode); }},
    {"call tty mode set", "set the text telephony mode", "call tty mode set full",
     [](Arguments &arguments) {
         return with_number(arguments.choice("MODE", "the mode", kTtyModes), ims_call_set_tty_mode);
     }},
    {"call mute status", "show whether a call is muted", "call mute status",
     [](Arguments &arguments) {
         return on_session(arguments, kEstablished, ims_call_is_muted, flag_as("muted"));
     }},
    {"call mute toggle", "mute a call, or unmute it", "call mute toggle",
     [](Arguments &arguments) {
         return on_session(arguments, kEstablished, ims_call_toggle_mute);
     }},
    {"call volume set", "set a call's volume", "call volume set 5", prepare_volume},
    {"call volume max", "show a call's greatest volume", "call volume max",
     [](Arguments &arguments) {
         return on_session(arguments, kEstablished, ims_call_get_max_volume,
                           number_as("max_volume"));
     }},
    {"call speaker", "switch the speaker", "call speaker on", prepare_speaker},
};

} // namespace

std::span<const Verb> media_verbs() {
    return kMediaVerbs;
}

} // namespace imsctl
