// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "sim/base/per_slot.hpp"
#include "sim/base/result.hpp"

#include <cstdint>
#include <functional>
#include <optional>
#include <utility>
#include <variant>

namespace sim {

enum class RegistrationReason : std::int32_t { kNone = 0, kUnderWay = 1, kFlightMode = 2 };

// The members of the query's answer and of RegistrationStatus.
struct RegistrationInfo {
    bool registered = false;
    std::uint32_t network = 0;
    std::uint32_t features = 0;
    RegistrationReason reason = RegistrationReason::kNone;
    std::int32_t sip_status = 0;
    std::int32_t expires = 0;
    bool operator==(const RegistrationInfo &) const = default;
};

struct EmergencyRegistrationStatus {
    bool registered = false;
    std::uint32_t network = 0;
    RegistrationReason reason = RegistrationReason::kNone;
    bool operator==(const EmergencyRegistrationStatus &) const = default;
};

using RegistrationEvent = std::variant<RegistrationInfo, EmergencyRegistrationStatus>;

// Which slots the network knows, and which have their radio off. The device's.
class Registrations {
  public:
    using Sink = std::function<void(int slot, const RegistrationEvent &event)>;
    using Listener = std::function<void(int slot)>;

    Registrations(int slots, Timers &timers, Sink sink);

    // Every slot begins to register.
    void start();

    bool registered(int slot) const { return slots_[slot].state == State::kRegistered; }
    RegistrationInfo info(int slot) const;
    // Why nothing can be sent, when the radio is off.
    std::optional<Refusal> radio_off(int slot) const;

    Status enable_flight_mode(int slot);
    // Leaves flight mode. Without effect when the radio is on.
    void switch_on(int slot);

    bool emergency_bearer(int slot) const { return slots_[slot].emergency_bearer; }
    void set_emergency_bearer(int slot, bool registered) {
        set_bearer(slot, registered, RegistrationReason::kNone);
    }

    // Called before the loss is announced, and after the registration has been.
    void when_lost(Listener listener) { lost_ = std::move(listener); }
    void when_registered(Listener listener) { registered_ = std::move(listener); }

  private:
    enum class State { kRegistering, kRegistered, kFlightMode };
    struct Slot {
        State state = State::kRegistering;
        Timer timer;
        bool emergency_bearer = false;
    };

    void begin(int slot);
    void complete(int slot);
    void set_bearer(int slot, bool registered, RegistrationReason reason);

    Timers &timers_;
    Sink sink_;
    PerSlot<Slot> slots_;
    Listener lost_;
    Listener registered_;
};

} // namespace sim
