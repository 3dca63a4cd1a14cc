// SPDX-License-Identifier: Apache-2.0
#include "tests/sim/network.hpp"

namespace sim::test {
namespace {

class LoggingIn : public NetworkTest {
  protected:
    Status login(const std::string &user, const std::string &password,
                 LoginKind kind = LoginKind::kIms) {
        return logins_.login(0, user, password, kind);
    }
    LoginState state(LoginKind kind = LoginKind::kIms) {
        const auto found = logins_.state(0, kind);
        EXPECT_TRUE(found);
        return found ? *found : LoginState{};
    }
};

TEST_F(LoggingIn, TakesAMomentAndIsAnnouncedTwice) {
    EXPECT_EQ(state(), LoginState{});
    expect_accepted(login("alice", "secret"));
    EXPECT_THAT(take(0), ElementsAre("LoginState (1, 1, 0, 0)"));
    EXPECT_EQ(state().phase, LoginPhase::kLoggingIn);
    advance(299ms);
    EXPECT_THAT(take(0), IsEmpty());
    advance(1ms);
    EXPECT_THAT(take(0), ElementsAre("LoginState (2, 1, 0, 0)"));
    EXPECT_EQ(state(), (LoginState{LoginPhase::kLoggedIn, 1, LoginReason::kAskedFor}));
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST_F(LoggingIn, LogsOutAllKinds) {
    expect_accepted(login("alice", "secret"));
    advance(1s);
    expect_accepted(login("alice", "secret", LoginKind::kPushToTalk));
    EXPECT_EQ(state(LoginKind::kPushToTalk).number, 2u);
    forget_events();
    // The second one is still under way.
    expect_accepted(logins_.logout(0));
    EXPECT_THAT(take(0), ElementsAre("LoginState (0, 0, 0, 0)", "LoginState (0, 0, 0, 1)"));
    advance(1s);
    EXPECT_THAT(take(0), IsEmpty());
    EXPECT_EQ(state(), LoginState{});
    expect_refused(logins_.logout(0), Result::kWrongState, "nobody is logged in on slot 0");
}

TEST_F(LoggingIn, OneUserOfAKindAtATimeOnEachSlot) {
    expect_accepted(login("alice", "secret"));
    expect_refused(login("bob", "secret"), Result::kWrongState, "logging in");
    advance(1s);
    expect_refused(login("alice", "secret"), Result::kWrongState, "logged in: log out first");
    expect_accepted(logins_.login(1, "bob", "secret", LoginKind::kIms));
    expect_accepted(logins_.logout(0));
    expect_accepted(login("bob", "secret"));
    EXPECT_EQ(state().number, 2u);
}

TEST_F(LoggingIn, AWrongPasswordIsRefused) {
    expect_refused(login("alice", "wrong"), Result::kWrongPassword, "the password of alice");
    expect_refused(login("alice", ""), Result::kWrongPassword, "the password of alice");
    EXPECT_THAT(take(0), IsEmpty());
    expect_accepted(login("alice", "Wrong"));
    EXPECT_EQ(state().number, 1u);
}

TEST_F(LoggingIn, RefusesWhatMakesNoSense) {
    expect_refused(login("", "secret"), Result::kInvalidArgument, "user is empty");
    expect_refused(login("alice", "secret", LoginKind{2}), Result::kInvalidArgument, "not 2");
    expect_refused(login("alice", "secret", LoginKind{-1}), Result::kInvalidArgument, "not -1");
    expect_refused(logins_.state(0, LoginKind{2}), Result::kInvalidArgument, "not 2");
}

TEST_F(LoggingIn, FlightModeLogsOut) {
    expect_accepted(login("alice", "secret"));
    forget_events();
    expect_accepted(registrations_.enable_flight_mode(0));
    EXPECT_EQ(take(0).front(), "LoginState (0, 0, 2, 0)");
    EXPECT_EQ(state().reason, LoginReason::kFlightMode);
    advance(1s);
    EXPECT_EQ(state().phase, LoginPhase::kLoggedOut);
    expect_refused(login("alice", "secret"), Result::kWrongState, "flight mode");
    come_back(0);
    EXPECT_EQ(state().phase, LoginPhase::kLoggedOut);
    expect_accepted(login("alice", "secret"));
}

} // namespace
} // namespace sim::test
