// SPDX-License-Identifier: Apache-2.0
// What watches over the other tests does fail them.
#include "platform.h"
#include "tests/support/glib_watch.hpp"
#include "tests/support/malformed.hpp"
#include "tests/support/platform_capture.hpp"
#include "tests/support/process.hpp"
#include "tests/support/with_peer.hpp"

#include <gmock/gmock.h>
#include <gtest/gtest-spi.h>

#include <csignal>
#include <cstdlib>
#include <set>
#include <system_error>

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

TEST(ProcessRunner, TellsWhatAChildWroteAndHowItEnded) {
    Process child{{"sh", "-c", "echo $GREETING; echo two; echo three >&2; exit 3"},
                  {{"GREETING", "one"}}};
    EXPECT_EQ(child.read_line(), "one");
    child.wait_for_error("three");
    EXPECT_EQ(child.wait(), 3);
    EXPECT_EQ(child.output(), "one\ntwo\n");
    EXPECT_EQ(child.read_errors(), "three\n");
    Process killed{{"sh", "-c", "kill -TERM $$"}};
    EXPECT_EQ(killed.wait(), 128 + SIGTERM);
}

TEST(ProcessRunner, SaysWhatDoesNotCome) {
    Process child{{"echo", "something"}};
    try {
        child.wait_for_output("something else");
        FAIL() << "it came";
    } catch (const std::runtime_error &why) {
        EXPECT_STREQ(why.what(), "ended without \"something else\"; output: something\nerror: ");
    }
    EXPECT_THROW(Process{{"/nonexistent/program"}}, std::system_error);
}

TEST(ProcessRunner, HasNoInputUnlessItIsAskedFor) {
    EXPECT_EQ(Process{{"cat"}}.wait(), 0);
    Process reader{{"sh", "-c", "read line; exit 5"}, {}, {.has_input = true}};
    reader.close_input();
    EXPECT_EQ(reader.wait(), 5);
}

TEST(ProcessRunner, LeavesNoChildBehind) {
    pid_t pid = -1;
    {
        const Process child{{"sleep", "1000"}};
        pid = child.pid();
        EXPECT_EQ(kill(pid, 0), 0);
    }
    EXPECT_EQ(kill(pid, 0), -1);
}

TEST(PrivateBusOfATest, IsTheSystemBusWhileItLives) {
    const auto system_bus = [] {
        const char *address = std::getenv("DBUS_SYSTEM_BUS_ADDRESS");
        return std::string{address != nullptr ? address : "none"};
    };
    EXPECT_EQ(system_bus(), "none");
    {
        const PrivateBus first;
        EXPECT_EQ(system_bus(), first.address());
        {
            const PrivateBus second;
            EXPECT_EQ(system_bus(), second.address());
        }
        EXPECT_EQ(system_bus(), first.address());
    }
    EXPECT_EQ(system_bus(), "none");
}

TEST(BusClientOfATest, SeesNamesComeAndGo) {
    const PrivateBus bus;
    BusClient one{bus.address()};
    BusClient other{bus.address()};
    EXPECT_FALSE(one.has_owner(kServiceName));
    EXPECT_TRUE(other.own_name(kServiceName));
    one.wait_until_owned(kServiceName);
    other.close();
    one.wait_until_gone(kServiceName);
    EXPECT_FALSE(one.has_owner(other.unique_name()));
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
