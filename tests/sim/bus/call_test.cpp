// SPDX-License-Identifier: Apache-2.0
// Calls from end to end, as two applications live them.
#include "tests/sim/bus/bus_client.hpp"

namespace sim::test {
namespace {

using testing::HasSubstr;

class BusCall : public Served {
  protected:
    BusCall() : BusCall({"--speed", "0"}) {}
    explicit BusCall(std::vector<std::string> options) : Served(std::move(options)) {
        other_ = another();
        client_->register_application(0); // application 1
        other_->register_application(1);  // application 2
    }

    std::string ask(const char *method, const std::string &arguments) {
        const auto reply = client_->call(0, kCall, method, arguments);
        return reply.error.empty() ? reply.body : reply.error + ": " + reply.text;
    }
    std::string ask_other(const char *method, const std::string &arguments) {
        const auto reply = other_->call(1, kCall, method, arguments);
        return reply.error.empty() ? reply.body : reply.error + ": " + reply.text;
    }
    // Call 1 of both slots.
    void connect() {
        ASSERT_EQ(ask("MakeCall", "(1, '+15550101', 0, 'b', 'c', 'd', 'e')"), "(0, 1)");
        other_->wait_for(1, "CallIncomingInd");
        ASSERT_EQ(ask_other("AnswerCall", "(2, 1, 0, 0)"), "(0,)");
        client_->wait_for(0, "CallEstablished");
        other_->wait_for(1, "CallEstablished");
    }

