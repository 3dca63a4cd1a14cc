// SPDX-License-Identifier: Apache-2.0
// The command line from end to end: imsctl and the stand-in service, processes on a private bus.
#pragma once

#include "tests/imsctl/program.hpp"
#include "tests/support/private_bus.hpp"

#include <gtest/gtest.h>

namespace test {

class WithStandIn : public ::testing::Test {
  protected:
    static constexpr int kUsualSlots = 2;

    // When this returns all slots have registered: no event of that is under way any more. The
    // service's clock runs fast.
    explicit WithStandIn(int slots = kUsualSlots);
    // The service ends well: what its memory holds then is looked at where it is sanitized.
    ~WithStandIn() override;

    // A command line without quoting.
    static Outcome run(const std::string &line) { return run_imsctl(split(line)); }
    static void expect_ok(const std::string &line);
    static void expect_output(const std::string &line, const std::string &output);
    static void expect_refusal(const std::string &line, int result);

    // A verb that watches, and does so when the constructor returns.
    struct Watcher : Process {
        explicit Watcher(const std::string &line);
        // Of one with --json, when it has ended well.
        std::vector<Json> lines();
    };

    PrivateBus bus_;
    Process service_;
};

} // namespace test
