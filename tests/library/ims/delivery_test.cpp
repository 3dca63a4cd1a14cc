// SPDX-License-Identifier: Apache-2.0
// When, where and in which order answers and notifications arrive.
#include "tests/library/ims/notification_table.hpp"
#include "tests/support/expectations.hpp"
#include "tests/support/with_peer.hpp"

#include <thread>

namespace test {
namespace {

constexpr const char *kHold = "org.kelvo.ims.Call.HoldCall";
constexpr const char *kResume = "org.kelvo.ims.Call.ResumeCall";

class Delivery : public WithPeer {
  protected:
    void hold(ResponseRecorder &recorder, int session = 7) {
        EXPECT_EQ(ims_call_hold_call(handle_, session, ResponseRecorder::callback, &recorder),
                  IMS_ERROR_NONE);
    }

    void emit_ended(int session) {
        emit(kCall, "CallEnded", share(g_variant_new("(ii)", session, 16)));
    }
};

TEST_F(Delivery, AnAnswerThatComesLateStillArrives) {
    peer().on(kHold, Silence{});
    ResponseRecorder &recorder = lasting_recorder();
    hold(recorder);
    const auto number = peer().wait_for_calls(kHold, 1).front().number;
    fence();
    EXPECT_EQ(recorder.count(), 0U);
    peer().answer(number, reply("(i)", "(7,)"));
    fence();
    ASSERT_EQ(recorder.count(), 1U);
    EXPECT_EQ(recorder.last().result, 7);
}

TEST_F(Delivery, RequestsReachTheServiceInTheOrderInWhichTheyWereMade) {
    for (int i = 0; i < 200; ++i)
        EXPECT_EQ(ims_call_hold_call(handle_, i, nullptr, nullptr), IMS_ERROR_NONE);
    const std::vector<Call> calls = requests();
    ASSERT_EQ(calls.size(), 200U);
    for (std::size_t i = 0; i < calls.size(); ++i)
        expect_sent(calls[i], "(ii)", "(42, " + std::to_string(i) + ")");
}

TEST_F(Delivery, AnswersArriveInTheOrderInWhichTheyWereGiven) {
    peer().on(kHold, Silence{});
    std::vector<int> arrived;
    std::list<ResponseRecorder> recorders;
    for (int i = 0; i < 5; ++i) {
        recorders.emplace_back([&arrived, i](const Response &response, void *) {
            EXPECT_EQ(response.result, 100 + i);
            arrived.push_back(i);
        });
        hold(recorders.back(), i);
    }
    const std::vector<Call> calls = peer().wait_for_calls(kHold, 5);
    const std::vector<int> order{3, 0, 4, 1, 2};
    for (const int i : order) {
        const Variant result = share(g_variant_new("(i)", 100 + i));
        peer().answer(calls[static_cast<std::size_t>(i)].number, reply_with(result.get()));
    }
    fence();
    EXPECT_EQ(arrived, order);
}

TEST_F(Delivery, AnswersAndSignalsKeepTheOrderInWhichTheServiceSentThem) {
    peer().on(kHold, Silence{});
    std::string arrived;
    NotificationRecorder signals{[&](const Notified &, void *event) {
        arrived += std::to_string(static_cast<ims_call_ended_s *>(event)->session_id);
    }};
    listen(IMS_NOTI_CALL_ENDED, signals);
    std::list<ResponseRecorder> recorders;
    for (const char *name : {"a", "b", "c"}) {
        recorders.emplace_back([&arrived, name](const Response &, void *) { arrived += name; });
        hold(recorders.back());
    }
    const std::vector<Call> calls = peer().wait_for_calls(kHold, 3);
    emit_ended(1);
    peer().answer(calls[0].number, reply("(i)", "(0,)"));
    emit_ended(2);
    emit_ended(3);
    peer().answer(calls[2].number, failure(error_name::kFailed));
    peer().answer(calls[1].number, reply("(i)", "(0,)"));
    emit_ended(4);
    fence();
    EXPECT_EQ(arrived, "1a23cb4");
}

TEST_F(Delivery, AThousandRequestsAtOnceAreAllAnswered) {
    peer().on(kHold, reply("(i)", "(0,)"));
    ResponseRecorder recorder;
    for (int i = 0; i < 1000; ++i)
        hold(recorder, i);
    pump_until([&] { return recorder.count() >= 1000; }, "a thousand answers");
    fence();
    EXPECT_EQ(recorder.count(), 1000U);
}

TEST_F(Delivery, ARequestCanBeMadeInACallback) {
    peer().on(kHold, reply("(i)", "(0,)"));
    peer().on(kResume, reply("(i)", "(5,)"));
    ResponseRecorder second;
    ResponseRecorder first{[&](const Response &response, void *) {
        EXPECT_EQ(ims_call_resume_call(response.handle, 7, ResponseRecorder::callback, &second),
                  IMS_ERROR_NONE);
    }};
    hold(first);
    pump_until([&] { return second.count() == 1; }, "the second answer");
    EXPECT_EQ(first.count(), 1U);
    EXPECT_EQ(second.last().result, 5);
}

TEST_F(Delivery, ASynchronousQueryInACallbackReturnsItsAnswer) {
    peer().on(kHold, reply("(i)", "(0,)"));
    peer().on("org.kelvo.ims.Call.CallListInfo",
              reply("(iuaa{sv})", "(0, 1, [{'session_id': <7>}])"));
    ResponseRecorder recorder{[&](const Response &response, void *) {
        ims_call_list_info_s list{};
        EXPECT_EQ(ims_call_get_call_list_info(response.handle, &list), IMS_ERROR_NONE);
        EXPECT_EQ(list.count, 1U);
    }};
    hold(recorder);
    fence();
    EXPECT_EQ(recorder.count(), 1U);
}

TEST_F(Delivery, AServiceThatIsGoneFailsTheRequest) {
    peer_.reset();
    ResponseRecorder recorder;
    hold(recorder);
    pump_until([&] { return recorder.count() == 1; }, "the failure");
    EXPECT_EQ(recorder.last().result, 1);
    EXPECT_TRUE(take_log().empty());
    ims_call_list_info_s list{};
    EXPECT_EQ(ims_call_get_call_list_info(handle_, &list), IMS_ERROR_OPERATION_FAILED);
}

// The bus's own refusal of a request.
class DeniedByTheBus : public Delivery {
  protected:
    DeniedByTheBus() {
        policy_rules_ = "<deny send_destination=\"org.kelvo.ims\""
                        " send_interface=\"org.kelvo.ims.Call\"/>\n";
    }
};

TEST_F(DeniedByTheBus, IsARefusalLikeTheServices) {
    ResponseRecorder recorder;
    hold(recorder);
    pump_until([&] { return recorder.count() == 1; }, "the refusal");
    EXPECT_EQ(recorder.last().result, 2);
    expect_one_line("ims_call.cpp", "on_response_call_hold_call", "Permission denied");

    ims_call_list_info_s list{};
    EXPECT_EQ(ims_call_get_call_list_info(handle_, &list), IMS_ERROR_PERMISSION_DENIED);
    expect_one_line("ims_call.cpp", "ims_call_get_call_list_info", "Permission denied");
    EXPECT_TRUE(requests().empty());
}

TEST_F(Delivery, AServiceThatEndsWhileARequestIsPendingFailsIt) {
    peer().on(kHold, Silence{});
    ResponseRecorder recorder;
    hold(recorder);
    peer().wait_for_calls(kHold, 1);
    peer_.reset();
    pump_until([&] { return recorder.count() == 1; }, "the failure");
    EXPECT_EQ(recorder.last().result, 1);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(Delivery, ABusThatEndsWhileARequestIsPendingFailsIt) {
    peer().on(kHold, Silence{});
    NotificationRecorder signals;
    listen(IMS_NOTI_CALL_ENDED, signals);
    ResponseRecorder recorder;
    hold(recorder);
    peer().wait_for_calls(kHold, 1);
    bus().stop();
    pump_until([&] { return recorder.count() == 1; }, "the failure");
    EXPECT_EQ(recorder.last().result, 1);
    ims_call_list_info_s list{};
    EXPECT_EQ(ims_call_get_call_list_info(handle_, &list), IMS_ERROR_OPERATION_FAILED);
    EXPECT_EQ(ims_unset_notification_cb(handle_, IMS_NOTI_CALL_ENDED), IMS_ERROR_NONE);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(Delivery, AServiceThatCameBackIsHeardAndAnswersAgain) {
    NotificationRecorder signals;
    listen(IMS_NOTI_CALL_ENDED, signals);
    peer_.reset();
    peer_.emplace(bus().address());
    shared().settle(); // has seen the new owner
    peer().on(kHold, reply("(i)", "(0,)"));
    ResponseRecorder recorder;
    hold(recorder);
    emit_ended(1);
    fence();
    EXPECT_EQ(signals.count(), 1U);
    ASSERT_EQ(recorder.count(), 1U);
    EXPECT_EQ(recorder.last().result, 0);
}

TEST_F(Delivery, AnAnswerArrivesInTheContextOfTheRequest) {
    peer().on(kHold, reply("(i)", "(0,)"));
    ResponseRecorder recorder;
    std::optional<ThreadDefaultContext> context{std::in_place};
    hold(recorder);
    const std::unique_ptr<GMainContext, decltype(&g_main_context_unref)> kept{
        g_main_context_ref(context->get()), g_main_context_unref};
    context.reset();
    fence(); // runs the default context only
    EXPECT_EQ(recorder.count(), 0U);
    pump_until([&] { return recorder.count() == 1; }, "the answer", kept.get());
}

TEST_F(Delivery, ANotificationArrivesInTheContextOfItsSubscription) {
    NotificationRecorder there;
    NotificationRecorder here;
    std::optional<ThreadDefaultContext> context{std::in_place};
    const std::unique_ptr<GMainContext, decltype(&g_main_context_unref)> kept{
        g_main_context_ref(context->get()), g_main_context_unref};
    listen(IMS_NOTI_CALL_ENDED, there);
    context.reset();
    listen(IMS_NOTI_CALL_ALERTING, here);
    emit_ended(1);
    emit(kCall, "CallAlerting", parse("(i)", "(1,)"));
    fence();
    EXPECT_EQ(there.count(), 0U);
    EXPECT_EQ(here.count(), 1U);
    pump_until([&] { return there.count() == 1; }, "the notification", kept.get());
    pump_ready(kept.get());
    EXPECT_EQ(there.count(), 1U);
}

TEST_F(Delivery, AHandleWorksWhollyInAnotherThread) {
    peer().on(kHold, reply("(i)", "(0,)"));
    std::thread worker{[this] {
        const ThreadDefaultContext context;
        ims_h handle = nullptr;
        ASSERT_EQ(ims_init(5, &handle), IMS_ERROR_NONE);
        NotificationRecorder signals;
        ASSERT_EQ(ims_set_notification_cb(handle, IMS_NOTI_CALL_ENDED,
                                          NotificationRecorder::callback, &signals),
                  IMS_ERROR_NONE);
        shared().settle();
        ResponseRecorder recorder;
        ASSERT_EQ(ims_call_hold_call(handle, 7, ResponseRecorder::callback, &recorder),
                  IMS_ERROR_NONE);
        peer().emit_signal("/org/kelvo/ims/sub5", kCall, "CallEnded", parse("(ii)", "(1, 2)"));
        pump_until([&] { return recorder.count() == 1 && signals.count() == 1; },
                   "answer and signal in the thread", context.get());
        EXPECT_EQ(ims_deinit(handle), IMS_ERROR_NONE);
        pump_ready(context.get());
    }};
    worker.join();
}

TEST_F(Delivery, SignalsOfOthersAreNotDelivered) {
    NotificationRecorder recorder;
    listen(IMS_NOTI_CALL_ENDED, recorder);
    BusClient foreign{bus().address()};
    foreign.emit_signal(kPath, kCall, "CallEnded", parse("(ii)", "(1, 2)"));
    foreign.emit_signal(kPath, kCall, "CallEnded", parse("(ii)", "(1, 2)"),
                        shared().unique_name().c_str());
    foreign.settle();
    fence();
    EXPECT_EQ(recorder.count(), 0U);
    EXPECT_TRUE(take_log().empty());
    emit_ended(1);
    fence();
    EXPECT_EQ(recorder.count(), 1U);
}

TEST_F(Delivery, SignalsOfOtherSlotsAreNotDelivered) {
    NotificationRecorder recorder;
    listen(IMS_NOTI_CALL_ENDED, recorder);
    for (const char *path : {"/org/kelvo/ims/sub0", "/org/kelvo/ims/sub33", "/org/kelvo/ims",
                             "/org/kelvo/ims/sub3/call1", "/"})
        peer().emit_signal(path, kCall, "CallEnded", parse("(ii)", "(1, 2)"));
    fence();
    EXPECT_EQ(recorder.count(), 0U);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(Delivery, TwoHandlesOfTheSameSlotBothReceiveASignal) {
    const ims_h other = init(kSlot);
    NotificationRecorder first;
    NotificationRecorder second;
    listen(handle_, IMS_NOTI_CALL_ENDED, first);
    listen(other, IMS_NOTI_CALL_ENDED, second);
    emit_ended(1);
    fence();
    ASSERT_EQ(first.count(), 1U);
    ASSERT_EQ(second.count(), 1U);
    EXPECT_EQ(first.all()[0].handle, handle_);
    EXPECT_EQ(second.all()[0].handle, other);

    EXPECT_EQ(ims_unset_notification_cb(handle_, IMS_NOTI_CALL_ENDED), IMS_ERROR_NONE);
    emit_ended(1);
    fence();
    EXPECT_EQ(first.count(), 1U);
    EXPECT_EQ(second.count(), 2U);
}

TEST_F(Delivery, HandlesOfTwoSlotsReceiveTheirOwnSignals) {
    const ims_h other = init(4);
    NotificationRecorder three;
    NotificationRecorder four;
    listen(handle_, IMS_NOTI_CALL_ENDED, three);
    listen(other, IMS_NOTI_CALL_ENDED, four);
    peer().emit_signal("/org/kelvo/ims/sub4", kCall, "CallEnded", parse("(ii)", "(1, 2)"));
    fence();
    EXPECT_EQ(three.count(), 0U);
    EXPECT_EQ(four.count(), 1U);
}

} // namespace
} // namespace test
