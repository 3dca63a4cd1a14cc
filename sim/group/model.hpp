// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/result.hpp"
#include "sim/group/answers.hpp"
#include "sim/group/state.hpp"

#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace sim {

// The group documents of the network, the same for every slot. A request changes all that it names
// or nothing.
class GroupModel {
  public:
    // Makes the state durable. What went wrong, or nothing.
    using Keeper = std::function<std::optional<std::string>(const GroupState &)>;
    using Edit = std::function<Status(GroupDocument &)>;

    static constexpr std::size_t kMostGroups = 1000;
    // As large as all groups together may be, about as they travel: an answer has to fit into a
    // message of the bus.
    static constexpr std::size_t kLargestState = 32 << 20;

    const GroupState &state() const { return state_; }
    void restore(GroupState state) { state_ = std::move(state); }
    void keep_with(Keeper keeper) { keeper_ = std::move(keeper); }

    Status create(GroupDocument group);
    Status remove(std::string_view uri);
    Status edit(std::string_view uri, const Edit &edit);

    // By its uri; without one, by its channel. A channel that comes beside the uri has to be its.
    Answer<const GroupDocument *> find(std::string_view uri, std::string_view channel) const;
    // Of the groups that this user is a member of; without a user, of all.
    SharedGroups shared_groups(std::string_view user) const;
    ParticipantGroups participant_groups(std::string_view user) const;
    // Puts a group into a list of the user and makes it the only default group there, or no longer
    // one.
    Status set_default(std::string_view user, const std::string &list, const std::string &uri,
                       bool is_default);

    // The uris of the members of a group; nothing when there is no such group.
    std::optional<std::vector<std::string>> participants_of(std::string_view uri) const;

  private:
    // Becomes the state once it is durable.
    Status commit(GroupState next);

    GroupState state_;
    Keeper keeper_;
};

// What makes kept state impossible, or nothing.
std::optional<std::string> find_contradiction(const GroupState &state);

} // namespace sim
