// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/number_plan.hpp"
#include "sim/bus/service.hpp"
#include "sim/group/model.hpp"
#include "sim/registration/registrations.hpp"

namespace sim {

// org.kelvo.ims.Xdm. Its requests carry no application id.
class XdmInterface {
  public:
    XdmInterface(GroupModel &groups, const NumberPlan &plan, const Registrations &registrations,
                 RunningSessions sessions)
        : groups_(groups), plan_(plan), registrations_(registrations),
          sessions_(std::move(sessions)) {}

    Interface describe();

  private:
    using Outcome = Answer<Variant>;

    Outcome create_group(const Request &request);
    Outcome delete_group(const Request &request);
    Outcome fetch_shared_group(const Request &request);
    Outcome fetch_all_shared_groups(const Request &request);
    Outcome fetch_all_participant_groups(const Request &request);
    Outcome fetch_shared_user_profile(const Request &request);
    Outcome modify_group_attributes(const Request &request);
    Outcome modify_default_group(const Request &request);
    Outcome get_participant_info(const Request &request);

    // What a function of `group_edits.hpp` does with the second argument.
    template <auto kEdit>
    Outcome edit(const Request &request);
    // The second argument becomes this property.
    template <auto kProperty>
    Outcome set_property(const Request &request);

    // The user that a request names; without a name, the slot's own.
    std::string user_of(const Request &request) const;

    static const MethodRow<XdmInterface> kMethods[];

    GroupModel &groups_;
    const NumberPlan &plan_;
    const Registrations &registrations_;
    RunningSessions sessions_;
};

} // namespace sim
