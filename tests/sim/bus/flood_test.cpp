// SPDX-License-Identifier: Apache-2.0
// Applications that ask for much at once, and those that do not wait for the answer.
#include "tests/sim/bus/bus_client.hpp"
#include "tests/support/pump.hpp"

#include <fmt/format.h>

namespace sim::test {
namespace {

using testing::HasSubstr;
using testing::Not;

constexpr int kRequests = 100; // a bus lets a connection wait for some more at once

class BusFlood : public Served {
  protected:
    // At once, so that requests queue up; the answers are noted as they come.
    void ask(Client &client, const char *interface, const char *method, const char *arguments) {
        g_dbus_connection_call(
            client.connection(), kServiceName, slot_path(0).c_str(), interface, method,
            g_variant_parse(nullptr, arguments, nullptr, nullptr, nullptr), nullptr,
            G_DBUS_CALL_FLAGS_NONE, -1, nullptr,
            [](GObject *connection, GAsyncResult *result, gpointer answers) {
                const auto reply = Variant::adopt(
                    g_dbus_connection_call_finish(G_DBUS_CONNECTION(connection), result, nullptr));
                static_cast<std::vector<std::string> *>(answers)->push_back(reply ? reply.print()
                                                                                  : "none");
            },
            &answers_);
    }

    void wait_for_answers() {
        ::test::pump_until([this] { return answers_.size() >= kRequests; }, "all answers");
    }

    std::vector<std::string> answers_;
};

TEST_F(BusFlood, IsAnsweredWholeAndInOrder) {
    std::vector<std::string> expected;
    for (int i = 1; i <= kRequests; ++i) {
        ask(*client_, kRegistration, "RegisterApplication", "(0, 'flood')");
        expected.push_back(fmt::format("(0, {})", i));
    }
    wait_for_answers();
    EXPECT_EQ(answers_, expected);
}

TEST_F(BusFlood, OfOneWhoLeavesInTheMiddleHarmsNobody) {
    client_->register_application(0);
    auto other = another();
    for (int i = 0; i < kRequests; ++i)
        ask(*other, "org.kelvo.ims.Settings", "GetGlobalSettings", "('default',)");
    g_dbus_connection_flush_sync(other->connection(), nullptr, nullptr);
    const auto name = other->unique_name();
    other->close();
    client_->wait_until_gone(name);
    EXPECT_EQ(client_->call(0, kCall, "SwapCall", "(1,)").body, "(13,)");
    // Its calls have failed by now; their answers must not outlive what they are noted in.
    wait_for_answers();
}

TEST_F(BusFlood, OfManyWhoComeAndGoLeavesNoApplicationBehind) {
    for (int i = 1; i <= 50; ++i) {
        const auto other = another();
        EXPECT_EQ(other->register_application(0), i);
        other->close();
        client_->wait_until_gone(other->unique_name());
    }
    const int last = client_->register_application(0);
    EXPECT_EQ(last, 51);
    for (int i = 1; i < last; ++i)
        EXPECT_EQ(client_->call(0, kCall, "SwapCall", fmt::format("({},)", i)).body, "(11,)") << i;
}

// The log of this program is a pipe, and nobody empties it.
TEST_F(BusFlood, OfTheLogThatNobodyReadsStopsNobody) {
    constexpr int kRounds = 150;
    for (int i = 0; i < kRounds; ++i)
        EXPECT_EQ(
            client_->call(0, "org.kelvo.ims.Settings", "GetGlobalSettings", "('default',)").type,
            "(ia{sv})");
    // Once there is room again it says so, with the next line.
    EXPECT_THAT(program_->read_errors("GetGlobalSettings"), Not(HasSubstr("lost")));
    client_->register_application(0);
    EXPECT_THAT(program_->read_errors("RegisterApplication"), HasSubstr("lines are lost"));
}

} // namespace
} // namespace sim::test
