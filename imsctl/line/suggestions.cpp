// SPDX-License-Identifier: Apache-2.0
#include "imsctl/line/suggestions.hpp"

#include <algorithm>
#include <fmt/format.h>
#include <fmt/ranges.h>

namespace imsctl {

std::size_t edit_distance(std::string_view from, std::string_view to) {
    const std::size_t width = to.size() + 1;
    std::vector<std::size_t> cells((from.size() + 1) * width);
    const auto cell = [&](std::size_t i, std::size_t j) -> std::size_t & {
        return cells[i * width + j];
    };
    for (std::size_t i = 0; i <= from.size(); ++i) {
        for (std::size_t j = 0; j <= to.size(); ++j) {
            if (i == 0 || j == 0) {
                cell(i, j) = i + j;
                continue;
            }
            const std::size_t replaced = from[i - 1] == to[j - 1] ? 0 : 1;
            cell(i, j) =
                std::min({cell(i - 1, j) + 1, cell(i, j - 1) + 1, cell(i - 1, j - 1) + replaced});
            if (i > 1 && j > 1 && from[i - 1] == to[j - 2] && from[i - 2] == to[j - 1])
                cell(i, j) = std::min(cell(i, j), cell(i - 2, j - 2) + 1);
        }
    }
    return cells.back();
}

std::vector<std::string> nearest(std::string_view word,
                                 const std::vector<std::string> &candidates) {
    constexpr std::size_t kMost = 3;
    struct Match {
        std::size_t distance;
        const std::string *name;
    };
    std::size_t longest = 0;
    for (const std::string &name : candidates)
        longest = std::max(longest, name.size());
    // The limit grows with the word: to a word without end everything would be near.
    if (word.size() > 2 * longest)
        return {};
    const std::size_t limit = std::max<std::size_t>(1, word.size() / 3);
    std::vector<Match> matches;
    for (const std::string &name : candidates) {
        const bool begun = word.size() > 1 && name.starts_with(word);
        const std::size_t longer = std::max(word.size(), name.size());
        const std::size_t shorter = std::min(word.size(), name.size());
        if (!begun && longer - shorter > limit)
            continue;
        const std::size_t distance = begun ? 0 : edit_distance(word, name);
        if (distance <= limit)
            matches.push_back({distance, &name});
    }
    std::stable_sort(matches.begin(), matches.end(),
                     [](const Match &a, const Match &b) { return a.distance < b.distance; });
    std::vector<std::string> names;
    for (const Match &match : matches)
        if (names.size() < kMost)
            names.push_back(*match.name);
    return names;
}

std::string did_you_mean(std::string_view word, const std::vector<std::string> &candidates) {
    std::vector<std::string> quoted;
    for (const std::string &name : nearest(word, candidates))
        quoted.push_back(fmt::format("\"{}\"", name));
    if (quoted.empty())
        return "";
    return fmt::format("; did you mean {}?", fmt::join(quoted, " or "));
}

} // namespace imsctl
