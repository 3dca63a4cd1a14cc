// SPDX-License-Identifier: Apache-2.0
#include "sim/base/main_loop.hpp"

#include <csignal>
#include <glib-unix.h>
#include <sys/signalfd.h>
#include <unistd.h>

namespace sim {

namespace {

using std::chrono::duration_cast;
using std::chrono::microseconds;

GSourceFuncs timer_functions{
    nullptr, nullptr, [](GSource *, GSourceFunc callback, gpointer data) {
                                 return callback(data); },
    nullptr, nullptr, nullptr};

} // namespace

MainLoop::MainLoop() : loop_(g_main_loop_new(nullptr, FALSE)) {}

MainLoop::~MainLoop() {
    if (signal_fd_ >= 0)
        close(signal_fd_);
}

Timers::Duration MainLoop::now() {
    return microseconds(g_get_monotonic_time());
}

void MainLoop::drive(Timers &timers) {
    struct Driven {
        Timers &timers;
        GSource *source;

        void arm() const {
            const auto due = timers.next_due();
            // Rounded up: an appointment must not be looked for before its time.
            g_source_set_ready_time(
                source,
                due ? duration_cast<microseconds>(*due + std::chrono::nanoseconds(999)).count()
                    : -1);
        }
    };
    GSource *source = g_source_new(&timer_functions, sizeof(GSource));
    timer_source_ = GSourceGuard(source);
    auto *driven = new Driven{timers, source};
    g_source_set_callback(
        source,
        [](gpointer data) -> gboolean {
            const auto &self = *static_cast<Driven *>(data);
            self.timers.run_due();
            self.arm();
            return G_SOURCE_CONTINUE;
        },
        driven, [](gpointer data) { delete static_cast<Driven *>(data); });
    timers.on_change([driven] { driven->arm(); });
    g_source_attach(source, nullptr);
}

void MainLoop::watch_signals(const std::vector<int> &signals,
                             std::function<void(int, bool)> handler) {
    signal_handler_ = std::move(handler);
    sigset_t set;
    sigemptyset(&set);
    for (const int signal : signals)
        sigaddset(&set, signal);
    pthread_sigmask(SIG_BLOCK, &set, nullptr);
    signal_fd_ = signalfd(-1, &set, SFD_CLOEXEC | SFD_NONBLOCK);
    GSource *source = g_unix_fd_source_new(signal_fd_, G_IO_IN);
    signal_source_ = GSourceGuard(source);
    const GUnixFDSourceFunc on_ready = [](gint, GIOCondition, gpointer self) -> gboolean {
        static_cast<MainLoop *>(self)->on_signal();
        return G_SOURCE_CONTINUE;
    };
    g_source_set_callback(source, G_SOURCE_FUNC(on_ready), this, nullptr);
    g_source_attach(source, nullptr);
}

void MainLoop::on_signal() {
    signalfd_siginfo info{};
    while (read(signal_fd_, &info, sizeof info) == sizeof info)
        signal_handler_(static_cast<int>(info.ssi_signo), info.ssi_code == SI_KERNEL);
}

int MainLoop::run() {
    // Somebody may have had enough before the loop began.
    if (!status_)
        g_main_loop_run(loop_.get());
    return status_.value_or(0);
}

void MainLoop::quit(int status) {
    // The first reason counts; what follows from it may call again.
    if (!status_)
        status_ = status;
    g_main_loop_quit(loop_.get());
}

void unblock_signals() {
    sigset_t set;
    sigemptyset(&set);
    sigprocmask(SIG_SETMASK, &set, nullptr);
}

} // namespace sim
