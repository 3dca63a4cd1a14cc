// SPDX-License-Identifier: Apache-2.0
#include "sim/registration/registrations.hpp"

namespace sim {

namespace {

constexpr std::chrono::milliseconds kRegistrationTime{300};

constexpr std::uint32_t kNoNetwork = 0;
constexpr std::uint32_t kLte = 1;
constexpr std::uint32_t kVoice = 1;
constexpr std::uint32_t kVideo = 2;
constexpr std::uint32_t kShortMessages = 4;
constexpr std::uint32_t kUssd = 8;
constexpr std::int32_t kSipOk = 200;
constexpr std::int32_t kGrantedSeconds = 3600;

} // namespace

Registrations::Registrations(int slots, Timers &timers, Sink sink)
    : timers_(timers), sink_(std::move(sink)), slots_(slots) {}

void Registrations::start() {
    for (int slot = 0; slot < slots_.slots(); ++slot)
        begin(slot);
}

RegistrationInfo Registrations::info(int slot) const {
    switch (slots_[slot].state) {
    case State::kRegistered:
        return {true, kLte, kVoice | kVideo | kShortMessages | kUssd, {}, kSipOk, kGrantedSeconds};
    case State::kFlightMode:
        return {.reason = RegistrationReason::kFlightMode};
    case State::kRegistering:
        break;
    }
    return {.reason = RegistrationReason::kUnderWay};
}

std::optional<Refusal> Registrations::radio_off(int slot) const {
    if (slots_[slot].state != State::kFlightMode)
        return std::nullopt;
    return refuse(Result::kWrongState,
                  "slot {} is in flight mode: RegisterApplication without "
                  "parameters leaves it",
                  slot);
}

Status Registrations::enable_flight_mode(int slot) {
    if (auto refusal = radio_off(slot))
        return *refusal;
    const bool announced = registered(slot);
    slots_[slot].timer.cancel();
    slots_[slot].state = State::kFlightMode;
    if (lost_)
        lost_(slot);
    if (emergency_bearer(slot))
        set_bearer(slot, false, RegistrationReason::kFlightMode);
    if (announced)
        sink_(slot, info(slot));
    return Done{};
}

void Registrations::switch_on(int slot) {
    if (slots_[slot].state == State::kFlightMode)
        begin(slot);
}

void Registrations::begin(int slot) {
    slots_[slot].state = State::kRegistering;
    slots_[slot].timer = timers_.after(kRegistrationTime, [this, slot] { complete(slot); });
}

void Registrations::complete(int slot) {
    slots_[slot].state = State::kRegistered;
    sink_(slot, info(slot));
    if (registered_)
        registered_(slot);
}

void Registrations::set_bearer(int slot, bool registered, RegistrationReason reason) {
    slots_[slot].emergency_bearer = registered;
    sink_(slot, EmergencyRegistrationStatus{registered, registered ? kLte : kNoNetwork, reason});
}

} // namespace sim
