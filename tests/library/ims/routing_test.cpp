// SPDX-License-Identifier: Apache-2.0
// The signal callback called as the bus never calls it, and a table that fails.
#include "src/client.hpp"
#include "tests/support/bus_observer.hpp"
#include "tests/support/expectations.hpp"
#include "tests/support/with_peer.hpp"

#include <dlfcn.h>

namespace test {
namespace {

// Removals from this one fail.
GHashTable *failing_table = nullptr;

constexpr const char *kInterface = "org.kelvo.ims.Call";

class Routing : public WithPeer {
  protected:
    void SetUp() override {
        WithPeer::SetUp();
        listen(IMS_NOTI_CALL_ENDED, recorder_);
    }

    // What the subscription would be called with.
    void route(const char *interface, const char *member, void *user_data) {
        const GDBusSignalCallback callback = observed_subscriptions().at(0).callback;
        const Variant parameters = parse("(ii)", "(3, 16)");
        callback(nullptr, ":1.1", kPath, interface, member, parameters.get(), user_data);
    }

    // An entry that no id leads to.
    void insert(const char *noti_str) {
        auto *entry = g_new0(ims_noti_cb_info_s, 1);
        entry->callback = NotificationRecorder::callback;
        entry->user_data = &recorder_;
        g_hash_table_insert(handle_->noti_table.get(), g_strdup(noti_str), entry);
    }

    void remove(const char *noti_str) {
        EXPECT_TRUE(g_hash_table_remove(handle_->noti_table.get(), noti_str));
    }

    NotificationRecorder recorder_;
};

TEST_F(Routing, FindsTheCallbackOfTheSignal) {
    route(kInterface, "CallEnded", handle_);
    ASSERT_EQ(recorder_.count(), 1U);
    EXPECT_EQ(recorder_.all()[0].id, 0x209);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(Routing, LogsANullHandle) {
    route(kInterface, "CallEnded", nullptr);
    EXPECT_EQ(recorder_.count(), 0U);
    expect_one_line("ims.cpp", "on_signal_callback", "Invalid parameter");
}

TEST_F(Routing, LogsASignalWithoutAnEntry) {
    route(kInterface, "CallBusy", handle_);
    EXPECT_EQ(recorder_.count(), 0U);
    expect_one_line("ims.cpp", "on_signal_callback",
                    "can't find noti_str(org.kelvo.ims.Call:CallBusy) callback info");
}

TEST_F(Routing, LogsASignalOfAnUnknownInterface) {
    insert("org.kelvo.ims.Other:CallEnded");
    route("org.kelvo.ims.Other", "CallEnded", handle_);
    EXPECT_EQ(recorder_.count(), 0U);
    expect_one_line("ims.cpp", "on_signal_callback", "unhandled signal!!");
    remove("org.kelvo.ims.Other:CallEnded");
}

// It gets the id 0, which the call decoder returns for without a line.
TEST_F(Routing, GivesAnEntryThatNoNotificationHasTheIdZero) {
    insert("org.kelvo.ims.Call:CallUnheardOf");
    route(kInterface, "CallUnheardOf", handle_);
    EXPECT_EQ(recorder_.count(), 0U);
    EXPECT_TRUE(take_log().empty());
    remove("org.kelvo.ims.Call:CallUnheardOf");
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
