// SPDX-License-Identifier: Apache-2.0
// The lists and dictionaries that requests send.
#include "tests/support/expectations.hpp"
#include "tests/support/request_row.hpp"
#include "tests/support/with_peer.hpp"

#include <climits>

namespace test {
namespace {

class PocRequest : public WithPeer {
  protected:
    // The one call that reached the peer, whatever it was answered.
    void expect_only_request(const char *type, const std::string &value) {
        const std::vector<Call> sent = requests();
        ASSERT_EQ(sent.size(), 1U);
        expect_sent(sent[0], type, value);
    }
};

// A chain of five, and how each is sent.
constexpr ims_poc_user_s kE{5, nullptr, nullptr, false, false, 0, 0, nullptr};
constexpr ims_poc_user_s kD{4, nullptr, nullptr, false, false, 0, 0, &kE};
constexpr ims_poc_user_s kC{3, nullptr, nullptr, false, false, 0, 0, &kD};
constexpr ims_poc_user_s kB{2, nullptr, nullptr, false, false, 0, 0, &kC};
constexpr ims_poc_user_s kA{1, nullptr, nullptr, false, false, 0, 0, &kB};

// The users of these types as an "aa{sv}" inside a "v". The address lies in two levels of variant,
// which the service unwraps both.
std::string users_of_types(int first, int last) {
    std::string list;
    for (int type = first; type <= last; ++type)
        list += (list.empty() ? "{'uri_gv': <<{'uri_type': <int64 "
                              : ", {'uri_gv': <<{'uri_type': "
                                "<int64 ") +
                std::to_string(type) +
                ">, 'is_group_uri': <false>}>>, 'is_anonymous': <false>, 'participant_state': "
                "<int64 0>, 'uri_usage_type': <int64 0>}";
    return "<@aa{sv} [" + list + "]>";
}

struct UserCase {
    const char *name;
    std::int32_t count;
    const ims_poc_user_s *list;
    int first;
    int last;
};

constexpr UserCase kUserCases[] = {
    {"CountTwoOfFiveSendsTwo", 2, &kA, 1, 2},      {"CountTwoOfOneSendsOne", 2, &kE, 5, 5},
    {"CountOneOfFiveSendsOne", 1, &kA, 1, 1},      {"CountFiveOfFiveSendsFive", 5, &kA, 1, 5},
    {"HugeCountSendsTheList", INT_MAX, &kD, 4, 5}, {"NoListSendsNone", 3, nullptr, 1, 0}};

class UserList : public PocRequest, public ::testing::WithParamInterface<UserCase> {};

INSTANTIATE_TEST_SUITE_P(Poc, UserList, ::testing::ValuesIn(kUserCases),
                         [](const auto &tested) { return std::string{tested.param.name}; });

TEST_P(UserList, OfAnAdHocCallIsCappedByTheCount) {
    const auto &[name, count, list, first, last] = GetParam();
    ims_poc_ad_hoc_call_s info{};
    info.text_1 = info.text_2 = "";
    info.user_count = count;
    info.user_list = list;
    EXPECT_EQ(ims_poc_make_ad_hoc_call(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_only_request("(vbvssbibivi)", "(<[0, 0, 0, 0]>, false, <[0, 0, 0, 0]>, '', '', false, " +
                                             std::to_string(count) + ", false, 0, " +
                                             users_of_types(first, last) + ", 0)");
}

TEST_P(UserList, OfAChangeIsCappedByTheCount) {
    const auto &[name, count, list, first, last] = GetParam();
    const ims_poc_users_s info{1, count, 2, list, 3, nullptr};
    EXPECT_EQ(ims_poc_add_users_to_ad_hoc_call(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    EXPECT_EQ(ims_poc_remove_users_from_ad_hoc_call(handle_, &info, nullptr, nullptr),
              IMS_ERROR_NONE);
    const std::vector<Call> sent = requests();
    ASSERT_EQ(sent.size(), 2U);
    for (const Call &call : sent)
        expect_sent(call, "(iiiviv)",
                    "(1, " + std::to_string(count) + ", 2, " + users_of_types(first, last) +
                        ", 3, <@a{sv} {}>)");
}

TEST_F(PocRequest, CountsOfUsersBelowOneAreRefusedWhateverTheListHolds) {
    for (const std::int32_t count : {0, -1, INT_MIN}) {
        ims_poc_ad_hoc_call_s call{};
        call.text_1 = call.text_2 = "";
        call.user_count = count;
        call.user_list = &kA;
        const ims_poc_users_s users{1, count, 2, &kA, 3, nullptr};
        EXPECT_EQ(ims_poc_make_ad_hoc_call(handle_, &call, nullptr, nullptr),
                  IMS_ERROR_INVALID_PARAMETER);
        expect_one_line("ims_poc.cpp", "ims_poc_make_ad_hoc_call", "Invalid parameter");
        EXPECT_EQ(ims_poc_add_users_to_ad_hoc_call(handle_, &users, nullptr, nullptr),
                  IMS_ERROR_INVALID_PARAMETER);
        expect_one_line("ims_poc.cpp", "ims_poc_add_users_to_ad_hoc_call", "Invalid parameter");
        EXPECT_EQ(ims_poc_remove_users_from_ad_hoc_call(handle_, &users, nullptr, nullptr),
                  IMS_ERROR_INVALID_PARAMETER);
        expect_one_line("ims_poc.cpp", "ims_poc_remove_users_from_ad_hoc_call",
                        "Invalid parameter");
    }
    EXPECT_TRUE(requests().empty());
}

TEST_F(PocRequest, UsersBehindTheCountAreNotLookedAt) {
    const ims_poc_user_s bad{1, kNotUtf8, nullptr, false, false, 0, 0, nullptr};
    const ims_poc_user_s good{1, nullptr, nullptr, false, false, 0, 0, &bad};
    const ims_poc_users_s info{1, 1, 2, &good, 3, nullptr};
    EXPECT_EQ(ims_poc_add_users_to_ad_hoc_call(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_only_request("(iiiviv)", "(1, 1, 2, " + users_of_types(1, 1) + ", 3, <@a{sv} {}>)");
}

TEST_F(PocRequest, ContentsLeaveNullTextsOut) {
    const ims_poc_content_s content{nullptr, "", nullptr, nullptr, nullptr, "Welcome"};
    const ims_poc_users_s info{1, 1, 2, nullptr, 3, &content};
    EXPECT_EQ(ims_poc_remove_users_from_ad_hoc_call(handle_, &info, nullptr, nullptr),
              IMS_ERROR_NONE);
    expect_only_request("(iiiviv)", "(1, 1, 2, <@aa{sv} []>, 3, <{'content_disposition': <''>, "
                                    "'content': <'Welcome'>}>)");
}

TEST_F(PocRequest, MakeCallSendsNullTextsAsEmptyOnes) {
    const ims_poc_make_call_s info{};
    EXPECT_EQ(ims_poc_call_make_call(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_only_request("(bbbsisvvi)",
                        "(false, false, false, '', 0, '', <[0, 0, 0, 0]>, <[0, 0, 0, 0]>, 0)");
}

// A caller's slip, which must not bring down the process.
TEST_F(PocRequest, RequiredTextsThatAreMissingAreSentAsEmptyOnes) {
    const ims_poc_ad_hoc_call_s call{{}, false, {}, nullptr, nullptr, false,
                                     1,  false, 0,  nullptr, 0};
    const ims_poc_floor_s floor{7, {1, 2, 3, 4}, 8, 9, nullptr};
    const ims_poc_message_s message{};
    const ims_poc_msg_notification_s notice{};
    const ims_poc_transfer_answer_s answer{7, nullptr};
    EXPECT_EQ(ims_poc_make_ad_hoc_call(handle_, &call, nullptr, nullptr), IMS_ERROR_NONE);
    EXPECT_EQ(ims_poc_call_request_floor(handle_, &floor, nullptr, nullptr), IMS_ERROR_NONE);
    EXPECT_EQ(ims_poc_send_msg(handle_, &message, nullptr, nullptr), IMS_ERROR_NONE);
    EXPECT_EQ(ims_poc_send_received_msg_notification(handle_, &notice, nullptr, nullptr),
              IMS_ERROR_NONE);
    EXPECT_EQ(ims_poc_accept_file_transfer(handle_, &answer, nullptr, nullptr), IMS_ERROR_NONE);
    EXPECT_EQ(ims_poc_reject_file_transfer(handle_, &answer, nullptr, nullptr), IMS_ERROR_NONE);
    const std::vector<Call> sent = requests();
    ASSERT_EQ(sent.size(), 6U);
    expect_sent(sent[0], "(vbvssbibivi)",
                "(<[0, 0, 0, 0]>, false, <[0, 0, 0, 0]>, '', '', false, 1, false, 0, "
                "<@aa{sv} []>, 0)");
    expect_sent(sent[1], "(iviis)", "(7, <[1, 2, 3, 4]>, 8, 9, '')");
    expect_sent(sent[2], "(isvissivi)", "(0, '', <@aa{sv} []>, 0, '', '', 0, <@a{sv} {}>, 0)");
    expect_sent(sent[3], "(isvvsi)", "(0, '', <@a{sv} {}>, <@aa{sv} []>, '', 0)");
    expect_sent(sent[4], "(is)", "(7, '')");
    expect_sent(sent[5], "(is)", "(7, '')");
}

TEST_F(PocRequest, ReleaseFloorLooksAtItsSessionAndSetOnly) {
    const ims_poc_floor_s info{7, {-1, 2, -3, INT_MAX}, 8, 9, kNotUtf8};
    EXPECT_EQ(ims_poc_call_release_floor(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_only_request("(iv)", "(7, <[-1, 2, -3, 2147483647]>)");
}

TEST_F(PocRequest, MessagesWithoutTargetsSendAnEmptyListOfDictionaries) {
    const ims_poc_peer_info_s me{1, nullptr, nullptr, false, nullptr};
    const ims_poc_message_s info{1, "a", nullptr, 2, "b", "c", 3, &me, 4};
    EXPECT_EQ(ims_poc_send_msg(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_only_request("(isvissivi)",
                        "(1, 'a', <@aa{sv} []>, 2, 'b', 'c', 3, <{'uri_type': <int64 1>, "
                        "'is_group_uri': <false>}>, 4)");
}

TEST_F(PocRequest, APeerWithoutTextsIsItsTypeAndWhetherItIsAGroup) {
    const ims_poc_peer_info_s peer{INT_MIN, nullptr, nullptr, true, nullptr};
    const ims_poc_message_s info{1, "a", &peer, 2, "b", "c", 3, nullptr, 4};
    EXPECT_EQ(ims_poc_send_msg(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_only_request("(isvissivi)",
                        "(1, 'a', <[{'uri_type': <int64 -2147483648>, 'is_group_uri': "
                        "<true>}]>, 2, 'b', 'c', 3, <@a{sv} {}>, 4)");
}

TEST_F(PocRequest, NoticesWithoutOriginatorSendAnEmptyDictionary) {
    const ims_poc_msg_notification_s info{1, "a", nullptr, nullptr, "b", 2};
    EXPECT_EQ(ims_poc_send_received_msg_notification(handle_, &info, nullptr, nullptr),
              IMS_ERROR_NONE);
    expect_only_request("(isvvsi)", "(1, 'a', <@a{sv} {}>, <@aa{sv} []>, 'b', 2)");
}

TEST_F(PocRequest, FilesWithoutAttributesSendAnEmptyDictionary) {
    const ims_poc_file_transfer_s info{7, nullptr, nullptr, nullptr};
    EXPECT_EQ(ims_poc_transfer_file(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_only_request("(ivvv)", "(7, <@aa{sv} []>, <@a{sv} {}>, <@a{sv} {}>)");
}

TEST_F(PocRequest, FileAttributesWithoutTextsAreSizePushStartAndEnd) {
    const ims_poc_file_attributes_s file{nullptr, nullptr, INT_MAX, false,  -1,
                                         INT_MIN, nullptr, nullptr, nullptr};
    const ims_poc_file_transfer_s info{7, nullptr, &file, nullptr};
    EXPECT_EQ(ims_poc_transfer_file(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_only_request("(ivvv)",
                        "(7, <@aa{sv} []>, <{'file_size': <int64 2147483647>, 'push': <false>, "
                        "'start': <int64 -1>, 'end': <int64 -2147483648>}>, <@a{sv} {}>)");
}

TEST_F(PocRequest, LongListsAreSentWhole) {
    constexpr std::size_t kCount = 10000;
    std::vector<ims_poc_peer_info_s> peers(kCount,
                                           {1, "sip:a@example.org", nullptr, false, nullptr});
    for (std::size_t at = 0; at + 1 < kCount; ++at)
        peers[at].next = &peers[at + 1];
    const ims_poc_file_transfer_s info{7, peers.data(), nullptr, nullptr};
    EXPECT_EQ(ims_poc_transfer_file(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    const std::vector<Call> sent = requests();
    ASSERT_EQ(sent.size(), 1U);
    const Variant boxed{g_variant_get_child_value(sent[0].body.get(), 1)};
    const Variant list{g_variant_get_variant(boxed.get())};
    EXPECT_EQ(g_variant_n_children(list.get()), kCount);
}

} // namespace
} // namespace test
