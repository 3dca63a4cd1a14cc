// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/group/answers.hpp"
#include "sim/group/state.hpp"

#include <string_view>

// The lists in which a user finds the groups that it is a member of.
namespace sim {

// The contact of a group who is this user, or null.
const GroupMember *find_member(const GroupDocument &group, std::string_view user);

ParticipantGroups list_groups(const GroupState &state, std::string_view user);

// In one list of its user a group stands, and a list has one default group at most.
void place_group(GroupState &state, const GroupPlacement &placement);

} // namespace sim
