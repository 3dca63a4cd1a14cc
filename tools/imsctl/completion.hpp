// SPDX-License-Identifier: Apache-2.0
// Shell completion: the shell asks the program itself.
#pragma once

#include <CLI/CLI.hpp>
#include <span>
#include <string>
#include <vector>

namespace imsctl {

// What may stand in place of the last word.
std::vector<std::string> complete(const CLI::App &program, std::span<const std::string> words);

// All options that a verb takes, "--slot" and its like included.
std::vector<std::string> option_names(const CLI::App &verb);

std::string bash_completion_script();

} // namespace imsctl
