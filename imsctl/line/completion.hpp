// SPDX-License-Identifier: Apache-2.0
// Shell completion: the shell asks the program itself.
#pragma once

#include "imsctl/line/arguments.hpp"

#include <span>
#include <string>
#include <vector>

namespace imsctl {

// What may stand in place of the last word.
std::vector<std::string> complete(const CLI::App &program, const Completions &completions,
                                  std::span<const std::string> words);

// All verbs of a group; none for a verb.
std::vector<std::string> verbs_of(const CLI::App &group);

// All options that a verb takes, "--slot" and its like included.
std::vector<std::string> option_names(const CLI::App &verb);

std::string bash_completion_script();

} // namespace imsctl
