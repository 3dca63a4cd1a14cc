// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "sim/base/glib_ref.hpp"

#include <functional>
#include <vector>

namespace sim {

// The one loop of the process: messages, appointments and signals of the system all end up here.
class MainLoop {
  public:
    MainLoop();
    MainLoop(const MainLoop &) = delete;
    MainLoop &operator=(const MainLoop &) = delete;
    ~MainLoop();

    static Timers::Duration now();
    void drive(Timers &timers);

    // These signals no longer interrupt the process but are handed over. Call it before any
    // thread starts. `from_terminal`: the whole foreground group has received it.
    void watch_signals(const std::vector<int> &signals,
                       std::function<void(int signal, bool from_terminal)> handler);

    // Returns what `quit` was given.
    int run();
    void quit(int status);

  private:
    void on_signal();

    GMainLoopPtr loop_;
    GSourceGuard timer_source_;
    GSourceGuard signal_source_;
    int signal_fd_ = -1;
    std::function<void(int, bool)> signal_handler_;
    std::optional<int> status_;
};

// What a child undoes of `watch_signals` before it becomes another program.
void unblock_signals();

} // namespace sim
