// SPDX-License-Identifier: Apache-2.0
// Channels: whoever is tuned to one takes part in what goes on there.
#include "sim/ptt/model.hpp"

namespace sim {

Status PttCalls::set_channel(int slot, std::int32_t channel, PttChannelMode mode) {
    if (auto refusal = registrations_.radio_off(slot))
        return *refusal;
    if (channel < 0 || channel > kPttChannels)
        return refuse(Result::kInvalidArgument, "a channel is 1 to {}, or 0 for none, not {}",
                      kPttChannels, channel);
    if (mode != PttChannelMode::kTalkAndListen && mode != PttChannelMode::kListenOnly)
        return refuse(Result::kInvalidArgument,
                      "a mode is 0 (talk and listen) or 1 (listen), not {}", mode);
    Line &here = lines_[slot];
    here.channel_mode = mode;
    if (channel == here.channel) {
        for (const auto &[session, ref] : here.sessions)
            if (PttCall &call = *find(ref.call); call.type == PttCallType::kChannel) {
                PttParticipant &self = *find(ref);
                self.listens_only = mode == PttChannelMode::kListenOnly;
                if (self.listens_only)
                    cancel_floor(call, self, PttFloorCause::kListensOnly);
            }
        return Done{};
    }
    leave_channel(slot);
    here.channel = channel;
    for (auto &[id, call] : calls_) {
        if (call.type != PttCallType::kChannel || !call.established ||
            call.uri != channel_uri(channel))
            continue;
        PttParticipant &late =
            add_participant(call, {directory_.uri_of(slot), {}, slot, nullptr, call.uri, false, 0});
        invite_slot(call, late);
        break;
    }
    return Done{};
}

void PttCalls::leave_channel(int slot) {
    for (const auto &[session, ref] : lines_[slot].sessions)
        if (find(ref.call)->type == PttCallType::kChannel)
            return leave(ref, PttEndReason::kEndedHere, PttEndReason::kEndedByPeer);
}

std::string PttCalls::channel_uri(std::int32_t channel) {
    return fmt::format("sip:channel-{}@{}", channel, PttDirectory::kGroupHost);
}

} // namespace sim
