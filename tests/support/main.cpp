// SPDX-License-Identifier: Apache-2.0
// The main of the test executables: each test begins with the gate on and nothing noted.
#include "tests/support/bus_observer.hpp"
#include "tests/support/glib_watch.hpp"
#include "tests/support/platform_capture.hpp"

#include <gtest/gtest.h>

#include <cstdlib>

namespace {

class FreshStart : public ::testing::EmptyTestEventListener {
    void OnTestStart(const ::testing::TestInfo &) override {
        test::reset_platform();
        test::reset_observer();
    }
};

// What the environment could change in GLib.
void clean_environment() {
    for (const char *name :
         {"DBUS_SYSTEM_BUS_ADDRESS", "DBUS_SESSION_BUS_ADDRESS", "DBUS_STARTER_BUS_TYPE",
          "G_DBUS_DEBUG", "G_DEBUG", "G_MESSAGES_DEBUG"})
        unsetenv(name);
}

} // namespace

int main(int argc, char **argv) {
    clean_environment();
    test::watch_glib();
    ::testing::InitGoogleTest(&argc, argv);
    ::testing::UnitTest::GetInstance()->listeners().Append(new FreshStart);
    return RUN_ALL_TESTS();
}
