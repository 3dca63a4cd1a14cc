// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/bus/interface.hpp"
#include "sim/ptt/events.hpp"
#include "sim/ptt/files.hpp"
#include "sim/ptt/messages.hpp"
#include "sim/ptt/model.hpp"
#include "sim/ptt/recorder.hpp"

#include <string_view>

namespace sim {

// org.kelvo.ims.Poc: requests to the models, answers and events to the bus.
class PttInterface {
  public:
    PttInterface(PttCalls &calls, PttRecorder &recorder, PttMessages &messages, PttFiles &files)
        : calls_(calls), recorder_(recorder), messages_(messages), files_(files) {}

    static constexpr std::string_view kName = "org.kelvo.ims.Poc";
    Interface describe();

  private:
    PttCalls &calls_;
    PttRecorder &recorder_;
    PttMessages &messages_;
    PttFiles &files_;
};

Signal to_signal(const PttEvent &event);

} // namespace sim
