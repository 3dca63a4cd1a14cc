// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <chrono>
#include <cstdint>
#include <functional>
#include <map>
#include <optional>
#include <utility>

namespace sim {

class Timers;

// One appointment. It is cancelled when this handle goes away.
class Timer {
  public:
    Timer() = default;
    Timer(Timer &&other) noexcept;
    Timer &operator=(Timer &&other) noexcept;
    ~Timer() { cancel(); }

    void cancel();
    bool pending() const;

  private:
    friend class Timers;
    using Key = std::pair<std::chrono::nanoseconds, std::uint64_t>;
    Timer(Timers *timers, Key key) : timers_(timers), key_(key) {}

    Timers *timers_ = nullptr;
    Key key_{};
};

// Appointments in order of their time. Where the time comes from is the owner's business: the
// process takes it from the machine, a test steps it.
class Timers {
  public:
    using Duration = std::chrono::nanoseconds;
    using Now = std::function<Duration()>;

    // A speed of 0 makes everything that the network does due at once, in its order.
    Timers(double speed, Now now) : speed_(speed), now_(std::move(now)), started_(now_()) {}
    Timers(const Timers &) = delete;
    Timers &operator=(const Timers &) = delete;

    // The network's own pace, which the speed scales.
    Timer after(Duration delay, std::function<void()> action);
    // A limit to somebody's patience: never scaled, or a fast network would leave an application
    // no time to answer.
    Timer after_unscaled(Duration delay, std::function<void()> action);

    // A span that the network merely waits: scaled, but for a speed of 0, at which nothing would
    // wait at all.
    Timer after_waiting(Duration delay, std::function<void()> action);

    // How far the network's own clock has run. At a speed of 0 it keeps the machine's pace.
    std::chrono::duration<double> network_time() const;

    std::optional<Duration> next_due() const;
    void run_due();
    void on_change(std::function<void()> changed) { changed_ = std::move(changed); }

  private:
    friend class Timer;
    Duration scaled(Duration delay) const;

    double speed_;
    Now now_;
    Duration started_;
    std::map<Timer::Key, std::function<void()>> queue_;
    std::uint64_t next_id_ = 1;
    std::function<void()> changed_;
};

} // namespace sim
