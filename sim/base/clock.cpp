// SPDX-License-Identifier: Apache-2.0
#include "sim/base/clock.hpp"

#include <algorithm>

namespace sim {

Timer::Timer(Timer &&other) noexcept
    : timers_(std::exchange(other.timers_, nullptr)), key_(std::move(other.key_)) {}

Timer &Timer::operator=(Timer &&other) noexcept {
    if (this != &other) {
        cancel();
        timers_ = std::exchange(other.timers_, nullptr);
        key_ = other.key_;
    }
    return *this;
}

void Timer::cancel() {
    if (timers_)
        timers_->queue_.erase(key_);
    timers_ = nullptr;
}

bool Timer::pending() const {
    return timers_ && timers_->queue_.contains(key_);
}

Timers::Duration Timers::scaled(Duration delay) const {
    // A nanosecond a second is "at once" and still keeps the order of what waits together.
    constexpr double kAtOnce = 1e9;
    constexpr double kForever = 1e18; // three decades, far from what a duration can hold
    const double speed = speed_ > 0 ? speed_ : kAtOnce;
    const double count = std::min(static_cast<double>(delay.count()) / speed, kForever);
    return Duration(static_cast<Duration::rep>(count));
}

Timer Timers::after(Duration delay, std::function<void()> action) {
    return after_unscaled(scaled(delay), std::move(action));
}

Timer Timers::after_unscaled(Duration delay, std::function<void()> action) {
    const Timer::Key key{now_() + delay, next_id_++};
    queue_.emplace(key, std::move(action));
    if (changed_)
        changed_();
    return Timer(this, key);
}

Timer Timers::after_waiting(Duration delay, std::function<void()> action) {
    return after_unscaled(speed_ > 0 ? scaled(delay) : delay, std::move(action));
}

std::chrono::duration<double> Timers::network_time() const {
    return std::chrono::duration<double>(now_() - started_) * (speed_ > 0 ? speed_ : 1);
}

std::optional<Timers::Duration> Timers::next_due() const {
    if (queue_.empty())
        return std::nullopt;
    return queue_.begin()->first.first;
}

void Timers::run_due() {
    const Duration until = now_();
    while (!queue_.empty() && queue_.begin()->first.first <= until) {
        const auto appointment = queue_.extract(queue_.begin());
        appointment.mapped()();
    }
}

} // namespace sim
