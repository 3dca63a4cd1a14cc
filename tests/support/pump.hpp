// SPDX-License-Identifier: Apache-2.0
// Waiting for the thing itself, with a deadline.
#pragma once

#include <gio/gio.h>

#include <chrono>
#include <functional>
#include <memory>
#include <stdexcept>
#include <string_view>

namespace test {

inline constexpr std::chrono::seconds kDeadline{20};

// Ends the test: what it waited for did not happen.
struct DeadlineExceeded : std::runtime_error {
    using std::runtime_error::runtime_error;
};

// Runs a main context (the default one when none is given) until the predicate holds.
void pump_until(const std::function<bool()> &predicate, std::string_view waiting_for,
                GMainContext *context = nullptr);

// Runs everything that is ready, and waits for nothing.
void pump_ready(GMainContext *context = nullptr);

// A main context of its own, thread-default in this thread as long as it lives.
class ThreadDefaultContext {
  public:
    ThreadDefaultContext();
    ~ThreadDefaultContext();
    ThreadDefaultContext(const ThreadDefaultContext &) = delete;
    ThreadDefaultContext &operator=(const ThreadDefaultContext &) = delete;

    GMainContext *get() const { return context_; }

  private:
    GMainContext *context_;
};

} // namespace test
