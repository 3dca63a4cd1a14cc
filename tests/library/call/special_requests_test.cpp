// SPDX-License-Identifier: Apache-2.0
// What single call requests do beside the common frame.
#include "tests/support/expectations.hpp"
#include "tests/support/request_row.hpp"
#include "tests/support/with_peer.hpp"

#include <climits>
#include <cstdlib>
#include <cstring>

namespace test {
namespace {

class CallRequest : public WithPeer {
  protected:
    // The one call that reached the peer, whatever it was answered.
    Call only_request() {
        const std::vector<Call> sent = requests();
        if (sent.size() != 1)
            throw std::runtime_error(std::to_string(sent.size()) + " calls instead of 1");
        return sent.front();
    }
};

TEST_F(CallRequest, MakeCallSendsNullTextsAsEmptyOnes) {
    const ims_call_make_info_s info{nullptr, 7, nullptr, nullptr, nullptr, nullptr};
    EXPECT_EQ(ims_call_make_call(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(only_request(), "(isissss)", "(42, '', 7, '', '', '', '')");
}

TEST_F(CallRequest, MakeCallSendsTextsOfAnyScriptUnchanged) {
    const ims_call_make_info_s info{
        "sip:zo\xc3\xab@example.org", -1, "\xe2\x82\xac", "", " ", "\xf0\x9f\x93\x9e"};
    EXPECT_EQ(ims_call_make_call(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(only_request(), "(isissss)",
                "(42, 'sip:zo\xc3\xab@example.org', -1, '\xe2\x82\xac', '', ' ', "
                "'\xf0\x9f\x93\x9e')");
}

TEST_F(CallRequest, SendDtmfSendsANullTextAsAnEmptyOne) {
    const ims_call_dtmf_info_s info{7, nullptr};
    EXPECT_EQ(ims_call_send_dtmf(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(only_request(), "(iis)", "(42, 7, '')");
}

TEST_F(CallRequest, VoiceRecordSendsANullTextAsAnEmptyOne) {
    const ims_call_record_info_s info{7, 1, nullptr};
    EXPECT_EQ(ims_call_voice_record(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(only_request(), "(iiis)", "(42, 7, 1, '')");
}

TEST_F(CallRequest, AddUserForConferenceCallSendsANullTextAsAnEmptyOne) {
    const ims_call_conf_user_s info{7, nullptr, 3};
    EXPECT_EQ(ims_call_add_user_for_conference_call(handle_, &info, nullptr, nullptr),
              IMS_ERROR_NONE);
    expect_sent(only_request(), "(iisi)", "(42, 7, '', 3)");
}

TEST_F(CallRequest, StartDtmfSendsAnyByte) {
    const ims_call_dtmf_tone_s info{7, 255};
    EXPECT_EQ(ims_call_start_dtmf(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(only_request(), "(iiy)", "(42, 7, 0xff)");
}

TEST_F(CallRequest, SendUssdOfTypeThreeSendsNoTextAndLeavesTheBufferUntouched) {
    char text[] = "*100#12";
    const ims_call_ussd_info_s info{3, 15, text, 4};
    EXPECT_EQ(ims_call_send_ussd(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(only_request(), "(iiis)", "(42, 3, 15, '')");
    EXPECT_EQ(std::memcmp(text, "*100#12", sizeof text), 0);
}

TEST_F(CallRequest, SendUssdOfTypeThreeDoesNotLookAtItsText) {
    char text[] = "caf\xe9";
    const ims_call_ussd_info_s info{3, 15, text, 4};
    EXPECT_EQ(ims_call_send_ussd(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(only_request(), "(iiis)", "(42, 3, 15, '')");
    EXPECT_TRUE(take_log().empty());
}

TEST_F(CallRequest, SendUssdWritesAZeroByteAtTheLengthIntoTheCallersBuffer) {
    char text[] = "*100#12";
    const ims_call_ussd_info_s info{1, 15, text, 4};
    EXPECT_EQ(ims_call_send_ussd(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(only_request(), "(iiis)", "(42, 1, 15, '*100')");
    EXPECT_EQ(std::memcmp(text,
                          "*100\0"
                          "12",
                          sizeof text),
              0);
}

TEST_F(CallRequest, SendUssdOfLengthNoneSendsNoText) {
    char text[] = "*100#";
    const ims_call_ussd_info_s info{2, 15, text, 0};
    EXPECT_EQ(ims_call_send_ussd(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(only_request(), "(iiis)", "(42, 2, 15, '')");
    EXPECT_EQ(text[0], '\0');
}

TEST_F(CallRequest, SendUssdSendsANullTextAsAnEmptyOne) {
    const ims_call_ussd_info_s info{1, 15, nullptr, 4};
    EXPECT_EQ(ims_call_send_ussd(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(only_request(), "(iiis)", "(42, 1, 15, '')");
}

TEST_F(CallRequest, SendUssdOfANegativeLengthWritesNothing) {
    char buffer[] = "ab*100#";
    const ims_call_ussd_info_s info{1, 15, buffer + 2, -1};
    EXPECT_EQ(ims_call_send_ussd(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(only_request(), "(iiis)", "(42, 1, 15, '*100#')");
    EXPECT_STREQ(buffer, "ab*100#");
}

TEST_F(CallRequest, SendTtyDataSendsEveryByteAsPaddedBase64) {
    std::vector<std::uint8_t> bytes(256);
    for (std::size_t i = 0; i < bytes.size(); ++i)
        bytes[i] = static_cast<std::uint8_t>(i);
    const ims_call_tty_data_s info{7, bytes.data(), 256};
    EXPECT_EQ(ims_call_send_tty_data(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    const Call sent = only_request();
    EXPECT_EQ(sent.signature, "iis");
    const Variant text{g_variant_get_child_value(sent.body.get(), 2)};
    gsize length = 0;
    guchar *decoded = g_base64_decode(g_variant_get_string(text.get(), nullptr), &length);
    EXPECT_EQ(std::vector<std::uint8_t>(decoded, decoded + length), bytes);
    g_free(decoded);
    EXPECT_EQ(std::strlen(g_variant_get_string(text.get(), nullptr)), 344U);
}

TEST_F(CallRequest, SendTtyDataPadsShortData) {
    const std::uint8_t byte[] = {'A'};
    const ims_call_tty_data_s info{7, byte, 1};
    EXPECT_EQ(ims_call_send_tty_data(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(only_request(), "(iis)", "(42, 7, 'QQ==')");
}

TEST_F(CallRequest, SendTtyDataSendsNoBytesForNullAndForCountsThatAreNotPositive) {
    const std::uint8_t bytes[] = {'A', 'B'};
    const ims_call_tty_data_s infos[] = {
        {7, nullptr, 2}, {7, nullptr, 0}, {7, bytes, 0}, {7, bytes, -1}, {7, bytes, INT_MIN}};
    for (const auto &info : infos)
        EXPECT_EQ(ims_call_send_tty_data(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    const std::vector<Call> sent = requests();
    ASSERT_EQ(sent.size(), std::size(infos));
    for (const Call &call : sent)
        expect_sent(call, "(iis)", "(42, 7, '')");
}

TEST_F(CallRequest, GetTtyModeDecodesAnEmptyTextToNoBytes) {
    peer().on("org.kelvo.ims.Call.GetTtyMode", reply("(iiis)", "(0, 7, 8, '')"));
    ResponseRecorder recorder{[](const Response &, void *data) {
        ASSERT_NE(data, nullptr);
        EXPECT_EQ(static_cast<ims_call_tty_mode_s *>(data)->length, 0);
    }};
    EXPECT_EQ(ims_call_get_tty_mode(handle_, ResponseRecorder::callback, &recorder),
              IMS_ERROR_NONE);
    fence();
    EXPECT_EQ(recorder.count(), 1U);
}

TEST_F(CallRequest, GetTtyModeSurvivesATextThatIsNotBase64) {
    ResponseRecorder recorder;
    for (const char *text : {"(0, 7, 8, 'not base64 at all!')", "(0, 7, 8, '====')",
                             "(0, 7, 8, 'Q')", "(0, 7, 8, '\xe2\x82\xac')"}) {
        peer().on("org.kelvo.ims.Call.GetTtyMode", reply("(iiis)", text));
        EXPECT_EQ(ims_call_get_tty_mode(handle_, ResponseRecorder::callback, &recorder),
                  IMS_ERROR_NONE);
        fence();
    }
    EXPECT_EQ(recorder.count(), 4U);
}

TEST_F(CallRequest, ChangeCallsTextIsTheApplicationsAfterTheCallback) {
    peer().on("org.kelvo.ims.Call.ChangeCall", reply("(iis)", "(0, 9, 'kept for later')"));
    char *text = nullptr;
    ResponseRecorder recorder{[&](const Response &, void *data) {
        text = static_cast<ims_call_change_result_s *>(data)->text_1;
    }};
    const ims_call_pair_info_s info{1, 2};
    EXPECT_EQ(ims_call_change_call(handle_, &info, ResponseRecorder::callback, &recorder),
              IMS_ERROR_NONE);
    fence();
    EXPECT_STREQ(text, "kept for later");
    std::free(text);
}

TEST_F(CallRequest, IsMutedHandsFalseOverAsAByteOfZero) {
    peer().on("org.kelvo.ims.Call.IsMuted", reply("(ib)", "(0, false)"));
    ResponseRecorder recorder{[](const Response &, void *data) {
        ASSERT_NE(data, nullptr);
        EXPECT_EQ(*static_cast<unsigned char *>(data), 0);
    }};
    EXPECT_EQ(ims_call_is_muted(handle_, 7, ResponseRecorder::callback, &recorder), IMS_ERROR_NONE);
    fence();
    EXPECT_EQ(recorder.count(), 1U);
}

TEST_F(CallRequest, MergeCallsHandsOverAPointerToTheSecondInt) {
    peer().on("org.kelvo.ims.Call.MergeCalls", reply("(ii)", "(0, 7)"));
    ResponseRecorder recorder{[](const Response &, void *data) {
        ASSERT_NE(data, nullptr);
        EXPECT_EQ(*static_cast<std::int32_t *>(data), 7);
    }};
    EXPECT_EQ(ims_call_merge_calls(handle_, ResponseRecorder::callback, &recorder), IMS_ERROR_NONE);
    fence();
    ASSERT_EQ(recorder.count(), 1U);
    EXPECT_EQ(recorder.last().result, 0);
}

TEST_F(CallRequest, StartConferenceHandsOverTheSecondIntItself) {
    const ims_call_conference_s info{1, 0, nullptr};
    for (const int value : {7, 0, -7, INT_MIN, INT_MAX}) {
        const Variant answer = share(g_variant_new("(ii)", 0, value));
        peer().on("org.kelvo.ims.Call.StartConference", reply_with(answer.get()));
        ResponseRecorder recorder{[&](const Response &, void *data) {
            EXPECT_EQ(static_cast<int>(reinterpret_cast<std::intptr_t>(data)), value);
        }};
        EXPECT_EQ(ims_call_start_conference(handle_, &info, ResponseRecorder::callback, &recorder),
                  IMS_ERROR_NONE);
        fence();
        ASSERT_EQ(recorder.count(), 1U);
        EXPECT_EQ(recorder.last().result, 0);
    }
}

// A chain of three.
constexpr ims_call_participant_s kC{"c", nullptr};
constexpr ims_call_participant_s kB{"b", &kC};
constexpr ims_call_participant_s kA{"a", &kB};

struct ConferenceCase {
    const char *name;
    std::int32_t count;
    const ims_call_participant_s *list;
    const char *array;
};

constexpr ConferenceCase kConferenceCases[] = {
    {"CountFiveOfThreeSendsThree", 5, &kA, "['a', 'b', 'c']"},
    {"CountTwoOfThreeSendsTwo", 2, &kA, "['a', 'b']"},
    {"CountThreeOfThreeSendsThree", 3, &kA, "['a', 'b', 'c']"},
    {"CountNoneSendsNone", 0, &kA, "@as []"},
    {"NegativeCountSendsNone", -1, &kA, "@as []"},
    {"NoListSendsNone", 4, nullptr, "@as []"},
    {"NothingAtAllSendsNone", 0, nullptr, "@as []"},
    {"HugeCountSendsTheList", INT_MAX, &kB, "['b', 'c']"}};

class Conference : public WithPeer, public ::testing::WithParamInterface<ConferenceCase> {};

std::string conference_name(const ::testing::TestParamInfo<ConferenceCase> &tested) {
    return tested.param.name;
}

INSTANTIATE_TEST_SUITE_P(Call, Conference, ::testing::ValuesIn(kConferenceCases), conference_name);

TEST_P(Conference, StartSendsParticipantsUpToTheCount) {
    const auto &[name, count, list, array] = GetParam();
    const ims_call_conference_s info{9, count, list};
    EXPECT_EQ(ims_call_start_conference(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    const std::vector<Call> sent = requests();
    ASSERT_EQ(sent.size(), 1U);
    expect_sent(sent[0], "(iiv)", "(9, " + std::to_string(count) + ", <" + array + ">)");
}

TEST_P(Conference, ModifySendsParticipantsUpToTheCount) {
    const auto &[name, count, list, array] = GetParam();
    const ims_call_conference_modify_s info{9, 8, count, list};
    EXPECT_EQ(ims_call_modify_participants_in_conference(handle_, &info, nullptr, nullptr),
              IMS_ERROR_NONE);
    const std::vector<Call> sent = requests();
    ASSERT_EQ(sent.size(), 1U);
    expect_sent(sent[0], "(iiiv)", "(9, 8, " + std::to_string(count) + ", <" + array + ">)");
}

TEST_F(CallRequest, ConferencesSendANullParticipantAsAnEmptyText) {
    const ims_call_participant_s nobody{nullptr, &kC};
    const ims_call_conference_s info{9, 2, &nobody};
    EXPECT_EQ(ims_call_start_conference(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(only_request(), "(iiv)", "(9, 2, <['', 'c']>)");
}

TEST_F(CallRequest, ConferencesDoNotLookPastTheCount) {
    const ims_call_participant_s bad{kNotUtf8, nullptr};
    const ims_call_participant_s good{"a", &bad};
    const ims_call_conference_s info{9, 1, &good};
    EXPECT_EQ(ims_call_start_conference(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(only_request(), "(iiv)", "(9, 1, <['a']>)");
}

TEST_F(CallRequest, EmergencyPdnSendsTheFirstTextsInOrder) {
    constexpr const char *texts[] = {"z", "a", kNotUtf8};
    const ims_call_emergency_pdn_s info{"first", 2, texts, "last"};
    EXPECT_EQ(ims_call_set_emergency_pdn_info(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(only_request(), "(isivs)", "(42, 'first', 2, <['z', 'a']>, 'last')");
}

TEST_F(CallRequest, EmergencyPdnSendsNoTextsForCountsThatAreNotPositive) {
    constexpr const char *texts[] = {"z"};
    for (const std::int32_t count : {0, -1, INT_MIN}) {
        const ims_call_emergency_pdn_s info{"first", count, texts, "last"};
        EXPECT_EQ(ims_call_set_emergency_pdn_info(handle_, &info, nullptr, nullptr),
                  IMS_ERROR_NONE);
        expect_sent(requests().back(), "(isivs)",
                    "(42, 'first', " + std::to_string(count) + ", <@as []>, 'last')");
    }
}

TEST_F(CallRequest, EmergencyPdnSurvivesNullTexts) {
    constexpr const char *texts[] = {nullptr, "a"};
    const ims_call_emergency_pdn_s info{nullptr, 2, texts, nullptr};
    EXPECT_EQ(ims_call_set_emergency_pdn_info(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(only_request(), "(isivs)", "(42, '', 2, <['', 'a']>, '')");
}

TEST(CallGate, SwapCallWithANullHandleIsRefusedAfterTheGate) {
    EXPECT_EQ(ims_call_swap_call(nullptr, nullptr, nullptr), IMS_ERROR_INVALID_PARAMETER);
    set_gate(Gate::kOff);
    EXPECT_EQ(ims_call_swap_call(nullptr, nullptr, nullptr), IMS_ERROR_NOT_SUPPORTED);
}

TEST_F(CallRequest, IntegersPassThroughUnchecked) {
    for (const std::int32_t value : {INT_MIN, -1, 0, INT_MAX}) {
        EXPECT_EQ(ims_call_hold_call(handle_, value, nullptr, nullptr), IMS_ERROR_NONE);
        expect_sent(requests().back(), "(ii)", "(42, " + std::to_string(value) + ")");
    }
}

} // namespace
} // namespace test
