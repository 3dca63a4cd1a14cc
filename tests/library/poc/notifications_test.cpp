// SPDX-License-Identifier: Apache-2.0
// The push-to-talk signals as they reach the application's callback.
#include "tests/library/poc/event_rows.hpp"
#include "tests/support/event_checks.hpp"

#include <array>
#include <set>

namespace test {

INSTANTIATE_TEST_SUITE_P(Poc, Events, ::testing::ValuesIn(events_of(kPocEvents, poc_event_rows())),
                         event_name);

namespace {

TEST(PocEventRows, CoverEveryPushToTalkNotification) {
    std::set<int> expected;
    for (int id = 0x401; id <= 0x416; ++id)
        expected.insert(id);
    EXPECT_EQ(ids_of(poc_event_rows()), expected);
}

using FourNumbers = std::array<std::int32_t, IMS_POC_INT_SET_SIZE>;

class PocNotification : public WithPeer {
  protected:
    // What becomes of this set in a modification.
    void expect_set(const char *boxed, const FourNumbers &expected) {
        SCOPED_TRACE(boxed);
        NotificationRecorder recorder{[&](const Notified &, void *event) {
            const auto &modify = *static_cast<ims_poc_modify_request_s *>(event);
            EXPECT_EQ(std::to_array(modify.int_set_1), expected);
            EXPECT_EQ(std::to_array(modify.int_set_2), (FourNumbers{5, 6, 7, 8}));
        }};
        listen(IMS_NOTI_POC_CALL_MODIFY_REQUEST, recorder);
        emit(kPocEvents.interface, "PocCallModifyRequest",
             parse("(bbiivv)", std::string{"(true, true, 1, 2, "} + boxed + ", <[5, 6, 7, 8]>)"));
        fence();
        EXPECT_EQ(recorder.count(), 1U);
        EXPECT_TRUE(take_log().empty());
        EXPECT_EQ(ims_unset_notification_cb(handle_, IMS_NOTI_POC_CALL_MODIFY_REQUEST),
                  IMS_ERROR_NONE);
    }
};

TEST_F(PocNotification, ASetOfAnotherSizeFillsFourAtMost) {
    expect_set("<@ai []>", {0, 0, 0, 0});
    expect_set("<[1]>", {1, 0, 0, 0});
    expect_set("<[1, 2, 3]>", {1, 2, 3, 0});
    expect_set("<[1, 2, 3, 4, 9]>", {1, 2, 3, 4});
}

TEST_F(PocNotification, SomethingElseThanASetIsFourZeroes) {
    for (const char *boxed :
         {"<1>", "<'1234'>", "<@ax [1, 2, 3, 4]>", "<@au [1, 2, 3, 4]>", "<[[1, 2, 3, 4]]>",
          "<(1, 2, 3, 4)>", "<[<1>, <2>, <3>, <4>]>", "<@a{sv} {}>", "<@ay [1, 2, 3, 4]>"})
        expect_set(boxed, {0, 0, 0, 0});
}

// The callback is told the id that came, not that of the record's shape.
TEST_F(PocNotification, FloorEventsOfOneShapeKeepTheirIds) {
    NotificationRecorder recorder;
    const Variant body = parse("(ivisisiiis)", "(7, <[1, 2]>, 2, '', 3, '', 4, 5, 6, '')");
    listen(IMS_NOTI_POC_CALL_FLOOR_REQUEST_TIMEOUT, recorder);
    listen(IMS_NOTI_POC_CALL_FLOOR_GRANTED, recorder);
    emit(kPocEvents.interface, "PocCallFloorRequestTimeout", body);
    emit(kPocEvents.interface, "PocCallFloorGranted", body);
    fence();
    ASSERT_EQ(recorder.count(), 2U);
    EXPECT_EQ(recorder.all()[0].id, 0x40E);
    EXPECT_EQ(recorder.all()[1].id, 0x406);
}

} // namespace
} // namespace test
