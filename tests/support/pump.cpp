// SPDX-License-Identifier: Apache-2.0
#include "tests/support/pump.hpp"

#include <string>

namespace test {
namespace {

// What is waited for may happen in another thread, which wakes nobody: look again this often.
constexpr guint kLookAgainMs = 5;

struct Tick {
    explicit Tick(GMainContext *context) : source{g_timeout_source_new(kLookAgainMs)} {
        g_source_set_callback(
            source, [](gpointer) -> gboolean { return G_SOURCE_CONTINUE; }, nullptr, nullptr);
        g_source_attach(source, context);
    }
    ~Tick() {
        g_source_destroy(source);
        g_source_unref(source);
    }
    Tick(const Tick &) = delete;
    Tick &operator=(const Tick &) = delete;

    GSource *source;
};

} // namespace

void pump_until(const std::function<bool()> &predicate, std::string_view waiting_for,
                GMainContext *context) {
    const auto deadline = std::chrono::steady_clock::now() + kDeadline;
    const Tick tick{context};
    while (!predicate()) {
        if (std::chrono::steady_clock::now() > deadline)
            throw DeadlineExceeded("waited in vain for " + std::string{waiting_for});
        g_main_context_iteration(context, TRUE);
    }
}

void pump_ready(GMainContext *context) {
    while (g_main_context_iteration(context, FALSE)) {
    }
}

ThreadDefaultContext::ThreadDefaultContext() : context_{g_main_context_new()} {
    g_main_context_push_thread_default(context_);
}

ThreadDefaultContext::~ThreadDefaultContext() {
    g_main_context_pop_thread_default(context_);
    g_main_context_unref(context_);
}

} // namespace test
