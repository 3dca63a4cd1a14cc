// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "sim/base/number_plan.hpp"
#include "sim/base/per_slot.hpp"
#include "sim/base/result.hpp"
#include "sim/call/events.hpp"
#include "sim/registration/registrations.hpp"

#include <functional>
#include <string>

namespace sim {

// The network's side of USSD: a small tree of pages, one dialogue at a time in each slot.
class UssdService {
  public:
    using Sink = std::function<void(int slot, const CallEvent &event)>;

    UssdService(const NumberPlan &plan, Timers &timers, const Registrations &registrations,
                Sink sink);

    Status send(int slot, UssdRequest type, int coding_scheme, const std::string &text);
    // The radio is off.
    void drop_dialogue(int slot);

  private:
    enum class State { kIdle, kNetworkAnswers, kUserAnswers };
    struct Dialogue {
        State state = State::kIdle;
        int number = 0;
        int coding_scheme = 0;
        std::string path;
        Timer timer;
    };

    Status start(int slot, int coding_scheme, const std::string &code);
    Status reply(int slot, int coding_scheme, const std::string &text);
    void await_network(int slot);
    void turn_page(int slot);
    void indicate(int slot, UssdAnswer type, std::string text);
    void release(int slot, std::string why);

    const NumberPlan &plan_;
    Timers &timers_;
    const Registrations &registrations_;
    Sink sink_;
    PerSlot<Dialogue> dialogues_;
};

} // namespace sim
