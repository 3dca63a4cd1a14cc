// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/bus/service.hpp"
#include "sim/ss/model.hpp"

namespace sim {

// org.kelvo.ims.Ss
class SsInterface {
  public:
    explicit SsInterface(SupplementaryServices &services) : services_(services) {}

    static constexpr std::string_view kName = "org.kelvo.ims.Ss";
    Interface describe();

  private:
    Answer<Variant> set_call_waiting(const Request &request);
    Answer<Variant> get_call_waiting(const Request &request);
    Answer<Variant> set_call_forwarding(const Request &request);
    Answer<Variant> get_call_forwarding(const Request &request);
    Answer<Variant> set_call_barring(const Request &request);
    Answer<Variant> get_call_barring(const Request &request);

    static const MethodRow<SsInterface> kMethods[];

    SupplementaryServices &services_;
};

} // namespace sim
