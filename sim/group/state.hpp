// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/group/records.hpp"

#include <cstdint>
#include <string>
#include <vector>

namespace sim {

// Where a user has put a group that it is a member of.
struct GroupPlacement {
    std::string user{};
    std::string group_uri{};
    std::string list{};
    bool is_default = false;
    bool operator==(const GroupPlacement &) const = default;
};

// All that is kept about groups.
struct GroupState {
    std::int32_t revision = 0; // counts the changes
    std::vector<GroupDocument> groups;
    std::vector<GroupPlacement> placements;
    bool operator==(const GroupState &) const = default;
};

} // namespace sim
