// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/bus/interface.hpp"
#include "sim/vt/model.hpp"

#include <string_view>

namespace sim {

// org.kelvo.ims.Vt
class VtInterface {
  public:
    explicit VtInterface(VideoTelephony &video) : video_(video) {}

    static constexpr std::string_view kName = "org.kelvo.ims.Vt";
    Interface describe();

  private:
    VideoTelephony &video_;
};

} // namespace sim
