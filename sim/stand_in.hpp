// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "sim/base/log.hpp"
#include "sim/base/main_loop.hpp"
#include "sim/base/number_plan.hpp"
#include "sim/bus/applications.hpp"
#include "sim/bus/bus.hpp"
#include "sim/bus/service.hpp"
#include "sim/call/interface.hpp"
#include "sim/call/model.hpp"
#include "sim/call/ussd.hpp"
#include "sim/group/interface.hpp"
#include "sim/options.hpp"
#include "sim/ptt/interface.hpp"
#include "sim/registration/interface.hpp"
#include "sim/registration/login_interface.hpp"
#include "sim/settings/interface.hpp"
#include "sim/sms/interface.hpp"
#include "sim/ss/interface.hpp"
#include "sim/vt/interface.hpp"
#include "sim/vt/model.hpp"

#include <functional>
#include <optional>
#include <string>

namespace sim {

// The whole service: the network, its models and their interfaces on one bus.
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
    NumberPlan plan_;
    Timers timers_;
    Bus bus_;
    Applications applications_;
    Service service_;
    // In flight mode a slot loses what these hold in this order.
    Registrations registrations_;
    SupplementaryServices services_;
    CallModel calls_;
    VideoTelephony video_;
    UssdService ussd_;
    Logins logins_;
    ServiceCentre centre_;
    PttDirectory ptt_directory_;
    PttCalls ptt_calls_;
    PttRecorder ptt_recorder_;
    PttMessages ptt_messages_;
    PttFiles ptt_files_;
    SettingsModel settings_;
    GroupModel groups_;
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
