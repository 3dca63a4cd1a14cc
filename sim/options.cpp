// SPDX-License-Identifier: Apache-2.0
#include "sim/options.hpp"

#include "sim/base/number_plan.hpp"
#include "sim/call/parties.hpp"

#include <CLI/CLI.hpp>
#include <algorithm>
#include <charconv>
#include <limits>

namespace sim {

namespace {

constexpr int kMaxSlots = 64;
constexpr double kFastest = 1e9; // a nanosecond a second, which is at once

struct Raw {
    int slots = 2;
    std::vector<std::string> numbers;
    bool verbose = false;
    bool quiet = false;
};

// CLI::Range takes "nan", which is neither too small nor too large.
CLI::Validator number_between(double least, double most) {
    return {[=](const std::string &text) {
                double number = std::numeric_limits<double>::quiet_NaN();
                const bool fits =
                    CLI::detail::lexical_cast(text, number) && number >= least && number <= most;
                return fits ? std::string()
                            : fmt::format("\"{}\" is no number from {} to {}", text, least, most);
            },
            {}};
}

std::string parties_help() {
    std::string text = "Numbers with a meaning (any other number answers):\n";
    for (const auto &party : parties())
        text += fmt::format("  {}  {}\n", party.number, party.description);
    return text + "  112, 911      emergency service: answers at once\n";
}

void add_common(CLI::App &command, Options &options, Raw &raw) {
    command.add_option("--slots", raw.slots, "How many subscription slots there are")
        ->check(CLI::Range(1, kMaxSlots))
        ->type_name("COUNT")
        ->capture_default_str();
    command
        .add_option("--number", raw.numbers,
                    "SLOT=NUMBER: the number of a slot (else +15550100, +15550101, ...)")
        ->type_name("SLOT=NUMBER")
        ->allow_extra_args(false);
    command
        .add_option("--speed", options.speed,
                    "How fast the network is: 2 is twice as fast, 0 does everything at once")
        ->check(number_between(0, kFastest))
        ->type_name("FACTOR")
        ->capture_default_str();
    auto *ring_time = command.add_option_function<double>(
        "--ring-time",
        [&options](double seconds) { options.ring_time = std::chrono::duration<double>(seconds); },
        "Seconds that a slot rings before the network gives up (not scaled) [60]");
    ring_time->check(number_between(0.001, 86400))->type_name("SECONDS");
    command
        .add_option("--state", options.state,
                    "Directory where settings, profiles and groups survive the end of the stand-in")
        ->check(CLI::Validator(
            [](const std::string &path) {
                return std::string(path.empty() ? "the directory has no name" : "");
            },
            {}))
        ->type_name("DIRECTORY");
    auto *verbose =
        command.add_flag("-v,--verbose", raw.verbose, "Print every request, reply and signal");
    command.add_flag("-q,--quiet", raw.quiet, "Print failures of the stand-in alone")
        ->excludes(verbose);
    command.footer(parties_help());
}

void set_number(Options &options, const std::string &text) {
    const auto equals = text.find('=');
    const auto fail = [&](const std::string &why) {
        throw CLI::ValidationError("--number", fmt::format("\"{}\": {}", text, why));
    };
    if (equals == std::string::npos)
        fail("write SLOT=NUMBER, for example 0=+15551234");
    std::size_t slot = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + equals, slot);
    if (error != std::errc() || end != text.data() + equals || slot >= options.numbers.size())
        fail(fmt::format("the slots are 0 to {}", options.numbers.size() - 1));
    auto number = parse_number(text.substr(equals + 1));
    if (!number)
        fail(number.refusal().reason);
    options.numbers[slot] = *number;
}

void check_numbers(const Options &options) {
    for (std::size_t i = 0; i < options.numbers.size(); ++i) {
        const auto same = [&](const auto &other) { return same_number(other, options.numbers[i]); };
        if (std::any_of(options.numbers.begin(),
                        options.numbers.begin() + static_cast<std::ptrdiff_t>(i), same))
            throw CLI::ValidationError("--number",
                                       fmt::format("{} belongs to two slots", options.numbers[i]));
        if (is_emergency(options.numbers[i]))
            throw CLI::ValidationError(
                "--number", fmt::format("{} is an emergency number", options.numbers[i]));
    }
}

void complete(Options &options, const Raw &raw) {
    options.log_level = raw.verbose ? LogLevel::kVerbose
                        : raw.quiet ? LogLevel::kQuiet
                                    : LogLevel::kNormal;
    for (int slot = 0; slot < raw.slots; ++slot)
        options.numbers.push_back(NumberPlan::default_slot_number(slot));
    for (const auto &number : raw.numbers)
        set_number(options, number);
    check_numbers(options);
}

} // namespace

std::variant<Options, int> parse_options(int argc, const char *const *argv) {
    Options options;
    Raw raw;
    CLI::App app("A stand-in for a device's IMS service: a small IMS network of its own");
    app.name("ims-sim");
    app.set_version_flag("--version", fmt::format("ims-sim {}", IMS_SIM_VERSION));
    app.require_subcommand(0, 1);
    app.footer("Exit status: 0 ended on request, 1 failure, 2 wrong usage. `run` exits with the\n"
               "status of its command, 128 + N when signal N ended it, 127 when there is no such\n"
               "command, 126 when it cannot be executed, 125 when the stand-in itself failed.\n");

    auto *serve = app.add_subcommand("serve", "Serve on a bus until SIGINT or SIGTERM");
    serve->add_option("--address", options.address, "D-Bus address [the system bus]")
        ->type_name("ADDRESS");
    add_common(*serve, options, raw);

    auto *run = app.add_subcommand("run", "Run a command with a bus and a stand-in of its own");
    add_common(*run, options, raw);
    run->add_option("COMMAND", options.command, "The command and its arguments, after --")
        ->type_name("");

    try {
        app.parse(argc, argv);
        options.run = run->parsed();
        if (!options.run && !serve->parsed())
            throw CLI::ValidationError("ims-sim", "say what to do: ims-sim serve, or ims-sim run "
                                                  "-- COMMAND");
        if (options.run && options.command.empty())
            throw CLI::ValidationError("run", "the command is missing: ims-sim run -- COMMAND");
        complete(options, raw);
    } catch (const CLI::ParseError &error) {
        const int status = app.exit(error) == 0 ? kExitOk : kExitUsage;
        if (status != kExitOk && run->parsed())
            fmt::print(stderr, "Options of the command go after --: ims-sim run [OPTIONS] -- "
                               "COMMAND [ARGS]...\n");
        return status;
    }
    return options;
}

} // namespace sim
