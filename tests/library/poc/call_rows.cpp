// SPDX-License-Identifier: Apache-2.0
#include "tests/library/poc/poc_rows.hpp"

#include "tests/support/data_checks.hpp"

#include <gtest/gtest.h>

namespace test {
namespace {

constexpr ims_poc_make_call_s kMake{
    true, false, true, "tel:+4912345", 2, "subject", {1, 2, 3, 4}, {5, -6, 7, INT32_MIN}, -9};
constexpr ims_poc_call_media_s kMedia{false, true, 7, -8, {1, 2, 3, 4}, {5, 6, 7, INT32_MAX}};
constexpr ims_poc_user_s kSecond{2, "sip:b@example.org", nullptr, true, false, 5, 6, nullptr};
constexpr ims_poc_user_s kFirst{1, "sip:a@example.org", "Zo\xc3\xab", false, true, 3, -4, &kSecond};
constexpr ims_poc_ad_hoc_call_s kAdHoc{{1, 2, 3, 4}, true, {5, 6, 7, 8}, "one",     "two", false, 2,
                                       true,         -9,   &kFirst,      1000000000};
constexpr ims_poc_content_s kContent{"text/plain", "render", "id", "8bit", "a note", "Welcome"};
constexpr ims_poc_users_s kUsers{7, 2, -8, &kFirst, 9, &kContent};
constexpr ims_poc_value_pair_s kPair{7, -8};
constexpr std::int32_t kSession = -7;
constexpr ims_poc_floor_s kFloor{7, {1, 2, 3, 4}, 8, -9, "talk"};
constexpr ims_poc_floor_query_s kQuery{5, {7, 8, 9, 10, 11}};

#define USERS_AS_SENT                                                                              \
    "<[{'uri_gv': <<{'uri_type': <int64 1>, 'uri': <'sip:a@example.org'>, "                        \
    "'display_name': <'Zo\xc3\xab'>, 'is_group_uri': <false>}>>, 'is_anonymous': <true>, "         \
    "'participant_state': <int64 3>, 'uri_usage_type': <int64 -4>}, "                              \
    "{'uri_gv': <<{'uri_type': <int64 2>, 'uri': <'sip:b@example.org'>, "                          \
    "'is_group_uri': <true>}>>, 'is_anonymous': <false>, 'participant_state': <int64 5>, "         \
    "'uri_usage_type': <int64 6>}]>"
#define CHANGE_AS_SENT                                                                             \
    "(7, 2, -8, " USERS_AS_SENT ", 9, <{'content_type': <'text/plain'>, 'content_disposition': "   \
    "<'render'>, 'content_id': <'id'>, 'content_encoding_type': <'8bit'>, "                        \
    "'content_description': <'a note'>, 'content': <'Welcome'>}>)"
#define MEDIA_AS_SENT "(false, true, 7, -8, <[1, 2, 3, 4]>, <[5, 6, 7, 2147483647]>)"

// "(0, [...])" below
void is_status_list(void *data) {
    const auto *status = static_cast<const ims_poc_floor_status_s *>(data);
    ASSERT_NE(status, nullptr);
    EXPECT_EQ(status->session_id, 7);
    EXPECT_EQ(status->status, 2);
    EXPECT_EQ(status->participant_count, 3);
    EXPECT_STREQ(status->floor_taken_uri, "sip:a@example.org");
    ASSERT_NE(status->next, nullptr);
    EXPECT_EQ(status->next->session_id, 8);
    EXPECT_EQ(status->next->next, nullptr);
}

constexpr ims_poc_user_s kBadUser{1, kNotUtf8, nullptr, false, false, 0, 0, nullptr};
constexpr ims_poc_user_s kBadName{1, nullptr, kNotUtf8, false, false, 0, 0, nullptr};
constexpr ims_poc_user_s kBadSecond{1, nullptr, nullptr, false, false, 0, 0, &kBadUser};

template <const char *ims_poc_content_s::*Field>
constexpr ims_poc_content_s kBadContent = [] {
    ims_poc_content_s content = kContent;
    content.*Field = kNotUtf8;
    return content;
}();

std::vector<BadText> bad_users() {
    using Users = ims_poc_users_s;
    using Content = ims_poc_content_s;
    return {bad_part<&Users::user_list, kBadUser>("uri"),
            bad_part<&Users::user_list, kBadName>("display_name"),
            bad_part<&Users::user_list, kBadSecond>("second user"),
            bad_part<&Users::content, kBadContent<&Content::content_type>>("type"),
            bad_part<&Users::content, kBadContent<&Content::content>>("content")};
}

std::vector<RequestRow> making_rows() {
    using Make = ims_poc_make_call_s;
    using AdHoc = ims_poc_ad_hoc_call_s;
    return {
        {.function = request<ims_poc_call_make_call, kMake>(),
         .method = "PocMakeCall",
         .type = "(bbbsisvvi)",
         .arguments = "(true, false, true, 'tel:+4912345', 2, 'subject', <[1, 2, 3, 4]>, "
                      "<[5, -6, 7, -2147483648]>, -9)",
         .bad_texts = {bad_text<&Make::text_1>(), bad_text<&Make::text_2>()},
         .reply_type = "(ii)",
         .reply = "(0, 7)",
         .check_data = points_to<7>},
        {.function = request<ims_poc_make_ad_hoc_call, kAdHoc>(),
         .method = "PocMakeAdHocConfCall",
         .type = "(vbvssbibivi)",
         .arguments = "(<[1, 2, 3, 4]>, true, <[5, 6, 7, 8]>, 'one', 'two', false, 2, true, "
                      "-9, " USERS_AS_SENT ", 1000000000)",
         .bad_texts = {bad_text<&AdHoc::text_1>(), bad_text<&AdHoc::text_2>(),
                       bad_part<&AdHoc::user_list, kBadUser>("uri"),
                       bad_part<&AdHoc::user_list, kBadSecond>("second user")},
         .reply_type = "(ii)",
         .reply = "(0, 7)",
         .check_data = points_to<7>},
        {.function = request<ims_poc_add_users_to_ad_hoc_call, kUsers>(),
         .method = "PocAddUsersToAdHocConfCall",
         .type = "(iiiviv)",
         .arguments = CHANGE_AS_SENT,
         .bad_texts = bad_users()},
        {.function = request<ims_poc_remove_users_from_ad_hoc_call, kUsers>(),
         .method = "PocRemoveUsersFromAdHocConfCall",
         .type = "(iiiviv)",
         .arguments = CHANGE_AS_SENT,
         .bad_texts = bad_users()},
    };
}

std::vector<RequestRow> session_rows() {
    return {
        {.function = request<ims_poc_call_convert_normal_call_to_crisis_call, kSession>(),
         .method = "PocCallConvertToCrisisCall",
         .type = "(i)",
         .arguments = "(-7,)"},
        {.function = request<ims_poc_call_answer_call, kMedia>(),
         .method = "PocAnswerCall",
         .type = "(bbiivv)",
         .arguments = MEDIA_AS_SENT},
        {.function = request<ims_poc_call_reject_call, kPair>(),
         .method = "PocRejectCall",
         .type = "(ii)",
         .arguments = "(7, -8)"},
        {.function = request<ims_poc_call_end_call, kPair>(),
         .method = "PocEndCall",
         .type = "(ii)",
         .arguments = "(7, -8)"},
        {.function = request<ims_poc_call_request_floor, kFloor>(),
         .method = "PocRequestFloor",
         .type = "(iviis)",
         .arguments = "(7, <[1, 2, 3, 4]>, 8, -9, 'talk')",
         .bad_texts = {bad_text<&ims_poc_floor_s::text>()}},
        {.function = request<ims_poc_call_release_floor, kFloor>(),
         .method = "PocReleaseFloor",
         .type = "(iv)",
         .arguments = "(7, <[1, 2, 3, 4]>)"},
        {.function = request<ims_poc_call_request_floor_status, kQuery>(),
         .method = "PocRequestFloorStatus",
         .type = "(v)",
         .arguments = "(<[7, 8, 9, 10, 11]>,)",
         .reply_type = "(iaa{sv})",
         .reply = "(0, [{'session_id': <int64 7>, 'status': <int64 2>, 'participant_count': "
                  "<int64 3>, 'floor_taken_uri': <'sip:a@example.org'>}, "
                  "{'session_id': <int64 8>}])",
         .check_data = is_status_list},
        {.function = request<ims_poc_modify_call, kMedia>(),
         .method = "PocModifyCall",
         .type = "(bbiivv)",
         .arguments = MEDIA_AS_SENT},
        {.function = request<ims_poc_accept_call_modify, kMedia>(),
         .method = "PocAcceptModifyCall",
         .type = "(bbiivv)",
         .arguments = MEDIA_AS_SENT},
        {.function = request<ims_poc_reject_call_modify, kSession>(),
         .method = "PocRejectModifyCall",
         .type = "(i)",
         .arguments = "(-7,)"},
        {.function = request<ims_poc_set_channel, kPair>(),
         .method = "PocSetChannel",
         .type = "(ii)",
         .arguments = "(7, -8)"},
    };
}

} // namespace

std::vector<RequestRow> poc_call_rows() {
    return joined({making_rows(), session_rows()});
}

} // namespace test
