// SPDX-License-Identifier: Apache-2.0
// "Did you mean ...?"
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace imsctl {

// How many letters have to be added, left out, replaced or swapped with their neighbour.
std::size_t edit_distance(std::string_view from, std::string_view to);

// The candidates that are near enough to be what was meant, the nearest first, at most three.
std::vector<std::string> nearest(std::string_view word, const std::vector<std::string> &candidates);

// "" or "; did you mean \"dial\" or \"list\"?"
std::string did_you_mean(std::string_view word, const std::vector<std::string> &candidates);

} // namespace imsctl
