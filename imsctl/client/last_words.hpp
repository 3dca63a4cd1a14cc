// SPDX-License-Identifier: Apache-2.0
// What is said when the process ends from within a signal handler.
#pragma once

#include "imsctl/client/main_loop.hpp"
#include "imsctl/output/output.hpp"

namespace imsctl {

// A time limit for the library's blocking calls, which take none themselves: while it lives, the
// process says its last words and ends with status 1 once the time is over.
class BlockingLimit {
  public:
    BlockingLimit(Seconds limit, LastWords words);
    ~BlockingLimit();
    BlockingLimit(const BlockingLimit &) = delete;
    BlockingLimit &operator=(const BlockingLimit &) = delete;
};

// GIO ends the process by SIGTERM when the connection to the bus breaks. From now on the process
// says its last words then and ends with status 1. SIGTERM from others keeps its usual effect.
void explain_bus_break(LastWords words);

} // namespace imsctl
