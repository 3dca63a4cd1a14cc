// SPDX-License-Identifier: Apache-2.0
#include "tests/library/poc/poc_rows.hpp"

#include <gtest/gtest.h>

namespace test {
namespace {

constexpr ims_poc_peer_info_s kSecond{2, nullptr, "B", true, nullptr};
constexpr ims_poc_peer_info_s kFirst{1, "sip:a@example.org", nullptr, false, &kSecond};
constexpr ims_poc_peer_info_s kOriginator{-3, "sip:me@example.org", "Me", false, &kFirst};
constexpr ims_poc_record_request_s kRecord{7, -8, 9, "/tmp/talk.wav"};
constexpr ims_poc_message_s kMessage{7,          "id",      &kFirst,      -8,        "text/plain",
                                     "Hello!\n", INT32_MAX, &kOriginator, 1000000000};
constexpr ims_poc_name_node_s kLastName{nullptr, nullptr, nullptr};
constexpr ims_poc_name_node_s kNextName{nullptr, "C", &kLastName};
constexpr ims_poc_name_node_s kFirstName{"sip:a@example.org", "A", &kNextName};
constexpr ims_poc_msg_notification_s kNotice{7, "id", &kOriginator, &kFirstName, "when", -8};
constexpr ims_poc_file_attributes_s kFile{"map.png", "where", 1048576,     true,   1,
                                          -2,        "t-1",   "image/png", "image"};
constexpr ims_poc_file_transfer_s kTransfer{7, &kFirst, &kFile, &kOriginator};
constexpr ims_poc_transfer_answer_s kAnswer{7, "t-1"};

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

RequestRow with_message_result(RequestRow row) {
    return with_reply(std::move(row), "(iiii)", "(0, 1, -2, 3)", is_message_result);
}
RequestRow with_transfer_result(RequestRow row) {
    return with_reply(std::move(row), "(iii)", "(0, 1, -2)", is_transfer_result);
}

constexpr ims_poc_peer_info_s kBadPeer{1, kNotUtf8, nullptr, false, nullptr};
constexpr ims_poc_peer_info_s kBadNextPeer{1, nullptr, nullptr, false, &kBadPeer};
constexpr ims_poc_name_node_s kBadName{nullptr, kNotUtf8, nullptr};
constexpr ims_poc_file_attributes_s kBadFile{nullptr, nullptr, 0,       false,   0,
                                             0,       nullptr, nullptr, kNotUtf8};

RequestRow start_recording_row() {
    using Recording = ims_poc_record_request_s;
    constexpr auto call = ims_poc_start_call_recording;
    return with_reply(
        with_bad_texts(record_row<call, kRecord>(kPoc, "ims_poc_start_call_recording",
                                                 "PocStartCallRecording", "(iiis)",
                                                 "(7, -8, 9, '/tmp/talk.wav')"),
                       {bad_text<call, kRecord, &Recording::text>("text")}),
        "(ia{sv})",
        "(0, {'session_id': <int64 7>, 'record_state': <int64 1>, 'record_error': <int64 -2>, "
        "'record_file_path': <'/tmp/talk.wav'>})",
        is_recording);
}

RequestRow send_msg_row() {
    using Message = ims_poc_message_s;
    constexpr auto call = ims_poc_send_msg;
    return with_message_result(with_bad_texts(
        record_row<call, kMessage>(kPoc, "ims_poc_send_msg", "PocSendMsg", "(isvissivi)",
                                   "(7, 'id', " TARGETS_AS_SENT ", -8, 'text/plain', 'Hello!\\n', "
                                   "2147483647, " ORIGINATOR_AS_SENT ", 1000000000)"),
        {bad_text<call, kMessage, &Message::text_1>("text_1"),
         bad_text<call, kMessage, &Message::text_2>("text_2"),
         bad_text<call, kMessage, &Message::text_3>("text_3"),
         bad_part<call, kMessage, &Message::targets, kBadNextPeer>("targets"),
         bad_part<call, kMessage, &Message::originator, kBadPeer>("originator")}));
}

RequestRow send_notification_row() {
    using Notice = ims_poc_msg_notification_s;
    constexpr auto call = ims_poc_send_received_msg_notification;
    return with_message_result(with_bad_texts(
        record_row<call, kNotice>(kPoc, "ims_poc_send_received_msg_notification",
                                  "PocSendReceivedMsgNoti", "(isvvsi)",
                                  "(7, 'id', " ORIGINATOR_AS_SENT
                                  ", <[{'uri': <'sip:a@example.org'>, 'display_name': <'A'>}, "
                                  "{'display_name': <'C'>}, @a{sv} {}]>, 'when', -8)"),
        {bad_text<call, kNotice, &Notice::text_1>("text_1"),
         bad_text<call, kNotice, &Notice::text_2>("text_2"),
         bad_part<call, kNotice, &Notice::originator, kBadPeer>("originator"),
         bad_part<call, kNotice, &Notice::parties, kBadName>("parties")}));
}

RequestRow transfer_file_row() {
    using Transfer = ims_poc_file_transfer_s;
    constexpr auto call = ims_poc_transfer_file;
    return with_transfer_result(with_bad_texts(
        record_row<call, kTransfer>(
            kPoc, "ims_poc_transfer_file", "PocTransferFile", "(ivvv)",
            "(7, " TARGETS_AS_SENT ", <{'file_name': <'map.png'>, 'file_description': <'where'>, "
            "'file_size': <int64 1048576>, 'push': <true>, 'start': <int64 1>, 'end': <int64 -2>, "
            "'transfer_id': <'t-1'>, 'content_type': <'image/png'>, 'file_type': "
            "<'image'>}>, " ORIGINATOR_AS_SENT ")"),
        {bad_part<call, kTransfer, &Transfer::targets, kBadPeer>("targets"),
         bad_part<call, kTransfer, &Transfer::attributes, kBadFile>("attributes"),
         bad_part<call, kTransfer, &Transfer::originator, kBadPeer>("originator")}));
}

template <auto Function>
RequestRow answer_row(const char *function, const char *method) {
    using Answer = ims_poc_transfer_answer_s;
    return with_transfer_result(
        with_bad_texts(record_row<Function, kAnswer>(kPoc, function, method, "(is)", "(7, 't-1')"),
                       {bad_text<Function, kAnswer, &Answer::transfer_id>("transfer_id")}));
}

template <auto Function>
RequestRow session_row(const char *function, const char *method) {
    return value_row<Function, -7>(kPoc, function, method, "(i)", "(-7,)");
}

} // namespace

std::vector<RequestRow> poc_message_rows() {
    return {
        start_recording_row(),
        session_row<ims_poc_pause_call_recording>("ims_poc_pause_call_recording",
                                                  "PocPauseCallRecording"),
        session_row<ims_poc_resume_call_recording>("ims_poc_resume_call_recording",
                                                   "PocResumeCallRecording"),
        session_row<ims_poc_stop_call_recording>("ims_poc_stop_call_recording",
                                                 "PocStopCallRecording"),
        session_row<ims_poc_cancel_call_recording>("ims_poc_cancel_call_recording",
                                                   "PocCancelCallRecording"),
        send_msg_row(),
        send_notification_row(),
        transfer_file_row(),
        answer_row<ims_poc_accept_file_transfer>("ims_poc_accept_file_transfer",
                                                 "PocAcceptFileTransfer"),
        // The service has the method under this name, with an A too many.
        answer_row<ims_poc_reject_file_transfer>("ims_poc_reject_file_transfer",
                                                 "PocARejectFileTransfer"),
        with_transfer_result(session_row<ims_poc_cancel_file_transfer>(
            "ims_poc_cancel_file_transfer", "PocCancelFileTransfer")),
        session_row<ims_poc_send_keep_alive>("ims_poc_send_keep_alive", "PocSendKeepAlive"),
    };
}

} // namespace test
