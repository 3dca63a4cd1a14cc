// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <string>
#include <sys/types.h>
#include <utility>
#include <variant>
#include <vector>

namespace sim {

struct SpawnRequest {
    std::vector<std::string> command; // the program is searched for in PATH
    std::vector<std::pair<std::string, std::string>> environment; // added to this process's
    std::vector<std::pair<int, int>> descriptors;                 // ours, the child's
    int error_output = -1;                                        // else this process's
    int death_signal = 0;                                         // when this process dies
    bool own_session = false; // out of reach of the terminal's signals
};

struct SpawnError {
    std::string text;
    bool not_found = false;
};

std::variant<pid_t, SpawnError> spawn(const SpawnRequest &request);

// Orphaned grandchildren become children of this process from now on.
void adopt_orphans();
// Ends every child but one: asked first, made to after a moment.
void end_children_except(pid_t spared);

} // namespace sim
