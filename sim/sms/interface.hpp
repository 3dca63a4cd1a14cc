// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/bus/service.hpp"
#include "sim/sms/service_centre.hpp"

namespace sim {

// org.kelvo.ims.Sms
class SmsInterface {
  public:
    explicit SmsInterface(ServiceCentre &centre) : centre_(centre) {}

    static constexpr std::string_view kName = "org.kelvo.ims.Sms";
    Interface describe();

  private:
    Answer<Variant> send_sms(const Request &request);
    Answer<Variant> send_deliver_report(const Request &request);

    static const MethodRow<SmsInterface> kMethods[];

    ServiceCentre &centre_;
};

Signal to_signal(const MessageEvent &event);

} // namespace sim
