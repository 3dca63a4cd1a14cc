// SPDX-License-Identifier: Apache-2.0
// Registration, login and supplementary services, as applications see them.
#include "tests/sim/bus/bus_client.hpp"

namespace sim::test {
namespace {

using testing::HasSubstr;

class BusAccess : public Served {
  protected:
    BusAccess() : BusAccess({"--speed", "0"}) {}
    explicit BusAccess(std::vector<std::string> options) : Served(std::move(options)) {
        other_ = another();
        client_->register_application(0); // application 1
        other_->register_application(1);  // application 2
    }

    std::string ask(const char *interface, const char *method,
                    const std::string &arguments = "()") {
        return on(*client_, 0, interface, method, arguments);
    }
    std::string ask_other(const char *interface, const char *method,
                          const std::string &arguments = "()") {
        return on(*other_, 1, interface, method, arguments);
    }
    std::string call_other() {
        return ask(kCall, "MakeCall", "(1, '+15550101', 0, '', '', '', '')");
    }

    std::unique_ptr<Client> other_;

  private:
    static std::string on(Client &client, int slot, const char *interface, const char *method,
                          const std::string &arguments) {
        const auto reply = client.call(slot, interface, method, arguments);
        return reply.error.empty() ? reply.body : reply.error + ": " + reply.text;
    }
};

TEST_F(BusAccess, RegistrationAndFlightMode) {
    EXPECT_EQ(ask(kRegistration, "GetRegistrationInfo"), "(true, 1, 15, 0, 200, 3600, 0)");
    call_other();
    other_->wait_for(1, "CallIncomingInd");
    EXPECT_EQ(ask(kRegistration, "EnableFlightMode"), "(0,)");
    EXPECT_EQ(client_->wait_for(0, "CallEnded"), "(1, 0)");
    EXPECT_EQ(client_->wait_for(0, "RegistrationStatus"), "(false, 0, 0, 2, 0, 0)");
    EXPECT_EQ(other_->wait_for(1, "CallEnded"), "(1, 7)");
    EXPECT_EQ(ask(kRegistration, "GetRegistrationInfo"), "(false, 0, 0, 2, 0, 0, 0)");
    EXPECT_EQ(ask(kRegistration, "EnableFlightMode"), "(13,)");
    EXPECT_EQ(call_other(), "(13, 0)");
    EXPECT_EQ(ask_other(kCall, "MakeCall", "(2, '+15550100', 0, '', '', '', '')"), "(0, 2)");
    EXPECT_EQ(other_->wait_for(1, "CallError"), "(2, 480, 'the party cannot be reached')");
    EXPECT_EQ(ask(kRegistration, "RegisterApplication"), "(0, 1)");
    EXPECT_EQ(client_->wait_for(0, "RegistrationStatus"), "(true, 1, 15, 0, 200, 3600)");
    EXPECT_EQ(call_other(), "(0, 2)");
}

TEST_F(BusAccess, RegisteringAnApplicationDoesNotEndFlightMode) {
    EXPECT_EQ(ask(kRegistration, "EnableFlightMode"), "(0,)");
    EXPECT_EQ(ask(kRegistration, "RegisterApplication", "(0, 'x')"), "(0, 3)");
    EXPECT_EQ(ask(kRegistration, "GetRegistrationInfo"), "(false, 0, 0, 2, 0, 0, 0)");
}

TEST_F(BusAccess, TheQueryRefusesStrangersWithItsLastMember) {
    EXPECT_EQ(another()->call(0, kRegistration, "GetRegistrationInfo").body,
              "(false, 0, 0, 0, 0, 0, 11)");
    EXPECT_EQ(another()->call(0, kRegistration, "EnableFlightMode").body, "(11,)");
}

TEST_F(BusAccess, EmergencyRegistration) {
    EXPECT_EQ(ask(kCall, "SetEmergencyPdnInfo", "(1, 'rmnet1', 1, <['192.0.2.1']>, '192.0.2.7')"),
              "(0,)");
    EXPECT_EQ(ask(kCall, "RegisterEmergencyPdn"), "(0,)");
    EXPECT_EQ(client_->wait_for(0, "EmergencyRegistrationStatus"), "(true, 1, 0)");
    EXPECT_EQ(ask(kCall, "DeregisterEmergencyPdn"), "(0,)");
    EXPECT_EQ(client_->wait_for(0, "EmergencyRegistrationStatus"), "(false, 0, 0)");
}

TEST_F(BusAccess, Login) {
    EXPECT_EQ(ask(kLogin, "GetLoginState", "(0, 1)"), "(0, 0, 0, 0)");
    EXPECT_EQ(ask(kLogin, "Logout", "(1,)"), "(13,)");
    EXPECT_EQ(ask(kLogin, "Login", "('alice', 'wrong', 0, 1)"), "(18,)");
    EXPECT_THAT(program_->read_errors("refused with 18"),
                AllOf(HasSubstr("Login ('alice', ***, 0, 1)"), HasSubstr("the password of alice")));
    EXPECT_EQ(ask(kLogin, "Login", "('', 'secret', 0, 1)"), "(10,)");
    EXPECT_EQ(ask(kLogin, "Login", "('alice', 'secret', 5, 1)"), "(10,)");
    EXPECT_EQ(ask(kLogin, "Login", "('alice', 'secret', 1, 1)"), "(0,)");
    EXPECT_EQ(client_->wait_for(0, "LoginState"), "(1, 1, 0, 1)");
    EXPECT_EQ(client_->wait_for(0, "LoginState"), "(2, 1, 0, 1)");
    EXPECT_EQ(ask(kLogin, "Login", "('bob', 'secret', 1, 1)"), "(13,)");
    EXPECT_EQ(ask(kLogin, "GetLoginState", "(1, 1)"), "(0, 2, 1, 0)");
    EXPECT_EQ(ask(kLogin, "GetLoginState", "(0, 1)"), "(0, 0, 0, 0)");
    EXPECT_EQ(ask(kLogin, "GetLoginState", "(9, 1)"), "(10, 0, 0, 0)");
    EXPECT_EQ(ask_other(kLogin, "GetLoginState", "(1, 2)"), "(0, 0, 0, 0)");
    EXPECT_EQ(ask(kLogin, "Logout", "(1,)"), "(0,)");
    EXPECT_EQ(client_->wait_for(0, "LoginState"), "(0, 0, 0, 1)");
    EXPECT_EQ(ask(kRegistration, "EnableFlightMode"), "(0,)");
    EXPECT_EQ(ask(kLogin, "Login", "('alice', 'secret', 0, 1)"), "(13,)");
}

TEST_F(BusAccess, TheApplicationIsTheLastMemberOfLogin) {
    // Member 1 of GetLoginState would be known as an application, and is none.
    EXPECT_EQ(ask(kLogin, "GetLoginState", "(1, 7)"), "(11, 0, 0, 0)");
    EXPECT_EQ(ask(kLogin, "Login", "('alice', 'secret', 1, 7)"), "(11,)");
}

TEST_F(BusAccess, CallWaiting) {
    EXPECT_EQ(ask_other(kSs, "GetCallWaiting", "(2, 3)"),
              "(0, 2, [{'ss_class': <1>, 'ss_status': <1>}, {'ss_class': <2>, 'ss_status': <1>}])");
    EXPECT_EQ(ask_other(kSs, "SetCallWaiting", "(2, 1, 0)"), "(0,)");
    EXPECT_EQ(ask_other(kSs, "GetCallWaiting", "(2, 1)"),
              "(0, 1, [{'ss_class': <1>, 'ss_status': <0>}])");
    EXPECT_EQ(ask_other(kSs, "SetCallWaiting", "(2, 9, 0)"), "(10,)");
    EXPECT_EQ(ask_other(kSs, "SetCallWaiting", "(2, 1, 3)"), "(10,)");
    EXPECT_EQ(ask_other(kSs, "GetCallWaiting", "(2, 9)"), "(10, 0, [])");

    EXPECT_EQ(ask_other(kCall, "MakeCall", "(2, '+15559999', 0, '', '', '', '')"), "(0, 1)");
    other_->wait_for(1, "CallEstablished");
    EXPECT_EQ(call_other(), "(0, 1)");
    EXPECT_EQ(client_->wait_for(0, "CallBusy"), "(1,)");
    EXPECT_EQ(client_->wait_for(0, "CallEnded"), "(1, 2)");
    EXPECT_EQ(ask_other(kSs, "SetCallWaiting", "(2, 1, 1)"), "(0,)");
    EXPECT_EQ(call_other(), "(0, 2)");
    EXPECT_EQ(other_->wait_for(1, "CallIncomingInd"),
              "(2, 'tel:+15550100', 0, 'tel:+15550101', '', '', '', '', true)");
}

TEST_F(BusAccess, CallForwarding) {
    EXPECT_EQ(ask_other(kSs, "GetCallForwarding", "(2, 1, 0)"),
              "(0, 1, [{'ss_class': <1>, 'ss_status': <0>, 'cf_type': <0>, 'no_reply_time': <0>, "
              "'cf_uri_length': <0>, 'cf_uri_type': <0>, 'cf_uri': <''>}])");
    EXPECT_EQ(ask_other(kSs, "SetCallForwarding", "(2, 1, 1, 0, 0, 9, 0, '+15559999')"), "(0,)");
    EXPECT_EQ(ask_other(kSs, "GetCallForwarding", "(2, 1, 0)"),
              "(0, 1, [{'ss_class': <1>, 'ss_status': <1>, 'cf_type': <0>, 'no_reply_time': <0>, "
              "'cf_uri_length': <9>, 'cf_uri_type': <0>, 'cf_uri': <'+15559999'>}])");
    EXPECT_EQ(call_other(), "(0, 1)");
    EXPECT_EQ(client_->wait_for(0, "CallForwarded"), "(1,)");
    EXPECT_EQ(client_->wait_for(0, "CallEstablished"), "(1, 0, true, 'tel:+15559999', false)");

    EXPECT_EQ(ask_other(kSs, "SetCallForwarding", "(2, 1, 1, 0, 0, 8, 0, '+15559999')"), "(10,)");
    EXPECT_THAT(program_->read_errors("refused"),
                HasSubstr("the length says 8, and the uri has 9 bytes"));
    EXPECT_EQ(ask_other(kSs, "SetCallForwarding", "(2, 1, 1, 6, 0, 9, 0, '+15559999')"), "(10,)");
    EXPECT_EQ(ask_other(kSs, "SetCallForwarding", "(2, 1, 1, 1, 0, 0, 0, '')"), "(10,)");
    EXPECT_EQ(ask_other(kSs, "SetCallForwarding", "(2, 1, 1, 2, 3, 9, 0, '+15559999')"), "(10,)");
    EXPECT_EQ(ask_other(kSs, "GetCallForwarding", "(2, 1, 6)"), "(10, 0, [])");
}

TEST_F(BusAccess, CallBarring) {
    EXPECT_EQ(ask(kSs, "GetCallBarring", "(1, 1, 1)"),
              "(0, 1, [{'ss_class': <1>, 'ss_status': <0>, 'cb_type': <1>}])");
    EXPECT_EQ(ask(kSs, "SetCallBarring", "(1, 1, 1, 1, '9999')"), "(18,)");
    EXPECT_THAT(program_->read_errors("refused with 18"),
                AllOf(HasSubstr("SetCallBarring (1, 1, 1, 1, ***)"), HasSubstr("barring password"),
                      Not(HasSubstr("9999"))));
    EXPECT_EQ(ask(kSs, "SetCallBarring", "(1, 1, 1, 1, '0000')"), "(0,)");
    EXPECT_EQ(ask(kSs, "GetCallBarring", "(1, 1, 1)"),
              "(0, 1, [{'ss_class': <1>, 'ss_status': <1>, 'cb_type': <1>}])");
    EXPECT_EQ(ask(kCall, "MakeCall", "(1, '+447700900123', 0, '', '', '', '')"), "(16, 0)");
    EXPECT_EQ(ask(kSs, "SetCallBarring", "(1, 3, 1, 0, '0000')"), "(0,)");
    EXPECT_EQ(call_other(), "(16, 0)");
    EXPECT_EQ(ask(kSs, "SetCallBarring", "(1, 3, 0, 5, '0000')"), "(0,)");
    EXPECT_EQ(ask_other(kSs, "SetCallBarring", "(2, 1, 1, 3, '0000')"), "(0,)");
    EXPECT_EQ(call_other(), "(0, 1)");
    EXPECT_EQ(client_->wait_for(0, "CallError"), "(1, 403, 'incoming calls are barred there')");
    EXPECT_EQ(ask(kSs, "SetCallBarring", "(1, 1, 1, 6, '0000')"), "(10,)");
    EXPECT_EQ(ask(kSs, "SetCallBarring", "(1, 1, 1, 5, '0000')"), "(10,)");
    EXPECT_EQ(ask(kSs, "GetCallBarring", "(1, 1, 6)"), "(10, 0, [])");
}

TEST_F(BusAccess, SupplementaryServicesNeedTheNetwork) {
    EXPECT_EQ(ask(kRegistration, "EnableFlightMode"), "(0,)");
    EXPECT_EQ(ask(kSs, "SetCallWaiting", "(1, 1, 0)"), "(13,)");
    EXPECT_EQ(ask(kSs, "GetCallWaiting", "(1, 1)"), "(13, 0, [])");
    EXPECT_EQ(ask(kSs, "SetCallForwarding", "(1, 1, 1, 0, 0, 9, 0, '+15559999')"), "(13,)");
    EXPECT_EQ(ask(kSs, "GetCallForwarding", "(1, 1, 0)"), "(13, 0, [])");
    EXPECT_EQ(ask(kSs, "SetCallBarring", "(1, 1, 1, 0, '0000')"), "(13,)");
    EXPECT_EQ(ask(kSs, "GetCallBarring", "(1, 1, 0)"), "(13, 0, [])");
}

class BusImpatient : public BusAccess {
  protected:
    BusImpatient() : BusAccess({"--speed", "0", "--ring-time", "0.05"}) {}
};

TEST_F(BusImpatient, NoReplyIsForwardedWhenTheRingingEndsFirst) {
    EXPECT_EQ(ask_other(kSs, "SetCallForwarding", "(2, 1, 1, 2, 30, 13, 0, 'tel:+15559999')"),
              "(0,)");
    EXPECT_EQ(call_other(), "(0, 1)");
    EXPECT_EQ(other_->wait_for(1, "CallEnded"), "(1, 5)");
    EXPECT_EQ(client_->wait_for(0, "CallForwarded"), "(1,)");
    EXPECT_EQ(client_->wait_for(0, "CallEstablished"), "(1, 0, true, 'tel:+15559999', false)");
}

} // namespace
} // namespace sim::test
