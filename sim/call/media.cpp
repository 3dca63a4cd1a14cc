// SPDX-License-Identifier: Apache-2.0
#include "sim/call/media.hpp"

#include <algorithm>

namespace sim {

namespace {

constexpr std::string_view kTones = "0123456789*#ABCDabcd";

bool is_tone(char tone) {
    return tone != '\0' && kTones.find(tone) != std::string_view::npos;
}

} // namespace

void CallMedia::forget(SessionRef ref) {
    slots_[ref.slot].sounds.erase(ref.id);
    if (sessions_[ref.slot].sessions.empty())
        slots_[ref.slot].tty.received.clear();
}

Answer<CallMedia::Sound *> CallMedia::sound(int slot, int id) {
    if (const auto session = sessions_.established(slot, id); !session)
        return session.refusal();
    return &slots_[slot].sounds[id];
}

Answer<CallMedia::Sound *> CallMedia::silent(int slot, int id) {
    if (const auto session = sessions_.talking(slot, id); !session)
        return session.refusal();
    Sound &found = slots_[slot].sounds[id];
    if (found.tone)
        return refuse(Result::kWrongState, "call {} sends a tone: stop that first", id);
    return &found;
}

std::vector<SessionRef> CallMedia::far_ends(SessionRef ref) {
    const Session &session = *sessions_.find(ref);
    std::vector<SessionRef> ends;
    if (session.peer)
        ends.push_back(*session.peer);
    for (const SessionRef name : sessions_.members_of(session))
        if (const Session &member = *sessions_.find(name); member.peer && member.established())
            ends.push_back(*member.peer);
    return ends;
}

Answer<bool> CallMedia::is_muted(int slot, int id) {
    const auto found = sound(slot, id);
    if (!found)
        return found.refusal();
    return (*found)->muted;
}

Status CallMedia::toggle_mute(int slot, int id) {
    const auto found = sound(slot, id);
    if (!found)
        return found.refusal();
    (*found)->muted = !(*found)->muted;
    return Done{};
}

Status CallMedia::set_volume(int slot, int id, std::int32_t volume) {
    const auto found = sound(slot, id);
    if (!found)
        return found.refusal();
    if (volume < 0 || volume > kMaxVolume)
        return refuse(Result::kInvalidArgument, "a volume is 0 to {}, not {}", kMaxVolume, volume);
    (*found)->volume = volume;
    return Done{};
}

Answer<std::int32_t> CallMedia::max_volume(int slot, int id) {
    const auto found = sound(slot, id);
    if (!found)
        return found.refusal();
    return kMaxVolume;
}

Status CallMedia::set_speaker(int slot, int id, std::int32_t on) {
    const auto found = sound(slot, id);
    if (!found)
        return found.refusal();
    if (on != 0 && on != 1)
        return refuse(Result::kInvalidArgument, "the speaker is 0 (off) or 1 (on), not {}", on);
    (*found)->speaker = on == 1;
    return Done{};
}

Status CallMedia::record(int slot, int id, RecordAction action, const std::string &path) {
    const auto found = sound(slot, id);
    if (!found)
        return found.refusal();
    if (action != RecordAction::kStart && action != RecordAction::kStop)
        return refuse(Result::kInvalidArgument, "a recording is 1 (started) or 0 (stopped), not {}",
                      action);
    const bool start = action == RecordAction::kStart;
    if ((*found)->recording == start)
        return refuse(Result::kWrongState, "call {} is {} recorded", id,
                      start ? "already" : "not being");
    if (start && path.empty())
        return refuse(Result::kInvalidArgument, "a recording needs the path of a file");
    (*found)->recording = start;
    return Done{};
}

Status CallMedia::send_dtmf(int slot, int id, std::string_view tones) {
    const auto found = silent(slot, id);
    if (!found)
        return found.refusal();
    if (tones.empty())
        return refuse(Result::kInvalidArgument, "there is no tone to send");
    if (!std::ranges::all_of(tones, is_tone))
        return refuse(Result::kInvalidArgument, "\"{}\": tones are 0-9, *, # and A-D", tones);
    for (const char tone : tones)
        for (const SessionRef end : far_ends({slot, id}))
            sessions_.emit(end.slot, CallDtmfEvent{static_cast<std::uint8_t>(tone)});
    return Done{};
}

Status CallMedia::start_dtmf(int slot, int id, std::uint8_t tone) {
    const auto found = silent(slot, id);
    if (!found)
        return found.refusal();
    if (!is_tone(static_cast<char>(tone)))
        return refuse(Result::kInvalidArgument, "{:#04x}: tones are 0-9, *, # and A-D", tone);
    (*found)->tone = tone;
    for (const SessionRef end : far_ends({slot, id}))
        sessions_.emit(end.slot, CallDtmfEvent{tone});
    return Done{};
}

Status CallMedia::stop_dtmf(int slot, int id) {
    const auto found = sound(slot, id);
    if (!found)
        return found.refusal();
    if (!(*found)->tone)
        return refuse(Result::kWrongState, "call {} sends no tone", id);
    (*found)->tone.reset();
    return Done{};
}

Status CallMedia::set_tty_mode(int slot, TtyMode mode) {
    if (mode < TtyMode::kOff || mode > TtyMode::kVoiceCarryOver)
        return refuse(Result::kInvalidArgument,
                      "a mode is 0 (off), 1 (full), 2 (hearing carry over) or 3 (voice carry "
                      "over), not {}",
                      mode);
    slots_[slot].tty.mode = mode;
    return Done{};
}

Status CallMedia::send_tty(int slot, int id, const std::string &bytes) {
    const auto session = sessions_.talking(slot, id);
    if (!session)
        return session.refusal();
    if (slots_[slot].tty.mode == TtyMode::kOff)
        return refuse(Result::kWrongState, "text telephony is off: set a mode first");
    if (bytes.empty())
        return refuse(Result::kInvalidArgument, "there is no text to send");
    const auto ends = far_ends({slot, id});
    for (const SessionRef end : ends)
        slots_[end.slot].tty.received = bytes;
    // A party of the network types back what it reads.
    if (ends.empty())
        slots_[slot].tty.received = bytes;
    return Done{};
}

} // namespace sim
