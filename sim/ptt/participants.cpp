// SPDX-License-Identifier: Apache-2.0
// A slot's group calls as those who ask about participants are told of them.
#include "sim/ptt/model.hpp"

#include <fmt/format.h>
#include <string_view>

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

ParticipantInfo info_of(const PttCall &call, const PttParticipant &self) {
    ParticipantInfo info;
    info.list_service_uri = call.uri;
    info.session_uri = fmt::format("sip:{}@{}", self.session, kSessionHost);
    info.disp_name = call.name;
    info.session_type = static_cast<std::int32_t>(call.type);
    info.media = group_media(self.media);
    info.is_emergency = call.crisis;
    const auto owner = call.participants.find(call.owner);
    if (owner != call.participants.end())
        info.inviting_user = owner->second.uri();
    for (const auto &[who, participant] : call.participants) {
        SessionParticipant &told = info.participants.emplace_back();
        told.member.uri = participant.uri();
        if (const auto name = participant.name(); !name.empty())
            told.member.disp_name = name;
        told.member.active = participant.connected();
        told.user_state = participant.connected() ? kConnected : kBeingAsked;
        told.media = info.media;
    }
    return info;
}

} // namespace

std::vector<ParticipantInfo> PttCalls::running(int slot) const {
    std::vector<ParticipantInfo> running;
    for (const auto &[session, ref] : sessions_[slot].sessions) {
        const PttCall &call = sessions_.calls().at(ref.call);
        const PttParticipant &self = call.participants.at(ref.who);
        if (call.is_group() && self.connected())
            running.push_back(info_of(call, self));
    }
    return running;
}

} // namespace sim
