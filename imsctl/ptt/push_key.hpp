// SPDX-License-Identifier: Apache-2.0
// A key of the terminal as a push-to-talk key. Terminals tell of no release: a key that is held
// repeats itself, and one that has not come for a while is not held any more.
#pragma once

#include "imsctl/client/main_loop.hpp"

#include <functional>
#include <optional>
#include <termios.h>

namespace imsctl {

// Longer than the time after which keyboards begin to repeat.
inline constexpr Seconds kKeyPause = 0.75;

class PushKey {
  public:
    struct Actions {
        std::function<void()> pressed;
        std::function<void()> released;
    };

    // Takes the terminal at standard input over until it is destroyed. Throws a failure when there
    // is none.
    explicit PushKey(Actions actions);
    ~PushKey();
    PushKey(const PushKey &) = delete;
    PushKey &operator=(const PushKey &) = delete;

    // The user typed "q", or there is no more input.
    bool wants_end() const { return wants_end_; }

  private:
    void read();
    void press();
    void release();
    static gboolean on_readable(gint, GIOCondition, gpointer self);
    static gboolean on_pause(gpointer self);

    Actions actions_;
    termios before_{};
    Source input_;
    Source pause_;
    bool wants_end_ = false;
};

} // namespace imsctl
