// SPDX-License-Identifier: Apache-2.0
// The platform's two functions as the test executables define them: a gate that can be set, and
// every line that was logged.
#pragma once

#include <ostream>
#include <string>
#include <vector>

namespace test {

enum class Gate { kOn, kOff, kFailing };

void set_gate(Gate gate);

// How often the gate was asked since the test began.
int gate_queries();

struct LogLine {
    int log_id = -1;
    int priority = -1;
    std::string tag;
    std::string file;
    std::string function;
    int line = -1;
    std::string message;

    bool operator==(const LogLine &) const = default;
};

std::ostream &operator<<(std::ostream &out, const LogLine &line);

// What was logged since the test began or since the last call of this.
std::vector<LogLine> take_log();

// Before each test.
void reset_platform();

} // namespace test
