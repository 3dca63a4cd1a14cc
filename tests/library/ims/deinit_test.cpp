// SPDX-License-Identifier: Apache-2.0
// Releasing handles.
#include "tests/support/bus_observer.hpp"
#include "tests/support/expectations.hpp"
#include "tests/support/with_peer.hpp"

#include <algorithm>

namespace test {
namespace {

class Deinit : public WithPeer {
  protected:
    // Whether every subscription made so far has been ended.
    static bool all_ended() {
        const auto subscriptions = observed_subscriptions();
        return std::all_of(subscriptions.begin(), subscriptions.end(),
                           [](const ObservedSubscription &one) { return one.is_ended; });
    }
};

TEST(DeinitArguments, ANullHandleIsRefused) {
    EXPECT_EQ(ims_deinit(nullptr), IMS_ERROR_INVALID_PARAMETER);
    expect_one_line("ims.cpp", "ims_deinit", "Invalid parameter");
}

TEST_F(Deinit, EndsThreeNotificationsBeforeItDropsTheConnection) {
    NotificationRecorder recorder;
    listen(IMS_NOTI_CALL_ALERTING, recorder);
    listen(IMS_NOTI_CALL_ENDED, recorder);
    listen(IMS_NOTI_CALL_HELD, recorder);
    ASSERT_EQ(observed_subscriptions().size(), 3U);
    EXPECT_FALSE(all_ended());
    deinit(handle_); // ending a subscription of a dropped connection is a GLib critical
    EXPECT_TRUE(all_ended());
    EXPECT_TRUE(take_log().empty());
    pump_until([this] { return shared().is_gone(); }, "the connection to be dropped");
}

TEST_F(Deinit, TellsTheServiceNothing) {
    deinit(handle_);
    pump_until([this] { return shared().is_gone(); }, "the connection to be dropped");
    peer().client().settle();
    EXPECT_EQ(peer().calls().size(), 1U); // the registration
}

TEST_F(Deinit, LeavesOtherHandlesAtWork) {
    peer().on("org.kelvo.ims.Call.HoldCall", reply("(i)", "(0,)"));
    const ims_h other = init(4);
    NotificationRecorder recorder;
    listen(other, IMS_NOTI_CALL_ENDED, recorder);
    deinit(handle_);

    ResponseRecorder response;
    EXPECT_EQ(ims_call_hold_call(other, 7, ResponseRecorder::callback, &response), IMS_ERROR_NONE);
    peer().emit_signal("/org/kelvo/ims/sub4", "org.kelvo.ims.Call", "CallEnded",
                       parse("(ii)", "(1, 2)"));
    fence();
    EXPECT_EQ(response.count(), 1U);
    EXPECT_EQ(recorder.count(), 1U);
}

TEST_F(Deinit, DoesNotReleaseTheHandleWhileTheGateIsNotOn) {
    NotificationRecorder recorder;
    listen(IMS_NOTI_CALL_ENDED, recorder);
    set_gate(Gate::kOff);
    EXPECT_EQ(ims_deinit(handle_), IMS_ERROR_NOT_SUPPORTED);
    set_gate(Gate::kFailing);
    EXPECT_EQ(ims_deinit(handle_), IMS_ERROR_OPERATION_FAILED);
    set_gate(Gate::kOn);
    emit("org.kelvo.ims.Call", "CallEnded", parse("(ii)", "(1, 2)"));
    fence();
    EXPECT_EQ(recorder.count(), 1U);
}

TEST_F(Deinit, DoesNotCancelPendingRequests) {
    peer().on("org.kelvo.ims.Call.HoldCall", Silence{});
    const ims_h other = init(4);
    ResponseRecorder &recorder = lasting_recorder();
    EXPECT_EQ(ims_call_hold_call(handle_, 7, ResponseRecorder::callback, &recorder),
              IMS_ERROR_NONE);
    const auto number = peer().wait_for_calls("org.kelvo.ims.Call.HoldCall", 1).front().number;
    const ims_h released = handle_;
    deinit(handle_);
    fence();
    EXPECT_EQ(recorder.count(), 0U);
    peer().answer(number, reply("(i)", "(0,)"));
    fence();
    ASSERT_EQ(recorder.count(), 1U);
    EXPECT_EQ(recorder.last().handle, released);
    EXPECT_EQ(recorder.last().result, 0);
    deinit(other);
}

TEST_F(Deinit, IsAllowedInAResponseCallback) {
    peer().on("org.kelvo.ims.Call.ChangeCall", reply("(iis)", "(0, 7, 'text')"));
    init(4); // keeps the connection
    ResponseRecorder recorder{[this](const Response &response, void *data) {
        forget(response.handle);
        EXPECT_EQ(ims_deinit(response.handle), IMS_ERROR_NONE);
        free(static_cast<ims_call_change_result_s *>(data)->text_1);
    }};
    const ims_call_pair_info_s info{1, 2};
    EXPECT_EQ(ims_call_change_call(handle_, &info, ResponseRecorder::callback, &recorder),
              IMS_ERROR_NONE);
    fence();
    EXPECT_EQ(recorder.count(), 1U);
}

TEST_F(Deinit, LetsANewHandleRegisterAgain) {
    deinit(handle_);
    pump_until([this] { return shared().is_gone(); }, "the connection to be dropped");
    peer().on(kRegisterApplication, reply("(ii)", "(0, 43)"));
    handle_ = init();
    EXPECT_EQ(ims_call_hold_call(handle_, 7, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(requests().back(), "(ii)", "(43, 7)");
}

} // namespace
} // namespace test
