// SPDX-License-Identifier: Apache-2.0
// What a command is, and how it is made ready to run.
#pragma once

#include "imsctl/client/invocation.hpp"
#include "imsctl/line/arguments.hpp"

#include <string_view>

namespace imsctl {

struct Verb {
    std::string_view path;    // "call tty mode get"
    std::string_view summary; // one line
    std::string_view example; // what follows "imsctl "
    // Declares the arguments and returns what is done with them.
    Action (*prepare)(Arguments &);
};

// For a word that other words follow, "call tty": its line of help.
struct VerbGroup {
    std::string_view path;
    std::string_view summary;
};

} // namespace imsctl
