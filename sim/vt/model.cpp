// SPDX-License-Identifier: Apache-2.0
// Which calls have video, and until when.
#include "sim/vt/model.hpp"

#include <algorithm>

namespace sim {

namespace {

bool is_established(CallState state) {
    return state == CallState::kActive || state == CallState::kHeld ||
           state == CallState::kHeldByPeer;
}

std::optional<CallInfo> call_of(const CallModel &calls, int slot, int id) {
    const auto list = calls.list(slot);
    const auto found = std::ranges::find(list, id, &CallInfo::session_id);
    return found == list.end() ? std::nullopt : std::optional(*found);
}

} // namespace

void VideoTelephony::hear(int slot, const CallEvent &event) {
    if (const auto *ended = std::get_if<CallEnded>(&event))
        drop(slot, ended->session_id);
    // A video call may be answered as a voice call.
    if (const auto *established = std::get_if<CallEstablished>(&event);
        established && established->type != CallType::kVideo)
        drop(slot, established->session_id);
    if (const auto *switched = std::get_if<CallSwitched>(&event);
        switched && switched->type != CallType::kVideo)
        drop(slot, switched->session_id);
}

void VideoTelephony::drop(int slot, int id) {
    slots_[slot].videos.erase(id);
    if (slots_[slot].active == id)
        slots_[slot].active = 0;
}

const Video *VideoTelephony::find(int slot, int id) const {
    const auto found = slots_[slot].videos.find(id);
    return found == slots_[slot].videos.end() ? nullptr : &found->second;
}

Answer<Video *> VideoTelephony::video(int slot, int id) {
    const auto call = call_of(calls_, slot, id);
    if (!call)
        return refuse(Result::kUnknownSession, "there is no call {}", id);
    if (call->type != CallType::kVideo)
        return refuse(Result::kWrongState, "call {} is no video call but of type {}", id,
                      call->type);
    return &slots_[slot].videos[id];
}

Answer<Video *> VideoTelephony::streaming(int slot, int id) {
    auto found = video(slot, id);
    if (found && !is_established(call_of(calls_, slot, id)->state))
        return refuse(Result::kWrongState, "call {} is not established yet", id);
    return found;
}

Status VideoTelephony::set_active(int slot, int id) {
    const auto found = video(slot, id);
    if (!found)
        return found.refusal();
    slots_[slot].active = id;
    return Done{};
}

std::optional<Refusal> no_such_end(VideoEnd end) {
    if (end == VideoEnd::kNear || end == VideoEnd::kFar)
        return std::nullopt;
    return refuse(Result::kInvalidArgument, "an end is 0 (near) or 1 (far), not {}", end);
}

} // namespace sim
