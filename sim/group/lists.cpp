// SPDX-License-Identifier: Apache-2.0
#include "sim/group/lists.hpp"

#include "sim/base/number_plan.hpp"

#include <algorithm>

namespace sim {

namespace {

// The list of the groups that a user has put nowhere.
constexpr std::string_view kFirstList = "default";
constexpr std::int32_t kTelUri = 0;
constexpr std::int32_t kSipUri = 1;

GroupList &list_named(std::vector<GroupList> &lists, const std::string &name) {
    const auto found = std::ranges::find(lists, name, &GroupList::name);
    return found != lists.end() ? *found : lists.emplace_back(GroupList{name, name, {}});
}

bool takes_messages(const SupportedService &service) {
    return service.media && (service.media->message || service.media->pager_mode);
}

GroupListEntry entry_of(const GroupDocument &group, const GroupMember &member) {
    const auto properties = group.properties.value_or(GroupProperties());
    const auto &services = properties.supported_services;
    GroupListEntry entry;
    entry.uri = {group.uri.starts_with("sip:") ? kSipUri : kTelUri, group.uri,
                 properties.display_name, true};
    entry.poc_usage = "true";
    entry.im_usage = std::ranges::any_of(services, takes_messages) ? "true" : "false";
    entry.usages.push_back({group.channel_id.value_or(""),
                            {properties.subject, 0, properties.display_name, services, group.uri}});
    entry.is_start_up = member.auto_join;
    return entry;
}

} // namespace

const GroupMember *find_member(const GroupDocument &group, std::string_view user) {
    if (!group.members)
        return nullptr;
    const auto &contacts = group.members->contacts;
    const auto found = std::ranges::find_if(
        contacts, [&](const GroupMember &contact) { return same_user(contact.uri, user); });
    return found == contacts.end() ? nullptr : &*found;
}

ParticipantGroups list_groups(const GroupState &state, std::string_view user) {
    ParticipantGroups listed{std::to_string(state.revision), {}};
    for (const auto &group : state.groups) {
        const auto *member = find_member(group, user);
        if (!member)
            continue;
        auto entry = entry_of(group, *member);
        const auto placement =
            std::ranges::find_if(state.placements, [&](const GroupPlacement &placed) {
                return placed.group_uri == group.uri && same_user(placed.user, user);
            });
        const bool placed = placement != state.placements.end();
        entry.is_default_group = placed && placement->is_default;
        list_named(listed.lists, placed ? placement->list : std::string(kFirstList))
            .entries.push_back(std::move(entry));
    }
    return listed;
}

void place_group(GroupState &state, const GroupPlacement &placement) {
    std::erase_if(state.placements, [&](const GroupPlacement &placed) {
        return placed.group_uri == placement.group_uri && same_user(placed.user, placement.user);
    });
    if (placement.is_default)
        for (auto &placed : state.placements)
            if (placed.list == placement.list && same_user(placed.user, placement.user))
                placed.is_default = false;
    state.placements.push_back(placement);
}

} // namespace sim
