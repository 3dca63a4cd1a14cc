// SPDX-License-Identifier: Apache-2.0
#include "imsctl/line/watching.hpp"

#include <fmt/format.h>
#include <limits>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

// Long enough for any service that is alive, short enough for a user who waits for the first line.
constexpr Seconds kSettleTime = 2;

// For answers to requests that are on their way already.
constexpr Seconds kLastMoment = 1;

} // namespace

WatchLimits watch_limits(Arguments &arguments) {
    constexpr auto kMost = std::numeric_limits<std::int32_t>::max();
    return {arguments.number_from(1, kMost, "--count", "end after so many events", 0),
            arguments.seconds("--for", "end after so many seconds", 0)};
}

Watch::Watch(Invocation &run, const WatchLimits &limits, const std::vector<const EventRow *> &rows,
             std::string_view what)
    : run_(run), limits_(limits), reader_(run.output().descriptor()) {
    for (const EventRow *row : rows)
        run.client().watch(*row);
    run.client().settle(kSettleTime);
    run.output().note(fmt::format("{} slot {}", what, run.settings().slot));
}

void Watch::until_end(const std::function<bool(const Event &)> &show) {
    until_end(show, [] { return false; });
}

void Watch::until_end(const std::function<bool(const Event &)> &show,
                      const std::function<bool()> &enough) {
    std::int32_t left = *limits_.count;
    const auto finished = [&] {
        while (run_.client().has_event()) {
            const bool counts = show(run_.client().take_event());
            if (counts && *limits_.count > 0 && --left == 0)
                return true;
        }
        return enough() || signals_.arrived() || reader_.gone();
    };
    const Seconds limit = *limits_.seconds;
    run_until(limit > 0 ? std::optional(limit) : std::nullopt, finished);
    if (reader_.gone())
        throw ReaderGone();
    check_bus();
}

void Watch::finish(const std::function<bool()> &done) {
    if (signals_.arrived())
        return finish_soon(done);
    run_until(run_.settings().timeout, [&] { return done() || signals_.arrived(); });
    check_bus();
}

void Watch::finish_soon(const std::function<bool()> &done) {
    run_until(kLastMoment, done);
    check_bus();
}

void Watch::check_bus() const {
    if (bus_is_gone())
        throw bus_break_failure();
}

void show_event(const Invocation &run, const Event &event) {
    const Output &output = run.output();
    output.line(output.json() ? dump(to_json(event, run.settings().slot)) : to_text(event));
}

} // namespace imsctl
