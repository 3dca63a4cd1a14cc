// SPDX-License-Identifier: Apache-2.0
#include "sim/ptt/participants.hpp"

#include <fmt/format.h>

namespace sim {
namespace {

constexpr std::string_view kSessionHost = "sessions.invalid";
constexpr std::int32_t kBeingAsked = 0;
constexpr std::int32_t kConnected = 1;

GroupMedia group_media(const FourIntegers &media) {
    return {.audio = media[kPttVoice] != 0,
            .video = media[kPttVideo] != 0,
            .message = media[kPttMessages] != 0,
            .file_transfer = media[kPttFiles] != 0,
            .poc_speech = media[kPttVoice] != 0};
}

} // namespace

ParticipantInfo participant_info(const PttRunningCall &call) {
    ParticipantInfo info;
    info.list_service_uri = call.uri;
    info.session_uri = fmt::format("sip:{}@{}", call.session, kSessionHost);
    info.disp_name = call.name;
    info.session_type = static_cast<std::int32_t>(call.type);
    info.media = group_media(call.media);
    info.inviting_user = call.placed_by;
    info.is_emergency = call.crisis;
    for (const auto &participant : call.participants) {
        SessionParticipant &told = info.participants.emplace_back();
        told.member.uri = participant.uri;
        if (!participant.display_name.empty())
            told.member.disp_name = participant.display_name;
        told.member.active = participant.connected;
        told.user_state = participant.connected ? kConnected : kBeingAsked;
        told.media = info.media;
    }
    return info;
}

} // namespace sim
