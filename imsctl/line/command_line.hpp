// SPDX-License-Identifier: Apache-2.0
// The whole program but for main().
#pragma once

#include "imsctl/line/modules.hpp"

#include <cstdio>
#include <span>

namespace imsctl {

// Returns the exit status: 0 done, 1 failed, 2 wrong usage.
int run(const Catalogue &catalogue, std::span<const char *const> arguments, std::FILE *out,
        std::FILE *err);

} // namespace imsctl
