// SPDX-License-Identifier: Apache-2.0
// Ending notifications and releasing the handle inside a callback, with more signals waiting.
#include "tests/library/ims/notification_table.hpp"
#include "tests/support/with_peer.hpp"

#include <optional>

namespace test {
namespace {

class Reentrancy : public WithPeer {
  protected:
    void SetUp() override {
        WithPeer::SetUp();
        other_ = init(kSlot); // keeps the connection, and hears the same signals
    }

    // Three of each kind, none delivered yet.
    void queue_signals() {
        for (int i = 1; i <= 3; ++i) {
            emit(kCall, "CallEnded", share(g_variant_new("(ii)", i, 16)));
            emit(kCall, "CallAlerting", share(g_variant_new("(i)", i)));
        }
        queue_up();
    }

    static int session_of(void *event) {
        return static_cast<ims_call_session_s *>(event)->session_id;
    }

    ims_h other_ = nullptr;
};

TEST_F(Reentrancy, UnsetEndsItsOwnKindWithMoreWaiting) {
    NotificationRecorder alerting;
    NotificationRecorder ended{[](const Notified &notified, void *) {
        EXPECT_EQ(ims_unset_notification_cb(notified.handle, notified.id), IMS_ERROR_NONE);
    }};
    listen(IMS_NOTI_CALL_ENDED, ended);
    listen(IMS_NOTI_CALL_ALERTING, alerting);
    queue_signals();
    fence();
    EXPECT_EQ(ended.count(), 1U);
    EXPECT_EQ(alerting.count(), 3U);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(Reentrancy, UnsetEndsAnotherKindWithMoreWaiting) {
    NotificationRecorder alerting;
    NotificationRecorder ended{[&](const Notified &notified, void *event) {
        if (session_of(event) == 2) {
            EXPECT_EQ(ims_unset_notification_cb(notified.handle, IMS_NOTI_CALL_ALERTING),
                      IMS_ERROR_NONE);
        }
    }};
    listen(IMS_NOTI_CALL_ENDED, ended);
    listen(IMS_NOTI_CALL_ALERTING, alerting);
    queue_signals();
    fence();
    EXPECT_EQ(ended.count(), 3U);
    EXPECT_EQ(alerting.count(), 1U);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(Reentrancy, UnsetAllowsTheUserDataToBeReleasedAtOnce) {
    auto *recorder = new std::optional<NotificationRecorder>{};
    recorder->emplace();
    std::size_t delivered = 0;
    (*recorder)->inspect_with([&](const Notified &notified, void *) {
        ++delivered;
        EXPECT_EQ(ims_unset_notification_cb(notified.handle, notified.id), IMS_ERROR_NONE);
    });
    listen(IMS_NOTI_CALL_ENDED, **recorder);
    queue_signals();
    pump_until([&] { return delivered == 1; }, "the first signal");
    delete recorder;
    fence();
    EXPECT_EQ(delivered, 1U);
}

TEST_F(Reentrancy, UnsetOutsideACallbackDropsWhatIsWaiting) {
    NotificationRecorder ended;
    NotificationRecorder alerting;
    listen(IMS_NOTI_CALL_ENDED, ended);
    listen(IMS_NOTI_CALL_ALERTING, alerting);
    queue_signals();
    EXPECT_EQ(ims_unset_notification_cb(handle_, IMS_NOTI_CALL_ENDED), IMS_ERROR_NONE);
    fence();
    EXPECT_EQ(ended.count(), 0U);
    EXPECT_EQ(alerting.count(), 3U);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(Reentrancy, SetAfterUnsetInACallbackHearsWhatComesAfterwards) {
    std::vector<int> heard;
    NotificationRecorder second{
        [&](const Notified &, void *event) { heard.push_back(session_of(event)); }};
    NotificationRecorder first{[&](const Notified &notified, void *) {
        EXPECT_EQ(ims_unset_notification_cb(notified.handle, notified.id), IMS_ERROR_NONE);
        EXPECT_EQ(ims_set_notification_cb(notified.handle, notified.id,
                                          NotificationRecorder::callback, &second),
                  IMS_ERROR_NONE);
    }};
    listen(IMS_NOTI_CALL_ENDED, first);
    queue_signals();
    fence();
    shared().settle();
    emit(kCall, "CallEnded", parse("(ii)", "(9, 16)"));
    fence();
    EXPECT_EQ(first.count(), 1U);
    ASSERT_FALSE(heard.empty());
    EXPECT_EQ(heard.back(), 9);
}

TEST_F(Reentrancy, SetOfAnotherKindInACallbackWorks) {
    NotificationRecorder alerting;
    NotificationRecorder ended{[&](const Notified &notified, void *) {
        EXPECT_EQ(ims_set_notification_cb(notified.handle, IMS_NOTI_CALL_ALERTING,
                                          NotificationRecorder::callback, &alerting),
                  IMS_ERROR_NONE);
    }};
    listen(IMS_NOTI_CALL_ENDED, ended);
    emit(kCall, "CallEnded", parse("(ii)", "(1, 16)"));
    fence();
    shared().settle();
    emit(kCall, "CallAlerting", parse("(i)", "(1,)"));
    fence();
    EXPECT_EQ(ended.count(), 1U);
    EXPECT_EQ(alerting.count(), 1U);
}

TEST_F(Reentrancy, DeinitEndsEveryKindWithMoreWaiting) {
    NotificationRecorder others;
    listen(other_, IMS_NOTI_CALL_ENDED, others);
    NotificationRecorder alerting;
    NotificationRecorder ended{[this](const Notified &notified, void *) {
        forget(notified.handle);
        EXPECT_EQ(ims_deinit(notified.handle), IMS_ERROR_NONE);
    }};
    listen(IMS_NOTI_CALL_ENDED, ended);
    listen(IMS_NOTI_CALL_ALERTING, alerting);
    queue_signals();
    fence();
    EXPECT_EQ(ended.count(), 1U);
    EXPECT_EQ(alerting.count(), 0U);
    EXPECT_EQ(others.count(), 3U);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(Reentrancy, DeinitOfTheLastHandleInACallbackDropsTheConnection) {
    deinit(other_);
    NotificationRecorder ended{[this](const Notified &notified, void *) {
        forget(notified.handle);
        EXPECT_EQ(ims_deinit(notified.handle), IMS_ERROR_NONE);
    }};
    NotificationRecorder alerting;
    listen(IMS_NOTI_CALL_ENDED, ended);
    listen(IMS_NOTI_CALL_ALERTING, alerting);
    queue_signals();
    pump_until([this] { return shared().is_gone(); }, "the connection to be dropped");
    pump_ready();
    EXPECT_EQ(ended.count(), 1U);
    EXPECT_EQ(alerting.count(), 0U);
}

TEST_F(Reentrancy, DeinitOfAnotherHandleInACallbackEndsItsKinds) {
    NotificationRecorder others;
    listen(other_, IMS_NOTI_CALL_ALERTING, others);
    NotificationRecorder ended{[this](const Notified &, void *event) {
        if (session_of(event) == 1) {
            forget(other_);
            EXPECT_EQ(ims_deinit(other_), IMS_ERROR_NONE);
        }
    }};
    listen(IMS_NOTI_CALL_ENDED, ended);
    queue_signals();
    fence();
    EXPECT_EQ(ended.count(), 3U);
    EXPECT_EQ(others.count(), 0U);
}

TEST_F(Reentrancy, DeinitOutsideACallbackDropsWhatIsWaiting) {
    NotificationRecorder ended;
    listen(IMS_NOTI_CALL_ENDED, ended);
    queue_signals();
    deinit(handle_);
    fence();
    EXPECT_EQ(ended.count(), 0U);
    EXPECT_TRUE(take_log().empty());
}

} // namespace
} // namespace test
