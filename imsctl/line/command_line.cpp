// SPDX-License-Identifier: Apache-2.0
#include "imsctl/line/command_line.hpp"

#include "imsctl/line/completion.hpp"
#include "imsctl/line/suggestions.hpp"

#include <CLI/CLI.hpp>
#include <algorithm>
#include <fmt/format.h>
#include <fmt/ranges.h>
#include <limits>
#include <map>

namespace imsctl {
namespace {

constexpr std::string_view kJsonFlag = "--json";

std::string_view last_word(std::string_view path) {
    return path.substr(path.rfind(' ') + 1); // npos + 1 is 0
}

bool is_option(std::string_view word) {
    return word.size() > 1 && word.front() == '-';
}

// The verbs and options as CLI11 knows them, and what each verb does.
class CommandLine {
  public:
    explicit CommandLine(const Catalogue &catalogue);

    CLI::App &program() { return program_; }
    const Completions &completions() const { return completions_; }

    // After parsing, in words of our own: CLI11 knows no verbs, only "subcommands".
    Settings settings() const;
    std::string path() const { return path_of(parsed_verb()); }
    const Action &action() const { return actions_.at(&parsed_verb()); }
    bool has_unknown_word() const { return program_.remaining_size(true) > 0; }
    bool has_unknown_option() const {
        return has_unknown_word() && is_option(program_.remaining(true).front());
    }
    Failure explain(const CLI::ParseError &error) const;

  private:
    static CLI::App &add_word(CLI::App &group, std::string_view word, std::string_view summary);
    CLI::App &group_of(std::string_view path);
    void add_verb(const Verb &verb);
    const CLI::App &parsed_verb() const;
    std::string unknown_word_message(const CLI::App &verb) const;
    std::string hint(const CLI::App &verb) const;
    static std::string path_of(const CLI::App &verb);

