// SPDX-License-Identifier: Apache-2.0
#include "completion.hpp"

#include "events.hpp"
#include "settings_completion.hpp"

#include <algorithm>

namespace imsctl {
namespace {

const CLI::App *find_verb(const CLI::App &group, const std::string &name) {
    const auto found =
        group.get_subcommands([&](const CLI::App *sub) { return sub->get_name() == name; });
    return found.empty() ? nullptr : found.front();
}

std::vector<std::string> verb_names(const CLI::App &verb) {
    std::vector<std::string> names;
    for (const CLI::App *sub : verb.get_subcommands([](const CLI::App *) { return true; }))
        names.push_back(sub->get_name());
    return names;
}

} // namespace

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

std::vector<std::string> complete(const CLI::App &program, std::span<const std::string> words) {
    if (words.empty())
        return {};
    const CLI::App *verb = &program;
    std::size_t words_behind_verb = 0;
    for (const std::string &word : words.first(words.size() - 1)) {
        ++words_behind_verb;
        if (const CLI::App *sub = find_verb(*verb, word)) {
            verb = sub;
            words_behind_verb = 0;
        }
    }
    std::vector<std::string> candidates =
        words.back().starts_with('-') ? option_names(*verb) : verb_names(*verb);
    if (verb->get_name() == "monitor" && candidates.empty())
        candidates = event_names();
    // The first word is the set or the profile.
    if (verb->get_parent() != nullptr && candidates.empty() && words_behind_verb > 0)
        candidates = key_completions(verb->get_parent()->get_name(), verb->get_name());
    candidates.erase(
        std::remove_if(candidates.begin(), candidates.end(),
                       [&](const std::string &name) { return !name.starts_with(words.back()); }),
        candidates.end());
    return candidates;
}

std::string bash_completion_script() {
    return R"(_imsctl() {
    local IFS=$'\n'
    COMPREPLY=($("${COMP_WORDS[0]}" __complete "${COMP_WORDS[@]:1:COMP_CWORD}" 2>/dev/null))
    [[ ${COMPREPLY[0]} == *= ]] && compopt -o nospace
}
complete -F _imsctl imsctl)";
}

} // namespace imsctl
