// SPDX-License-Identifier: Apache-2.0
#include "tests/library/poc/poc_rows.hpp"

#include <gtest/gtest.h>

namespace test {
namespace {

constexpr ims_poc_peer_info_s kSecondTarget{2, nullptr, "B", true, nullptr};
constexpr ims_poc_peer_info_s kFirstTarget{1, "sip:a@example.org", nullptr, false, &kSecondTarget};
constexpr ims_poc_peer_info_s kOriginator{-3, "sip:me@example.org", "Me", false, &kFirstTarget};
constexpr ims_poc_record_request_s kRecord{7, -8, 9, "/tmp/talk.wav"};
constexpr ims_poc_message_s kMessage{7,          "id",      &kFirstTarget, -8,        "text/plain",
                                     "Hello!\n", INT32_MAX, &kOriginator,  1000000000};
constexpr ims_poc_name_node_s kLastName{nullptr, nullptr, nullptr};
constexpr ims_poc_name_node_s kNextName{nullptr, "C", &kLastName};
constexpr ims_poc_name_node_s kFirstName{"sip:a@example.org", "A", &kNextName};
constexpr ims_poc_msg_notification_s kNotice{7, "id", &kOriginator, &kFirstName, "when", -8};
constexpr ims_poc_file_attributes_s kFile{"map.png", "where", 1048576,     true,   1,
                                          -2,        "t-1",   "image/png", "image"};
constexpr ims_poc_file_transfer_s kTransfer{7, &kFirstTarget, &kFile, &kOriginator};
constexpr ims_poc_transfer_answer_s kAnswer{7, "t-1"};
constexpr std::int32_t kAnySession = -7;

#define TARGETS_AS_SENT                                                                            \
    "<[{'uri_type': <int64 1>, 'uri': <'sip:a@example.org'>, 'is_group_uri': <false>}, "           \
    "{'uri_type': <int64 2>, 'display_name': <'B'>, 'is_group_uri': <true>}]>"
#define ORIGINATOR_AS_SENT                                                                         \
    "<{'uri_type': <int64 -3>, 'uri': <'sip:me@example.org'>, 'display_name': <'Me'>, "            \
    "'is_group_uri': <false>}>"

// "(0, {...})" below
void is_recording(void *data) {
    const auto *recording = static_cast<const ims_poc_recording_info_s *>(data);
    ASSERT_NE(recording, nullptr);
    EXPECT_EQ(recording->session_id, 7);
    EXPECT_EQ(recording->record_state, 1);
    EXPECT_EQ(recording->record_error, -2);
    EXPECT_STREQ(recording->record_file_path, "/tmp/talk.wav");
}

// "(0, 1, -2, 3)"
void is_message_result(void *data) {
    const auto *result = static_cast<const ims_poc_msg_result_s *>(data);
    ASSERT_NE(result, nullptr);
    EXPECT_EQ(result->value_1, 1);
    EXPECT_EQ(result->value_2, -2);
    EXPECT_EQ(result->value_3, 3);
}

// "(0, 1, -2)"
void is_transfer_result(void *data) {
    const auto *result = static_cast<const ims_poc_transfer_result_s *>(data);
    ASSERT_NE(result, nullptr);
    EXPECT_EQ(result->value_1, 1);
    EXPECT_EQ(result->value_2, -2);
}

constexpr ims_poc_peer_info_s kBadPeer{1, kNotUtf8, nullptr, false, nullptr};
constexpr ims_poc_peer_info_s kBadNextPeer{1, nullptr, nullptr, false, &kBadPeer};
constexpr ims_poc_name_node_s kBadParty{nullptr, kNotUtf8, nullptr};
constexpr ims_poc_file_attributes_s kBadFile{nullptr, nullptr, 0,       false,   0,
                                             0,       nullptr, nullptr, kNotUtf8};

std::vector<RequestRow> recording_rows() {
    return {
        {.function = request<ims_poc_start_call_recording, kRecord>(),
         .method = "PocStartCallRecording",
         .type = "(iiis)",
         .arguments = "(7, -8, 9, '/tmp/talk.wav')",
         .bad_texts = {bad_text<&ims_poc_record_request_s::text>()},
         .reply_type = "(ia{sv})",
         .reply = "(0, {'session_id': <int64 7>, 'record_state': <int64 1>, 'record_error': "
                  "<int64 -2>, 'record_file_path': <'/tmp/talk.wav'>})",
         .check_data = is_recording},
        {.function = request<ims_poc_pause_call_recording, kAnySession>(),
         .method = "PocPauseCallRecording",
         .type = "(i)",
         .arguments = "(-7,)"},
        {.function = request<ims_poc_resume_call_recording, kAnySession>(),
         .method = "PocResumeCallRecording",
         .type = "(i)",
         .arguments = "(-7,)"},
        {.function = request<ims_poc_stop_call_recording, kAnySession>(),
         .method = "PocStopCallRecording",
         .type = "(i)",
         .arguments = "(-7,)"},
        {.function = request<ims_poc_cancel_call_recording, kAnySession>(),
         .method = "PocCancelCallRecording",
         .type = "(i)",
         .arguments = "(-7,)"},
    };
}

std::vector<RequestRow> sending_rows() {
    using Message = ims_poc_message_s;
    using Notice = ims_poc_msg_notification_s;
    return {
        {.function = request<ims_poc_send_msg, kMessage>(),
         .method = "PocSendMsg",
         .type = "(isvissivi)",
         .arguments = "(7, 'id', " TARGETS_AS_SENT ", -8, 'text/plain', 'Hello!\\n', "
                      "2147483647, " ORIGINATOR_AS_SENT ", 1000000000)",
         .bad_texts = {bad_text<&Message::text_1>(), bad_text<&Message::text_2>(),
                       bad_text<&Message::text_3>(),
                       bad_part<&Message::targets, kBadNextPeer>("targets"),
                       bad_part<&Message::originator, kBadPeer>("originator")},
         .reply_type = "(iiii)",
         .reply = "(0, 1, -2, 3)",
         .check_data = is_message_result},
        {.function = request<ims_poc_send_received_msg_notification, kNotice>(),
         .method = "PocSendReceivedMsgNoti",
         .type = "(isvvsi)",
         .arguments = "(7, 'id', " ORIGINATOR_AS_SENT
                      ", <[{'uri': <'sip:a@example.org'>, 'display_name': <'A'>}, "
                      "{'display_name': <'C'>}, @a{sv} {}]>, 'when', -8)",
         .bad_texts = {bad_text<&Notice::text_1>(), bad_text<&Notice::text_2>(),
                       bad_part<&Notice::originator, kBadPeer>("originator"),
                       bad_part<&Notice::parties, kBadParty>("parties")},
         .reply_type = "(iiii)",
         .reply = "(0, 1, -2, 3)",
         .check_data = is_message_result},
        {.function = request<ims_poc_send_keep_alive, kAnySession>(),
         .method = "PocSendKeepAlive",
         .type = "(i)",
         .arguments = "(-7,)"},
    };
}

std::vector<RequestRow> file_rows() {
    using Transfer = ims_poc_file_transfer_s;
    using Answer = ims_poc_transfer_answer_s;
    return {
        {.function = request<ims_poc_transfer_file, kTransfer>(),
         .method = "PocTransferFile",
         .type = "(ivvv)",
         .arguments =
             "(7, " TARGETS_AS_SENT ", <{'file_name': <'map.png'>, 'file_description': <'where'>, "
             "'file_size': <int64 1048576>, 'push': <true>, 'start': <int64 1>, 'end': "
             "<int64 -2>, 'transfer_id': <'t-1'>, 'content_type': <'image/png'>, "
             "'file_type': <'image'>}>, " ORIGINATOR_AS_SENT ")",
         .bad_texts = {bad_part<&Transfer::targets, kBadPeer>("targets"),
                       bad_part<&Transfer::attributes, kBadFile>("attributes"),
                       bad_part<&Transfer::originator, kBadPeer>("originator")},
         .reply_type = "(iii)",
         .reply = "(0, 1, -2)",
         .check_data = is_transfer_result},
        {.function = request<ims_poc_accept_file_transfer, kAnswer>(),
         .method = "PocAcceptFileTransfer",
         .type = "(is)",
         .arguments = "(7, 't-1')",
         .bad_texts = {bad_text<&Answer::transfer_id>()},
         .reply_type = "(iii)",
         .reply = "(0, 1, -2)",
         .check_data = is_transfer_result},
        // The service has the method under this name, with an A too many.
        {.function = request<ims_poc_reject_file_transfer, kAnswer>(),
         .method = "PocARejectFileTransfer",
         .type = "(is)",
         .arguments = "(7, 't-1')",
         .bad_texts = {bad_text<&Answer::transfer_id>()},
         .reply_type = "(iii)",
         .reply = "(0, 1, -2)",
         .check_data = is_transfer_result},
        {.function = request<ims_poc_cancel_file_transfer, kAnySession>(),
         .method = "PocCancelFileTransfer",
         .type = "(i)",
         .arguments = "(-7,)",
         .reply_type = "(iii)",
         .reply = "(0, 1, -2)",
         .check_data = is_transfer_result},
    };
}

} // namespace

std::vector<RequestRow> poc_message_rows() {
    return joined({recording_rows(), sending_rows(), file_rows()});
}

} // namespace test
