// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/bus/service.hpp"
#include "sim/settings/model.hpp"

namespace sim {

// org.kelvo.ims.Settings. Its requests carry no application id: they concern the slot.
class SettingsInterface {
  public:
    explicit SettingsInterface(SettingsModel &settings) : settings_(settings) {}

    Interface describe();

  private:
    using Outcome = Answer<Variant>;

    Outcome get_global_settings(const Request &request);
    Outcome update_global_settings(const Request &request);
    Outcome add_global_settings(const Request &request);
    Outcome delete_global_settings(const Request &request);
    Outcome get_profile_list(const Request &request);
    Outcome update_profile(const Request &request);
    Outcome add_profile(const Request &request);
    Outcome delete_profile(const Request &request);
    Outcome set_network_environment(const Request &request);
    Outcome get_network_environment(const Request &request);

    static const MethodRow<SettingsInterface> kMethods[];

    SettingsModel &settings_;
};

} // namespace sim
