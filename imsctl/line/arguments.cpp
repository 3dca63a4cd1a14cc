// SPDX-License-Identifier: Apache-2.0
#include "imsctl/line/arguments.hpp"

#include "imsctl/line/suggestions.hpp"
#include "imsctl/output/failure.hpp"

#include <CLI/CLI.hpp>
#include <algorithm>
#include <charconv>
#include <fmt/format.h>
#include <fmt/ranges.h>
#include <utility>

namespace imsctl {
namespace {

// What an argument is called in messages: its last name, "--session" of "SESSION,--session".
std::string shown_name(const std::string &names) {
    const auto comma = names.find(',');
    return comma == std::string::npos ? names : names.substr(0, comma);
}

std::int32_t number_or_refusal(const std::string &names, const std::string &text) {
    if (const auto number = parse_number(text))
        return *number;
    refuse_argument(shown_name(names),
                    fmt::format("{} is not a whole number of 32 bits", quote(text)));
}

std::int32_t choice_or_refusal(const std::string &names, NamedValues values,
                               const std::string &text) {
    if (const auto value = parse_value(values, text))
        return *value;
    refuse_argument(shown_name(names),
                    fmt::format("{} is not one of {}", quote(text), choices(values)));
}

std::function<std::string(const std::string &)> one_of(const std::vector<std::string> &known) {
    return [known](const std::string &name) {
        return std::find(known.begin(), known.end(), name) != known.end()
                   ? ""
                   : fmt::format("there is none called {}{}", quote(name),
                                 did_you_mean(name, known));
    };
}

std::vector<std::string> split_at_commas(const std::string &text) {
    std::vector<std::string> parts;
    std::size_t begin = 0;
    for (auto end = text.find(','); end != std::string::npos; end = text.find(',', begin)) {
        parts.push_back(text.substr(begin, end - begin));
        begin = end + 1;
    }
    parts.push_back(text.substr(begin));
    return parts;
}

std::optional<IntSet> parse_set(const std::string &text,
                                std::span<const std::string_view> members) {
    const std::vector<std::string> parts = split_at_commas(text);
    IntSet set{};
    if (parse_number(parts.front())) {
        if (parts.size() != set.size())
            return std::nullopt;
        for (std::size_t at = 0; at < set.size(); ++at) {
            const auto number = parse_number(parts[at]);
            if (!number)
                return std::nullopt;
            set[at] = *number;
        }
        return set;
    }
    for (const std::string &part : parts) {
        const auto member = std::find(members.begin(), members.end(), part);
        if (member == members.end())
            return std::nullopt;
        set[static_cast<std::size_t>(member - members.begin())] = 1;
    }
    return set;
}

// A place is its own description.
std::string type_name(const std::string &names, const std::string &name) {
    return names.starts_with('-') ? name : "";
}

template <class Store>
void add(CLI::App &verb, const std::string &names, const std::string &type, const std::string &help,
         Store store) {
    verb.add_option_function<std::string>(
            names, [store](const std::string &text) { store(text); }, help)
        ->type_name(type_name(names, type));
}

} // namespace

Seconds seconds_or_refusal(const std::string &name, const std::string &text) {
    Seconds seconds = 0;
    const char *end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), end, seconds);
    // Written so that what is not a number does not pass either.
    const bool fits = error == std::errc() && stop == end && seconds > 0 && seconds <= kLongestWait;
    if (!fits)
        refuse_argument(name, fmt::format("{} is not a number of seconds above 0", quote(text)));
    return seconds;
}

void refuse_argument(const std::string &name, const std::string &problem) {
    throw CLI::ValidationError(name, problem);
}

CLI::Option &Arguments::option(const std::string &names) {
    return *verb_.get_option(shown_name(names));
}

void Arguments::complete_with(const std::string &names,
                              const std::vector<std::string> &completions) {
    if (!completions.empty())
        completions_[&option(names)] = completions;
}

Argument<std::int32_t> Arguments::number(const std::string &names, const std::string &help,
                                         std::int32_t fallback) {
    auto value = std::make_shared<std::int32_t>(fallback);
    add(verb_, names, "N", help,
        [=](const std::string &text) { *value = number_or_refusal(names, text); });
    return value;
}

Argument<std::int32_t> Arguments::number(const std::string &names, const std::string &help) {
    auto value = number(names, help, 0);
    option(names).required();
    return value;
}

Argument<std::int32_t> Arguments::number_from(std::int32_t least, std::int32_t most,
                                              const std::string &names, const std::string &help,
                                              std::int32_t fallback) {
    auto value = std::make_shared<std::int32_t>(fallback);
    add(verb_, names, "N", help, [=](const std::string &text) {
        const auto number = parse_number(text);
        if (!number || *number < least || *number > most)
            refuse_argument(shown_name(names), fmt::format("{} is not a whole number from {} to {}",
                                                           quote(text), least, most));
        *value = *number;
    });
    return value;
}

