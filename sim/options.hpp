// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/log.hpp"

#include <chrono>
#include <string>
#include <variant>
#include <vector>

namespace sim {

// The program's own exit statuses; those of `run` are otherwise its command's.
enum ExitStatus : int {
    kExitOk = 0,
    kExitFailure = 1,
    kExitUsage = 2,
    kExitRunFailure = 125,
    kExitNotExecutable = 126,
    kExitNotFound = 127,
    kExitSignalBase = 128,
};

struct Options {
    bool run = false;
    std::string address;
    std::vector<std::string> numbers; // one a slot
    double speed = 1;
    std::chrono::duration<double> ring_time{60};
    std::string state; // where settings survive; empty: nowhere
    LogLevel log_level = LogLevel::kNormal;
    std::vector<std::string> command;
};

// What the arguments ask for, or the exit status when they are answered already.
std::variant<Options, int> parse_options(int argc, const char *const *argv);

} // namespace sim
