// SPDX-License-Identifier: Apache-2.0
// Asking for notifications and ending them.
#include "src/notifications.hpp"
#include "tests/library/ims/notification_table.hpp"
#include "tests/support/bus_observer.hpp"
#include "tests/support/expectations.hpp"
#include "tests/support/with_peer.hpp"

#include <iterator>
#include <set>

namespace test {
namespace {

static_assert(std::size(kNotifications) == 48);

const ims_notification_cb kCallback = NotificationRecorder::callback;

std::string signal_string(const NotificationRow &row) {
    return std::string{row.interface} + ":" + row.member;
}

// What the library keeps of a subscription, and is given with each of its signals.
const ims_noti_cb_info_s &kept_of(const ObservedSubscription &subscription) {
    return *static_cast<const ims_noti_cb_info_s *>(subscription.user_data);
}

class Registry : public WithPeer {
  protected:
    void expect_refused_to_set(int id, const std::string &message) {
        EXPECT_EQ(ims_set_notification_cb(handle_, id, kCallback, nullptr),
                  IMS_ERROR_INVALID_PARAMETER);
        expect_one_line("ims.cpp", "ims_set_notification_cb", message);
    }

    void expect_refused_to_unset(int id, const std::string &message) {
        EXPECT_EQ(ims_unset_notification_cb(handle_, id), IMS_ERROR_INVALID_PARAMETER);
        expect_one_line("ims.cpp", "ims_unset_notification_cb", message);
    }
};

class Notifications : public Registry, public ::testing::WithParamInterface<NotificationRow> {};

std::string member_name(const ::testing::TestParamInfo<NotificationRow> &tested) {
    return tested.param.member;
}

INSTANTIATE_TEST_SUITE_P(All, Notifications, ::testing::ValuesIn(kNotifications), member_name);

TEST_P(Notifications, AreSubscribedToExactlyTheirSignal) {
    const NotificationRow &row = GetParam();
    EXPECT_EQ(row.name, row.id);
    EXPECT_EQ(ims_set_notification_cb(handle_, row.id, kCallback, nullptr), IMS_ERROR_NONE);
    const auto subscriptions = observed_subscriptions();
    ASSERT_EQ(subscriptions.size(), 1U);
    EXPECT_EQ(subscriptions[0].sender, "org.kelvo.ims");
    EXPECT_EQ(subscriptions[0].interface, row.interface);
    EXPECT_EQ(subscriptions[0].member, row.member);
    EXPECT_EQ(subscriptions[0].path, kPath);
    EXPECT_FALSE(subscriptions[0].has_argument_filter);
    EXPECT_EQ(subscriptions[0].flags, G_DBUS_SIGNAL_FLAGS_NONE);
    const ims_noti_cb_info_s &kept = kept_of(subscriptions[0]);
    EXPECT_EQ(kept.subscription_id, subscriptions[0].id);
    EXPECT_EQ(kept.callback, kCallback);
    EXPECT_EQ(kept.user_data, nullptr);
    EXPECT_EQ(kept.handle, handle_);
    EXPECT_EQ(kept.row->id, row.id);
    EXPECT_FALSE(subscriptions[0].has_free_function);
    EXPECT_FALSE(subscriptions[0].is_ended);
    EXPECT_TRUE(take_log().empty());
    EXPECT_TRUE(requests().empty());
}

TEST_P(Notifications, AreRefusedTwiceEndedOnceAndAcceptedAgain) {
    const NotificationRow &row = GetParam();
    expect_refused_to_unset(row.id, "noti hasn't registered");

    EXPECT_EQ(ims_set_notification_cb(handle_, row.id, kCallback, nullptr), IMS_ERROR_NONE);
    expect_refused_to_set(row.id, "noti_str[" + signal_string(row) + "] is already registered");
    EXPECT_EQ(observed_subscriptions().size(), 1U);

    EXPECT_EQ(ims_unset_notification_cb(handle_, row.id), IMS_ERROR_NONE);
    EXPECT_TRUE(observed_subscriptions()[0].is_ended);
    expect_refused_to_unset(row.id, "noti hasn't registered");

    EXPECT_EQ(ims_set_notification_cb(handle_, row.id, kCallback, nullptr), IMS_ERROR_NONE);
    EXPECT_EQ(observed_subscriptions().size(), 2U);
    EXPECT_FALSE(observed_subscriptions()[1].is_ended);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(Registry, TakesAllNotificationsAtOnceAndDeinitEndsThem) {
    std::set<guint> ids;
    for (const NotificationRow &row : kNotifications)
        EXPECT_EQ(ims_set_notification_cb(handle_, row.id, kCallback, nullptr), IMS_ERROR_NONE);
    for (const auto &subscription : observed_subscriptions())
        EXPECT_TRUE(ids.insert(subscription.id).second);
    EXPECT_EQ(ids.size(), 48U);
    deinit(handle_);
    for (const auto &subscription : observed_subscriptions())
        EXPECT_TRUE(subscription.is_ended) << subscription.member;
}

TEST_F(Registry, EndsOneNotificationAndNoOther) {
    for (const int id : {0x202, 0x203, 0x204})
        EXPECT_EQ(ims_set_notification_cb(handle_, id, kCallback, nullptr), IMS_ERROR_NONE);
    EXPECT_EQ(ims_unset_notification_cb(handle_, 0x203), IMS_ERROR_NONE);
    const auto subscriptions = observed_subscriptions();
    EXPECT_FALSE(subscriptions[0].is_ended);
    EXPECT_TRUE(subscriptions[1].is_ended);
    EXPECT_FALSE(subscriptions[2].is_ended);
}

TEST_F(Registry, RefusesUnknownIds) {
    for (const int id : kUnknownIds) {
        SCOPED_TRACE(id);
        expect_refused_to_set(id, "Invalid parameter");
        expect_refused_to_unset(id, "Invalid parameter");
    }
    EXPECT_TRUE(observed_subscriptions().empty());
}

TEST_F(Registry, RefusesTheFirstIdAfterTheConferencesAndTakesTheDtmfEvent) {
    expect_refused_to_set(0x214, "Invalid parameter");
    EXPECT_EQ(ims_set_notification_cb(handle_, 0x223, kCallback, nullptr), IMS_ERROR_NONE);
}

TEST_F(Registry, RefusesANullCallbackForAValidId) {
    EXPECT_EQ(ims_set_notification_cb(handle_, 0x201, nullptr, nullptr),
              IMS_ERROR_INVALID_PARAMETER);
    expect_one_line("ims.cpp", "ims_set_notification_cb", "Invalid parameter");
    EXPECT_TRUE(observed_subscriptions().empty());
    expect_refused_to_unset(0x201, "noti hasn't registered");
}

TEST_F(Registry, RefusesANullHandle) {
    EXPECT_EQ(ims_set_notification_cb(nullptr, 0x201, kCallback, nullptr),
              IMS_ERROR_INVALID_PARAMETER);
    expect_one_line("ims.cpp", "ims_set_notification_cb", "Invalid parameter");
    EXPECT_EQ(ims_unset_notification_cb(nullptr, 0x201), IMS_ERROR_INVALID_PARAMETER);
    expect_one_line("ims.cpp", "ims_unset_notification_cb", "Invalid parameter");
    EXPECT_EQ(ims_unset_notification_cb(nullptr, 0x214), IMS_ERROR_INVALID_PARAMETER);
    expect_one_line("ims.cpp", "ims_unset_notification_cb", "Invalid parameter");
}

TEST_F(Registry, KeepsTheFirstCallbackWhenTheSecondIsRefused) {
    NotificationRecorder first{[](const Notified &, void *event) {
        const auto &record = *static_cast<ims_call_incoming_s *>(event);
        for (char *text : {record.number, record.text_1, record.text_2, record.text_3,
                           record.text_4, record.text_5})
            free(text);
    }};
    NotificationRecorder second;
    listen(0x201, first);
    EXPECT_EQ(ims_set_notification_cb(handle_, 0x201, kCallback, &second),
              IMS_ERROR_INVALID_PARAMETER);
    emit(kCall, "CallIncomingInd",
         parse("(isisssssb)", "(1, 'a', 2, 'b', 'c', 'd', 'e', 'f', true)"));
    fence();
    EXPECT_EQ(first.count(), 1U);
    EXPECT_EQ(second.count(), 0U);
}

TEST_F(Registry, DeliversNothingAfterUnsetAndAgainAfterSet) {
    NotificationRecorder first;
    listen(IMS_NOTI_CALL_ENDED, first);
    const auto emit_ended = [this] { emit(kCall, "CallEnded", parse("(ii)", "(3, 16)")); };
    emit_ended();
    fence();
    EXPECT_EQ(first.count(), 1U);

    EXPECT_EQ(ims_unset_notification_cb(handle_, IMS_NOTI_CALL_ENDED), IMS_ERROR_NONE);
    emit_ended();
    fence();
    EXPECT_EQ(first.count(), 1U);
    EXPECT_TRUE(take_log().empty()); // the subscription is gone: nothing to log either

    NotificationRecorder second;
    listen(IMS_NOTI_CALL_ENDED, second);
    emit_ended();
    fence();
    EXPECT_EQ(first.count(), 1U);
    EXPECT_EQ(second.count(), 1U);
}

TEST_F(Registry, EachHandleHasItsOwnNotifications) {
    const ims_h other = init(kSlot);
    EXPECT_EQ(ims_set_notification_cb(handle_, 0x209, kCallback, nullptr), IMS_ERROR_NONE);
    EXPECT_EQ(ims_unset_notification_cb(other, 0x209), IMS_ERROR_INVALID_PARAMETER);
    take_log();
    EXPECT_EQ(ims_set_notification_cb(other, 0x209, kCallback, nullptr), IMS_ERROR_NONE);
    EXPECT_EQ(kept_of(observed_subscriptions()[0]).handle, handle_);
    EXPECT_EQ(kept_of(observed_subscriptions()[1]).handle, other);
}

} // namespace
} // namespace test
