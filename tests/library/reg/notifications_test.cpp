// SPDX-License-Identifier: Apache-2.0
// The registration signals as they reach the application's callback.
#include "tests/library/reg/event_rows.hpp"
#include "tests/support/event_checks.hpp"

namespace test {

INSTANTIATE_TEST_SUITE_P(Reg, Events, ::testing::ValuesIn(events_of(kRegEvents, reg_event_rows())),
                         event_name);

namespace {

TEST(RegEventRows, CoverEveryRegistrationNotification) {
    EXPECT_EQ(ids_of(reg_event_rows()),
              (std::set<int>{IMS_NOTI_REG_REGISTRATION_STATUS,
                             IMS_NOTI_REG_EMERGENCY_REGISTRATION_STATUS}));
}

class RegNotification : public WithPeer {};

TEST_F(RegNotification, EachKindArrivesAtItsOwnCallback) {
    NotificationRecorder normal;
    NotificationRecorder emergency;
    listen(0x101, normal);
    listen(0x102, emergency);
    emit(kRegEvents.interface, "EmergencyRegistrationStatus", parse("(bui)", "(true, 1, 2)"));
    emit(kRegEvents.interface, "EmergencyRegistrationStatus", parse("(bui)", "(false, 1, 2)"));
    emit(kRegEvents.interface, "RegistrationStatus", parse("(buuiii)", "(true, 1, 2, 3, 4, 5)"));
    fence();
    EXPECT_EQ(normal.count(0x101), 1U);
    EXPECT_EQ(normal.count(), 1U);
    EXPECT_EQ(emergency.count(0x102), 2U);
    EXPECT_EQ(emergency.count(), 2U);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(RegNotification, TheSameMemberOfAnotherInterfaceIsNotDelivered) {
    NotificationRecorder recorder;
    listen(0x101, recorder);
    for (const char *interface : {"org.kelvo.ims.Login", "org.kelvo.ims.Call", "org.kelvo.ims"})
        emit(interface, "RegistrationStatus", parse("(buuiii)", "(true, 1, 2, 3, 4, 5)"));
    fence();
    EXPECT_EQ(recorder.count(), 0U);
    EXPECT_TRUE(take_log().empty());
}

} // namespace
} // namespace test
