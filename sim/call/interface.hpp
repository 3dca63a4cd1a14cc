// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/bus/interface.hpp"
#include "sim/call/model.hpp"
#include "sim/call/ussd.hpp"

#include <string_view>

namespace sim {

// org.kelvo.ims.Call: requests to the model, answers and events to the bus.
class CallInterface {
  public:
    CallInterface(CallModel &calls, UssdService &ussd) : calls_(calls), ussd_(ussd) {}

    static constexpr std::string_view kName = "org.kelvo.ims.Call";
    Interface describe();

  private:
    CallModel &calls_;
    UssdService &ussd_;
};

} // namespace sim
