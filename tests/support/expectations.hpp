// SPDX-License-Identifier: Apache-2.0
// What several tests expect of a function's log line, of a call that the peer got, of how it was
// made.
#pragma once

#include "tests/support/function_name.hpp"
#include "tests/support/scripted_peer.hpp"

#include <string>

namespace test {

// Both answers of a gate that is not on, with every argument 0 or NULL.
void check_gate(const std::string &unit, const std::string &function, int (*call_with_nothing)());

template <auto Function>
void check_gate(const std::string &unit) {
    check_gate(unit, std::string{name_of<Function>()}, with_nothing<Function>);
}

// The one line that a function writes.
void expect_one_line(const std::string &unit, const std::string &function,
                     const std::string &message);
// The same, whatever the line says.
void expect_one_line(const std::string &unit, const std::string &function);
// The one warning.
void expect_one_warning(const std::string &unit, const std::string &function,
                        const std::string &message);

// How the call was made: destination, path, parameters, time limit.
void expect_sent(const Call &call, const std::string &type, const std::string &value);
void expect_call_arguments(bool synchronous, const std::string &interface,
                           const std::string &method);

} // namespace test