Argument<std::int32_t> Arguments::choice(const std::string &names, const std::string &help,
                                         NamedValues values, std::int32_t fallback) {
    auto value = std::make_shared<std::int32_t>(fallback);
    add(verb_, names, "VALUE", fmt::format("{}: {}", help, choices(values)),
        [=](const std::string &text) { *value = choice_or_refusal(names, values, text); });
    complete_with(names, names_of(values));
    return value;
}

Argument<std::int32_t> Arguments::choice(const std::string &names, const std::string &help,
                                         NamedValues values) {
    auto value = choice(names, help, values, 0);
    option(names).required();
    return value;
}

Argument<std::string> Arguments::text_or(const std::string &names, const std::string &help,
                                         std::string fallback) {
    auto value = std::make_shared<std::string>(std::move(fallback));
    add(verb_, names, "TEXT", help, [=](const std::string &text) { *value = text; });
    return value;
}

Argument<std::string> Arguments::text(const std::string &names, const std::string &help) {
    auto value = text_or(names, help, "");
    option(names).required();
    return value;
}

Argument<std::vector<std::string>>
Arguments::some_texts(const std::string &names, const std::string &help,
                      const std::vector<std::string> &completions) {
    auto values = std::make_shared<std::vector<std::string>>();
    CLI::Option *option = verb_.add_option_function<std::vector<std::string>>(
        names, [values](const std::vector<std::string> &texts) { *values = texts; }, help);
    option->type_name(type_name(names, "NAME"));
    // An option takes one at a time, so that what follows may be something else.
    if (!option->get_positional())
        option->allow_extra_args(false);
    complete_with(names, completions);
    return values;
}

Argument<std::vector<std::string>> Arguments::some_names(const std::string &names,
                                                         const std::string &help,
                                                         const std::vector<std::string> &known) {
    auto values = some_texts(names, help, known);
    option(names).check(one_of(known));
    return values;
}

Argument<std::string> Arguments::name(const std::string &names, const std::string &help,
                                      const std::vector<std::string> &known) {
    auto value = text(names, help);
    option(names).check(one_of(known));
    complete_with(names, known);
    return value;
}

Argument<std::vector<std::string>> Arguments::texts(const std::string &names,
                                                    const std::string &help,
                                                    const std::vector<std::string> &completions) {
    auto values = some_texts(names, help, completions);
    option(names).required();
    return values;
}

Argument<bool> Arguments::flag(const std::string &names, const std::string &help) {
    auto value = std::make_shared<bool>(false);
    verb_.add_flag_callback(
        names, [value] { *value = true; }, help);
    return value;
}

Argument<std::vector<std::int32_t>> Arguments::some_numbers(const std::string &names,
                                                            const std::string &help) {
    auto values = std::make_shared<std::vector<std::int32_t>>();
    verb_
        .add_option_function<std::vector<std::string>>(
            names,
            [=](const std::vector<std::string> &texts) {
                for (const std::string &text : texts)
                    values->push_back(number_or_refusal(names, text));
            },
            help)
        ->type_name(type_name(names, "N"));
    return values;
}

Argument<std::optional<IntSet>> Arguments::set(const std::string &names, const std::string &help,
                                               std::span<const std::string_view> members) {
    auto value = std::make_shared<std::optional<IntSet>>();
    add(verb_, names, "SET",
        fmt::format("{}: {} with commas between, or four numbers", help, fmt::join(members, ", ")),
        [=](const std::string &text) {
            *value = parse_set(text, members);
            if (!*value)
                refuse_argument(shown_name(names),
                                fmt::format("{} is neither some of {} nor four numbers",
                                            quote(text), fmt::join(members, ", ")));
        });
    complete_with(names, {members.begin(), members.end()});
    return value;
}

std::function<void()> Arguments::no_effect_beside(const std::string &name,
                                                  const std::vector<std::string> &others) {
    return [&verb = verb_, name, others] {
        if (verb.count(name) == 0)
            return;
        for (const std::string &other : others)
            if (verb.count(other) > 0)
                throw Failure(FailureKind::kUsage,
                              fmt::format("{} has no effect with {}", other, name));
    };
}

Argument<double> Arguments::seconds(const std::string &names, const std::string &help,
                                    double fallback) {
    auto value = std::make_shared<double>(fallback);
    add(verb_, names, "S", help,
        [=](const std::string &text) { *value = seconds_or_refusal(names, text); });
    return value;
}

SessionChoice Arguments::session(const std::string &names, const Fitting &fitting) {
    SessionChoice choice(fitting);
    const std::string help =
        fmt::format("the session; when left out, the only one of the {}", fitting.what);
    add(verb_, names, "N", help,
        [=](const std::string &text) { choice.give(number_or_refusal(names, text)); });
    return choice;
}

SessionChoice Arguments::session_place(const Fitting &fitting) {
    return session("SESSION,--session", fitting);
}

SessionChoice Arguments::session_option(const Fitting &fitting) {
    return session("--session", fitting);
}

} // namespace imsctl
