// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/glib_ref.hpp"
#include "sim/base/log.hpp"
#include "sim/base/result.hpp"
#include "sim/bus/applications.hpp"
#include "sim/bus/bus.hpp"
#include "sim/bus/wire.hpp"

#include <functional>
#include <map>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <tuple>
#include <vector>

namespace sim {

// How a method learns which application asks.
enum class Caller {
    kAnybody,
    kFirstArgument, // the application id comes first
    kLastArgument,  // ... or last
    kConnection,    // the connection must have registered on the slot
};

// A method call whose signature has been checked.
struct Request {
    int slot = -1;
    std::string connection;
    Variant arguments;

    template <typename... Ts>
    std::tuple<Ts...> unpack() const {
        return wire::unpack<Ts...>(arguments.get());
    }
};

using Handler = std::function<Answer<Variant>(const Request &)>;

// Signatures are those of the whole body in parentheses, "()" for none.
struct Method {
    std::string_view member;
    std::string_view in;
    std::string_view out;
    Caller caller;
    Handler handler;
    std::size_t result_index = 0;          // where in the reply the result stands
    std::optional<std::size_t> password{}; // the argument that the log does not show
};

struct SignalInfo {
    std::string_view member;
    std::string_view signature;
};

// What an event becomes on the wire.
struct Signal {
    std::string_view member;
    Variant body;
};

struct Interface {
    std::string_view name;
    std::vector<Method> methods;
    std::span<const SignalInfo> signals;
};

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

// A module's table holds pointers to its own members; this makes them methods of that module.
template <typename Module>
struct MethodRow {
    std::string_view member;
    std::string_view in;
    std::string_view out;
    Caller caller;
    Answer<Variant> (Module::*handler)(const Request &);
    std::size_t result_index = 0;
    std::optional<std::size_t> password{};
};

template <typename Module>
std::vector<Method> bind_methods(Module &module, std::span<const MethodRow<Module>> rows) {
    std::vector<Method> methods;
    for (const auto &row : rows)
        methods.push_back({row.member, row.in, row.out, row.caller,
                           [&module, handler = row.handler](const Request &request) {
                               return (module.*handler)(request);
                           },
                           row.result_index, row.password});
    return methods;
}

} // namespace sim
