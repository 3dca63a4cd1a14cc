// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/call_type.hpp"
#include "sim/base/number_plan.hpp"
#include "sim/base/per_slot.hpp"
#include "sim/base/result.hpp"
#include "sim/registration/registrations.hpp"

#include <array>
#include <chrono>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace sim {

// Bits of a service class; 0 stands for all of them.
enum class ServiceClass : std::int32_t { kVoice = 1, kVideo = 2, kBoth = 3 };

enum class ForwardCondition : std::int32_t {
    kUnconditional = 0,
    kBusy = 1,
    kNoReply = 2,
    kNotReachable = 3,
    kAll = 4,
    kAllConditional = 5,
};

enum class BarringType : std::int32_t {
    kAllOutgoing = 0,
    kInternational = 1,
    kInternationalExceptHome = 2,
    kAllIncoming = 3,
    kIncomingWhenRoaming = 4,
    kAll = 5,
};

enum class UriType : std::int32_t { kNumber = 0, kSip = 1 };

// Entries of a query's answer; what a change asks for has the same form.
struct WaitingEntry {
    ServiceClass service = ServiceClass::kVoice;
    std::int32_t status = 0;
    bool operator==(const WaitingEntry &) const = default;
};
struct ForwardingEntry {
    ServiceClass service = ServiceClass::kVoice;
    std::int32_t status = 0;
    ForwardCondition condition = ForwardCondition::kUnconditional;
    std::int32_t no_reply_time = 0;
    std::int32_t uri_length = 0;
    UriType uri_type = UriType::kNumber;
    std::string uri;
    bool operator==(const ForwardingEntry &) const = default;
};
struct BarringEntry {
    ServiceClass service = ServiceClass::kVoice;
    std::int32_t status = 0;
    BarringType type = BarringType::kAllOutgoing;
    bool operator==(const BarringEntry &) const = default;
};

// Call waiting, forwarding and barring of all slots, and what they mean for a call. The network's:
// it applies them on the side that they belong to.
class SupplementaryServices {
  public:
    SupplementaryServices(const NumberPlan &plan, const Registrations &registrations);

    Status set_waiting(int slot, const WaitingEntry &wanted);
    Answer<std::vector<WaitingEntry>> waiting(int slot, ServiceClass service) const;
    Status set_forwarding(int slot, const ForwardingEntry &wanted);
    Answer<std::vector<ForwardingEntry>> forwarding(int slot, ServiceClass service,
                                                    ForwardCondition condition) const;
    Status set_barring(int slot, const BarringEntry &wanted, std::string_view password);
    Answer<std::vector<BarringEntry>> barring(int slot, ServiceClass service,
                                              BarringType type) const;

    bool may_wait(int slot, CallType type) const;
    std::optional<Refusal> bars_outgoing(int slot, std::string_view number, CallType type) const;
    bool bars_incoming(int slot, CallType type) const;
    // Where calls go under this condition, one of the four; nothing when they are not forwarded.
    std::optional<std::string> forward_target(int slot, ForwardCondition condition,
                                              CallType type) const;
    // How long a slot rings before a call is forwarded; nothing when it is not.
    std::optional<std::chrono::seconds> no_reply_time(int slot, CallType type) const;

  private:
    struct Forwarding {
        bool active = false;
        std::int32_t no_reply_time = 0;
        UriType uri_type = UriType::kNumber;
        std::string uri;
        std::string number;
    };
    struct Services { // of one class
        bool waiting = true;
        std::array<Forwarding, 4> forwarding; // by condition
        std::array<bool, 5> barring{};        // by type
    };
    using Slot = std::array<Services, 2>; // voice, video

    const Services &services(int slot, CallType type) const;
    std::optional<Refusal> bad_change(int slot, ServiceClass service, std::int32_t status) const;
    std::optional<Refusal> bad_query(int slot, ServiceClass service) const;
    Answer<Forwarding> to_forwarding(int slot, const ForwardingEntry &wanted) const;

    const NumberPlan &plan_;
    const Registrations &registrations_;
    PerSlot<Slot> slots_;
};

} // namespace sim
