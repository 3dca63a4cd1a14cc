// SPDX-License-Identifier: Apache-2.0
// A video call from end to end, with the stand-in service.
#include "private_bus.hpp"
#include "program.hpp"

#include <gtest/gtest.h>

namespace test {
namespace {

class VideoOverStandIn : public ::testing::Test {
  protected:
    VideoOverStandIn() { service_.wait_for_error("is ready"); }

    static void expect_ok(const char *line, const std::string &output) {
        const Outcome outcome = run_imsctl(split(line));
        EXPECT_EQ(outcome.status, 0) << line << '\n' << outcome.error;
        EXPECT_EQ(outcome.output, output + "\n") << line;
    }
    static void expect_refusal(const char *line, int result) {
        const Outcome outcome = run_imsctl(split(line + std::string(" --json")));
        EXPECT_EQ(outcome.status, 1) << line;
        EXPECT_EQ(outcome.json()["error"]["result"], result) << line;
    }

    PrivateBus bus_;
    Process service_{{IMS_SIM_PATH, "serve", "--speed", "20", "--verbose"}};
};

TEST_F(VideoOverStandIn, IsSteeredWhileTheCallLasts) {
    ASSERT_EQ(run_imsctl(split("call dial +15550199 --type video --wait")).status, 0);
    expect_refusal("vt zoom set 3", 13); // no camera is on
    expect_ok("vt camera start --camera back", "session_id=1");
    expect_ok("vt zoom set 3 --camera back", "session_id=1");
    expect_ok("vt zoom get --camera back", "session_id=1 zoom=3");
    expect_refusal("vt record pause", 13); // nothing is recorded
    expect_ok("vt record start call.mp4 --end near", "session_id=1");
    expect_ok("vt record pause --end near", "session_id=1");
    expect_ok("vt surface far 4 5", "session_id=1");
    expect_ok("vt pixmap release 4", "session_id=1");
    expect_refusal("vt pixmap release 4", 10);
    ASSERT_EQ(run_imsctl(split("call end")).status, 0);
    expect_refusal("vt camera stop 1", 12);
}

} // namespace
} // namespace test
