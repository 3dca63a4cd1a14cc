// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/ptt/values.hpp"

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace sim {

// A participant's wish to speak.
struct FloorWish {
    int who = 0;
    std::int32_t priority = 0;
    FourIntegers media{};
    std::string name; // under which the others hear it
};

// Who speaks in a call, and who waits to: the higher priority first, then the earlier wish.
class PttFloor {
  public:
    static constexpr std::size_t kLongestQueue = 8;

    const std::optional<FloorWish> &holder() const { return holder_; }
    const std::vector<FloorWish> &queue() const { return queue_; }
    bool held_by(int who) const { return holder_ && holder_->who == who; }
    // From 1; 0 for one who does not wait.
    std::int32_t position(int who) const;
    bool full() const { return queue_.size() >= kLongestQueue; }
    // Whether this wish takes the floor from the one who has it.
    bool interrupted_by(const FloorWish &wish) const;

    void grant(FloorWish wish) { holder_ = std::move(wish); }
    void free() { holder_.reset(); }
    void wait(FloorWish wish);
    void withdraw(int who);
    // The one whose turn it is, who then waits no longer.
    std::optional<FloorWish> next();

  private:
    std::optional<FloorWish> holder_;
    std::vector<FloorWish> queue_;
};

} // namespace sim
