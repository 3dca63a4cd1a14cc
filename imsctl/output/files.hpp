// SPDX-License-Identifier: Apache-2.0
// Whole files, read and written.
#pragma once

#include <string>

namespace imsctl {

// "-" stands for standard input and output.
inline constexpr const char *kStandardStream = "-";

// Throws an input failure.
std::string read_file(const std::string &name);

// Throws an output failure. The file may hold passwords: whatever stood in its place, it is its
// owner's alone. It takes that place when it is complete, so that a failure leaves the old one.
void write_file(const std::string &name, const std::string &content);

} // namespace imsctl
