// SPDX-License-Identifier: Apache-2.0
#include "tests/library/call/call_rows.hpp"

#include "tests/support/data_checks.hpp"

#include <glib.h>
#include <gtest/gtest.h>

#include <cstdlib>
#include <cstring>

namespace test {
namespace {

constexpr Module kCall{.unit = "ims_call.cpp", .interface = "org.kelvo.ims.Call"};

constexpr ims_call_make_info_s kMake{"+4912345", 2, "one", "two", "three", "four"};
char ussd_text[] = "*100#";
const ims_call_ussd_info_s kUssd{1, 15, ussd_text, 5};
constexpr std::int32_t kSession = 7;
constexpr std::int32_t kTtyMode = 2;
constexpr ims_call_id_info_s kIds{7, 8, 9};
constexpr ims_call_pair_info_s kPair{7, -8};
constexpr ims_call_dtmf_info_s kDtmf{7, "12*#"};
constexpr ims_call_dtmf_tone_s kTone{7, '5'};
constexpr ims_call_record_info_s kVoiceRecord{7, 1, "/tmp/voice.amr"};
constexpr std::uint8_t kTtyBytes[] = {'h', 'e', 'l', 'l', 'o', 0, 255};
constexpr ims_call_tty_data_s kTty{7, kTtyBytes, sizeof kTtyBytes};
constexpr ims_call_conf_user_s kUser{7, "+4912345", 3};
constexpr ims_call_ssac_info_s kSsac{1, -2, 3, G_MININT32, G_MAXINT32};
constexpr const char *kPdnTexts[] = {"ims", "sos"};
constexpr ims_call_emergency_pdn_s kPdn{"first", 2, kPdnTexts, "last"};
constexpr ims_call_participant_s kSecond{"sip:b@example.org", nullptr};
constexpr ims_call_participant_s kFirst{"sip:a@example.org", &kSecond};
constexpr ims_call_conference_s kConference{5, 2, &kFirst};
constexpr ims_call_conference_modify_s kModify{5, 6, 2, &kFirst};

constexpr const char *kBadPdnTexts[] = {"ims", kNotUtf8};
constexpr ims_call_participant_s kBadSecond{kNotUtf8, nullptr};
constexpr ims_call_participant_s kBadFirst{"sip:a@example.org", &kBadSecond};

// "(ii)" "(0, 7)"
void is_seven_itself(void *data) {
    EXPECT_EQ(data, reinterpret_cast<void *>(std::intptr_t{7}));
}

// "(ib)" "(0, true)"
void is_pointer_to_true(void *data) {
    ASSERT_NE(data, nullptr);
    unsigned char byte = 0;
    std::memcpy(&byte, data, 1);
    EXPECT_EQ(byte, 1);
}

// "(iis)" "(0, 7, 'sip:x')"; the text is the application's
void is_change_result(void *data) {
    ASSERT_NE(data, nullptr);
    const auto &result = *static_cast<ims_call_change_result_s *>(data);
    EXPECT_EQ(result.value_1, 7);
    EXPECT_STREQ(result.text_1, "sip:x");
    std::free(result.text_1);
}

// "(iiis)" "(0, 7, 8, 'AP9oaQA=')": 0, 255, 'h', 'i', 0
void is_tty_mode(void *data) {
    ASSERT_NE(data, nullptr);
    const auto &mode = *static_cast<ims_call_tty_mode_s *>(data);
    EXPECT_EQ(mode.value_1, 7);
    EXPECT_EQ(mode.value_2, 8);
    ASSERT_EQ(mode.length, 5);
    const std::uint8_t expected[] = {0, 255, 'h', 'i', 0};
    EXPECT_EQ(std::memcmp(mode.data, expected, sizeof expected), 0);
}

// As long as the length says, for the library ends the text there.
BadText bad_ussd_text() {
    return spoilt<ims_call_ussd_info_s>("text", [](ims_call_ussd_info_s &info) {
        static char text[] = "caf\xe9*";
        info.text = text;
    });
}

std::vector<RequestRow> call_life_rows() {
    using Make = ims_call_make_info_s;
    return {
        {.function = request<ims_call_make_call, kMake>(),
         .method = "MakeCall",
         .type = "(isissss)",
         .arguments = "(42, '+4912345', 2, 'one', 'two', 'three', 'four')",
         .bad_texts = {bad_text<&Make::number>(), bad_text<&Make::text_1>(),
                       bad_text<&Make::text_2>(), bad_text<&Make::text_3>(),
                       bad_text<&Make::text_4>()},
         .reply_type = "(ii)",
         .reply = "(0, 7)",
         .check_data = points_to<7>},
        {.function = request<ims_call_send_ussd, kUssd>(),
         .method = "SendUssd",
         .type = "(iiis)",
         .arguments = "(42, 1, 15, '*100#')",
         .bad_texts = {bad_ussd_text()}},
        {.function = request<ims_call_answer_call, kIds>(),
         .method = "AnswerCall",
         .type = "(iiii)",
         .arguments = "(42, 7, 8, 9)"},
        {.function = request<ims_call_end_call, kIds>(),
         .method = "EndCall",
         .type = "(iiii)",
         .arguments = "(42, 7, 8, 9)"},
        {.function = request<ims_call_reject_call, kPair>(),
         .method = "RejectCall",
         .type = "(iii)",
         .arguments = "(42, 7, -8)"},
        {.function = request<ims_call_hold_call, kSession>(),
         .method = "HoldCall",
         .type = "(ii)",
         .arguments = "(42, 7)"},
        {.function = request<ims_call_resume_call, kSession>(),
         .method = "ResumeCall",
         .type = "(ii)",
         .arguments = "(42, 7)"},
        {.function = request<ims_call_swap_call>(),
         .method = "SwapCall",
         .type = "(i)",
         .arguments = "(42,)"},
        {.function = request<ims_call_upgrade_call, kPair>(),
         .method = "UpgradeCall",
         .type = "(iii)",
         .arguments = "(42, 7, -8)"},
        {.function = request<ims_call_downgrade_call, kPair>(),
         .method = "DowngradeCall",
         .type = "(iii)",
         .arguments = "(42, 7, -8)"},
        {.function = request<ims_call_change_call, kPair>(),
         .method = "ChangeCall",
         .type = "(iii)",
         .arguments = "(42, 7, -8)",
         .reply_type = "(iis)",
         .reply = "(0, 7, 'sip:x')",
         .check_data = is_change_result},
        {.function = request<ims_call_accept_change_request, kSession>(),
         .method = "AcceptChangeRequest",
         .type = "(ii)",
         .arguments = "(42, 7)"},
        {.function = request<ims_call_reject_change_request, kSession>(),
         .method = "RejectChangeRequest",
         .type = "(ii)",
         .arguments = "(42, 7)"},
    };
}

std::vector<RequestRow> media_rows() {
    return {
        {.function = request<ims_call_send_dtmf, kDtmf>(),
         .method = "SendDtmf",
         .type = "(iis)",
         .arguments = "(42, 7, '12*#')",
         .bad_texts = {bad_text<&ims_call_dtmf_info_s::digits>()}},
        {.function = request<ims_call_start_dtmf, kTone>(),
         .method = "StartDtmf",
         .type = "(iiy)",
         .arguments = "(42, 7, 0x35)"},
        {.function = request<ims_call_stop_dtmf, kSession>(),
         .method = "StopDtmf",
         .type = "(ii)",
         .arguments = "(42, 7)"},
        {.function = request<ims_call_voice_record, kVoiceRecord>(),
         .method = "VoiceRecord",
         .type = "(iiis)",
         .arguments = "(42, 7, 1, '/tmp/voice.amr')",
         .bad_texts = {bad_text<&ims_call_record_info_s::text_1>()}},
        {.function = request<ims_call_send_tty_data, kTty>(),
         .method = "SendTtyData",
         .type = "(iis)",
         .arguments = "(42, 7, 'aGVsbG8A/w==')"},
        {.function = request<ims_call_set_tty_mode, kTtyMode>(),
         .method = "SetTtyMode",
         .type = "(ii)",
         .arguments = "(42, 2)"},
        {.function = request<ims_call_get_tty_mode>(),
         .method = "GetTtyMode",
         .reply_type = "(iiis)",
         .reply = "(0, 7, 8, 'AP9oaQA=')",
         .check_data = is_tty_mode},
        {.function = request<ims_call_is_muted, kSession>(),
         .method = "IsMuted",
         .type = "(ii)",
         .arguments = "(42, 7)",
         .reply_type = "(ib)",
         .reply = "(0, true)",
         .check_data = is_pointer_to_true},
        {.function = request<ims_call_toggle_mute, kSession>(),
         .method = "ToggleMute",
         .type = "(ii)",
         .arguments = "(42, 7)"},
        {.function = request<ims_call_set_speaker_mode, kPair>(),
         .method = "SetSpeakerMode",
         .type = "(iii)",
         .arguments = "(42, 7, -8)"},
        {.function = request<ims_call_set_volume, kPair>(),
         .method = "SetVolume",
         .type = "(iii)",
         .arguments = "(42, 7, -8)"},
        {.function = request<ims_call_get_max_volume, kSession>(),
         .method = "GetMaxVolume",
         .type = "(ii)",
         .arguments = "(42, 7)",
         .reply_type = "(ii)",
         .reply = "(0, 7)",
         .check_data = points_to<7>},
    };
}

std::vector<RequestRow> network_rows() {
    using Pdn = ims_call_emergency_pdn_s;
    return {
        {.function = request<ims_call_indicate_srvcc_ho_started, kSession>(),
         .method = "IndicateSrvccHoStarted",
         .type = "(ii)",
         .arguments = "(42, 7)"},
        {.function = request<ims_call_indicate_srvcc_ho_failed, kSession>(),
         .method = "IndicateSrvccHoFailed",
         .type = "(ii)",
         .arguments = "(42, 7)"},
        {.function = request<ims_call_set_auto_response, kPair>(),
         .method = "SetAutoResponse",
         .type = "(iii)",
         .arguments = "(42, 7, -8)"},
        {.function = request<ims_call_set_emergency_pdn_info, kPdn>(),
         .method = "SetEmergencyPdnInfo",
         .type = "(isivs)",
         .arguments = "(42, 'first', 2, <['ims', 'sos']>, 'last')",
         .bad_texts = {bad_text<&Pdn::text_1>(), bad_text<&Pdn::text_2>(),
                       spoilt<Pdn>("texts", [](Pdn &info) { info.texts = kBadPdnTexts; })}},
        {.function = request<ims_call_register_emergency_pdn>(), .method = "RegisterEmergencyPdn"},
        {.function = request<ims_call_deregister_emergency_pdn>(),
         .method = "DeregisterEmergencyPdn"},
        {.function = request<ims_call_is_in_epdg_call>(),
         .method = "IsInEpdgCall",
         .type = "(i)",
         .arguments = "(42,)",
         .reply_type = "(ib)",
         .reply = "(0, true)",
         .check_data = is_pointer_to_true},
        {.function = request<ims_call_update_ssac_info, kSsac>(),
         .method = "UpdateSsacInfo",
         .type = "(iiiiii)",
         .arguments = "(42, 1, -2, 3, -2147483648, 2147483647)"},
        {.function = request<ims_call_change_epdg_audio_path, kSession>(),
         .method = "ChangeEpdgAudioPath",
         .type = "(ii)",
         .arguments = "(42, 7)"},
    };
}

std::vector<RequestRow> conference_rows() {
    return {
        {.function = request<ims_call_add_user_for_conference_call, kUser>(),
         .method = "AddUserForConferenceCall",
         .type = "(iisi)",
         .arguments = "(42, 7, '+4912345', 3)",
         .bad_texts = {bad_text<&ims_call_conf_user_s::number>()}},
        {.function = request<ims_call_start_nway_conference_call, kIds>(),
         .method = "StartNwayConferenceCall",
         .type = "(iiii)",
         .arguments = "(42, 7, 8, 9)",
         .reply_type = "(ii)",
         .reply = "(0, 7)",
         .check_data = points_to<7>},
        {.function = request<ims_call_merge_calls>(),
         .method = "MergeCalls",
         .type = "(i)",
         .arguments = "(42,)",
         .reply_type = "(ii)",
         .reply = "(0, 7)",
         .check_data = points_to<7>},
        {.function = request<ims_call_add_participant_to_nway_conference_call, kPair>(),
         .method = "AddParticipantToNwayConferenceCall",
         .type = "(iii)",
         .arguments = "(42, 7, -8)"},
        {.function = request<ims_call_remove_participant_from_nway_conference_call, kPair>(),
         .method = "RemoveParticipantFromNwayConferenceCall",
         .type = "(iii)",
         .arguments = "(42, 7, -8)"},
        {.function = request<ims_call_start_conference, kConference>(),
         .method = "StartConference",
         .type = "(iiv)",
         .arguments = "(5, 2, <['sip:a@example.org', 'sip:b@example.org']>)",
         .checked = Checked::kHandle,
         .bad_texts = {bad_part<&ims_call_conference_s::participants, kBadFirst>("participants")},
         .reply_type = "(ii)",
         .reply = "(0, 7)",
         .check_data = is_seven_itself,
         .handler = "on_response_start_conference"},
        {.function = request<ims_call_modify_participants_in_conference, kModify>(),
         .method = "ModifyParticipantsInConference",
         .type = "(iiiv)",
         .arguments = "(5, 6, 2, <['sip:a@example.org', 'sip:b@example.org']>)",
         .checked = Checked::kHandle,
         .bad_texts = {bad_part<&ims_call_conference_modify_s::participants, kBadFirst>(
             "participants")},
         .reply_type = "(ii)",
         .reply = "(0, 7)",
         .check_data = is_seven_itself,
         .handler = "on_response_modify_participants_into_conference"},
    };
}

} // namespace

std::vector<RequestRow> call_request_rows() {
    return requests_of(kCall,
                       joined({call_life_rows(), media_rows(), network_rows(), conference_rows()}));
}

std::vector<QueryRow> call_query_rows() {
    const std::vector<QueryRow> rows{
        {.function = query<ims_call_get_call_list_info>(),
         .method = "CallListInfo",
         .type = "(i)",
         .arguments = "(42,)",
         .reply_type = "(iuaa{sv})",
         .reply = "(0, 1, [{'session_id': <7>, 'peer_uri': <'sip:a@example.org'>}])",
         .refused_reply = "(4, 0, [])",
         .refused_message = "Failed to get Call Info: 4"},
    };
    return queries_of(kCall, rows);
}

} // namespace test
