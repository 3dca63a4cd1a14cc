// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/glib_ref.hpp"
#include "sim/base/result.hpp"

#include <functional>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

// What a module shows on the bus: its methods, and the signals that its events become.
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

} // namespace sim
