// SPDX-License-Identifier: Apache-2.0
#include "imsctl/client/last_words.hpp"

#include <algorithm>
#include <cmath>
#include <csignal>
#include <sys/time.h>
#include <unistd.h>
#include <utility>

namespace imsctl {
namespace {

// Written while the handlers are not in force, and read by them only.
LastWords on_time_over;
LastWords on_bus_break;

void write_all(int descriptor, const std::string &text) {
    const char *data = text.data();
    std::size_t size = text.size();
    while (size > 0) {
        const ssize_t written = write(descriptor, data, size);
        if (written <= 0)
            return;
        data += written;
        size -= static_cast<std::size_t>(written);
    }
}

[[noreturn]] void say_and_end(const LastWords &words) {
    write_all(STDOUT_FILENO, words.to_stdout);
    write_all(STDERR_FILENO, words.to_stderr);
    _exit(1);
}

extern "C" void handle_alarm(int) {
    say_and_end(on_time_over);
}

extern "C" void handle_termination(int number, siginfo_t *info, void *) {
    if (info->si_pid == getpid())
        say_and_end(on_bus_break);
    std::signal(number, SIG_DFL);
    raise(number);
}

void arm(Seconds seconds) {
    double whole = 0;
    const double fraction = std::modf(seconds, &whole);
    itimerval timer{};
    timer.it_value.tv_sec = static_cast<time_t>(whole);
    timer.it_value.tv_usec = static_cast<suseconds_t>(fraction * 1'000'000);
    setitimer(ITIMER_REAL, &timer, nullptr);
}

} // namespace

BlockingLimit::BlockingLimit(Seconds limit, LastWords words) {
    on_time_over = std::move(words);
    struct sigaction action {};
    action.sa_handler = handle_alarm;
    sigaction(SIGALRM, &action, nullptr);
    arm(std::clamp(limit, 0.001, kLongestWait));
}

BlockingLimit::~BlockingLimit() {
    arm(0);
}

void explain_bus_break(LastWords words) {
    std::signal(SIGTERM, SIG_DFL);
    on_bus_break = std::move(words);
    struct sigaction action {};
    action.sa_sigaction = handle_termination;
    action.sa_flags = SA_SIGINFO;
    sigaction(SIGTERM, &action, nullptr);
}

} // namespace imsctl
