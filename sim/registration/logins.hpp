// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "sim/base/per_slot.hpp"
#include "sim/base/result.hpp"
#include "sim/registration/registrations.hpp"

#include <array>
#include <cstdint>
#include <functional>
#include <string_view>

namespace sim {

enum class LoginKind : std::int32_t { kIms = 0, kPushToTalk = 1 };
enum class LoginPhase : std::int32_t { kLoggedOut = 0, kLoggingIn = 1, kLoggedIn = 2 };
enum class LoginReason : std::int32_t { kAskedFor = 0, kFlightMode = 2 };

// The members of the query's answer and of the signal of the same name.
struct LoginState {
    LoginPhase phase = LoginPhase::kLoggedOut;
    std::uint32_t number = 0; // of the login, from 1 in each slot; none when logged out
    LoginReason reason = LoginReason::kAskedFor;
    LoginKind kind = LoginKind::kIms;
    bool operator==(const LoginState &) const = default;
};

// Who is logged in: at most one user of each kind on a slot. The device's.
class Logins {
  public:
    using Sink = std::function<void(int slot, const LoginState &event)>;

    Logins(int slots, Timers &timers, const Registrations &registrations, Sink sink);

    Status login(int slot, std::string_view user, std::string_view password, LoginKind kind);
    Status logout(int slot);
    // The radio is off.
    void log_out(int slot) { leave_all(slot, LoginReason::kFlightMode); }
    Answer<LoginState> state(int slot, LoginKind kind) const;

  private:
    struct Login {
        LoginState state;
        Timer timer;
    };
    struct Slot {
        std::uint32_t next_number = 1;
        std::array<Login, 2> logins; // by kind
    };

    void enter(int slot, LoginKind kind, LoginPhase phase, std::uint32_t number,
               LoginReason reason = LoginReason::kAskedFor);
    bool leave_all(int slot, LoginReason reason);
    Login &at(int slot, LoginKind kind);
    const Login &at(int slot, LoginKind kind) const;

    Timers &timers_;
    const Registrations &registrations_;
    Sink sink_;
    PerSlot<Slot> slots_;
};

} // namespace sim
