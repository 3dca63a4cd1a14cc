// SPDX-License-Identifier: Apache-2.0
#include "tests/sim/network.hpp"

namespace sim::test {
namespace {

class CallRadio : public NetworkTest {};

TEST_F(CallRadio, AHandoverBelongsToALiveCall) {
    expect_refused(radio_.handover_started(0, 1), Result::kUnknownSession, "no call 1");
    expect_refused(radio_.handover_failed(0, 1), Result::kUnknownSession, "no call 1");
    const int id = connect_party(0);
    expect_refused(radio_.handover_failed(0, id), Result::kWrongState, "no handover");
    expect_accepted(radio_.handover_started(0, id));
    expect_refused(radio_.handover_started(0, id), Result::kWrongState, "under way already");
    expect_accepted(radio_.handover_failed(0, id));
    expect_refused(radio_.handover_failed(0, id), Result::kWrongState, "no handover");
}

TEST_F(CallRadio, TheEpdgPathCountsWhileACallIsEstablished) {
    EXPECT_FALSE(radio_.in_epdg_call(0));
    expect_refused(radio_.set_audio_path(0, AudioPath::kEpdg), Result::kWrongState,
                   "no established call");
    const int id = connect_party(0);
    EXPECT_FALSE(radio_.in_epdg_call(0));
    expect_refused(radio_.set_audio_path(0, AudioPath{2}), Result::kInvalidArgument, "not 2");
    expect_accepted(radio_.set_audio_path(0, AudioPath::kEpdg));
    EXPECT_TRUE(radio_.in_epdg_call(0));
    EXPECT_FALSE(radio_.in_epdg_call(1));
    expect_accepted(radio_.set_audio_path(0, AudioPath::kCellular));
    EXPECT_FALSE(radio_.in_epdg_call(0));
    expect_accepted(radio_.set_audio_path(0, AudioPath::kEpdg));
    expect_accepted(calls_.end(0, id));
    EXPECT_FALSE(radio_.in_epdg_call(0));
}

TEST_F(CallRadio, AFactorOfZeroBarsTheCallsOfItsKind) {
    expect_accepted(radio_.set_ssac(0, 1, {0, 4, 100, 0}));
    expect_refused(calls_.make_call(0, {"+15559999", CallType::kVoice, {}}), Result::kBarred,
                   "bars voice");
    expect_refused(calls_.start_conference(0, CallType::kVoice, {"+15559999"}), Result::kBarred,
                   "bars voice");
    const int video = dial(0, "+15559999", CallType::kVideo);
    expect_accepted(calls_.end(0, video));
    expect_accepted(radio_.set_ssac(0, 1, {95, 512, 0, 8}));
    expect_refused(calls_.make_call(0, {"+15559999", CallType::kVideo, {}}), Result::kBarred,
                   "bars video");
    // Emergency calls are never barred.
    expect_accepted(radio_.set_ssac(0, 1, {0, 4, 0, 4}));
    const int emergency = dial(0, "911");
    expect_accepted(calls_.end(0, emergency));
    expect_accepted(radio_.set_ssac(0, 0, {}));
    dial(0, "+15559999");
}

TEST_F(CallRadio, BarringIsChecked) {
    const auto refused = [&](std::int32_t apply, const Ssac &ssac, const char *reason) {
        expect_refused(radio_.set_ssac(0, apply, ssac), Result::kInvalidArgument, reason);
    };
    refused(2, {100, 0, 100, 0}, "not 2");
    refused(1, {101, 4, 100, 0}, "voice factor");
    refused(1, {-5, 4, 100, 0}, "voice factor");
    refused(1, {52, 4, 100, 0}, "steps of 5");
    refused(1, {50, 5, 100, 0}, "voice barring time");
    refused(1, {50, 1024, 100, 0}, "voice barring time");
    refused(1, {50, 4, 50, 0}, "video barring time");
    refused(1, {100, 0, 103, 0}, "video factor");
    dial(0, "+15559999");
}

TEST_F(CallRadio, TheEmergencyPdnIsDescribedThenRegisteredThenDeregistered) {
    expect_refused(radio_.register_emergency_pdn(0), Result::kWrongState,
                   "SetEmergencyPdnInfo first");
    expect_refused(radio_.deregister_emergency_pdn(0), Result::kWrongState, "not registered");
    expect_accepted(
        radio_.set_emergency_pdn(0, {"rmnet1", {"192.0.2.1", "2001:db8::1"}, "192.0.2.7"}));
    expect_accepted(radio_.register_emergency_pdn(0));
    expect_refused(radio_.register_emergency_pdn(0), Result::kWrongState, "registered already");
    expect_refused(radio_.set_emergency_pdn(0, {"rmnet1", {"192.0.2.1"}, "192.0.2.7"}),
                   Result::kWrongState, "deregister it first");
    expect_refused(radio_.register_emergency_pdn(1), Result::kWrongState,
                   "SetEmergencyPdnInfo first");
    expect_accepted(radio_.deregister_emergency_pdn(0));
    expect_refused(radio_.deregister_emergency_pdn(0), Result::kWrongState, "not registered");
    expect_accepted(radio_.register_emergency_pdn(0));
}

TEST_F(CallRadio, TheDescriptionOfTheEmergencyPdnIsChecked) {
    const auto refused = [&](EmergencyPdn info, const char *reason) {
        expect_refused(radio_.set_emergency_pdn(0, std::move(info)), Result::kInvalidArgument,
                       reason);
    };
    refused({"", {"192.0.2.1"}, "192.0.2.7"}, "interface is empty");
    refused({"rmnet1", {}, "192.0.2.7"}, "no server address");
    refused({"rmnet1", {"192.0.2.1", "here"}, "192.0.2.7"}, "\"here\" is no IP address");
    refused({"rmnet1", {"192.0.2.1"}, "192.0.2"}, "local address");
}

} // namespace
} // namespace sim::test
