// SPDX-License-Identifier: Apache-2.0
// The signal callback called as the bus never calls it, and a table that fails.
#include "src/notifications.hpp"
#include "tests/library/ims/notification_table.hpp"
#include "tests/support/bus_observer.hpp"
#include "tests/support/expectations.hpp"
#include "tests/support/with_peer.hpp"

#include <dlfcn.h>

namespace test {
namespace {

// Removals from this one fail.
GHashTable *failing_table = nullptr;

class Routing : public WithPeer {
  protected:
    void SetUp() override {
        WithPeer::SetUp();
        listen(IMS_NOTI_CALL_ENDED, recorder_);
    }

    // As the bus does with every signal that the subscription is for.
    void route(void *user_data) { route(user_data, kCall, "CallEnded"); }

    void route(void *user_data, const char *interface, const char *member) {
        const GDBusSignalCallback callback = observed_subscriptions().at(0).callback;
        const Variant parameters = parse("(ii)", "(3, 16)");
        callback(nullptr, ":1.1", kPath, interface, member, parameters.get(), user_data);
    }

    // What the bus keeps for it.
    static ims_noti_cb_info_s &subscription() {
        return *static_cast<ims_noti_cb_info_s *>(observed_subscriptions().at(0).user_data);
    }

    NotificationRecorder recorder_;
};

TEST_F(Routing, GivesASignalToTheCallbackOfItsSubscription) {
    route(&subscription());
    ASSERT_EQ(recorder_.count(), 1U);
    EXPECT_EQ(recorder_.all()[0].handle, handle_);
    EXPECT_EQ(recorder_.all()[0].id, 0x209);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(Routing, LooksItsOwnSignalUpNowhere) {
    ims_noti_cb_info_s elsewhere = subscription();
    EXPECT_EQ(ims_unset_notification_cb(handle_, IMS_NOTI_CALL_ENDED), IMS_ERROR_NONE);
    route(&elsewhere);
    EXPECT_EQ(recorder_.count(), 1U);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(Routing, LogsASignalWithoutAnEntry) {
    route(&subscription(), kCall, "CallBusy");
    EXPECT_EQ(recorder_.count(), 0U);
    expect_one_line("ims.cpp", "on_signal_callback",
                    "can't find noti_str(org.kelvo.ims.Call:CallBusy) callback info");
}

TEST_F(Routing, LogsASignalOfAnotherInterface) {
    route(&subscription(), kPoc, "CallEnded");
    EXPECT_EQ(recorder_.count(), 0U);
    expect_one_line("ims.cpp", "on_signal_callback",
                    "can't find noti_str(org.kelvo.ims.Poc:CallEnded) callback info");
}

TEST_F(Routing, GivesASignalOfAnotherSubscriptionToItsCallback) {
    NotificationRecorder other;
    listen(IMS_NOTI_CALL_SWITCHED, other);
    route(&subscription(), kCall, "CallSwitched");
    EXPECT_EQ(recorder_.count(), 0U);
    ASSERT_EQ(other.count(), 1U);
    EXPECT_EQ(other.all()[0].id, IMS_NOTI_CALL_SWITCHED);
}

TEST_F(Routing, LogsASignalOfNoSubscription) {
    route(nullptr);
    EXPECT_EQ(recorder_.count(), 0U);
    expect_one_line("ims.cpp", "on_signal_callback", "Invalid parameter");
}

// The call decoder returns for it without a line.
TEST_F(Routing, GivesTheDecoderAnIdThatNoEventHas) {
    ims_noti_cb_info_s unheard_of = subscription();
    const ims::Notification no_event{0, "CallEnded", nullptr};
    unheard_of.row = &no_event;
    route(&unheard_of);
    EXPECT_EQ(recorder_.count(), 0U);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(Routing, ReportsAnEntryThatCannotBeRemoved) {
    failing_table = handle_->noti_table.get();
    EXPECT_EQ(ims_unset_notification_cb(handle_, IMS_NOTI_CALL_ENDED), IMS_ERROR_OPERATION_FAILED);
    failing_table = nullptr;
    expect_one_line("ims.cpp", "ims_unset_notification_cb",
                    "Fail to deregister noti_str [org.kelvo.ims.Call:CallEnded]");
    EXPECT_TRUE(observed_subscriptions().at(0).is_ended);
}

TEST_F(Routing, UnsetRefusesAHandleWithoutAConnection) {
    auto connection = std::move(handle_->connection);
    EXPECT_EQ(ims_unset_notification_cb(handle_, IMS_NOTI_CALL_ENDED), IMS_ERROR_INVALID_PARAMETER);
    expect_one_line("ims.cpp", "ims_unset_notification_cb", "Invalid parameter");
    handle_->connection = std::move(connection);
}

} // namespace
} // namespace test

// In front of GLib's: removes the entry and says, when the test wants it, that it did not.
extern "C" __attribute__((visibility("default"))) gboolean g_hash_table_remove(GHashTable *table,
                                                                               gconstpointer key) {
    const auto real =
        reinterpret_cast<decltype(&g_hash_table_remove)>(dlsym(RTLD_NEXT, "g_hash_table_remove"));
    return real(table, key) && table != test::failing_table;
}
