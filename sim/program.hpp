// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/options.hpp"

namespace sim {

// The two commands of the program. Each returns the exit status.
int serve(const Options &options);
int run(const Options &options);

} // namespace sim
