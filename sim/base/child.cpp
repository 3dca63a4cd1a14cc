// SPDX-License-Identifier: Apache-2.0
#include "sim/base/child.hpp"

#include "sim/base/glib_ref.hpp"
#include "sim/base/main_loop.hpp"

#include <algorithm>
#include <chrono>
#include <csignal>
#include <fmt/format.h>
#include <fstream>
#include <sys/prctl.h>
#include <sys/wait.h>
#include <thread>
#include <unistd.h>

namespace sim {

namespace {

using std::chrono::steady_clock;

constexpr std::chrono::milliseconds kGrace{1000};
constexpr std::chrono::milliseconds kGlance{5};

struct Setup {
    pid_t parent;
    int death_signal;
    bool own_session;
};

// Runs between fork and exec: nothing here may allocate or lock.
void set_up_child(gpointer data) {
    const auto &setup = *static_cast<Setup *>(data);
    unblock_signals();
    if (setup.own_session)
        setsid();
    if (setup.death_signal == 0)
        return;
    prctl(PR_SET_PDEATHSIG, setup.death_signal);
    if (getppid() != setup.parent) // it died in between
        _exit(1);
}

std::vector<char *> pointers(std::vector<std::string> &texts) {
    std::vector<char *> result;
    result.reserve(texts.size() + 1);
    for (auto &text : texts)
        result.push_back(text.data());
    result.push_back(nullptr);
    return result;
}

std::vector<pid_t> children() {
    std::ifstream list(fmt::format("/proc/self/task/{}/children", getpid()));
    std::vector<pid_t> pids;
    for (pid_t pid = 0; list >> pid;)
        pids.push_back(pid);
    return pids;
}

void reap(const std::vector<pid_t> &pids) {
    for (const pid_t pid : pids)
        waitpid(pid, nullptr, WNOHANG);
}

} // namespace

std::variant<pid_t, SpawnError> spawn(const SpawnRequest &request) {
    auto command = request.command;
    const auto argv = pointers(command);
    gchar **environment = g_get_environ();
    for (const auto &[name, value] : request.environment)
        environment = g_environ_setenv(environment, name.c_str(), value.c_str(), TRUE);
    const std::unique_ptr<gchar *, FreeWith<g_strfreev>> environment_owner(environment);
    std::vector<int> sources;
    std::vector<int> targets;
    for (const auto &[source, target] : request.descriptors) {
        sources.push_back(source);
        targets.push_back(target);
    }
    Setup setup{getpid(), request.death_signal, request.own_session};
    // Whoever started this process may have left descriptors open for the command.
    const auto flags = static_cast<GSpawnFlags>(
        G_SPAWN_SEARCH_PATH | G_SPAWN_DO_NOT_REAP_CHILD | G_SPAWN_CHILD_INHERITS_STDIN |
        (request.descriptors.empty() ? G_SPAWN_LEAVE_DESCRIPTORS_OPEN : G_SPAWN_DEFAULT));
    ErrorSlot error;
    GPid pid = -1;
    if (!g_spawn_async_with_pipes_and_fds(nullptr, argv.data(), environment, flags, set_up_child,
                                          &setup, -1, -1, request.error_output, sources.data(),
                                          targets.data(), sources.size(), &pid, nullptr, nullptr,
                                          nullptr, &error.raw))
        return SpawnError{error.message(),
                          g_error_matches(error.raw, G_SPAWN_ERROR, G_SPAWN_ERROR_NOENT) != FALSE};
    return pid;
}

void adopt_orphans() {
    prctl(PR_SET_CHILD_SUBREAPER, 1);
}

void end_children_except(pid_t spared) {
    const auto patience = steady_clock::now() + kGrace;
    std::vector<pid_t> asked;
    for (;;) {
        auto pids = children();
        std::erase(pids, spared);
        if (pids.empty())
            return;
        const bool force = steady_clock::now() >= patience;
        for (const pid_t pid : pids) {
            const bool first_time = std::ranges::find(asked, pid) == asked.end();
            if (first_time)
                asked.push_back(pid);
            if (force || first_time)
                kill(pid, force ? SIGKILL : SIGTERM);
        }
        reap(pids);
        std::this_thread::sleep_for(kGlance);
    }
}

} // namespace sim
