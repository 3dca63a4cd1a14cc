// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <cstdlib>
#include <string>

namespace test {

// The path of ims-sim or imsctl: those that were built with the tests or, with a directory in
// IMS_PROGRAMS, those that were built otherwise.
inline std::string program(const char *name) {
    const char *directory = std::getenv("IMS_PROGRAMS");
    return std::string{directory != nullptr ? directory : IMS_BUILT_PROGRAMS} + '/' + name;
}

} // namespace test
