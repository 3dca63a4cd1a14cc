// SPDX-License-Identifier: Apache-2.0
#include "sim/registration/logins.hpp"

namespace sim {

namespace {

constexpr std::chrono::milliseconds kLoginTime{300};
constexpr std::string_view kWrongPassword = "wrong";
constexpr LoginKind kKinds[] = {LoginKind::kIms, LoginKind::kPushToTalk};

std::optional<Refusal> no_such_kind(LoginKind kind) {
    const auto value = static_cast<std::int32_t>(kind);
    if (kind == LoginKind::kIms || kind == LoginKind::kPushToTalk)
        return std::nullopt;
    return refuse(Result::kInvalidArgument, "a kind is 0 (IMS service) or 1 (push-to-talk), not {}",
                  value);
}

} // namespace

Logins::Logins(int slots, Timers &timers, const Registrations &registrations, Sink sink)
    : timers_(timers), registrations_(registrations), sink_(std::move(sink)), slots_(slots) {}

Logins::Login &Logins::at(int slot, LoginKind kind) {
    return slots_[slot].logins[static_cast<std::size_t>(kind)];
}

const Logins::Login &Logins::at(int slot, LoginKind kind) const {
    return slots_[slot].logins[static_cast<std::size_t>(kind)];
}

Status Logins::login(int slot, std::string_view user, std::string_view password, LoginKind kind) {
    if (auto refusal = no_such_kind(kind))
        return *refusal;
    if (user.empty())
        return refuse(Result::kInvalidArgument, "the name of the user is empty");
    if (auto refusal = registrations_.radio_off(slot))
        return *refusal;
    if (at(slot, kind).state.phase != LoginPhase::kLoggedOut)
        return refuse(Result::kWrongState, "a user of this kind is {}: log out first",
                      at(slot, kind).state.phase == LoginPhase::kLoggedIn ? "logged in"
                                                                          : "logging in");
    if (password.empty() || password == kWrongPassword)
        return refuse(Result::kWrongPassword,
                      "the password of {} is wrong: any but an empty one and \"{}\" is right", user,
                      kWrongPassword);
    const auto number = slots_[slot].next_number++;
    enter(slot, kind, LoginPhase::kLoggingIn, number);
    at(slot, kind).timer = timers_.after(kLoginTime, [this, slot, kind, number] {
        enter(slot, kind, LoginPhase::kLoggedIn, number);
    });
    return Done{};
}

Status Logins::logout(int slot) {
    if (!leave_all(slot, LoginReason::kAskedFor))
        return refuse(Result::kWrongState, "nobody is logged in on slot {}", slot);
    return Done{};
}

Answer<LoginState> Logins::state(int slot, LoginKind kind) const {
    if (auto refusal = no_such_kind(kind))
        return *refusal;
    return at(slot, kind).state;
}

void Logins::enter(int slot, LoginKind kind, LoginPhase phase, std::uint32_t number,
                   LoginReason reason) {
    at(slot, kind).state = {phase, number, reason, kind};
    sink_(slot, at(slot, kind).state);
}

bool Logins::leave_all(int slot, LoginReason reason) {
    bool left = false;
    for (const LoginKind kind : kKinds) {
        if (at(slot, kind).state.phase == LoginPhase::kLoggedOut)
            continue;
        at(slot, kind).timer.cancel();
        enter(slot, kind, LoginPhase::kLoggedOut, 0, reason);
        left = true;
    }
    return left;
}

} // namespace sim