    std::unique_ptr<Client> other_;
};

TEST_F(BusCall, FromTheFirstNumberToTheEnd) {
    EXPECT_EQ(ask("MakeCall", "(1, 'tel:+15550101', 0, 'b', 'c', 'd', 'e')"), "(0, 1)");
    EXPECT_EQ(client_->next_signal(), "sub0 CallInProgress (1,)");
    EXPECT_EQ(other_->wait_for(1, "CallIncomingInd"),
              "(1, 'tel:+15550100', 0, 'tel:+15550101', 'b', 'c', 'd', 'e', false)");
    client_->wait_for(0, "CallAlerting");
    EXPECT_EQ(ask("CallListInfo", "(1,)"),
              "(0, 1, [{'session_id': <1>, 'peer_uri': <'tel:+15550101'>, 'call_type': <0>, "
              "'bmocall': <true>, 'call_state': <2>, 'bconfcall': <false>}])");
    EXPECT_EQ(ask_other("AnswerCall", "(2, 1, 0, 0)"), "(0,)");
    EXPECT_EQ(client_->wait_for(0, "CallEstablished"), "(1, 0, true, 'tel:+15550101', false)");
    EXPECT_EQ(other_->wait_for(1, "CallEstablished"), "(1, 0, false, 'tel:+15550100', false)");

    EXPECT_EQ(ask("HoldCall", "(1, 1)"), "(0,)");
    EXPECT_EQ(client_->wait_for(0, "CallHeld"), "(1, true, 0)");
    EXPECT_EQ(other_->wait_for(1, "CallHeld"), "(1, false, 0)");
    EXPECT_EQ(ask("HoldCall", "(1, 1)"), "(13,)");
    EXPECT_EQ(ask("ResumeCall", "(1, 1)"), "(0,)");
    EXPECT_EQ(client_->wait_for(0, "CallResumed"), "(1, true, false, 0)");

    EXPECT_EQ(ask("EndCall", "(1, 1, 0, 0)"), "(0,)");
    EXPECT_EQ(client_->wait_for(0, "CallEnded"), "(1, 0)");
    EXPECT_EQ(other_->wait_for(1, "CallEnded"), "(1, 1)");
    EXPECT_EQ(ask("CallListInfo", "(1,)"), "(0, 0, [])");
}

TEST_F(BusCall, EachSideHasItsOwnListAndSignals) {
    connect();
    EXPECT_EQ(ask_other("CallListInfo", "(2,)"),
              "(0, 1, [{'session_id': <1>, 'peer_uri': <'tel:+15550100'>, 'call_type': <0>, "
              "'bmocall': <false>, 'call_state': <5>, 'bconfcall': <false>}])");
    // Connections hear all slots; the object that a signal comes from tells which one it means.
    ask("SendDtmf", "(1, 1, '1')");
    EXPECT_EQ(client_->wait_for(1, "CallDtmfEvent"), "(0x31,)");
}

TEST_F(BusCall, Rejected) {
    ask("MakeCall", "(1, '+15550101', 0, '', '', '', '')");
    other_->wait_for(1, "CallIncomingInd");
    EXPECT_EQ(ask_other("RejectCall", "(2, 1, 1)"), "(0,)");
    EXPECT_EQ(client_->wait_for(0, "CallBusy"), "(1,)");
    EXPECT_EQ(client_->wait_for(0, "CallEnded"), "(1, 2)");
}

TEST_F(BusCall, Change) {
    connect();
    EXPECT_EQ(ask("ChangeCall", "(1, 1, 1)"), "(0, 0, 'pending')");
    EXPECT_EQ(other_->wait_for(1, "CallChangeRequest"), "(1, 1, 'YXVkaW8sdmlkZW8=')");
    EXPECT_EQ(ask_other("AcceptChangeRequest", "(2, 1)"), "(0,)");
    EXPECT_EQ(client_->wait_for(0, "CallSwitched"), "(1, 1)");
    EXPECT_EQ(ask("ChangeCall", "(1, 1, 0)"), "(0, 0, 'switched')");
    EXPECT_EQ(ask("UpgradeCall", "(1, 1, 1)"), "(0,)");
    EXPECT_EQ(ask_other("RejectChangeRequest", "(2, 1)"), "(0,)");
    EXPECT_THAT(client_->wait_for(0, "CallError"), HasSubstr("(1, 488, "));
    EXPECT_EQ(ask("DowngradeCall", "(1, 1, 0)"), "(13,)");
}

TEST_F(BusCall, Media) {
    connect();
    EXPECT_EQ(ask("IsMuted", "(1, 1)"), "(0, false)");
    EXPECT_EQ(ask("ToggleMute", "(1, 1)"), "(0,)");
    EXPECT_EQ(ask("IsMuted", "(1, 1)"), "(0, true)");
    EXPECT_EQ(ask("GetMaxVolume", "(1, 1)"), "(0, 10)");
    EXPECT_EQ(ask("SetVolume", "(1, 1, 10)"), "(0,)");
    EXPECT_EQ(ask("SetVolume", "(1, 1, 11)"), "(10,)");
    EXPECT_EQ(ask("SetSpeakerMode", "(1, 1, 1)"), "(0,)");
    EXPECT_EQ(ask("VoiceRecord", "(1, 1, 1, '/tmp/call.amr')"), "(0,)");
    EXPECT_EQ(ask("VoiceRecord", "(1, 1, 0, '')"), "(0,)");
    EXPECT_EQ(ask("StartDtmf", "(1, 1, byte 0x23)"), "(0,)");
    EXPECT_EQ(other_->wait_for(1, "CallDtmfEvent"), "(0x23,)");
    EXPECT_EQ(ask("StopDtmf", "(1, 1)"), "(0,)");
    EXPECT_EQ(ask("SetTtyMode", "(1, 1)"), "(0,)");
    EXPECT_EQ(ask("SendTtyData", "(1, 1, 'aGVsbG8=')"), "(0,)");
    EXPECT_EQ(ask("SendTtyData", "(1, 1, 'aGVsbG8')"), "(10,)");
    EXPECT_EQ(ask("GetTtyMode", "()"), "(0, 1, 0, '')");
    EXPECT_EQ(ask_other("GetTtyMode", "()"), "(0, 0, 5, 'aGVsbG8=')");
}

TEST_F(BusCall, ConferenceOfTwoCalls) {
    connect();
    EXPECT_EQ(ask("HoldCall", "(1, 1)"), "(0,)");
    EXPECT_EQ(ask("MakeCall", "(1, '+15559999', 0, '', '', '', '')"), "(0, 2)");
    client_->wait_for(0, "CallEstablished");
    EXPECT_EQ(ask("SwapCall", "(1,)"), "(0,)");
    EXPECT_EQ(ask("MergeCalls", "(1,)"), "(0, 3)");
    EXPECT_EQ(client_->wait_for(0, "CallConfernceCallEstablished"), "(3, 0)");
    EXPECT_EQ(client_->wait_for(0, "CallConfNotifyReceived"),
              "(3, <[3, 3]>, 2, <['tel:+15550101', 'tel:+15559999']>, 2)");
    EXPECT_EQ(ask("AddUserForConferenceCall", "(1, 3, '+15558888', 0)"), "(0,)");
    EXPECT_EQ(client_->wait_for(0, "CallConfernceCallParticipantAdded"), "(3, 4)");
    EXPECT_EQ(ask("RemoveParticipantFromNwayConferenceCall", "(1, 3, 4)"), "(0,)");
    EXPECT_EQ(client_->wait_for(0, "CallConfernceCallParticipantRemoved"), "(3, 4)");
    EXPECT_EQ(ask("HoldCall", "(1, 3)"), "(0,)");
    EXPECT_EQ(ask("MakeCall", "(1, '+15557777', 0, '', '', '', '')"), "(0, 5)");
    client_->wait_for(0, "CallEstablished");
    EXPECT_EQ(ask("AddParticipantToNwayConferenceCall", "(1, 3, 5)"), "(0,)");
    EXPECT_EQ(ask("StartNwayConferenceCall", "(1, 3, 5, 0)"), "(13, 0)");
    EXPECT_EQ(ask("EndCall", "(1, 3, 0, 0)"), "(0,)");
    EXPECT_EQ(ask("CallListInfo", "(1,)"), "(0, 0, [])");
}

TEST_F(BusCall, ConferenceFromAList) {
    EXPECT_EQ(ask("StartConference", "(0, 2, <['+15550101', '+15559999']>)"), "(0, 1)");
    EXPECT_EQ(client_->next_signal(), "sub0 CallConfNotifyReceived (1, <[1, 1]>, 2, "
                                      "<['tel:+15550101', 'tel:+15559999']>, 2)");
    EXPECT_EQ(client_->wait_for(0, "CallConfernceCallEstablished"), "(1, 0)");
    EXPECT_EQ(ask("ModifyParticipantsInConference", "(1, 2, 1, <['+15550101']>)"), "(0, 1)");
    EXPECT_EQ(other_->wait_for(1, "CallEnded"), "(1, 8)");
    // Lists that are not what they say.
    EXPECT_EQ(ask("ModifyParticipantsInConference", "(1, 1, 3, <['+15550101']>)"), "(10, 0)");
    EXPECT_EQ(ask("ModifyParticipantsInConference", "(1, 1, -1, <@as []>)"), "(10, 0)");
    EXPECT_EQ(ask("ModifyParticipantsInConference", "(1, 1, 1, <'+15550101'>)"), "(10, 0)");
    EXPECT_THAT(program_->read_errors("does not hold"), HasSubstr("the count says 3, and 1 texts"));
}

TEST_F(BusCall, RadioAndAccess) {
    EXPECT_EQ(ask("IsInEpdgCall", "(1,)"), "(0, false)");
    EXPECT_EQ(ask("RegisterEmergencyPdn", "()"), "(13,)");
    EXPECT_EQ(ask("SetEmergencyPdnInfo", "(1, 'rmnet1', 1, <['192.0.2.1']>, '192.0.2.7')"), "(0,)");
    EXPECT_EQ(ask("RegisterEmergencyPdn", "()"), "(0,)");
    EXPECT_EQ(ask("DeregisterEmergencyPdn", "()"), "(0,)");
    connect();
    EXPECT_EQ(ask("ChangeEpdgAudioPath", "(1, 1)"), "(0,)");
    EXPECT_EQ(ask("IsInEpdgCall", "(1,)"), "(0, true)");
    EXPECT_EQ(ask("IndicateSrvccHoStarted", "(1, 1)"), "(0,)");
    EXPECT_EQ(ask("IndicateSrvccHoFailed", "(1, 1)"), "(0,)");
    EXPECT_EQ(ask("EndCall", "(1, 1, 0, 0)"), "(0,)");
    EXPECT_EQ(ask("UpdateSsacInfo", "(1, 1, 0, 4, 100, 0)"), "(0,)");
    EXPECT_EQ(ask("MakeCall", "(1, '+15559999', 0, '', '', '', '')"), "(16, 0)");
}

TEST_F(BusCall, Ussd) {
    EXPECT_EQ(ask("SendUssd", "(1, 1, 15, '*101#')"), "(0,)");
    EXPECT_THAT(client_->wait_for(0, "CallUssdIndication"), HasSubstr("(2, 15, 1, "));
    EXPECT_EQ(ask("SendUssd", "(1, 2, 15, '1')"), "(0,)");
    EXPECT_EQ(client_->wait_for(0, "CallUssdIndication"),
              "(1, 15, 1, 'WW91ciBiYWxhbmNlIGlzIDEyLjUw')");
    EXPECT_EQ(ask("SendUssd", "(1, 3, 15, '')"), "(13,)");
}

TEST_F(BusCall, AutoResponse) {
    EXPECT_EQ(ask_other("SetAutoResponse", "(2, 1, 0)"), "(0,)");
    ask("MakeCall", "(1, '+15550101', 1, '', '', '', '')");
    EXPECT_EQ(client_->wait_for(0, "CallEstablished"), "(1, 1, true, 'tel:+15550101', false)");
}

class BusCallOptions : public BusCall {
  protected:
    BusCallOptions()
        : BusCall({"--speed", "0", "--number", "1=+447700900123", "--ring-time", "0.05"}) {}
};

TEST_F(BusCallOptions, NumberAndRingTime) {
    ask("MakeCall", "(1, 'sip:+447700900123@ims.example.org', 0, '', '', '', '')");
    EXPECT_THAT(other_->wait_for(1, "CallIncomingInd"), HasSubstr("'tel:+447700900123'"));
    EXPECT_EQ(other_->wait_for(1, "CallEnded"), "(1, 5)");
    EXPECT_EQ(client_->wait_for(0, "CallEnded"), "(1, 4)");
}

} // namespace
} // namespace sim::test
