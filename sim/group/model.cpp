// SPDX-License-Identifier: Apache-2.0
#include "sim/group/model.hpp"

#include "sim/group/edits.hpp"
#include "sim/group/lists.hpp"
#include "sim/group/writer.hpp"

#include <algorithm>
#include <set>

namespace sim {

namespace {

// What a value takes on the bus beside its text: type, lengths and padding.
constexpr std::size_t kValueOverhead = 24;

std::size_t size_of(const GroupDictionary &dictionary);

std::size_t size_of(const GroupValue &value) {
    std::size_t size = kValueOverhead;
    if (const auto *text = std::get_if<std::string>(&value.content))
        size += text->size();
    else if (const auto *dictionary = std::get_if<GroupDictionary>(&value.content))
        size += size_of(*dictionary);
    else if (const auto *dictionaries = std::get_if<GroupDictionaries>(&value.content))
        for (const auto &entry : *dictionaries)
            size += kValueOverhead + size_of(entry);
    return size;
}

std::size_t size_of(const GroupDictionary &dictionary) {
    std::size_t size = 0;
    for (const auto &[key, value] : dictionary)
        size += key.size() + size_of(value);
    return size;
}

std::size_t size_of(const GroupState &state) {
    std::size_t size = 0;
    for (const auto &group : state.groups)
        size += size_of(write_record(group, GroupForm::kRead));
    return size;
}

template <typename Groups>
auto find_group(Groups &groups, std::string_view uri) {
    return std::ranges::find(groups, uri, &GroupDocument::uri);
}

Refusal unknown_group(std::string_view uri) {
    return refuse(Result::kUnknownRecord, "there is no group \"{}\"", uri);
}

} // namespace

Status GroupModel::commit(GroupState next) {
    std::erase_if(next.placements, [&](const GroupPlacement &placement) {
        const auto group = find_group(next.groups, placement.group_uri);
        return group == next.groups.end() || !find_member(*group, placement.user);
    });
    ++next.revision;
    if (size_of(next) > kLargestState)
        return refuse(Result::kTooMany, "the groups together become larger than {} bytes",
                      kLargestState);
    if (keeper_)
        if (const auto error = keeper_(next))
            return refuse(Result::kFailed, "the change cannot be kept: {}", *error);
    restore(std::move(next));
    return Done{};
}

Status GroupModel::create(GroupDocument group) {
    if (const auto contradiction = find_contradiction(group))
        return refuse(Result::kInvalidArgument, "{}", *contradiction);
    if (find_group(state_.groups, group.uri) != state_.groups.end())
        return refuse(Result::kDuplicate, "there is a group \"{}\" already", group.uri);
    if (state_.groups.size() >= kMostGroups)
        return refuse(Result::kTooMany, "there are {} groups already", kMostGroups);
    GroupState next = state_;
    next.groups.push_back(std::move(group));
    return commit(std::move(next));
}

Status GroupModel::remove(std::string_view uri) {
    GroupState next = state_;
    const auto group = find_group(next.groups, uri);
    if (group == next.groups.end())
        return unknown_group(uri);
    next.groups.erase(group);
    return commit(std::move(next));
}

Status GroupModel::edit(std::string_view uri, const Edit &edit) {
    GroupState next = state_;
    const auto group = find_group(next.groups, uri);
    if (group == next.groups.end())
        return unknown_group(uri);
    if (auto edited = edit(*group); !edited)
        return edited;
    if (const auto contradiction = find_contradiction(*group))
        return refuse(Result::kInvalidArgument, "{}", *contradiction);
    return commit(std::move(next));
}

Answer<const GroupDocument *> GroupModel::find(std::string_view uri,
                                               std::string_view channel) const {
    if (uri.empty() && channel.empty())
        return refuse(Result::kInvalidArgument, "neither a group nor a channel is named");
    const auto matches = [&](const GroupDocument &group) {
        return (uri.empty() || group.uri == uri) &&
               (channel.empty() || group.channel_id == channel);
    };
    const auto group = std::ranges::find_if(state_.groups, matches);
    if (group != state_.groups.end())
        return &*group;
    if (channel.empty())
        return unknown_group(uri);
    if (uri.empty())
        return refuse(Result::kUnknownRecord, "no group has the channel \"{}\"", channel);
    return refuse(Result::kUnknownRecord, "there is no group \"{}\" with the channel \"{}\"", uri,
                  channel);
}

SharedGroups GroupModel::shared_groups(std::string_view user) const {
    SharedGroups shared{std::to_string(state_.revision), {}};
    for (const auto &group : state_.groups)
        if (user.empty() || find_member(group, user))
            shared.groups.push_back({&group});
    return shared;
}

ParticipantGroups GroupModel::participant_groups(std::string_view user) const {
    return list_groups(state_, user);
}

Status GroupModel::set_default(std::string_view user, const std::string &list,
                               const std::string &uri, bool is_default) {
    if (list.empty())
        return refuse(Result::kInvalidArgument, "no group list is named");
    const auto group = find_group(state_.groups, uri);
    if (group == state_.groups.end())
        return unknown_group(uri);
    if (!find_member(*group, user))
        return refuse(Result::kUnknownRecord, "{} is no member of the group \"{}\"", user, uri);
    GroupState next = state_;
    place_group(next, {std::string(user), uri, list, is_default});
    return commit(std::move(next));
}

std::optional<std::vector<std::string>> GroupModel::participants_of(std::string_view uri) const {
    const auto group = find_group(state_.groups, uri);
    if (group == state_.groups.end())
        return std::nullopt;
    std::vector<std::string> uris;
    if (group->members)
        for (const auto &member : group->members->contacts)
            uris.push_back(member.uri);
    return uris;
}

std::optional<std::string> find_contradiction(const GroupState &state) {
    std::set<std::string_view> uris;
    for (const auto &group : state.groups) {
        if (auto contradiction = find_contradiction(group))
            return fmt::format("group \"{}\": {}", group.uri, *contradiction);
        if (!uris.insert(group.uri).second)
            return fmt::format("the group \"{}\" comes twice", group.uri);
    }
    for (const auto &placement : state.placements)
        if (placement.list.empty() || !uris.contains(placement.group_uri))
            return fmt::format("a list of {} has no name, or a group that does not exist",
                               placement.user);
    return std::nullopt;
}

} // namespace sim
