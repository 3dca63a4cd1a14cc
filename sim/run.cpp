// SPDX-License-Identifier: Apache-2.0
#include "sim/base/child.hpp"
#include "sim/base/main_loop.hpp"
#include "sim/base/private_bus.hpp"
#include "sim/program.hpp"
#include "sim/stand_in.hpp"

#include <csignal>
#include <sys/wait.h>

namespace sim {

namespace {

int exit_status(int wait_status) {
    return WIFSIGNALED(wait_status) ? kExitSignalBase + WTERMSIG(wait_status)
                                    : WEXITSTATUS(wait_status);
}

// The command, from its start to its end.
class Command {
  public:
    Command(const Log &log, MainLoop &loop) : log_(log), loop_(loop) {}

    // The exit status when it could not be started.
    std::optional<int> start(const std::vector<std::string> &command, const std::string &address) {
        const auto started = spawn({.command = command,
                                    .environment = {{"DBUS_SYSTEM_BUS_ADDRESS", address}},
                                    .descriptors = {},
                                    .death_signal = SIGKILL,
                                    .own_session = false});
        if (const auto *error = std::get_if<SpawnError>(&started)) {
            log_.failure("cannot run {}: {}", command.front(), error->text);
            return error->not_found ? kExitNotFound : kExitNotExecutable;
        }
        pid_ = std::get<pid_t>(started);
        g_child_watch_add(
            pid_,
            [](GPid, gint status, gpointer self) { static_cast<Command *>(self)->ended(status); },
            this);
        return std::nullopt;
    }

    void signal(int number) const {
        if (pid_ > 0)
            kill(pid_, number);
    }

    bool running() const { return pid_ > 0; }

  private:
    void ended(int status) {
        pid_ = -1;
        loop_.quit(exit_status(status));
    }

    const Log &log_;
    MainLoop &loop_;
    pid_t pid_ = -1;
};

} // namespace

int run(const Options &options) {
    const Log log(options.log_level);
    MainLoop loop;
    Command command(log, loop);
    loop.watch_signals({SIGINT, SIGTERM, SIGHUP}, [&](int number, bool from_terminal) {
        // The terminal has told the command already.
        if (command.running() && !from_terminal)
            command.signal(number);
        else if (!command.running())
            loop.quit(kExitSignalBase + number);
    });
    adopt_orphans();

    PrivateBus bus;
    if (const auto error = bus.start()) {
        log.failure("{}", *error);
        return kExitRunFailure;
    }
    StandIn stand_in(options, log, loop);
    if (const auto error = stand_in.restore(options.state)) {
        log.failure("{}", *error);
        return kExitRunFailure;
    }
    const auto error = stand_in.start(bus.address(), [&](const std::string &why) {
        log.failure("the bus is gone: {}", why);
        loop.quit(kExitRunFailure);
    });
    if (error) {
        log.failure("{}", *error);
        return kExitRunFailure;
    }
    if (const auto status = command.start(options.command, bus.address()))
        return *status;
    const int status = loop.run();
    end_children_except(bus.pid());
    return status;
}

} // namespace sim
