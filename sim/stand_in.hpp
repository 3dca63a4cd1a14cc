// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "sim/base/log.hpp"
#include "sim/base/main_loop.hpp"
#include "sim/bus/applications.hpp"
#include "sim/bus/bus.hpp"
#include "sim/bus/service.hpp"
#include "sim/call/interface.hpp"
#include "sim/group/interface.hpp"
#include "sim/network.hpp"
#include "sim/options.hpp"
#include "sim/ptt/interface.hpp"
#include "sim/registration/interface.hpp"
#include "sim/registration/login_interface.hpp"
#include "sim/settings/interface.hpp"
#include "sim/sms/interface.hpp"
#include "sim/ss/interface.hpp"
#include "sim/vt/interface.hpp"

#include <functional>
#include <optional>
#include <span>
#include <string>

namespace sim {

// The whole service: the network and its interfaces on one bus.
class StandIn {
  public:
    StandIn(const Options &options, const Log &log, MainLoop &loop);

    // Before `start`. What went wrong, or nothing.
    std::optional<std::string> restore(const std::string &state_directory);
    // Takes the name once everything can answer. What went wrong, or nothing.
    std::optional<std::string> start(const std::string &address,
                                     std::function<void(const std::string &why)> lost);

    // What it serves, for comparing with the contract.
    std::span<const Interface> interfaces() const { return service_.interfaces(); }

  private:
    const Log &log_;
    Timers timers_;
    Bus bus_;
    Applications applications_;
    Service service_;
    Network network_;
    RegistrationInterface registration_interface_;
    LoginInterface login_interface_;
    CallInterface call_interface_;
    SmsInterface sms_interface_;
    SsInterface ss_interface_;
    SettingsInterface settings_interface_;
    VtInterface vt_interface_;
    PttInterface ptt_interface_;
    GroupInterface group_interface_;
};

} // namespace sim
