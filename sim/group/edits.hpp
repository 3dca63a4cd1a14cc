// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/result.hpp"
#include "sim/group/records.hpp"

// What requests do to one document. After a refusal the document is of no use.
namespace sim {

Status add_members(GroupDocument &group, const GroupMembers &added);
// Known by their uris and names alone.
Status remove_members(GroupDocument &group, const GroupMembers &removed);
// The contact with this uri becomes this one.
Status replace_contact(GroupDocument &group, const GroupMember &contact);

Status add_rules(GroupDocument &group, const std::vector<GroupRule> &added);
// The rules with these ids become these.
Status replace_rules(GroupDocument &group, const std::vector<GroupRule> &rules);
Status delete_rule(GroupDocument &group, const std::string &id);

Status set_active_policy(GroupDocument &group, const SessionPolicy &policy);
// Of one service, which is added when the group does not have it.
Status set_service(GroupDocument &group, const SessionService &service);
Status set_age_restrictions(GroupDocument &group, const std::vector<AgeRestriction> &restrictions);

// A part that is not set is made when something in it is.
template <typename Part>
Part &made(std::optional<Part> &part) {
    return part ? *part : part.emplace();
}

// What makes a document impossible, or nothing.
std::optional<std::string> find_contradiction(const GroupDocument &group);

} // namespace sim
