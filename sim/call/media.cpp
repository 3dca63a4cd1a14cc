// SPDX-License-Identifier: Apache-2.0
// What is done inside a call: sound, tones, text telephony, recording.
#include "sim/call/model.hpp"

#include <algorithm>

namespace sim {

namespace {

constexpr std::string_view kTones = "0123456789*#ABCDabcd";

bool is_tone(char tone) {
    return tone != '\0' && kTones.find(tone) != std::string_view::npos;
}

} // namespace

std::vector<SessionRef> CallModel::far_ends(const Session &session) const {
    std::vector<SessionRef> ends;
    if (session.peer)
        ends.push_back(*session.peer);
    for (const SessionRef ref : member_refs(session))
        if (const auto &member = lines_[ref.slot].sessions.at(ref.id);
            member.peer && member.established())
            ends.push_back(*member.peer);
    return ends;
}

Answer<bool> CallModel::is_muted(int slot, int id) {
    const auto session = established(slot, id);
    if (!session)
        return session.refusal();
    return (*session)->muted;
}

Status CallModel::toggle_mute(int slot, int id) {
    const auto session = established(slot, id);
    if (!session)
        return session.refusal();
    (*session)->muted = !(*session)->muted;
    return Done{};
}

Status CallModel::set_volume(int slot, int id, std::int32_t volume) {
    const auto session = established(slot, id);
    if (!session)
        return session.refusal();
    if (volume < 0 || volume > kMaxVolume)
        return refuse(Result::kInvalidArgument, "a volume is 0 to {}, not {}", kMaxVolume, volume);
    (*session)->volume = volume;
    return Done{};
}

Answer<std::int32_t> CallModel::max_volume(int slot, int id) {
    const auto session = established(slot, id);
    if (!session)
        return session.refusal();
    return kMaxVolume;
}

Status CallModel::set_speaker(int slot, int id, std::int32_t on) {
    const auto session = established(slot, id);
    if (!session)
        return session.refusal();
    if (on != 0 && on != 1)
        return refuse(Result::kInvalidArgument, "the speaker is 0 (off) or 1 (on), not {}", on);
    (*session)->speaker = on == 1;
    return Done{};
}

Status CallModel::record(int slot, int id, RecordAction action, const std::string &path) {
    const auto session = established(slot, id);
    if (!session)
        return session.refusal();
    if (action != RecordAction::kStart && action != RecordAction::kStop)
        return refuse(Result::kInvalidArgument, "a recording is 1 (started) or 0 (stopped), not {}",
                      action);
    const bool start = action == RecordAction::kStart;
    if ((*session)->recording == start)
        return refuse(Result::kWrongState, "call {} is {} recorded", id,
                      start ? "already" : "not being");
    if (start && path.empty())
        return refuse(Result::kInvalidArgument, "a recording needs the path of a file");
    (*session)->recording = start;
    return Done{};
}

Answer<Session *> CallModel::silent(int slot, int id) {
    auto session = talking(slot, id);
    if (session && (*session)->tone)
        return refuse(Result::kWrongState, "call {} sends a tone: stop that first", id);
    return session;
}

Status CallModel::send_dtmf(int slot, int id, std::string_view tones) {
    const auto session = silent(slot, id);
    if (!session)
        return session.refusal();
    if (tones.empty())
        return refuse(Result::kInvalidArgument, "there is no tone to send");
    if (!std::ranges::all_of(tones, is_tone))
        return refuse(Result::kInvalidArgument, "\"{}\": tones are 0-9, *, # and A-D", tones);
    for (const char tone : tones)
        for (const SessionRef end : far_ends(**session))
            emit(end.slot, CallDtmfEvent{static_cast<std::uint8_t>(tone)});
    return Done{};
}

Status CallModel::start_dtmf(int slot, int id, std::uint8_t tone) {
    const auto session = silent(slot, id);
    if (!session)
        return session.refusal();
    if (!is_tone(static_cast<char>(tone)))
        return refuse(Result::kInvalidArgument, "{:#04x}: tones are 0-9, *, # and A-D", tone);
    (*session)->tone = tone;
    for (const SessionRef end : far_ends(**session))
        emit(end.slot, CallDtmfEvent{tone});
    return Done{};
}

Status CallModel::stop_dtmf(int slot, int id) {
    const auto session = established(slot, id);
    if (!session)
        return session.refusal();
    if (!(*session)->tone)
        return refuse(Result::kWrongState, "call {} sends no tone", id);
    (*session)->tone.reset();
    return Done{};
}

Status CallModel::set_tty_mode(int slot, TtyMode mode) {
    if (mode < TtyMode::kOff || mode > TtyMode::kVoiceCarryOver)
        return refuse(Result::kInvalidArgument,
                      "a mode is 0 (off), 1 (full), 2 (hearing carry over) or 3 (voice carry "
                      "over), not {}",
                      mode);
    lines_[slot].tty_mode = mode;
    return Done{};
}

TtyState CallModel::tty(int slot) const {
    return {lines_[slot].tty_mode, lines_[slot].tty_received};
}

Status CallModel::send_tty(int slot, int id, const std::string &bytes) {
    const auto session = talking(slot, id);
    if (!session)
        return session.refusal();
    if (lines_[slot].tty_mode == TtyMode::kOff)
        return refuse(Result::kWrongState, "text telephony is off: set a mode first");
    if (bytes.empty())
        return refuse(Result::kInvalidArgument, "there is no text to send");
    const auto ends = far_ends(**session);
    for (const SessionRef end : ends)
        lines_[end.slot].tty_received = bytes;
    // A party of the network types back what it reads.
    if (ends.empty())
        lines_[slot].tty_received = bytes;
    return Done{};
}

} // namespace sim
