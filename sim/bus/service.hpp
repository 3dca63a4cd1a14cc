// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/glib_ref.hpp"
#include "sim/base/log.hpp"
#include "sim/base/result.hpp"
#include "sim/bus/applications.hpp"
#include "sim/bus/bus.hpp"
#include "sim/bus/interface.hpp"

#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

namespace sim {

// The objects on the bus: finds the method that a call means, checks its signature, lets the
// module answer and writes the log.
class Service {
  public:
    static constexpr std::string_view kName = "org.kelvo.ims";
    static constexpr std::string_view kPath = "/org/kelvo/ims";
    static std::string slot_path(int slot);

    Service(Bus &bus, const Log &log, Applications &applications, int slots);

    // On every slot.
    void add(Interface interface) { interfaces_.push_back(std::move(interface)); }
    std::span<const Interface> interfaces() const { return interfaces_; }
    void handle(GDBusMessage *call);
    // What a request causes while it is handled goes out after its answer.
    void emit(int slot, std::string_view interface, std::string_view member, const Variant &body);

  private:
    struct Call;
    // A call that is no request of the contract gets an error of the bus.
    struct Fault {
        std::string_view name;
        std::string text;
    };
    struct Refused {
        Refusal refusal;
        Variant body;
    };
    using Outcome = std::variant<Variant, Refused, Fault>;

    Outcome dispatch(const Call &call);
    Outcome dispatch_standard(const Call &call);
    Outcome invoke(const Call &call, const Interface &interface);
    Outcome run(const Call &call, const Method &method);
    Outcome properties(const Call &call);
    std::optional<Refusal> refuse_caller(const Call &call, const Method &method) const;

    std::string describe_arguments(const Call &call) const;
    const Interface *find_interface(std::string_view name) const;
    const Interface *find_owner(std::string_view member) const;
    bool is_node(std::string_view path) const;
    std::string introspect(std::string_view path) const;
    void respond(const Call &call, const Outcome &outcome);
    void send_signal(int slot, std::string_view interface, std::string_view member,
                     const Variant &body);
    std::string describe(const Call &call) const;

    struct PendingSignal {
        int slot;
        std::string_view interface;
        std::string_view member;
        Variant body;
    };

    Bus &bus_;
    const Log &log_;
    Applications &applications_;
    int slots_;
    std::vector<Interface> interfaces_;
    bool handling_ = false;
    std::vector<PendingSignal> pending_;
};

} // namespace sim
