// SPDX-License-Identifier: Apache-2.0
#include "tests/library/poc/event_rows.hpp"

#include "ims.h"

#include <gtest/gtest.h>

#include <array>
#include <string_view>

namespace test {
namespace {

using Set = std::array<std::int32_t, IMS_POC_INT_SET_SIZE>;

void expect_set(const std::int32_t (&set)[IMS_POC_INT_SET_SIZE], const Set &expected) {
    EXPECT_EQ(std::to_array(set), expected);
}

void expect_peer(const ims_poc_peer_info_s &peer, const ims_poc_peer_info_s &expected) {
    EXPECT_EQ(peer.uri_type, expected.uri_type);
    EXPECT_STREQ(peer.uri, expected.uri);
    EXPECT_STREQ(peer.display_name, expected.display_name);
    EXPECT_EQ(peer.is_group_uri, expected.is_group_uri);
    EXPECT_EQ(peer.next, nullptr);
}

void expect_peer(const ims_poc_peer_info_s *peer, const ims_poc_peer_info_s &expected) {
    ASSERT_NE(peer, nullptr);
    expect_peer(*peer, expected);
}

// The two parties of the rows below.
constexpr ims_poc_peer_info_s kPeerA{1, "sip:a@example.org", "Zo\xc3\xab", false, nullptr};
constexpr ims_poc_peer_info_s kGroup{-2, "sip:group@example.org", nullptr, true, nullptr};
#define PEER_A                                                                                     \
    "{'uri_type': <int64 1>, 'uri': <'sip:a@example.org'>, 'display_name': <'Zo\xc3\xab'>, "       \
    "'is_group_uri': <false>}"
#define PEER_GROUP                                                                                 \
    "{'is_group_uri': <true>, 'uri': <'sip:group@example.org'>, 'uri_type': <int64 -2>}"

template <std::int32_t Value>
void is_call_event(const void *event) {
    EXPECT_EQ(as<ims_poc_call_event_s>(event).value_1, Value);
}

void is_incoming(const void *event) {
    const auto &call = as<ims_poc_call_incoming_s>(event);
    EXPECT_TRUE(call.flag_1);
    EXPECT_FALSE(call.flag_2);
    EXPECT_TRUE(call.flag_3);
    EXPECT_FALSE(call.flag_4);
    EXPECT_STREQ(call.text_1, "one");
    EXPECT_STREQ(call.text_2, "two");
    EXPECT_STREQ(call.text_3, "three");
    EXPECT_STREQ(call.text_4, "");
    EXPECT_STREQ(call.text_5, "zo\xc3\xab");
    EXPECT_STREQ(call.text_6, "six");
    EXPECT_EQ(call.value_1, 7);
    EXPECT_EQ(call.value_2, INT32_MIN);
    expect_set(call.int_set_1, {1, 2, 3, 4});
    expect_set(call.int_set_2, {-5, 6, INT32_MAX, 8});
}

template <bool Flag>
void is_established(const void *event) {
    const auto &call = as<ims_poc_call_established_s>(event);
    EXPECT_EQ(call.value_1, 7);
    EXPECT_EQ(call.value_2, -8);
    EXPECT_EQ(call.flag_1, Flag);
    EXPECT_STREQ(call.text_1, "text");
    EXPECT_EQ(call.flag_2, !Flag);
    expect_set(call.int_set_1, {1, 2, 3, 4});
    EXPECT_EQ(call.flag_3, Flag);
    expect_set(call.int_set_2, {5, 6, 7, 8});
    expect_peer(call.peer, kPeerA);
}

void is_ended(const void *event) {
    const auto &call = as<ims_poc_call_ended_s>(event);
    EXPECT_EQ(call.value_1, 7);
    EXPECT_EQ(call.value_2, -16);
}

void is_floor(const void *event) {
    const auto &floor = as<ims_poc_floor_event_s>(event);
    EXPECT_EQ(floor.value_1, 7);
    expect_set(floor.int_set_1, {1, 2, 3, 4});
    EXPECT_EQ(floor.value_2, 2);
    EXPECT_STREQ(floor.text_1, "one");
    EXPECT_EQ(floor.value_3, -3);
    EXPECT_STREQ(floor.text_2, "");
    EXPECT_EQ(floor.value_4, 4);
    EXPECT_EQ(floor.value_5, 5);
    EXPECT_EQ(floor.value_6, 6);
    EXPECT_STREQ(floor.text_3, "three");
}

void is_modify_request(const void *event) {
    const auto &modify = as<ims_poc_modify_request_s>(event);
    EXPECT_TRUE(modify.flag_1);
    EXPECT_FALSE(modify.flag_2);
    EXPECT_EQ(modify.value_1, 7);
    EXPECT_EQ(modify.value_2, -8);
    expect_set(modify.int_set_1, {1, 2, 3, 4});
    expect_set(modify.int_set_2, {5, 6, 7, 8});
}

void is_modify_status(const void *event) {
    const auto &modify = as<ims_poc_modify_status_s>(event);
    EXPECT_TRUE(modify.flag_1);
    EXPECT_FALSE(modify.flag_2);
    EXPECT_TRUE(modify.flag_3);
    EXPECT_EQ(modify.value_1, 7);
    EXPECT_EQ(modify.value_2, -8);
    expect_set(modify.int_set_1, {1, 2, 3, 4});
    expect_set(modify.int_set_2, {5, 6, 7, 8});
}

void is_advertisement(const void *event) {
    const auto &advertisement = as<ims_poc_group_advertisement_s>(event);
    EXPECT_EQ(advertisement.value_1, 7);
    ASSERT_NE(advertisement.group_adv, nullptr);
    const ims_poc_group_adv_s &adv = *advertisement.group_adv;
    EXPECT_STREQ(adv.subject, "News");
    EXPECT_STREQ(adv.call_info, "info");
    expect_peer(adv.remote_uri, kGroup);
    const ims_poc_group_content_s *content = adv.group_advertisement_content;
    ASSERT_NE(content, nullptr);
    EXPECT_EQ(content->content_length, 5U);
    EXPECT_EQ((std::string_view{reinterpret_cast<const char *>(content->content_byte), 5}),
              (std::string_view{"\0v=0\xff", 5}));
    EXPECT_STREQ(content->content_type, "text/plain");
    EXPECT_STREQ(content->content_disposition, "render");
    content = content->next;
    ASSERT_NE(content, nullptr);
    EXPECT_EQ(content->content_byte, nullptr);
    EXPECT_EQ(content->content_length, 0U);
    EXPECT_STREQ(content->content_type, "image/png");
    EXPECT_EQ(content->content_disposition, nullptr);
    EXPECT_EQ(content->next, nullptr);
}

void is_participant_info(const void *event) {
    const auto &info = as<ims_poc_participant_info_s>(event);
    EXPECT_EQ(info.value_1, 7);
    EXPECT_STREQ(info.text_1, "one");
    EXPECT_STREQ(info.text_2, "two");
}

void is_incoming_msg(const void *event) {
    const auto &message = as<ims_poc_incoming_msg_s>(event);
    EXPECT_EQ(message.value_1, 1);
    expect_peer(message.peer_1, kPeerA);
    EXPECT_STREQ(message.text_1, "one");
    EXPECT_EQ(message.value_2, 2);
    EXPECT_STREQ(message.text_2, "two");
    EXPECT_STREQ(message.text_3, "three");
    const ims_poc_route_header_s *header = message.route_headers;
    ASSERT_NE(header, nullptr);
    EXPECT_STREQ(header->uri, "sip:proxy@example.org");
    EXPECT_STREQ(header->display_name, "Proxy");
    header = header->next;
    ASSERT_NE(header, nullptr);
    EXPECT_EQ(header->uri, nullptr);
    EXPECT_EQ(header->display_name, nullptr);
    EXPECT_EQ(header->next, nullptr);
    EXPECT_STREQ(message.text_4, "four");
    EXPECT_EQ(message.value_3, 3);
    EXPECT_EQ(message.value_4, -4);
    EXPECT_EQ(message.value_5, 5);
    expect_peer(message.peer_2, kGroup);
}

void is_msg_notification(const void *event) {
    const auto &notification = as<ims_poc_msg_event_s>(event);
    EXPECT_EQ(notification.value_1, 1);
    expect_peer(notification.peer_1, kPeerA);
    EXPECT_STREQ(notification.text_1, "one");
    EXPECT_EQ(notification.value_2, 2);
    EXPECT_EQ(notification.value_3, -3);
    expect_peer(notification.peer_2, kGroup);
}

void is_incoming_file(const void *event) {
    const auto &transfer = as<ims_poc_incoming_file_s>(event);
    EXPECT_EQ(transfer.value_1, 1);
    expect_peer(transfer.peer_1, kPeerA);
    ASSERT_NE(transfer.attributes, nullptr);
    const ims_poc_file_attributes_s &file = *transfer.attributes;
    EXPECT_STREQ(file.file_name, "map.png");
    EXPECT_STREQ(file.file_description, "where");
    EXPECT_EQ(file.file_size, 1048576);
    EXPECT_TRUE(file.push);
    EXPECT_EQ(file.start, 1);
    EXPECT_EQ(file.end, -2);
    EXPECT_STREQ(file.transfer_id, "t-1");
    EXPECT_STREQ(file.content_type, "image/png");
    EXPECT_STREQ(file.file_type, "image");
    EXPECT_EQ(transfer.value_2, -2);
    expect_peer(transfer.peer_2, kGroup);
}

void is_progress(const void *event) {
    const auto &progress = as<ims_poc_file_progress_s>(event);
    EXPECT_EQ(progress.value_1, 1);
    EXPECT_EQ(progress.value_2, -2);
    EXPECT_EQ(progress.value_3, INT32_MIN);
    EXPECT_EQ(progress.value_4, INT32_MAX);
}

void is_terminated(const void *event) {
    const auto &terminated = as<ims_poc_file_terminated_s>(event);
    EXPECT_EQ(terminated.value_1, 1);
    EXPECT_EQ(terminated.value_2, -2);
    EXPECT_EQ(terminated.value_3, 3);
}

// One shape under seven ids.
constexpr EventRow floor_row(const char *name, int id, const char *member) {
    return {.name = name,
            .id = id,
            .member = member,
            .type = "(ivisisiiis)",
            .value = "(7, <[1, 2, 3, 4]>, 2, 'one', -3, '', 4, 5, 6, 'three')",
            .check = is_floor};
}

constexpr EventRow kRows[] = {
    {.name = "Incoming",
     .id = 0x401,
     .member = "PocCallIncomingInd",
     .type = "(bbbbssssssiivv)",
     .value = "(true, false, true, false, 'one', 'two', 'three', '', 'zo\xc3\xab', 'six', 7, "
              "-2147483648, <[1, 2, 3, 4]>, <[-5, 6, 2147483647, 8]>)",
     .check = is_incoming},
    {.name = "InProgress",
     .id = 0x402,
     .member = "PocCallInProgress",
     .type = "(i)",
     .value = "(2,)",
     .check = is_call_event<2>},
    {.name = "Alerting",
     .id = 0x403,
     .member = "PocCallAlerting",
     .type = "(i)",
     .value = "(-3,)",
     .check = is_call_event<-3>},
    {.name = "Established",
     .id = 0x404,
     .member = "PocCallEstablished",
     .type = "(iibsbvbvv)",
     .value = "(7, -8, true, 'text', false, <[1, 2, 3, 4]>, true, <[5, 6, 7, 8]>, <" PEER_A ">)",
     .check = is_established<true>},
    {.name = "EstablishedOtherFlags",
     .id = 0x404,
     .member = "PocCallEstablished",
     .type = "(iibsbvbvv)",
     .value = "(7, -8, false, 'text', true, <[1, 2, 3, 4]>, false, <[5, 6, 7, 8]>, <" PEER_A ">)",
     .check = is_established<false>},
    // A service that wraps once more is understood.
    {.name = "EstablishedInManyVariants",
     .id = 0x404,
     .member = "PocCallEstablished",
     .type = "(iibsbvbvv)",
     .value = "(7, -8, true, 'text', false, <<<[1, 2, 3, 4]>>>, true, <<[5, 6, 7, 8]>>, <<<<" PEER_A
              ">>>>)",
     .check = is_established<true>},
    {.name = "Ended",
     .id = 0x405,
     .member = "PocCallEnded",
     .type = "(ii)",
     .value = "(7, -16)",
     .check = is_ended},
    floor_row("FloorGranted", 0x406, "PocCallFloorGranted"),
    floor_row("FloorRejected", 0x407, "PocCallFloorRejected"),
    floor_row("FloorIdle", 0x408, "PocCallFloorIdle"),
    floor_row("FloorQueuePosition", 0x409, "PocCallFloorQueuePosition"),
    floor_row("FloorCanceled", 0x40A, "PocCallFloorCanceled"),
    floor_row("FloorTaken", 0x40B, "PocCallFloorTaken"),
    {.name = "ModifyRequest",
     .id = 0x40C,
     .member = "PocCallModifyRequest",
     .type = "(bbiivv)",
     .value = "(true, false, 7, -8, <[1, 2, 3, 4]>, <[5, 6, 7, 8]>)",
     .check = is_modify_request},
    {.name = "ModifyStatus",
     .id = 0x40D,
     .member = "PocCallModifyStatus",
     .type = "(bbbiivv)",
     .value = "(true, false, true, 7, -8, <[1, 2, 3, 4]>, <[5, 6, 7, 8]>)",
     .check = is_modify_status},
    floor_row("FloorRequestTimeout", 0x40E, "PocCallFloorRequestTimeout"),
    {.name = "CrisisCallInitiated",
     .id = 0x40F,
     .member = "PocCallCrisisCallInitiated",
     .type = "(i)",
     .value = "(15,)",
     .check = is_call_event<15>},
    {.name = "GroupAdvertisement",
     .id = 0x410,
     .member = "PocGroupAdvertisement",
     .type = "(ia{sv})",
     .value = "(7, {'subject': <'News'>, 'group_advertisement_content': <[{'content_byte': "
              "<'AHY9MP8='>, "
              "'content_type': <'text/plain'>, 'content_disposition': <'render'>, 'unheard': <1>}, "
              "{'content_type': <'image/png'>}]>, 'unheard': <'of'>, 'remote_uri': <" PEER_GROUP
              ">, 'call_info': <'info'>})",
     .check = is_advertisement},
    {.name = "GroupConfParticipantInfo",
     .id = 0x411,
     .member = "PocGroupConfParticipantInfo",
     .type = "(iss)",
     .value = "(7, 'one', 'two')",
     .check = is_participant_info},
    {.name = "IncomingMsgInfo",
     .id = 0x412,
     .member = "PocIncomingMsgInfo",
     .type = "(ivsissvsiiiv)",
     .value = "(1, <" PEER_A ">, 'one', 2, 'two', 'three', <[{'uri': <'sip:proxy@example.org'>, "
              "'display_name': <'Proxy'>}, {}]>, 'four', 3, -4, 5, <" PEER_GROUP ">)",
     .check = is_incoming_msg},
    {.name = "MsgNotification",
     .id = 0x413,
     .member = "PocMsgNotification",
     .type = "(ivsiiv)",
     .value = "(1, <" PEER_A ">, 'one', 2, -3, <" PEER_GROUP ">)",
     .check = is_msg_notification},
    {.name = "IncomingFileTransfer",
     .id = 0x414,
     .member = "PocIncomingFileTransfer",
     .type = "(ivviv)",
     .value = "(1, <" PEER_A ">, <{'file_type': <'image'>, 'file_name': <'map.png'>, "
              "'file_description': <'where'>, 'file_size': <int64 1048576>, 'push': <true>, "
              "'start': <int64 1>, 'end': <int64 -2>, 'transfer_id': <'t-1'>, "
              "'content_type': <'image/png'>}>, -2, <" PEER_GROUP ">)",
     .check = is_incoming_file},
    {.name = "FileTransferProgress",
     .id = 0x415,
     .member = "PocFileTransferProgress",
     .type = "(iiii)",
     .value = "(1, -2, -2147483648, 2147483647)",
     .check = is_progress},
    {.name = "FileTransferTerminated",
     .id = 0x416,
     .member = "PocFileTransferTerminated",
     .type = "(iii)",
     .value = "(1, -2, 3)",
     .check = is_terminated},
};

} // namespace

std::span<const EventRow> poc_event_rows() {
    return kRows;
}

} // namespace test
