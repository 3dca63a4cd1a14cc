// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"

#include <cstdint>
#include <functional>
#include <map>
#include <utility>

namespace sim {

// Things to be done later that nobody calls off one by one. They are dropped with their owner.
class Errands {
  public:
    explicit Errands(Timers &timers) : timers_(timers) {}

    void after(Timers::Duration delay, std::function<void()> action) {
        const std::uint64_t id = next_id_++;
        pending_[id] = timers_.after(delay, wrapped(id, std::move(action)));
    }
    // As Timers::after_waiting.
    void after_waiting(Timers::Duration delay, std::function<void()> action) {
        const std::uint64_t id = next_id_++;
        pending_[id] = timers_.after_waiting(delay, wrapped(id, std::move(action)));
    }

  private:
    std::function<void()> wrapped(std::uint64_t id, std::function<void()> action) {
        return [this, id, act = std::move(action)] {
            pending_.erase(id);
            act();
        };
    }

    Timers &timers_;
    std::uint64_t next_id_ = 1;
    std::map<std::uint64_t, Timer> pending_;
};

} // namespace sim
