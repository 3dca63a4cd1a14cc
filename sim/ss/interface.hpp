// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/bus/interface.hpp"
#include "sim/ss/model.hpp"

#include <string_view>

namespace sim {

// org.kelvo.ims.Ss
class SsInterface {
  public:
    explicit SsInterface(SupplementaryServices &services) : services_(services) {}

    static constexpr std::string_view kName = "org.kelvo.ims.Ss";
    Interface describe();

  private:
    SupplementaryServices &services_;
};

} // namespace sim
