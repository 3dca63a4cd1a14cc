// SPDX-License-Identifier: Apache-2.0
// Standard streams that are closed, full, or that nobody reads.
#include "tests/imsctl/program.hpp"
#include "tests/support/private_bus.hpp"
#include "tests/support/scripted_peer.hpp"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace test {
namespace {

using testing::HasSubstr;

class Streams : public ::testing::Test {
  protected:
    Streams() { peer_.on("org.kelvo.ims.Call.IsInEpdgCall", reply("(ib)", "(0, true)")); }

    // In a shell that knows the program as "imsctl".
    static std::vector<std::string> shell(const std::string &script) {
        return {"sh", "-c", "imsctl() { \"" + program("imsctl") + "\" \"$@\"; }\n" + script};
    }

    PrivateBus bus_;
    ScriptedPeer peer_{bus_.address()};
};

TEST_F(Streams, ClosedOutputIsAFailure) {
    Process process(shell("imsctl call epdg status >&-"), strict_environment());
    EXPECT_EQ(process.wait(), 1);
    EXPECT_EQ(process.error(),
              "imsctl: call epdg status: cannot write the output: Bad file descriptor\n");
    // It did not reach the service in place of a message.
    EXPECT_EQ(peer_.calls().size(), 2u);
}

TEST_F(Streams, FullOutputIsAFailure) {
    Process process(shell("imsctl call epdg status --json >/dev/full"), strict_environment());
    EXPECT_EQ(process.wait(), 1);
    EXPECT_THAT(process.error(), HasSubstr("cannot write the output: No space left on device"));
}

TEST_F(Streams, ClosedErrorsAndInputDoNoHarm) {
    Process process(shell("imsctl call epdg status <&- 2>&-"), strict_environment());
    EXPECT_EQ(process.wait(), 0);
    EXPECT_EQ(process.output(), "in_epdg_call=true\n");
    Process failing(shell("imsctl call hold 1 2>&-"), strict_environment());
    EXPECT_EQ(failing.wait(), 1);
    Process watching(shell("imsctl monitor --for 0.1 2>&-"), strict_environment());
    EXPECT_EQ(watching.wait(), 0);
}

// No event comes: the watch does not wait for one to find out.
TEST_F(Streams, NobodyReadsWhatIsWatched) {
    for (const char *verb : {"monitor", "registration watch", "sms watch"}) {
        Process process(shell("{ imsctl " + std::string(verb) + "; echo status=$? >&2; } | :"),
                        strict_environment());
        EXPECT_EQ(process.wait(), 0) << verb;
        EXPECT_THAT(process.error(), testing::EndsWith(" slot 0\nstatus=1\n")) << verb;
    }
}

} // namespace
} // namespace test
