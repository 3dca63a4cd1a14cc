// SPDX-License-Identifier: Apache-2.0
// A video call from end to end, with the stand-in service.
#include "tests/imsctl/with_stand_in.hpp"

#include <gtest/gtest.h>

namespace test {
namespace {

using VideoOverStandIn = WithStandIn;

TEST_F(VideoOverStandIn, IsSteeredWhileTheCallLasts) {
    ASSERT_EQ(run_imsctl(split("call dial +15550199 --type video --wait")).status, 0);
    expect_refusal("vt zoom set 3", 13); // no camera is on
    expect_output("vt camera start --camera back", "session_id=1");
    expect_output("vt zoom set 3 --camera back", "session_id=1");
    expect_output("vt zoom get --camera back", "session_id=1 zoom=3");
    expect_refusal("vt record pause", 13); // nothing is recorded
    expect_output("vt record start call.mp4 --end near", "session_id=1");
    expect_output("vt record pause --end near", "session_id=1");
    expect_output("vt surface far 4 5", "session_id=1");
    expect_output("vt pixmap release 4", "session_id=1");
    expect_refusal("vt pixmap release 4", 10);
    ASSERT_EQ(run_imsctl(split("call end")).status, 0);
    expect_refusal("vt camera stop 1", 12);
}

} // namespace
} // namespace test
