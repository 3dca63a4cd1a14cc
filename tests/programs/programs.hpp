// SPDX-License-Identifier: Apache-2.0
// Where the programs under test are.
#pragma once

#include <cstdlib>
#include <string>
#include <vector>

namespace test {

// The path of ims-sim or imsctl: those that were built with the tests or, with a directory in
// IMS_PROGRAMS, those that were built otherwise.
inline std::string program(const char *name) {
    const char *directory = std::getenv("IMS_PROGRAMS");
    return std::string{directory != nullptr ? directory : IMS_BUILT_PROGRAMS} + '/' + name;
}

// The command that calls one of them.
inline std::vector<std::string> program(const char *name, std::vector<std::string> arguments) {
    arguments.insert(arguments.begin(), program(name));
    return arguments;
}

} // namespace test
