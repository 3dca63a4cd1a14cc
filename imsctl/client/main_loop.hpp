// SPDX-License-Identifier: Apache-2.0
// Waiting in the default main context.
#pragma once

#include <csignal>
#include <glib.h>
#include <memory>
#include <optional>

namespace imsctl {

struct SourceDestroy {
    void operator()(GSource *source) const {
        g_source_destroy(source);
        g_source_unref(source);
    }
};
using Source = std::unique_ptr<GSource, SourceDestroy>;

using Seconds = double;

// What a time limit may be: the main loop counts milliseconds in 32 bits.
inline constexpr Seconds kLongestWait = 1'000'000;

// Raises a flag once a time is over.
class Alarm {
  public:
    explicit Alarm(Seconds seconds);
    ~Alarm();
    Alarm(const Alarm &) = delete;
    Alarm &operator=(const Alarm &) = delete;

    bool raised() const { return raised_; }

  private:
    Source source_;
    bool raised_ = false;
};

// Takes SIGINT, SIGTERM and SIGHUP into the main context, and tells who sent them. Leaves SIGHUP
// alone where it is ignored.
// To be made before any thread is.
class StopSignals {
  public:
    StopSignals();
    ~StopSignals();
    StopSignals(const StopSignals &) = delete;
    StopSignals &operator=(const StopSignals &) = delete;

    bool arrived() const { return arrived_; }

    // GIO sends the process SIGTERM when the connection to the bus breaks.
    bool own() const { return own_; }

  private:
    void read();
    static gboolean on_readable(gint, GIOCondition, gpointer self);

    sigset_t signals_;
    sigset_t mask_before_;
    int descriptor_;
    Source source_;
    bool arrived_ = false;
    bool own_ = false;
};

// Tells when nobody reads any more what is written into a pipe.
class ReaderGuard {
  public:
    // A negative descriptor stands for a reader that stays.
    explicit ReaderGuard(int descriptor);
    ~ReaderGuard();
    ReaderGuard(const ReaderGuard &) = delete;
    ReaderGuard &operator=(const ReaderGuard &) = delete;

    bool gone() const { return gone_; }

  private:
    static gboolean on_error(gint, GIOCondition, gpointer self);

    Source source_;
    bool gone_ = false;
};

// Runs the main context until `done` says so; false when the time was over before.
template <class Done>
bool run_until(std::optional<Seconds> limit, const Done &done) {
    std::optional<Alarm> alarm;
    if (limit)
        alarm.emplace(*limit);
    while (!done()) {
        if (alarm && alarm->raised())
            return false;
        g_main_context_iteration(nullptr, TRUE);
    }
    return true;
}

} // namespace imsctl
