// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/bus/interface.hpp"
#include "sim/sms/service_centre.hpp"

#include <string_view>

namespace sim {

// org.kelvo.ims.Sms
class SmsInterface {
  public:
    explicit SmsInterface(ServiceCentre &centre) : centre_(centre) {}

    static constexpr std::string_view kName = "org.kelvo.ims.Sms";
    Interface describe();

  private:
    ServiceCentre &centre_;
};

Signal to_signal(const MessageEvent &event);

} // namespace sim
