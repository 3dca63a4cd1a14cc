// SPDX-License-Identifier: Apache-2.0
#include "imsctl/line/verbs.hpp"

#include <algorithm>
#include <iterator>

namespace imsctl {
namespace {

struct VerbGroup {
    std::string_view path;
    std::string_view summary;
};

constexpr VerbGroup kGroups[] = {
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
    {"registration", "registration with the network"},
    {"sms", "short messages"},
    {"ss", "supplementary services"},
    {"ss waiting", "call waiting"},
    {"ss forwarding", "call forwarding"},
    {"ss barring", "call barring"},
    {"settings", "sets of global settings"},
    {"network-environment", "the type of network environment"},
    {"profile", "registration profiles"},
    {"ptt", "push-to-talk"},
    {"ptt floor", "the right to talk"},
    {"ptt message", "messages"},
    {"ptt file", "file transfer"},
    {"ptt record", "recording of calls"},
    {"group", "group documents of push-to-talk"},
    {"group rule", "the rules of a group"},
    {"group set", "the properties of a group"},
    {"vt", "video telephony: the picture of a video call"},
    {"vt camera", "the camera"},
    {"vt zoom", "a camera's zoom"},
    {"vt record", "recording the video"},
    {"vt cast", "showing a file to the other party"},
    {"vt surface", "the pixmaps that the video is drawn on"},
    {"vt pixmap", "single pixmaps of a surface"},
    {"vt buffer", "the buffers that pictures go through"},
};

} // namespace

std::vector<Verb> all_verbs() {
    std::vector<Verb> verbs;
    for (const auto table :
         {call_verbs(), media_verbs(), conference_verbs(), access_verbs(), registration_verbs(),
          login_verbs(), sms_verbs(), ss_verbs(), settings_verbs(), profile_verbs(),
          ptt_call_verbs(), ptt_floor_verbs(), ptt_content_verbs(), group_verbs(),
          group_set_verbs(), vt_verbs(), general_verbs()})
        verbs.insert(verbs.end(), table.begin(), table.end());
    return verbs;
}

std::string_view group_summary(std::string_view path) {
    const auto *row = std::find_if(std::begin(kGroups), std::end(kGroups),
                                   [&](const VerbGroup &group) { return group.path == path; });
    return row == std::end(kGroups) ? "" : row->summary;
}

} // namespace imsctl
