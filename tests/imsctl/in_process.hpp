// SPDX-License-Identifier: Apache-2.0
// imsctl called as a function: for all that needs no service.
#pragma once

#include "imsctl/line/modules.hpp"

#include <string>
#include <string_view>
#include <vector>

namespace imsctl {

struct Outcome {
    int status;
    std::string output;
    std::string error;
};

// What the real program is made of.
const Catalogue &catalogue();

Outcome run_words(const std::vector<std::string> &words);

// Single quotes hold words together.
std::vector<std::string> split(std::string_view line);
Outcome run_line(std::string_view line);

} // namespace imsctl
