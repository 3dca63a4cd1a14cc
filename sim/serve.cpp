// SPDX-License-Identifier: Apache-2.0
#include "sim/base/main_loop.hpp"
#include "sim/program.hpp"
#include "sim/stand_in.hpp"

#include <csignal>

namespace sim {

int serve(const Options &options) {
    const Log log(options.log_level);
    MainLoop loop;
    loop.watch_signals({SIGINT, SIGTERM, SIGHUP}, [&](int, bool) { loop.quit(kExitOk); });
    StandIn stand_in(options, log, loop);
    if (const auto error = stand_in.restore(options.state)) {
        log.failure("{}", *error);
        return kExitFailure;
    }
    const auto error = stand_in.start(options.address, [&](const std::string &why) {
        log.failure("the bus is gone: {}", why);
        loop.quit(kExitFailure);
    });
    if (error) {
        log.failure("{}{}", *error,
                    options.address.empty()
                        ? " (--address ADDRESS serves on another bus; ims-sim run -- COMMAND "
                          "brings its own)"
                        : "");
        return kExitFailure;
    }
    for (std::size_t slot = 0; slot < options.numbers.size(); ++slot)
        log.note("{}/sub{} has the number {}", Service::kPath, slot, options.numbers[slot]);
    log.note("{} is ready", Service::kName);
    return loop.run();
}

} // namespace sim
