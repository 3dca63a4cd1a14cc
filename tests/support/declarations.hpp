// SPDX-License-Identifier: Apache-2.0
// What the public headers declare.
#pragma once

#include <set>
#include <string>

namespace test {

// The exported functions of one header.
std::set<std::string> declared_functions(const std::string &header);

} // namespace test
