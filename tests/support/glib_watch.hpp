// SPDX-License-Identifier: Apache-2.0
// Warnings and criticals of GLib fail the running test.
#pragma once

#include <string>

namespace test {

// From now on, for the life of the process.
void watch_glib();

// The one exception: as long as this lives, criticals that contain the text are counted instead.
// Not to have seen any fails the test.
class ExpectGlibCritical {
  public:
    explicit ExpectGlibCritical(std::string part);
    ~ExpectGlibCritical();
    ExpectGlibCritical(const ExpectGlibCritical &) = delete;
    ExpectGlibCritical &operator=(const ExpectGlibCritical &) = delete;
};

} // namespace test
