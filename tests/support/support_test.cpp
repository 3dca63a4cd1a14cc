// SPDX-License-Identifier: Apache-2.0
// What watches over the other tests does fail them.
#include "platform.h"
#include "tests/support/glib_watch.hpp"
#include "tests/support/malformed.hpp"
#include "tests/support/platform_capture.hpp"
#include "tests/support/with_peer.hpp"

#include <gtest/gtest-spi.h>

#include <set>

namespace test {
namespace {

TEST(Watch, FailsATestThatLetsGLibComplain) {
    EXPECT_NONFATAL_FAILURE(g_warning("a warning of a test"), "a warning of a test");
    EXPECT_NONFATAL_FAILURE(g_critical("a critical of a test"), "a critical of a test");
    EXPECT_NONFATAL_FAILURE(
        g_log_structured("Test", G_LOG_LEVEL_WARNING, "MESSAGE", "a structured warning"),
        "a structured warning");
}

TEST(Watch, IgnoresWhatIsNoComplaint) {
    g_message("a message of a test");
    g_debug("a line for debugging");
}

TEST(Watch, ExpectsACriticalWhereATestSaysSo) {
    {
        const ExpectGlibCritical expected{"of this kind"};
        g_critical("one of this kind");
        EXPECT_NONFATAL_FAILURE(g_critical("one of another"), "one of another");
        EXPECT_NONFATAL_FAILURE(g_warning("a warning of this kind"), "of this kind");
    }
    EXPECT_NONFATAL_FAILURE(g_critical("one of this kind"), "of this kind");
    EXPECT_NONFATAL_FAILURE(ExpectGlibCritical{"that never comes"}, "that never comes");
}

TEST(Capture, FailsATestWhoseLineHasNotThePrefix) {
    for (const char *line :
         {"message", "a.cpp: f(1): message", "a.cpp: f() > message", "src/a.cpp: f(1) > message",
          "a.cpp: ims::f(1) > message", "a.cpp: (1) > message", ": f(1) > message"}) {
        EXPECT_NONFATAL_FAILURE(__dlog_print(2, 6, "MEGORE", "%s", line), "without its prefix");
    }
    take_log();
}

TEST(Capture, TakesALineApart) {
    __dlog_print(2, 5, "MEGORE", "%s: %s(%d) > count(%d) > 2\n", "a.cpp", "f", 7, 3);
    const std::vector<LogLine> lines = take_log();
    ASSERT_EQ(lines.size(), 1U);
    EXPECT_EQ(lines[0], (LogLine{2, 5, "MEGORE", "a.cpp", "f", 7, "count(3) > 2\n"}));
    EXPECT_TRUE(take_log().empty());
}

TEST(Capture, FailsATestThatAsksForAnotherFeature) {
    bool enabled = false;
    EXPECT_NONFATAL_FAILURE(system_info_get_custom_bool("other", &enabled), "telephony.ims");
}

TEST(Malformed, LeavesOutTheShapeThatIsExpected) {
    std::set<std::string> types;
    for (const Malformed &malformed : malformed_for("(ii)")) {
        EXPECT_TRUE(types.insert(malformed.type).second) << malformed.type;
        EXPECT_EQ(malformed.body == nullptr, malformed.type.empty());
    }
    EXPECT_EQ(types.count("(ii)"), 0U);
    EXPECT_EQ(types.count("(i)"), 1U);
    EXPECT_EQ(types.count(""), 1U);
}

class Peer : public WithPeer {};

TEST_F(Peer, KnowsAnEmptyTupleFromNoParameters) {
    GDBusConnection *connection = peer().client().connection();
    for (GVariant *parameters : {static_cast<GVariant *>(nullptr), g_variant_new("()")})
        g_dbus_connection_call(connection, kServiceName, kPath, "test.Other", "Method", parameters,
                               nullptr, G_DBUS_CALL_FLAGS_NONE, -1, nullptr, nullptr, nullptr);
    const std::vector<Call> calls = peer().wait_for_calls("test.Other.Method", 2);
    EXPECT_FALSE(calls[0].has_signature);
    EXPECT_TRUE(calls[1].has_signature);
    EXPECT_EQ(calls[1].signature, "");
}

} // namespace
} // namespace test
