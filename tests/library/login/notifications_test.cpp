// SPDX-License-Identifier: Apache-2.0
// The login signal as it reaches the application's callback.
#include "tests/library/login/event_rows.hpp"
#include "tests/support/event_checks.hpp"

namespace test {

INSTANTIATE_TEST_SUITE_P(Login, Events,
                         ::testing::ValuesIn(events_of(kLoginEvents, login_event_rows())),
                         event_name);

namespace {

TEST(LoginEventRows, CoverTheLoginNotification) {
    EXPECT_EQ(ids_of(login_event_rows()), std::set<int>{IMS_NOTI_LOGIN_STATE});
}

class LoginNotification : public WithPeer {};

TEST_F(LoginNotification, EveryStateArrivesInItsOrder) {
    std::vector<std::int32_t> states;
    NotificationRecorder recorder{[&](const Notified &, void *event) {
        states.push_back(static_cast<ims_login_state_s *>(event)->value_1);
    }};
    listen(IMS_NOTI_LOGIN_STATE, recorder);
    for (const int state : {3, 1, 2, 0})
        emit(kLoginEvents.interface, "LoginState", share(g_variant_new("(iuii)", state, 2, 3, 4)));
    fence();
    EXPECT_EQ(states, (std::vector<std::int32_t>{3, 1, 2, 0}));
    EXPECT_TRUE(take_log().empty());
}

} // namespace
} // namespace test
