// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/bus/interface.hpp"
#include "sim/settings/model.hpp"

namespace sim {

// org.kelvo.ims.Settings. Its requests carry no application id: they concern the slot.
class SettingsInterface {
  public:
    explicit SettingsInterface(SettingsModel &settings) : settings_(settings) {}

    Interface describe();

  private:
    SettingsModel &settings_;
};

} // namespace sim
