// SPDX-License-Identifier: Apache-2.0
#include "tests/library/call/call_rows.hpp"

#include <glib.h>
#include <gtest/gtest.h>

#include <cstdlib>
#include <cstring>

namespace test {
namespace {

constexpr Module kCall{"ims_call.cpp", "org.kelvo.ims.Call"};

constexpr ims_call_make_info_s kMake{"+4912345", 2, "one", "two", "three", "four"};
char ussd_text[] = "*100#";
const ims_call_ussd_info_s kUssd{1, 15, ussd_text, 5};
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

RequestRow named(const char *handler, RequestRow row) {
    row.handler = handler;
    return row;
}

// "(ii)" "(0, 7)"
void is_pointer_to_seven(void *data) {
    ASSERT_NE(data, nullptr);
    EXPECT_EQ(*static_cast<std::int32_t *>(data), 7);
}
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

Variation bad_ussd_text() {
    return {"text", [](ims_h handle, ims_response_cb callback, void *user_data) {
                char text[] = "caf\xe9*";
                const ims_call_ussd_info_s info{1, 15, text, 5};
                return ims_call_send_ussd(handle, &info, callback, user_data);
            }};
}

Variation bad_pdn_list() {
    return {"texts", [](ims_h handle, ims_response_cb callback, void *user_data) {
                const ims_call_emergency_pdn_s info{"first", 2, kBadPdnTexts, "last"};
                return ims_call_set_emergency_pdn_info(handle, &info, callback, user_data);
            }};
}

Variation bad_participant() {
    return {"participants", [](ims_h handle, ims_response_cb callback, void *user_data) {
                const ims_call_conference_s info{5, 2, &kBadFirst};
                return ims_call_start_conference(handle, &info, callback, user_data);
            }};
}

Variation bad_modified_participant() {
    return {"participants", [](ims_h handle, ims_response_cb callback, void *user_data) {
                const ims_call_conference_modify_s info{5, 6, 2, &kBadFirst};
                return ims_call_modify_participants_in_conference(handle, &info, callback,
                                                                  user_data);
            }};
}

std::vector<RequestRow> call_life_rows() {
    using Make = ims_call_make_info_s;
    return {
        with_reply(with_bad_texts(record_row<ims_call_make_call, kMake>(
                                      kCall, "ims_call_make_call", "MakeCall", "(isissss)",
                                      "(42, '+4912345', 2, 'one', 'two', 'three', 'four')"),
                                  {bad_text<ims_call_make_call, kMake, &Make::number>("number"),
                                   bad_text<ims_call_make_call, kMake, &Make::text_1>("text_1"),
                                   bad_text<ims_call_make_call, kMake, &Make::text_2>("text_2"),
                                   bad_text<ims_call_make_call, kMake, &Make::text_3>("text_3"),
                                   bad_text<ims_call_make_call, kMake, &Make::text_4>("text_4")}),
                   "(ii)", "(0, 7)", is_pointer_to_seven),
        with_bad_texts(record_row<ims_call_send_ussd, kUssd>(kCall, "ims_call_send_ussd",
                                                             "SendUssd", "(iiis)",
                                                             "(42, 1, 15, '*100#')"),
                       {bad_ussd_text()}),
        record_row<ims_call_answer_call, kIds>(kCall, "ims_call_answer_call", "AnswerCall",
                                               "(iiii)", "(42, 7, 8, 9)"),
        record_row<ims_call_end_call, kIds>(kCall, "ims_call_end_call", "EndCall", "(iiii)",
                                            "(42, 7, 8, 9)"),
        record_row<ims_call_reject_call, kPair>(kCall, "ims_call_reject_call", "RejectCall",
                                                "(iii)", "(42, 7, -8)"),
        value_row<ims_call_hold_call, 7>(kCall, "ims_call_hold_call", "HoldCall", "(ii)",
                                         "(42, 7)"),
        value_row<ims_call_resume_call, 7>(kCall, "ims_call_resume_call", "ResumeCall", "(ii)",
                                           "(42, 7)"),
        plain_row<ims_call_swap_call>(kCall, "ims_call_swap_call", "SwapCall", "(i)", "(42,)"),
        record_row<ims_call_upgrade_call, kPair>(kCall, "ims_call_upgrade_call", "UpgradeCall",
                                                 "(iii)", "(42, 7, -8)"),
        record_row<ims_call_downgrade_call, kPair>(kCall, "ims_call_downgrade_call",
                                                   "DowngradeCall", "(iii)", "(42, 7, -8)"),
        with_reply(record_row<ims_call_change_call, kPair>(kCall, "ims_call_change_call",
                                                           "ChangeCall", "(iii)", "(42, 7, -8)"),
                   "(iis)", "(0, 7, 'sip:x')", is_change_result),
        value_row<ims_call_accept_change_request, 7>(kCall, "ims_call_accept_change_request",
                                                     "AcceptChangeRequest", "(ii)", "(42, 7)"),
        value_row<ims_call_reject_change_request, 7>(kCall, "ims_call_reject_change_request",
                                                     "RejectChangeRequest", "(ii)", "(42, 7)"),
    };
}

std::vector<RequestRow> media_rows() {
    return {
        with_bad_texts(
            record_row<ims_call_send_dtmf, kDtmf>(kCall, "ims_call_send_dtmf", "SendDtmf", "(iis)",
                                                  "(42, 7, '12*#')"),
            {bad_text<ims_call_send_dtmf, kDtmf, &ims_call_dtmf_info_s::digits>("digits")}),
        record_row<ims_call_start_dtmf, kTone>(kCall, "ims_call_start_dtmf", "StartDtmf", "(iiy)",
                                               "(42, 7, 0x35)"),
        value_row<ims_call_stop_dtmf, 7>(kCall, "ims_call_stop_dtmf", "StopDtmf", "(ii)",
                                         "(42, 7)"),
        with_bad_texts(
            record_row<ims_call_voice_record, kVoiceRecord>(kCall, "ims_call_voice_record",
                                                            "VoiceRecord", "(iiis)",
                                                            "(42, 7, 1, '/tmp/voice.amr')"),
            {bad_text<ims_call_voice_record, kVoiceRecord, &ims_call_record_info_s::text_1>(
                "text_1")}),
        record_row<ims_call_send_tty_data, kTty>(kCall, "ims_call_send_tty_data", "SendTtyData",
                                                 "(iis)", "(42, 7, 'aGVsbG8A/w==')"),
        value_row<ims_call_set_tty_mode, 2>(kCall, "ims_call_set_tty_mode", "SetTtyMode", "(ii)",
                                            "(42, 2)"),
        with_reply(
            plain_row<ims_call_get_tty_mode>(kCall, "ims_call_get_tty_mode", "GetTtyMode", "", ""),
            "(iiis)", "(0, 7, 8, 'AP9oaQA=')", is_tty_mode),
        with_reply(value_row<ims_call_is_muted, 7>(kCall, "ims_call_is_muted", "IsMuted", "(ii)",
                                                   "(42, 7)"),
                   "(ib)", "(0, true)", is_pointer_to_true),
        value_row<ims_call_toggle_mute, 7>(kCall, "ims_call_toggle_mute", "ToggleMute", "(ii)",
                                           "(42, 7)"),
        record_row<ims_call_set_speaker_mode, kPair>(kCall, "ims_call_set_speaker_mode",
                                                     "SetSpeakerMode", "(iii)", "(42, 7, -8)"),
        record_row<ims_call_set_volume, kPair>(kCall, "ims_call_set_volume", "SetVolume", "(iii)",
                                               "(42, 7, -8)"),
        with_reply(value_row<ims_call_get_max_volume, 7>(kCall, "ims_call_get_max_volume",
                                                         "GetMaxVolume", "(ii)", "(42, 7)"),
                   "(ii)", "(0, 7)", is_pointer_to_seven),
    };
}

std::vector<RequestRow> network_rows() {
    using Pdn = ims_call_emergency_pdn_s;
    return {
        value_row<ims_call_indicate_srvcc_ho_started, 7>(
            kCall, "ims_call_indicate_srvcc_ho_started", "IndicateSrvccHoStarted", "(ii)",
            "(42, 7)"),
        value_row<ims_call_indicate_srvcc_ho_failed, 7>(kCall, "ims_call_indicate_srvcc_ho_failed",
                                                        "IndicateSrvccHoFailed", "(ii)", "(42, 7)"),
        record_row<ims_call_set_auto_response, kPair>(kCall, "ims_call_set_auto_response",
                                                      "SetAutoResponse", "(iii)", "(42, 7, -8)"),
        with_bad_texts(record_row<ims_call_set_emergency_pdn_info, kPdn>(
                           kCall, "ims_call_set_emergency_pdn_info", "SetEmergencyPdnInfo",
                           "(isivs)", "(42, 'first', 2, <['ims', 'sos']>, 'last')"),
                       {bad_text<ims_call_set_emergency_pdn_info, kPdn, &Pdn::text_1>("text_1"),
                        bad_text<ims_call_set_emergency_pdn_info, kPdn, &Pdn::text_2>("text_2"),
                        bad_pdn_list()}),
        plain_row<ims_call_register_emergency_pdn>(kCall, "ims_call_register_emergency_pdn",
                                                   "RegisterEmergencyPdn", "", ""),
        plain_row<ims_call_deregister_emergency_pdn>(kCall, "ims_call_deregister_emergency_pdn",
                                                     "DeregisterEmergencyPdn", "", ""),
        with_reply(plain_row<ims_call_is_in_epdg_call>(kCall, "ims_call_is_in_epdg_call",
                                                       "IsInEpdgCall", "(i)", "(42,)"),
                   "(ib)", "(0, true)", is_pointer_to_true),
        record_row<ims_call_update_ssac_info, kSsac>(kCall, "ims_call_update_ssac_info",
                                                     "UpdateSsacInfo", "(iiiiii)",
                                                     "(42, 1, -2, 3, -2147483648, 2147483647)"),
        value_row<ims_call_change_epdg_audio_path, 7>(kCall, "ims_call_change_epdg_audio_path",
                                                      "ChangeEpdgAudioPath", "(ii)", "(42, 7)"),
    };
}

std::vector<RequestRow> conference_rows() {
    return {
        with_bad_texts(
            record_row<ims_call_add_user_for_conference_call, kUser>(
                kCall, "ims_call_add_user_for_conference_call", "AddUserForConferenceCall",
                "(iisi)", "(42, 7, '+4912345', 3)"),
            {bad_text<ims_call_add_user_for_conference_call, kUser, &ims_call_conf_user_s::number>(
                "number")}),
        with_reply(record_row<ims_call_start_nway_conference_call, kIds>(
                       kCall, "ims_call_start_nway_conference_call", "StartNwayConferenceCall",
                       "(iiii)", "(42, 7, 8, 9)"),
                   "(ii)", "(0, 7)", is_pointer_to_seven),
        with_reply(plain_row<ims_call_merge_calls>(kCall, "ims_call_merge_calls", "MergeCalls",
                                                   "(i)", "(42,)"),
                   "(ii)", "(0, 7)", is_pointer_to_seven),
        record_row<ims_call_add_participant_to_nway_conference_call, kPair>(
            kCall, "ims_call_add_participant_to_nway_conference_call",
            "AddParticipantToNwayConferenceCall", "(iii)", "(42, 7, -8)"),
        record_row<ims_call_remove_participant_from_nway_conference_call, kPair>(
            kCall, "ims_call_remove_participant_from_nway_conference_call",
            "RemoveParticipantFromNwayConferenceCall", "(iii)", "(42, 7, -8)"),
        named("on_response_start_conference",
              with_reply(
                  with_bad_texts(unchecked_record_row<ims_call_start_conference, kConference>(
                                     kCall, "ims_call_start_conference", "StartConference", "(iiv)",
                                     "(5, 2, <['sip:a@example.org', 'sip:b@example.org']>)"),
                                 {bad_participant()}),
                  "(ii)", "(0, 7)", is_seven_itself)),
        named("on_response_modify_participants_into_conference",
              with_reply(
                  with_bad_texts(
                      unchecked_record_row<ims_call_modify_participants_in_conference, kModify>(
                          kCall, "ims_call_modify_participants_in_conference",
                          "ModifyParticipantsInConference", "(iiiv)",
                          "(5, 6, 2, <['sip:a@example.org', 'sip:b@example.org']>)"),
                      {bad_modified_participant()}),
                  "(ii)", "(0, 7)", is_seven_itself)),
    };
}

} // namespace

std::vector<RequestRow> call_request_rows() {
    std::vector<RequestRow> rows;
    for (const auto &part : {call_life_rows(), media_rows(), network_rows(), conference_rows()})
        rows.insert(rows.end(), part.begin(), part.end());
    return rows;
}

std::vector<QueryRow> call_query_rows() {
    static ims_call_list_info_s list;
    QueryRow row;
    row.function = "ims_call_get_call_list_info";
    row.unit = kCall.unit;
    row.interface = kCall.interface;
    row.method = "CallListInfo";
    row.sent_type = "(i)";
    row.sent = "(42,)";
    row.call = [](ims_h handle) {
        list = {};
        const int result = ims_call_get_call_list_info(handle, &list);
        ims_call_list_info_clear(&list);
        return result;
    };
    row.call_with_nothing = with_nothing<ims_call_get_call_list_info>;
    row.missing_pointers = {
        {"handle", [](ims_h) { return ims_call_get_call_list_info(nullptr, &list); }},
        {"list", [](ims_h handle) { return ims_call_get_call_list_info(handle, nullptr); }}};
    row.reply_type = "(iuaa{sv})";
    row.reply = "(0, 1, [{'session_id': <7>, 'peer_uri': <'sip:a@example.org'>}])";
    row.refused_reply = "(4, 0, [])";
    row.refused_message = "Failed to get Call Info: 4";
    return {row};
}

} // namespace test
