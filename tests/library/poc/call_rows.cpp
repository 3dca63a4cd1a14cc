// SPDX-License-Identifier: Apache-2.0
#include "tests/library/poc/poc_rows.hpp"

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
constexpr std::int32_t kValue = -7;
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

void is_pointer_to_seven(void *data) {
    ASSERT_NE(data, nullptr);
    EXPECT_EQ(*static_cast<std::int32_t *>(data), 7);
}

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

template <auto Function>
RequestRow users_row(const char *function, const char *method) {
    using Users = ims_poc_users_s;
    using Content = ims_poc_content_s;
    return with_bad_texts(
        record_row<Function, kUsers>(kPoc, function, method, "(iiiviv)", CHANGE_AS_SENT),
        {bad_part<Function, kUsers, &Users::user_list, kBadUser>("uri"),
         bad_part<Function, kUsers, &Users::user_list, kBadName>("display_name"),
         bad_part<Function, kUsers, &Users::user_list, kBadSecond>("second user"),
         bad_part<Function, kUsers, &Users::content, kBadContent<&Content::content_type>>("type"),
         bad_part<Function, kUsers, &Users::content, kBadContent<&Content::content>>("content")});
}

template <auto Function>
RequestRow media_row(const char *function, const char *method) {
    return record_row<Function, kMedia>(kPoc, function, method, "(bbiivv)", MEDIA_AS_SENT);
}

template <auto Function>
RequestRow pair_row(const char *function, const char *method) {
    return record_row<Function, kPair>(kPoc, function, method, "(ii)", "(7, -8)");
}

RequestRow make_call_row() {
    using Make = ims_poc_make_call_s;
    constexpr auto call = ims_poc_call_make_call;
    return with_reply(
        with_bad_texts(record_row<call, kMake>(
                           kPoc, "ims_poc_call_make_call", "PocMakeCall", "(bbbsisvvi)",
                           "(true, false, true, 'tel:+4912345', 2, 'subject', <[1, 2, 3, 4]>, "
                           "<[5, -6, 7, -2147483648]>, -9)"),
                       {bad_text<call, kMake, &Make::text_1>("text_1"),
                        bad_text<call, kMake, &Make::text_2>("text_2")}),
        "(ii)", "(0, 7)", is_pointer_to_seven);
}

RequestRow make_ad_hoc_call_row() {
    using AdHoc = ims_poc_ad_hoc_call_s;
    constexpr auto call = ims_poc_make_ad_hoc_call;
    return with_reply(
        with_bad_texts(record_row<call, kAdHoc>(
                           kPoc, "ims_poc_make_ad_hoc_call", "PocMakeAdHocConfCall",
                           "(vbvssbibivi)",
                           "(<[1, 2, 3, 4]>, true, <[5, 6, 7, 8]>, 'one', 'two', false, 2, true, "
                           "-9, " USERS_AS_SENT ", 1000000000)"),
                       {bad_text<call, kAdHoc, &AdHoc::text_1>("text_1"),
                        bad_text<call, kAdHoc, &AdHoc::text_2>("text_2"),
                        bad_part<call, kAdHoc, &AdHoc::user_list, kBadUser>("uri"),
                        bad_part<call, kAdHoc, &AdHoc::user_list, kBadSecond>("second user")}),
        "(ii)", "(0, 7)", is_pointer_to_seven);
}

RequestRow request_floor_row() {
    using Floor = ims_poc_floor_s;
    constexpr auto call = ims_poc_call_request_floor;
    return with_bad_texts(record_row<call, kFloor>(kPoc, "ims_poc_call_request_floor",
                                                   "PocRequestFloor", "(iviis)",
                                                   "(7, <[1, 2, 3, 4]>, 8, -9, 'talk')"),
                          {bad_text<call, kFloor, &Floor::text>("text")});
}

} // namespace

std::vector<RequestRow> poc_call_rows() {
    return {
        make_call_row(),
        make_ad_hoc_call_row(),
        users_row<ims_poc_add_users_to_ad_hoc_call>("ims_poc_add_users_to_ad_hoc_call",
                                                    "PocAddUsersToAdHocConfCall"),
        users_row<ims_poc_remove_users_from_ad_hoc_call>("ims_poc_remove_users_from_ad_hoc_call",
                                                         "PocRemoveUsersFromAdHocConfCall"),
        record_row<ims_poc_call_convert_normal_call_to_crisis_call, kValue>(
            kPoc, "ims_poc_call_convert_normal_call_to_crisis_call", "PocCallConvertToCrisisCall",
            "(i)", "(-7,)"),
        media_row<ims_poc_call_answer_call>("ims_poc_call_answer_call", "PocAnswerCall"),
        pair_row<ims_poc_call_reject_call>("ims_poc_call_reject_call", "PocRejectCall"),
        pair_row<ims_poc_call_end_call>("ims_poc_call_end_call", "PocEndCall"),
        request_floor_row(),
        record_row<ims_poc_call_release_floor, kFloor>(
            kPoc, "ims_poc_call_release_floor", "PocReleaseFloor", "(iv)", "(7, <[1, 2, 3, 4]>)"),
        with_reply(record_row<ims_poc_call_request_floor_status, kQuery>(
                       kPoc, "ims_poc_call_request_floor_status", "PocRequestFloorStatus", "(v)",
                       "(<[7, 8, 9, 10, 11]>,)"),
                   "(iaa{sv})",
                   "(0, [{'session_id': <int64 7>, 'status': <int64 2>, 'participant_count': "
                   "<int64 3>, 'floor_taken_uri': <'sip:a@example.org'>}, "
                   "{'session_id': <int64 8>}])",
                   is_status_list),
        media_row<ims_poc_modify_call>("ims_poc_modify_call", "PocModifyCall"),
        media_row<ims_poc_accept_call_modify>("ims_poc_accept_call_modify", "PocAcceptModifyCall"),
        value_row<ims_poc_reject_call_modify, -7>(kPoc, "ims_poc_reject_call_modify",
                                                  "PocRejectModifyCall", "(i)", "(-7,)"),
        pair_row<ims_poc_set_channel>("ims_poc_set_channel", "PocSetChannel"),
    };
}

} // namespace test
