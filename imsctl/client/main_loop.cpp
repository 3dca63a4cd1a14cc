// SPDX-License-Identifier: Apache-2.0
#include "imsctl/client/main_loop.hpp"

#include <algorithm>
#include <cmath>
#include <glib-unix.h>
#include <sys/signalfd.h>
#include <unistd.h>

namespace imsctl {
namespace {

gboolean raise_flag(gpointer flag) {
    *static_cast<bool *>(flag) = true;
    return G_SOURCE_CONTINUE;
}

// As nohup has it. A signal that is blocked is not ignored any more.
bool is_ignored(int number) {
    struct sigaction action {};
    sigaction(number, nullptr, &action);
    return action.sa_handler == SIG_IGN;
}

guint milliseconds(Seconds seconds) {
    return static_cast<guint>(std::ceil(std::clamp(seconds, 0.0, kLongestWait) * 1000));
}

} // namespace

Alarm::Alarm(Seconds seconds) : source_(g_timeout_source_new(milliseconds(seconds))) {
    g_source_set_callback(source_.get(), raise_flag, &raised_, nullptr);
    g_source_attach(source_.get(), nullptr);
}

Alarm::~Alarm() = default;

StopSignals::StopSignals() {
    sigemptyset(&signals_);
    sigaddset(&signals_, SIGINT);
    sigaddset(&signals_, SIGTERM);
    if (!is_ignored(SIGHUP))
        sigaddset(&signals_, SIGHUP);
    pthread_sigmask(SIG_BLOCK, &signals_, &mask_before_);
    descriptor_ = signalfd(-1, &signals_, SFD_CLOEXEC | SFD_NONBLOCK);
    source_.reset(g_unix_fd_source_new(descriptor_, G_IO_IN));
    g_source_set_callback(source_.get(), G_SOURCE_FUNC(on_readable), this, nullptr);
    g_source_attach(source_.get(), nullptr);
}

StopSignals::~StopSignals() {
    source_.reset();
    close(descriptor_);
    pthread_sigmask(SIG_SETMASK, &mask_before_, nullptr);
}

gboolean StopSignals::on_readable(gint, GIOCondition, gpointer self) {
    static_cast<StopSignals *>(self)->read();
    return G_SOURCE_CONTINUE;
}

void StopSignals::read() {
    signalfd_siginfo info{};
    while (::read(descriptor_, &info, sizeof info) == static_cast<ssize_t>(sizeof info)) {
        arrived_ = true;
        own_ = own_ || info.ssi_pid == static_cast<std::uint32_t>(getpid());
    }
}

ReaderGuard::ReaderGuard(int descriptor) {
    if (descriptor < 0)
        return;
    source_.reset(g_unix_fd_source_new(descriptor, G_IO_ERR));
    g_source_set_callback(source_.get(), G_SOURCE_FUNC(on_error), this, nullptr);
    g_source_attach(source_.get(), nullptr);
}

ReaderGuard::~ReaderGuard() = default;

gboolean ReaderGuard::on_error(gint, GIOCondition, gpointer self) {
    static_cast<ReaderGuard *>(self)->gone_ = true;
    return G_SOURCE_REMOVE;
}

} // namespace imsctl
