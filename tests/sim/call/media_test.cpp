// SPDX-License-Identifier: Apache-2.0
#include "tests/sim/network.hpp"

namespace sim::test {
namespace {

class CallMedia : public NetworkTest {};

TEST_F(CallMedia, MuteIsKeptForEachCall) {
    const auto ends = connect(0, 1);
    EXPECT_FALSE(*media_.is_muted(0, ends.caller));
    expect_accepted(media_.toggle_mute(0, ends.caller));
    EXPECT_TRUE(*media_.is_muted(0, ends.caller));
    EXPECT_FALSE(*media_.is_muted(1, ends.callee));
    expect_accepted(media_.toggle_mute(0, ends.caller));
    EXPECT_FALSE(*media_.is_muted(0, ends.caller));
}

TEST_F(CallMedia, VolumeAndSpeakerHaveTheirRanges) {
    const int id = connect_party(0);
    EXPECT_EQ(*media_.max_volume(0, id), kMaxVolume);
    expect_accepted(media_.set_volume(0, id, 0));
    expect_accepted(media_.set_volume(0, id, kMaxVolume));
    expect_refused(media_.set_volume(0, id, kMaxVolume + 1), Result::kInvalidArgument, "0 to 10");
    expect_refused(media_.set_volume(0, id, -1), Result::kInvalidArgument, "0 to 10");
    expect_accepted(media_.set_speaker(0, id, 1));
    expect_accepted(media_.set_speaker(0, id, 0));
    expect_refused(media_.set_speaker(0, id, 2), Result::kInvalidArgument, "not 2");
}

TEST_F(CallMedia, ACallThatIsNotEstablishedHasNoMedia) {
    const int id = dial(0, "+15550207");
    const auto refused = [](const auto &answer) {
        expect_refused(answer, Result::kWrongState, "not established yet");
    };
    refused(media_.is_muted(0, id));
    refused(media_.toggle_mute(0, id));
    refused(media_.set_volume(0, id, 1));
    refused(media_.max_volume(0, id));
    refused(media_.set_speaker(0, id, 1));
    refused(media_.record(0, id, RecordAction::kStart, "/tmp/x"));
    refused(media_.send_dtmf(0, id, "1"));
    refused(media_.start_dtmf(0, id, '1'));
    refused(media_.stop_dtmf(0, id));
    refused(media_.send_tty(0, id, "x"));
    const auto unknown = [](const auto &answer) {
        expect_refused(answer, Result::kUnknownSession, "no call 5");
    };
    unknown(media_.is_muted(0, 5));
    unknown(media_.toggle_mute(0, 5));
    unknown(media_.set_volume(0, 5, 1));
    unknown(media_.max_volume(0, 5));
    unknown(media_.set_speaker(0, 5, 1));
    unknown(media_.record(0, 5, RecordAction::kStart, "/tmp/x"));
    unknown(media_.send_dtmf(0, 5, "1"));
    unknown(media_.start_dtmf(0, 5, '1'));
    unknown(media_.stop_dtmf(0, 5));
    unknown(media_.send_tty(0, 5, "x"));
}

TEST_F(CallMedia, RecordingStartsAndStopsOnce) {
    const int id = connect_party(0);
    expect_refused(media_.record(0, id, RecordAction::kStop, ""), Result::kWrongState,
                   "not being recorded");
    expect_refused(media_.record(0, id, RecordAction::kStart, ""), Result::kInvalidArgument,
                   "path");
    expect_refused(media_.record(0, id, RecordAction{2}, "/tmp/x"), Result::kInvalidArgument,
                   "not 2");
    expect_accepted(media_.record(0, id, RecordAction::kStart, "/tmp/x"));
    expect_refused(media_.record(0, id, RecordAction::kStart, "/tmp/x"), Result::kWrongState,
                   "already recorded");
    expect_accepted(media_.record(0, id, RecordAction::kStop, ""));
}

TEST_F(CallMedia, TonesReachTheOtherSlotOneByOne) {
    const auto ends = connect(0, 1);
    expect_accepted(media_.send_dtmf(0, ends.caller, "5*D"));
    EXPECT_THAT(take(1), ElementsAre("CallDtmfEvent (0x35,)", "CallDtmfEvent (0x2a,)",
                                     "CallDtmfEvent (0x44,)"));
    EXPECT_THAT(take(0), IsEmpty());
    expect_accepted(media_.start_dtmf(1, ends.callee, '#'));
    EXPECT_THAT(take(0), ElementsAre("CallDtmfEvent (0x23,)"));
    expect_refused(media_.start_dtmf(1, ends.callee, '1'), Result::kWrongState, "stop that first");
    expect_refused(media_.send_dtmf(1, ends.callee, "1"), Result::kWrongState, "stop that first");
    expect_accepted(media_.stop_dtmf(1, ends.callee));
    expect_refused(media_.stop_dtmf(1, ends.callee), Result::kWrongState, "sends no tone");
    EXPECT_THAT(take(0), IsEmpty());
}

TEST_F(CallMedia, TonesAreChecked) {
    const auto ends = connect(0, 1);
    expect_refused(media_.send_dtmf(0, ends.caller, ""), Result::kInvalidArgument, "no tone");
    expect_refused(media_.send_dtmf(0, ends.caller, "12E"), Result::kInvalidArgument, "12E");
    expect_refused(media_.start_dtmf(0, ends.caller, 'x'), Result::kInvalidArgument, "0x78");
    expect_refused(media_.start_dtmf(0, ends.caller, 0), Result::kInvalidArgument, "0x00");
    expect_accepted(calls_.hold(0, ends.caller));
    forget_events();
    expect_refused(media_.send_dtmf(0, ends.caller, "1"), Result::kWrongState, "is on hold");
    EXPECT_THAT(take(1), IsEmpty());
}

TEST_F(CallMedia, TonesReachEverybodyInAConference) {
    const auto first = connect(0, 1);
    expect_accepted(calls_.hold(0, first.caller));
    connect(0, 2);
    const auto conference = calls_.merge(0);
    ASSERT_TRUE(conference);
    forget_events();
    // A slot that is invited and still rings hears nothing yet.
    expect_accepted(calls_.invite(0, *conference, "+15550103", CallType::kVoice));
    advance(1s);
    forget_events();
    expect_accepted(media_.send_dtmf(0, *conference, "7"));
    EXPECT_THAT(take(3), IsEmpty());
    EXPECT_THAT(take(1), ElementsAre("CallDtmfEvent (0x37,)"));
    EXPECT_THAT(take(2), ElementsAre("CallDtmfEvent (0x37,)"));
}

TEST_F(CallMedia, TextTelephonyArrivesAtTheOtherSlot) {
    const auto ends = connect(0, 1);
    expect_refused(media_.send_tty(0, ends.caller, "hi"), Result::kWrongState, "set a mode first");
    expect_accepted(media_.set_tty_mode(0, TtyMode::kFull));
    EXPECT_EQ(media_.tty(0).mode, TtyMode::kFull);
    EXPECT_EQ(media_.tty(1).mode, TtyMode::kOff);
    expect_refused(media_.send_tty(0, ends.caller, ""), Result::kInvalidArgument, "no text");
    expect_accepted(media_.send_tty(0, ends.caller, "hi"));
    EXPECT_EQ(media_.tty(1).received, "hi");
    EXPECT_EQ(media_.tty(0).received, "");
    expect_accepted(calls_.hold(0, ends.caller));
    expect_refused(media_.send_tty(0, ends.caller, "x"), Result::kWrongState, "is on hold");
    // What was received goes with the last call.
    expect_accepted(calls_.end(1, ends.callee));
    EXPECT_EQ(media_.tty(1).received, "");
}

TEST_F(CallMedia, PartiesOfTheNetworkTypeBackWhatTheyRead) {
    const int id = connect_party(0);
    expect_accepted(media_.set_tty_mode(0, TtyMode::kVoiceCarryOver));
    expect_accepted(media_.send_tty(0, id, "echo"));
    EXPECT_EQ(media_.tty(0).received, "echo");
}

TEST_F(CallMedia, TtyModesAreChecked) {
    expect_refused(media_.set_tty_mode(0, TtyMode{4}), Result::kInvalidArgument, "not 4");
    expect_refused(media_.set_tty_mode(0, TtyMode{-1}), Result::kInvalidArgument, "not -1");
}

} // namespace
} // namespace sim::test
