// SPDX-License-Identifier: Apache-2.0
#include "sim/call/radio.hpp"

#include <arpa/inet.h>
#include <array>
#include <string_view>
#include <utility>

namespace sim {

namespace {

bool is_ip_address(const std::string &text) {
    std::array<unsigned char, sizeof(in6_addr)> bytes{};
    return inet_pton(AF_INET, text.c_str(), bytes.data()) == 1 ||
           inet_pton(AF_INET6, text.c_str(), bytes.data()) == 1;
}

// 3GPP TS 36.331 bars for 4 to 512 seconds, in powers of two.
bool is_barring_time(std::int32_t seconds) {
    return seconds >= 4 && seconds <= 512 && (seconds & (seconds - 1)) == 0;
}

std::optional<Refusal> bad_barring(std::string_view media, std::int32_t factor, std::int32_t time) {
    if (factor < 0 || factor > 100 || factor % 5 != 0)
        return refuse(Result::kInvalidArgument,
                      "the {} factor is 0 to 100 per cent in steps of 5, not {}", media, factor);
    if (factor < 100 && !is_barring_time(time))
        return refuse(Result::kInvalidArgument,
                      "the {} barring time is 4, 8, 16 ... 512 seconds, not {}", media, time);
    return std::nullopt;
}

} // namespace

Status CallRadio::handover_started(int slot, int id) {
    const auto session = sessions_.existing(slot, id);
    if (!session)
        return session.refusal();
    if ((*session)->handover)
        return refuse(Result::kWrongState, "a handover of call {} is under way already", id);
    (*session)->handover = true;
    return Done{};
}

Status CallRadio::handover_failed(int slot, int id) {
    const auto session = sessions_.existing(slot, id);
    if (!session)
        return session.refusal();
    if (!(*session)->handover)
        return refuse(Result::kWrongState, "no handover of call {} is under way", id);
    (*session)->handover = false;
    return Done{};
}

bool CallRadio::in_epdg_call(int slot) const {
    return slots_[slot].audio_path == AudioPath::kEpdg && sessions_.has_established(slot);
}

Status CallRadio::set_audio_path(int slot, AudioPath path) {
    if (path != AudioPath::kCellular && path != AudioPath::kEpdg)
        return refuse(Result::kInvalidArgument, "a path is 0 (cellular) or 1 (ePDG), not {}", path);
    if (!sessions_.has_established(slot))
        return refuse(Result::kWrongState, "there is no established call whose path could change");
    slots_[slot].audio_path = path;
    return Done{};
}

Status CallRadio::set_ssac(int slot, std::int32_t apply, const Ssac &ssac) {
    if (apply != 0 && apply != 1)
        return refuse(Result::kInvalidArgument, "barring is 1 (applies) or 0 (lifted), not {}",
                      apply);
    if (apply == 0) {
        slots_[slot].ssac.reset();
        return Done{};
    }
    if (auto refusal = bad_barring("voice", ssac.voice_factor, ssac.voice_time))
        return *refusal;
    if (auto refusal = bad_barring("video", ssac.video_factor, ssac.video_time))
        return *refusal;
    slots_[slot].ssac = ssac;
    return Done{};
}

std::optional<Refusal> CallRadio::bars(int slot, CallType type) const {
    const auto &ssac = slots_[slot].ssac;
    const bool video = type == CallType::kVideo;
    if (ssac && (video ? ssac->video_factor : ssac->voice_factor) == 0)
        return refuse(Result::kBarred, "the cell bars {} calls (UpdateSsacInfo set the factor 0)",
                      video ? "video" : "voice");
    return std::nullopt;
}

Status CallRadio::set_emergency_pdn(int slot, EmergencyPdn info) {
    if (info.interface.empty())
        return refuse(Result::kInvalidArgument, "the name of the network interface is empty");
    if (info.servers.empty())
        return refuse(Result::kInvalidArgument, "there is no server address");
    for (const auto &address : info.servers)
        if (!is_ip_address(address))
            return refuse(Result::kInvalidArgument, "\"{}\" is no IP address", address);
    if (!is_ip_address(info.local_address))
        return refuse(Result::kInvalidArgument, "the local address \"{}\" is no IP address",
                      info.local_address);
    if (registrations_.emergency_bearer(slot))
        return refuse(Result::kWrongState, "the emergency PDN is registered: deregister it first");
    slots_[slot].emergency_pdn = std::move(info);
    return Done{};
}

Status CallRadio::register_emergency_pdn(int slot) {
    if (auto refusal = registrations_.radio_off(slot))
        return *refusal;
    if (registrations_.emergency_bearer(slot))
        return refuse(Result::kWrongState, "the emergency PDN is registered already");
    if (!slots_[slot].emergency_pdn)
        return refuse(Result::kWrongState, "nothing is known of the emergency PDN: call "
                                           "SetEmergencyPdnInfo first");
    registrations_.set_emergency_bearer(slot, true);
    return Done{};
}

Status CallRadio::deregister_emergency_pdn(int slot) {
    if (!registrations_.emergency_bearer(slot))
        return refuse(Result::kWrongState, "the emergency PDN is not registered");
    registrations_.set_emergency_bearer(slot, false);
    return Done{};
}

} // namespace sim
