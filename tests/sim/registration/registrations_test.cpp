// SPDX-License-Identifier: Apache-2.0
// The device in the network, and what flight mode does to everything else.
#include "tests/sim/network.hpp"

namespace sim::test {
namespace {

class Registering : public NetworkTest {
  protected:
    static constexpr const char *kRegistered = "RegistrationStatus (true, 1, 15, 0, 200, 3600)";
    static constexpr const char *kFlightMode = "RegistrationStatus (false, 0, 0, 2, 0, 0)";

    void register_bearer(int slot) {
        expect_accepted(radio_.set_emergency_pdn(slot, {"rmnet1", {"192.0.2.1"}, "192.0.2.7"}));
        expect_accepted(radio_.register_emergency_pdn(slot));
    }
};

TEST_F(Registering, EverySlotRegistersAtTheStart) {
    std::vector<std::string> told;
    Registrations fresh(2, timers_, [&](int slot, const RegistrationEvent &event) {
        told.push_back(fmt::format("{} {}", slot, std::get<RegistrationInfo>(event).registered));
    });
    EXPECT_EQ(fresh.info(0), (RegistrationInfo{.reason = RegistrationReason::kUnderWay}));
    fresh.start();
    advance(299ms);
    EXPECT_THAT(told, IsEmpty());
    EXPECT_FALSE(fresh.registered(1));
    advance(1ms);
    EXPECT_THAT(told, ElementsAre("0 true", "1 true"));
    EXPECT_TRUE(fresh.registered(1));
    EXPECT_EQ(fresh.info(1), (RegistrationInfo{true, 1, 15, RegistrationReason::kNone, 200, 3600}));
}

TEST_F(Registering, FlightModeEndsItAndSwitchingOnBringsItBack) {
    expect_accepted(registrations_.enable_flight_mode(0));
    EXPECT_THAT(take(0), ElementsAre(kFlightMode));
    EXPECT_EQ(registrations_.info(0),
              (RegistrationInfo{.reason = RegistrationReason::kFlightMode}));
    EXPECT_TRUE(registrations_.registered(1));
    expect_refused(registrations_.enable_flight_mode(0), Result::kWrongState, "in flight mode");
    advance(1h);
    EXPECT_THAT(take(0), IsEmpty());
    registrations_.switch_on(0);
    EXPECT_EQ(registrations_.info(0), (RegistrationInfo{.reason = RegistrationReason::kUnderWay}));
    EXPECT_THAT(take(0), IsEmpty());
    advance(300ms);
    EXPECT_THAT(take(0), ElementsAre(kRegistered));
    registrations_.switch_on(0);
    advance(1h);
    EXPECT_THAT(take(0), IsEmpty());
}

TEST_F(Registering, FlightModeCutsARegistrationShort) {
    lose(0);
    registrations_.switch_on(0);
    advance(299ms);
    // It was not registered, so that nothing is lost.
    expect_accepted(registrations_.enable_flight_mode(0));
    advance(1h);
    EXPECT_THAT(take(0), IsEmpty());
    EXPECT_FALSE(registrations_.registered(0));
}

TEST_F(Registering, TheEmergencyBearerIsAnnounced) {
    register_bearer(0);
    EXPECT_THAT(take(0), ElementsAre("EmergencyRegistrationStatus (true, 1, 0)"));
    expect_refused(radio_.register_emergency_pdn(0), Result::kWrongState, "already");
    expect_accepted(radio_.deregister_emergency_pdn(0));
    EXPECT_THAT(take(0), ElementsAre("EmergencyRegistrationStatus (false, 0, 0)"));
    register_bearer(0);
    forget_events();
    expect_accepted(registrations_.enable_flight_mode(0));
    EXPECT_THAT(take(0), ElementsAre("EmergencyRegistrationStatus (false, 0, 2)", kFlightMode));
    expect_refused(radio_.register_emergency_pdn(0), Result::kWrongState, "flight mode");
    expect_refused(radio_.deregister_emergency_pdn(0), Result::kWrongState, "not registered");
}

TEST_F(Registering, FlightModeEndsEverythingBeforeItIsAnnounced) {
    connect(0, 1);
    expect_accepted(ussd_.send(0, UssdRequest::kStart, 15, "*101#"));
    advance(1s);
    expect_accepted(logins_.login(0, "alice", "secret", LoginKind::kIms));
    advance(1s);
    forget_events();
    expect_accepted(registrations_.enable_flight_mode(0));
    EXPECT_THAT(take(0),
                ElementsAre("CallEnded (1, 0)", "CallUssdIndication (3, 15, 1, 'RmxpZ2h0IG1vZGU=')",
                            "LoginState (0, 0, 2, 0)", kFlightMode));
    EXPECT_THAT(take(1), ElementsAre("CallEnded (1, 7)"));
    EXPECT_THAT(calls_.list(0), IsEmpty());
    EXPECT_THAT(calls_.list(1), IsEmpty());
}

TEST_F(Registering, FlightModeEndsPushToTalkAfterCalls) {
    using testing::StartsWith;
    connect(0, 1);
    expect_accepted(logins_.login(0, "alice", "secret", LoginKind::kIms));
    expect_accepted(network_.ptt.make_call(0, {{}, "+15550221", PttCallType::kOneToOne}));
    // Who never answers leaves the file where it is.
    PttFileOffer offer;
    offer.targets = {{0, "+15550207", {}, false}};
    offer.attributes.name = "notes.txt";
    offer.attributes.size = 1;
    expect_accepted(network_.ptt_files.offer(0, offer));
    advance(5s);
    forget_events();
    expect_accepted(registrations_.enable_flight_mode(0));
    EXPECT_THAT(take(0), ElementsAre(StartsWith("CallEnded (1,"), StartsWith("LoginState (0,"),
                                     StartsWith("PocCallEnded (1,"),
                                     StartsWith("PocFileTransferTerminated (1,"), kFlightMode));
}

TEST_F(Registering, FlightModeEndsCallsOfEveryKind) {
    // A conference with its members, and a call that waits.
    const auto held = connect(0, 1);
    expect_accepted(calls_.hold(0, held.caller));
    connect(0, 2);
    ASSERT_TRUE(calls_.merge(0));
    ring(3, 0);
    forget_events();
    expect_accepted(registrations_.enable_flight_mode(0));
    EXPECT_THAT(calls_.list(0), IsEmpty());
    for (const int slot : {1, 2, 3}) {
        EXPECT_THAT(take(slot), testing::Contains("CallEnded (1, 7)")) << slot;
        EXPECT_THAT(calls_.list(slot), IsEmpty()) << slot;
    }
}

TEST_F(Registering, NobodyCallsBackASlotInFlightMode) {
    dial(0, "+15550213");
    advance(3700ms);
    lose(0);
    come_back(0);
    forget_events();
    advance(10s);
    EXPECT_THAT(take(0), IsEmpty());
}

TEST_F(Registering, NothingCanBeDialledInFlightMode) {
    lose(0);
    for (const auto *number : {"+15550101", "112"})
        expect_refused(calls_.make_call(0, {number, CallType::kVoice, {}}), Result::kWrongState,
                       "slot 0 is in flight mode");
    expect_refused(calls_.start_conference(0, CallType::kVoice, {"+15550101"}), Result::kWrongState,
                   "flight mode");
    expect_refused(ussd_.send(0, UssdRequest::kStart, 15, "*100#"), Result::kWrongState,
                   "flight mode");
    come_back(0);
    EXPECT_TRUE(calls_.make_call(0, {"+15550101", CallType::kVoice, {}}));
}

TEST_F(Registering, ASlotInFlightModeCannotBeReached) {
    lose(1);
    dial(0, "+15550101");
    advance(700ms);
    EXPECT_THAT(take(0), ElementsAre("CallInProgress (1,)",
                                     "CallError (1, 480, 'the party cannot be reached')",
                                     "CallEnded (1, 6)"));
    EXPECT_THAT(take(1), IsEmpty());
    expect_refused(calls_.call_from_network(1, "+15559999", CallType::kVoice), Result::kWrongState,
                   "not registered");
    // Nor while it registers.
    registrations_.switch_on(1);
    expect_refused(calls_.call_from_network(1, "+15559999", CallType::kVoice), Result::kWrongState,
                   "not registered");
    advance(300ms);
    EXPECT_TRUE(calls_.call_from_network(1, "+15559999", CallType::kVoice));
}

} // namespace
} // namespace sim::test
