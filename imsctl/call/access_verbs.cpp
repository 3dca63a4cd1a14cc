// SPDX-License-Identifier: Apache-2.0
// How calls are responded to and what the radio side reports: not about one call's sound or
// parties.
#include "imsctl/call/module.hpp"
#include "imsctl/call/values.hpp"
#include "imsctl/line/requests.hpp"

namespace imsctl {
namespace {

Action prepare_auto_response(Arguments &arguments) {
    const auto mode = arguments.choice("MODE", "what becomes of incoming calls", kAutoResponses);
    const auto delay = arguments.number("--delay", "seconds before that", 0);
    return [=](Invocation &run) {
        const ims_call_pair_info_s info{*mode, *delay};
        run.request({}, with_record(ims_call_set_auto_response, info));
    };
}

Action prepare_emergency_pdn(Arguments &arguments) {
    const auto interface = arguments.text("INTERFACE", "the network interface");
    const auto servers = arguments.some_texts("SERVER", "addresses of the servers");
    const auto local = arguments.text_or("--local", "the address of this device", "");
    return [=](Invocation &run) {
        std::vector<const char *> texts;
        for (const std::string &server : *servers)
            texts.push_back(server.c_str());
        const ims_call_emergency_pdn_s info{interface->c_str(),
                                            static_cast<std::int32_t>(texts.size()), texts.data(),
                                            local->c_str()};
        run.request({}, with_record(ims_call_set_emergency_pdn_info, info));
    };
}

Action prepare_ssac(Arguments &arguments) {
    const auto apply = arguments.choice("BARRING", "whether calls are barred", kSwitch);
    const auto voice = arguments.number("--voice-factor", "per cent of calls let through", 100);
    const auto voice_time = arguments.number("--voice-time", "seconds of barring", 4);
    const auto video = arguments.number("--video-factor", "per cent of calls let through", 100);
    const auto video_time = arguments.number("--video-time", "seconds of barring", 4);
    return [=](Invocation &run) {
        const ims_call_ssac_info_s info{*apply, *voice, *voice_time, *video, *video_time};
        run.request({}, with_record(ims_call_update_ssac_info, info));
    };
}

constexpr Verb kAccessVerbs[] = {
    {"call auto-response", "have incoming calls answered or rejected by themselves",
     "call auto-response answer --delay 3", prepare_auto_response},
    {"call emergency-pdn set", "describe the packet data network for emergency calls",
     "call emergency-pdn set rmnet1 192.0.2.1 --local 192.0.2.7", prepare_emergency_pdn},
    {"call emergency-pdn register", "register the emergency packet data network",
     "call emergency-pdn register",
     [](Arguments &) { return plain(ims_call_register_emergency_pdn); }},
    {"call emergency-pdn deregister", "deregister the emergency packet data network",
     "call emergency-pdn deregister",
     [](Arguments &) { return plain(ims_call_deregister_emergency_pdn); }},
    {"call srvcc started", "tell that the handover to circuit-switched voice has started",
     "call srvcc started 1",
     [](Arguments &arguments) {
         return on_session(arguments, kAnyCall, ims_call_indicate_srvcc_ho_started);
     }},
    {"call srvcc failed", "tell that the handover to circuit-switched voice has failed",
     "call srvcc failed 1",
     [](Arguments &arguments) {
         return on_session(arguments, kAnyCall, ims_call_indicate_srvcc_ho_failed);
     }},
    {"call epdg status", "show whether a call runs over the evolved packet data gateway",
     "call epdg status",
     [](Arguments &) { return plain(ims_call_is_in_epdg_call, flag_as("in_epdg_call")); }},
    {"call epdg audio-path", "change the audio path", "call epdg audio-path epdg",
     [](Arguments &arguments) {
         return with_number(arguments.choice("PATH", "the audio path", kAudioPaths),
                            ims_call_change_epdg_audio_path);
     }},
    {"call ssac", "pass on the cell's service-specific access control",
     "call ssac on --voice-factor 50 --voice-time 16", prepare_ssac},
};

} // namespace

std::span<const Verb> access_verbs() {
    return kAccessVerbs;
}

} // namespace imsctl
