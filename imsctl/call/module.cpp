// SPDX-License-Identifier: Apache-2.0
#include "imsctl/call/module.hpp"

namespace imsctl {
namespace {

constexpr VerbGroup kCallVerbGroups[] = {
    {"call", "voice and video calls"},
    {"call tty", "text telephony"},
    {"call tty mode", "the text telephony mode"},
    {"call mute", "a call's microphone"},
    {"call volume", "a call's volume"},
    {"call conference", "calls with more than two parties"},
    {"call conference nway", "conferences made of single calls"},
    {"call emergency-pdn", "the packet data network for emergency calls"},
    {"call srvcc", "handover to circuit-switched voice"},
    {"call epdg", "calls over the evolved packet data gateway"},
};

} // namespace

Module call_module() {
    return {kCallVerbGroups,
            {call_verbs(), media_verbs(), conference_verbs(), access_verbs()},
            {call_events()}};
}

} // namespace imsctl
