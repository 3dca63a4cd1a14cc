// SPDX-License-Identifier: Apache-2.0
// For functions that use a pointer without a look: a NULL one ends the process. The test is run by
// a process of its own, which makes neither a bus nor a core file.
#pragma once

#include <gtest/gtest.h>

#include <sys/resource.h>

namespace test {

class UnguardedTest : public ::testing::Test {
  protected:
    void SetUp() override {
        GTEST_FLAG_SET(death_test_style, "threadsafe");
        const rlimit none{0, 0};
        ASSERT_EQ(setrlimit(RLIMIT_CORE, &none), 0);
    }
};

} // namespace test
