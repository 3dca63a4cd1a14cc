// SPDX-License-Identifier: Apache-2.0
#include "sim/registration/login_interface.hpp"

#include "sim/bus/ask.hpp"
#include "sim/bus/tell.hpp"

namespace sim {

namespace {

using enum Caller;

Answer<std::tuple<LoginPhase, std::uint32_t, LoginReason>>
get_login_state(const Logins &logins, int slot, LoginKind kind) {
    const auto state = logins.state(slot, kind);
    if (!state)
        return state.refusal();
    return std::tuple(state->phase, state->number, state->reason);
}

constexpr std::size_t kPassword = 1;

constexpr MethodRow<Logins> kMethods[] = {
    {"Login", ask<&Logins::login>, kLastArgument, kPassword},
    {"Logout", ask<&Logins::logout>, kFirstArgument},
    {"GetLoginState", ask<get_login_state>, kLastArgument},
};

constexpr SignalTable kLoginSignals{SignalRow<LoginState>{"LoginState"}};

} // namespace

Interface LoginInterface::describe() {
    return {kName, bind_methods(kMethods, logins_), kLoginSignals.infos()};
}

Signal to_signal(const LoginState &event) {
    return kLoginSignals.signal_of(event);
}

} // namespace sim
