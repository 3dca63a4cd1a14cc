// SPDX-License-Identifier: Apache-2.0
#include "imsctl/line/general_verbs.hpp"

#include "imsctl/line/completion.hpp"
#include "imsctl/line/watching.hpp"

#include <algorithm>

namespace imsctl {
namespace {

struct MonitorArguments {
    std::span<const EventRow> known;
    Argument<std::vector<std::string>> events;
    Argument<std::vector<std::string>> modules;
    WatchLimits limits;
};

std::vector<const EventRow *> chosen_events(const MonitorArguments &given) {
    std::vector<const EventRow *> rows;
    const auto is_named = [](const std::vector<std::string> &names, std::string_view name) {
        return std::find(names.begin(), names.end(), name) != names.end();
    };
    const bool all = given.events->empty() && given.modules->empty();
    for (const EventRow &row : given.known)
        if (all || is_named(*given.events, row.name) || is_named(*given.modules, row.module))
            rows.push_back(&row);
    return rows;
}

void monitor(Invocation &run, const MonitorArguments &given) {
    Watch watch(run, given.limits, chosen_events(given), "monitoring");
    watch.until_end([&](const Event &event) {
        show_event(run, event);
        return true;
    });
}

Action prepare_monitor(Arguments &arguments) {
    const std::span<const EventRow> known = arguments.events();
    const MonitorArguments given{
        known,
        arguments.some_names("EVENT", "show these only, for example call-ended",
                             event_names(known)),
        arguments.some_names("--module", "show the events of this module", event_modules(known)),
        watch_limits(arguments)};
    return [given](Invocation &run) { monitor(run, given); };
}

Action prepare_completion(Arguments &arguments) {
    arguments.name("SHELL", "the shell: bash", {"bash"});
    return [](Invocation &run) { run.output().line(bash_completion_script()); };
}

constexpr Verb kGeneralVerbs[] = {
    {"monitor", "show events as they arrive, until it is stopped with Ctrl-C or a signal",
     "monitor call-incoming-ind call-ended --json", prepare_monitor},
    {"completion", "print a script that completes imsctl's words in a shell",
     "completion bash > ~/.local/share/bash-completion/completions/imsctl", prepare_completion},
};

} // namespace

Module general_module() {
    return {{}, {kGeneralVerbs}, {}};
}

} // namespace imsctl
