// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/number_plan.hpp"
#include "sim/bus/interface.hpp"
#include "sim/group/model.hpp"
#include "sim/registration/registrations.hpp"

#include <string>
#include <utility>

namespace sim {

// org.kelvo.ims.Xdm. Its requests carry no application id.
class GroupInterface {
  public:
    GroupInterface(GroupModel &groups, const NumberPlan &plan, const Registrations &registrations,
                   RunningSessions sessions)
        : groups_(groups), plan_(plan), registrations_(registrations),
          sessions_(std::move(sessions)) {}

    Interface describe();

  private:
    ParticipantGroups fetch_participant_groups(int slot, const std::string &user) const;
    Answer<UserProfile> fetch_profile(int slot, const std::string &user) const;
    Status set_default(int slot, const std::string &list, const std::string &uri, bool is_default);
    Answer<ParticipantInfo> participant_info(int slot, const std::string &text) const;

    // The user that a request names; without a name, the slot's own.
    std::string user_of(int slot, const std::string &user) const;

    GroupModel &groups_;
    const NumberPlan &plan_;
    const Registrations &registrations_;
    RunningSessions sessions_;
};

} // namespace sim
