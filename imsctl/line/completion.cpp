// SPDX-License-Identifier: Apache-2.0
#include "imsctl/line/completion.hpp"

#include <CLI/CLI.hpp>
#include <algorithm>

namespace imsctl {
namespace {

// bash makes a word of its own of each.
constexpr std::string_view kEquals = "=";

const CLI::App *verb_named(const CLI::App &group, const std::string &name) {
    const auto found =
        group.get_subcommands([&](const CLI::App *verb) { return verb->get_name() == name; });
    return found.empty() ? nullptr : found.front();
}

// Goes along a command line and knows what belongs in the place behind it.
class Place {
  public:
    explicit Place(const CLI::App &program) : verb_(&program) {}

    void pass(const std::string &word) {
        behind_equals_ = word == kEquals;
        if (behind_equals_)
            return;
        if (option_ != nullptr)
            option_ = nullptr; // this was its value
        else if (word.starts_with('-'))
            option_ = option_with_value(word);
        else if (const CLI::App *sub = verb_named(*verb_, word))
            verb_ = sub;
        else
            ++arguments_;
    }

    std::vector<std::string> candidates(const Completions &completions,
                                        const std::string &begun) const {
        const CLI::Option *argument = option_ != nullptr ? option_ : next_argument();
        if (option_ == nullptr && begun.starts_with('-'))
            return option_names(*verb_);
        if (option_ == nullptr && behind_equals_)
            return {};
        const auto known = completions.find(argument);
        return known != completions.end() ? known->second
               : option_ != nullptr       ? std::vector<std::string>()
                                          : verbs_of(*verb_);
    }

  private:
    const CLI::Option *option_with_value(const std::string &word) const {
        for (const CLI::App *app = verb_; app != nullptr; app = app->get_parent())
            if (const CLI::Option *option = app->get_option_no_throw(word))
                return option->get_items_expected_max() > 0 ? option : nullptr;
        return nullptr;
    }

    // The last argument may stand there more than once.
    const CLI::Option *next_argument() const {
        const auto all =
            verb_->get_options([](const CLI::Option *option) { return option->get_positional(); });
        if (arguments_ < all.size())
            return all[arguments_];
        return all.empty() || all.back()->get_items_expected_max() == 1 ? nullptr : all.back();
    }

    const CLI::App *verb_;
    const CLI::Option *option_ = nullptr; // whose value is next
    std::size_t arguments_ = 0;           // that the verb has so far
    bool behind_equals_ = false;          // of KEY=VALUE
};

} // namespace

std::vector<std::string> verbs_of(const CLI::App &group) {
    std::vector<std::string> names;
    for (const CLI::App *verb : group.get_subcommands([](const CLI::App *) { return true; }))
        names.push_back(verb->get_name());
    return names;
}

std::vector<std::string> option_names(const CLI::App &verb) {
    std::vector<std::string> names;
    for (const CLI::App *app = &verb; app != nullptr; app = app->get_parent())
        for (const CLI::Option *option : app->get_options())
            for (const std::string &name : option->get_lnames())
                names.push_back("--" + name);
    std::sort(names.begin(), names.end());
    names.erase(std::unique(names.begin(), names.end()), names.end());
    return names;
}

std::vector<std::string> complete(const CLI::App &program, const Completions &completions,
                                  std::span<const std::string> words) {
    if (words.empty())
        return {};
    Place place(program);
    for (const std::string &word : words.first(words.size() - 1))
        place.pass(word);
    const bool is_value = words.back() == kEquals;
    if (is_value)
        place.pass(words.back());
    const std::string begun = is_value ? "" : words.back();
    std::vector<std::string> candidates = place.candidates(completions, begun);
    std::erase_if(candidates, [&](const std::string &name) { return !name.starts_with(begun); });
    return candidates;
}

// Where imsctl knows nothing, a file's name may be meant.
std::string bash_completion_script() {
    return R"(_imsctl() {
    local IFS=$'\n'
    COMPREPLY=($("${COMP_WORDS[0]}" __complete "${COMP_WORDS[@]:1:COMP_CWORD}" 2>/dev/null))
    [[ ${COMPREPLY[0]} == *= ]] && compopt -o nospace
}
complete -o default -F _imsctl imsctl)";
}

} // namespace imsctl
