// SPDX-License-Identifier: Apache-2.0
// The arguments of one verb. What is returned holds its value once the command line is parsed.
#pragma once

#include "imsctl/client/session_choice.hpp"
#include "imsctl/output/values.hpp"

#include <array>
#include <functional>
#include <ims.h>
#include <map>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <vector>

namespace CLI {
class App;
class Option;
} // namespace CLI

namespace imsctl {

using IntSet = std::array<std::int32_t, IMS_POC_INT_SET_SIZE>;

template <class Type>
using Argument = std::shared_ptr<Type>;

// What may be typed for an argument, as far as that is known beforehand: for the shell's
// completion.
using Completions = std::map<const CLI::Option *, std::vector<std::string>>;

// Names are as CLI11 has them: "NUMBER" is a place, "--number" an option, "NUMBER,--number" both.
class Arguments {
  public:
    Arguments(CLI::App &verb, Completions &completions, std::span<const EventRow> events)
        : verb_(verb), completions_(completions), events_(events) {}

    // All that there are: for a verb that lets its user choose among them.
    std::span<const EventRow> events() const { return events_; }

    // Required.
    Argument<std::int32_t> number(const std::string &names, const std::string &help);
    Argument<std::int32_t> choice(const std::string &names, const std::string &help,
                                  NamedValues values);
    Argument<std::string> text(const std::string &names, const std::string &help);
    Argument<std::string> name(const std::string &names, const std::string &help,
                               const std::vector<std::string> &known);
    Argument<std::vector<std::string>> texts(const std::string &names, const std::string &help,
                                             const std::vector<std::string> &completions = {});

    // May be left out.
    Argument<std::int32_t> number(const std::string &names, const std::string &help,
                                  std::int32_t fallback);
    Argument<std::int32_t> number_from(std::int32_t least, std::int32_t most,
                                       const std::string &names, const std::string &help,
                                       std::int32_t fallback);
    Argument<std::int32_t> choice(const std::string &names, const std::string &help,
                                  NamedValues values, std::int32_t fallback);
    Argument<std::string> text_or(const std::string &names, const std::string &help,
                                  std::string fallback);
    Argument<std::vector<std::string>> some_texts(const std::string &names, const std::string &help,
                                                  const std::vector<std::string> &completions = {});
    Argument<std::vector<std::string>> some_names(const std::string &names, const std::string &help,
                                                  const std::vector<std::string> &known);
    Argument<bool> flag(const std::string &names, const std::string &help);

    Argument<std::vector<std::int32_t>> some_numbers(const std::string &names,
                                                     const std::string &help);
    // Four integers, or the members that are 1 by name; nothing when it is left out.
    Argument<std::optional<IntSet>> set(const std::string &names, const std::string &help,
                                        std::span<const std::string_view> members);

    // Refuses, once the command line is parsed, each of `others` that is given beside `name`.
    std::function<void()> no_effect_beside(const std::string &name,
                                           const std::vector<std::string> &others);

    Argument<double> seconds(const std::string &names, const std::string &help, double fallback);

    SessionChoice session(const std::string &names, const Fitting &fitting);
    SessionChoice session_place(const Fitting &fitting);
    SessionChoice session_option(const Fitting &fitting);

  private:
    CLI::Option &option(const std::string &names);
    void complete_with(const std::string &names, const std::vector<std::string> &completions);

    CLI::App &verb_;
    Completions &completions_;
    std::span<const EventRow> events_;
};

// More than 0 and at most kLongestWait.
Seconds seconds_or_refusal(const std::string &name, const std::string &text);

// Throws what CLI11 throws for an argument of the wrong form.
[[noreturn]] void refuse_argument(const std::string &name, const std::string &problem);

} // namespace imsctl
