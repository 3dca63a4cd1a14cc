// SPDX-License-Identifier: Apache-2.0
// Following events until somebody ends it: what monitor and the verbs called "watch" share.
#pragma once

#include "imsctl/client/invocation.hpp"
#include "imsctl/line/arguments.hpp"

#include <functional>
#include <string_view>
#include <vector>

namespace imsctl {

struct WatchLimits {
    Argument<std::int32_t> count;
    Argument<double> seconds;
};

// "--count" and "--for".
WatchLimits watch_limits(Arguments &arguments);

// To be made before anything else connects to the bus.
class Watch {
  public:
    // Once the note "`what` slot N" is written no event is missed any more.
    Watch(Invocation &run, const WatchLimits &limits, const std::vector<const EventRow *> &rows,
          std::string_view what);

    // Until SIGINT, SIGTERM, SIGHUP or a limit, or until nobody reads any more. `show` tells
    // whether it showed something that counts.
    void until_end(const std::function<bool(const Event &)> &show);
    // The same, or until `enough` says so.
    void until_end(const std::function<bool(const Event &)> &show,
                   const std::function<bool()> &enough);

    // Waits for what is still under way: not for long when somebody wants the end.
    void finish(const std::function<bool()> &done);
    // Not for long in any case.
    void finish_soon(const std::function<bool()> &done);

    bool bus_is_gone() const { return signals_.own(); }

  private:
    void check_bus() const;

    Invocation &run_;
    WatchLimits limits_;
    StopSignals signals_;
    ReaderGuard reader_;
};

// The event itself, in the form that was asked for.
void show_event(const Invocation &run, const Event &event);

} // namespace imsctl
