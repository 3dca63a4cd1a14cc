// SPDX-License-Identifier: Apache-2.0
#include "sim/ptt/floor.hpp"

#include <algorithm>

namespace sim {

std::int32_t PttFloor::position(int who) const {
    const auto found = std::ranges::find(queue_, who, &FloorWish::who);
    return found == queue_.end() ? 0 : static_cast<std::int32_t>(found - queue_.begin()) + 1;
}

bool PttFloor::interrupted_by(const FloorWish &wish) const {
    return holder_ && wish.priority >= kPttTopPriority && holder_->priority < kPttTopPriority;
}

void PttFloor::wait(FloorWish wish) {
    const auto before = std::ranges::find_if(
        queue_, [&](const FloorWish &other) { return other.priority < wish.priority; });
    queue_.insert(before, std::move(wish));
}

void PttFloor::withdraw(int who) {
    std::erase_if(queue_, [&](const FloorWish &wish) { return wish.who == who; });
}

std::optional<FloorWish> PttFloor::next() {
    if (queue_.empty())
        return std::nullopt;
    FloorWish wish = std::move(queue_.front());
    queue_.erase(queue_.begin());
    return wish;
}

} // namespace sim