    const Catalogue &catalogue_;
    CLI::App program_{"Uses the device's IMS service from a shell.", "imsctl"};
    Completions completions_;
    Argument<std::int32_t> slot_;
    Argument<bool> json_;
    Argument<double> timeout_;
    std::map<std::string_view, CLI::App *> groups_;
    std::map<const CLI::App *, Action> actions_;
    std::map<const CLI::App *, std::string> examples_;
};

CommandLine::CommandLine(const Catalogue &catalogue) : catalogue_(catalogue) {
    const Settings usual;
    Arguments globals(program_, completions_, catalogue_.events());
    slot_ = globals.number_from(0, std::numeric_limits<std::int32_t>::max(), "--slot",
                                "the subscription slot (default 0)", usual.slot);
    json_ = globals.flag(std::string(kJsonFlag), "JSON objects instead of text");
    timeout_ = globals.seconds(
        "--timeout", fmt::format("how long to wait for an answer (default {})", usual.timeout),
        usual.timeout);
    program_.set_version_flag("--version", "imsctl " IMSCTL_VERSION);
    program_.fallthrough();
    program_.require_subcommand(1);
    program_.get_formatter()->label("SUBCOMMAND", "VERB");
    program_.get_formatter()->label("Positionals", "Arguments");
    program_.get_formatter()->label("REQUIRED", "");
    for (const Verb &verb : catalogue_.verbs())
        add_verb(verb);
    program_.footer("Examples:\n"
                    "  imsctl call dial +15550101 --wait\n"
                    "  imsctl --slot 1 monitor call-incoming-ind --json\n"
                    "Options may stand anywhere. Help for one verb: imsctl VERB --help\n"
                    "Exit status: 0 done, 1 failed, 2 wrong usage");
}

CLI::App &CommandLine::add_word(CLI::App &group, std::string_view word, std::string_view summary) {
    CLI::App *app = group.add_subcommand(std::string(word), std::string(summary));
    app->group("Verbs");
    return *app;
}

// The group that a path's last word belongs to; made when its first verb is.
CLI::App &CommandLine::group_of(std::string_view path) {
    const auto space = path.rfind(' ');
    if (space == std::string_view::npos)
        return program_;
    const std::string_view name = path.substr(0, space);
    const auto known = groups_.find(name);
    if (known != groups_.end())
        return *known->second;
    CLI::App &group = add_word(group_of(name), last_word(name), catalogue_.group_summary(name));
    group.require_subcommand(1);
    group.footer(fmt::format("Help for one verb: imsctl {} VERB --help", name));
    groups_[name] = &group;
    return group;
}

void CommandLine::add_verb(const Verb &verb) {
    CLI::App &app = add_word(group_of(verb.path), last_word(verb.path), verb.summary);
    Arguments arguments(app, completions_, catalogue_.events());
    actions_[&app] = verb.prepare(arguments);
    examples_[&app] = fmt::format("imsctl {}", verb.example);
    app.footer(fmt::format("Example: {}\nAlso: --slot, --json and --timeout; see imsctl --help",
                           examples_[&app]));
}

Settings CommandLine::settings() const {
    return {*slot_, *json_, *timeout_};
}

const CLI::App &CommandLine::parsed_verb() const {
    const CLI::App *verb = &program_;
    const auto was_parsed = [](const CLI::App *app) { return app->parsed(); };
    for (auto subs = verb->get_subcommands(was_parsed); !subs.empty();
         subs = verb->get_subcommands(was_parsed))
        verb = subs.front();
    return *verb;
}

std::string CommandLine::path_of(const CLI::App &verb) {
    if (verb.get_parent() == nullptr)
        return "";
    const std::string group = path_of(*verb.get_parent());
    return group.empty() ? verb.get_name() : group + ' ' + verb.get_name();
}

std::string CommandLine::hint(const CLI::App &verb) const {
    const std::string path = path_of(verb);
    const std::string help = fmt::format("help: imsctl {}{}--help", path, path.empty() ? "" : " ");
    const auto example = examples_.find(&verb);
    return example == examples_.end() ? help : fmt::format("try: {}\n{}", example->second, help);
}

std::string CommandLine::unknown_word_message(const CLI::App &verb) const {
    const std::string word = program_.remaining(true).front();
    if (is_option(word))
        return fmt::format("there is no option {}{}", quote(word),
                           did_you_mean(word.substr(0, word.find('=')), option_names(verb)));
    const std::vector<std::string> verbs = verbs_of(verb);
    if (verbs.empty())
        return fmt::format("{} is one argument too many", quote(word));
    const std::string guess = did_you_mean(word, verbs);
    return fmt::format("there is no verb {}{}", quote(word),
                       guess.empty() ? fmt::format("; the verbs: {}", fmt::join(verbs, ", "))
                                     : guess);
}

Failure CommandLine::explain(const CLI::ParseError &error) const {
    const CLI::App &verb = parsed_verb();
    const std::vector<std::string> verbs = verbs_of(verb);
    const std::string text = error.what();
    std::string problem = text;
    // "--slot call list": the value that is wrong says more than the word that is left over.
    const bool is_wrong_value = error.get_name() == "ValidationError" && !has_unknown_option();
    if (has_unknown_word() && !is_wrong_value)
        problem = unknown_word_message(verb);
    else if (!verbs.empty() && error.get_name() == "RequiredError")
        problem = fmt::format("a verb is missing: {}", fmt::join(verbs, ", "));
    else if (error.get_name() == "ArgumentMismatch")
        problem = fmt::format("{} needs exactly one value", text.substr(0, text.find(':')));
    return {FailureKind::kUsage, problem, hint(verb)};
}

// Known before parsing, which may fail.
bool asks_for_json(std::span<const char *const> arguments) {
    for (const std::string_view argument : arguments) {
        if (argument == "--")
            return false;
        if (argument == kJsonFlag)
            return true;
    }
    return false;
}

// Returns the exit status.
template <class Work>
int carry_out(const Output &output, const Work &work) {
    try {
        work();
        return 0;
    } catch (const ReaderGone &) {
        return 1;
    } catch (const Failure &failure) {
        output.failure(failure);
        return failure.exit_status();
    }
}

int run_verb(CommandLine &line, std::FILE *out, std::FILE *err) {
    const Settings settings = line.settings();
    Output output(settings.json, out, err);
    output.set_verb(line.path());
    return carry_out(output, [&] {
        Invocation invocation(settings, output);
        line.action()(invocation);
    });
}

int show(const Output &output, const std::string &text) {
    return carry_out(output, [&] { output.text(text); });
}

int refuse(const CommandLine &line, const CLI::ParseError &error, Output output) {
    const Failure failure = line.explain(error);
    output.set_verb(line.path());
    output.failure(failure);
    return failure.exit_status();
}

std::string completed(CommandLine &line, std::span<const char *const> words) {
    const std::vector<std::string> given(words.begin(), words.end());
    std::string text;
    for (const std::string &candidate : complete(line.program(), line.completions(), given))
        text += candidate + '\n';
    return text;
}

} // namespace

int run(const Catalogue &catalogue, std::span<const char *const> arguments, std::FILE *out,
        std::FILE *err) {
    CommandLine line(catalogue);
    const bool json = asks_for_json(arguments);
    const Output plain(false, out, err);
    if (!arguments.empty() && std::string_view(arguments.front()) == "__complete")
        return show(plain, completed(line, arguments.subspan(1)));
    try {
        // CLI11 takes them from the back.
        std::vector<std::string> reversed(arguments.rbegin(), arguments.rend());
        line.program().parse(std::move(reversed));
    } catch (const CLI::CallForHelp &help) {
        if (line.has_unknown_word())
            return refuse(line, help, {json, out, err});
        return show(plain, line.program().help());
    } catch (const CLI::CallForVersion &version) {
        return show(plain, std::string(version.what()) + '\n');
    } catch (const CLI::ParseError &error) {
        return refuse(line, error, {json, out, err});
    }
    return run_verb(line, out, err);
}

} // namespace imsctl
