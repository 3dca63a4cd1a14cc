// SPDX-License-Identifier: Apache-2.0
#include "tests/library/ss/ss_rows.hpp"

#include <gtest/gtest.h>

#include <cstddef>

namespace test {
namespace {

static_assert(sizeof(ims_ss_cw_info_s) == 8);
static_assert(offsetof(ims_ss_cw_info_s, ss_class) == 0);
static_assert(offsetof(ims_ss_cw_info_s, ss_status) == 4);

static_assert(sizeof(ims_ss_cb_info_s) == 12);
static_assert(offsetof(ims_ss_cb_info_s, ss_class) == 0);
static_assert(offsetof(ims_ss_cb_info_s, ss_status) == 4);
static_assert(offsetof(ims_ss_cb_info_s, cb_type) == 8);

static_assert(sizeof(ims_ss_cb_set_s) == 24);
static_assert(offsetof(ims_ss_cb_set_s, ss_class) == 0);
static_assert(offsetof(ims_ss_cb_set_s, ss_status) == 4);
static_assert(offsetof(ims_ss_cb_set_s, cb_type) == 8);
static_assert(offsetof(ims_ss_cb_set_s, cb_password) == 16);

static_assert(sizeof(ims_ss_cf_info_s) == 32);
static_assert(offsetof(ims_ss_cf_info_s, ss_class) == 0);
static_assert(offsetof(ims_ss_cf_info_s, ss_status) == 4);
static_assert(offsetof(ims_ss_cf_info_s, cf_type) == 8);
static_assert(offsetof(ims_ss_cf_info_s, no_reply_time) == 12);
static_assert(offsetof(ims_ss_cf_info_s, cf_uri_length) == 16);
static_assert(offsetof(ims_ss_cf_info_s, cf_uri_type) == 20);
static_assert(offsetof(ims_ss_cf_info_s, cf_uri) == 24);

static_assert(sizeof(ims_ss_query_s) == 8);
static_assert(offsetof(ims_ss_query_s, ss_class) == 0);
static_assert(offsetof(ims_ss_query_s, type) == 4);

static_assert(sizeof(ims_ss_status_list_s) == 16);
static_assert(offsetof(ims_ss_status_list_s, count) == 0);
static_assert(offsetof(ims_ss_status_list_s, entries) == 8);

constexpr Module kSs{.unit = "ims_ss.cpp", .interface = "org.kelvo.ims.Ss"};

constexpr ims_ss_cw_info_s kWaiting{1, -2};
constexpr ims_ss_cf_info_s kForwarding{1, -2, 3, 4, 5, 6, "tel:+4912345"};
constexpr ims_ss_cb_set_s kBarring{1, -2, 3, "0000"};
constexpr ims_ss_query_s kQuery{7, -8};
constexpr std::int32_t kClass = 7;

const ims_ss_status_list_s &list_of_one(void *data) {
    const auto &list = *static_cast<ims_ss_status_list_s *>(data);
    EXPECT_EQ(list.count, 1U);
    return list;
}

// "{'ss_class': <1>, 'ss_status': <2>}"
void is_waiting(void *data) {
    ASSERT_NE(data, nullptr);
    const ims_ss_cw_info_s *entry = list_of_one(data).entries.call_waiting;
    ASSERT_NE(entry, nullptr);
    EXPECT_EQ(entry->ss_class, 1);
    EXPECT_EQ(entry->ss_status, 2);
}

// "{'ss_class': <1>, 'ss_status': <2>, 'cf_type': <3>, 'cf_uri': <'tel:1'>}"
void is_forwarding(void *data) {
    ASSERT_NE(data, nullptr);
    const ims_ss_cf_info_s *entry = list_of_one(data).entries.call_forwarding;
    ASSERT_NE(entry, nullptr);
    EXPECT_EQ(entry->ss_class, 1);
    EXPECT_EQ(entry->ss_status, 2);
    EXPECT_EQ(entry->cf_type, 3);
    EXPECT_STREQ(entry->cf_uri, "tel:1");
}

// "{'ss_class': <1>, 'ss_status': <2>, 'cb_type': <3>}"
void is_barring(void *data) {
    ASSERT_NE(data, nullptr);
    const ims_ss_cb_info_s *entry = list_of_one(data).entries.call_barring;
    ASSERT_NE(entry, nullptr);
    EXPECT_EQ(entry->ss_class, 1);
    EXPECT_EQ(entry->ss_status, 2);
    EXPECT_EQ(entry->cb_type, 3);
}

// What a get request is answered: one entry.
std::string list_of(const char *dictionary) {
    return std::string{"(0, 1, ["} + dictionary + "])";
}

std::vector<RequestRow> all_rows() {
    constexpr const char *kListType = "(iuaa{sv})";
    return {
        {.function = request<ims_ss_set_call_waiting, kWaiting>(),
         .method = "SetCallWaiting",
         .type = "(iii)",
         .arguments = "(42, 1, -2)",
         .checked = Checked::kNothing},
        {.function = request<ims_ss_get_call_waiting, kClass>(),
         .method = "GetCallWaiting",
         .type = "(ii)",
         .arguments = "(42, 7)",
         .checked = Checked::kNothing,
         .reply_type = kListType,
         .reply = list_of("{'ss_class': <1>, 'ss_status': <2>}"),
         .check_data = is_waiting,
         .refused_message = "Failed to get waiting status: "},
        {.function = request<ims_ss_set_call_forwarding, kForwarding>(),
         .method = "SetCallForwarding",
         .type = "(iiiiiiis)",
         .arguments = "(42, 1, -2, 3, 4, 5, 6, 'tel:+4912345')",
         .bad_texts = {bad_text<&ims_ss_cf_info_s::cf_uri>()}},
        {.function = request<ims_ss_get_call_forwarding, kQuery>(),
         .method = "GetCallForwarding",
         .type = "(iii)",
         .arguments = "(42, 7, -8)",
         .reply_type = kListType,
         .reply =
             list_of("{'ss_class': <1>, 'ss_status': <2>, 'cf_type': <3>, 'cf_uri': <'tel:1'>}"),
         .check_data = is_forwarding,
         .refused_message = "Failed to get forwarding status: "},
        {.function = request<ims_ss_set_call_barring, kBarring>(),
         .method = "SetCallBarring",
         .type = "(iiiis)",
         .arguments = "(42, 1, -2, 3, '0000')",
         .bad_texts = {bad_text<&ims_ss_cb_set_s::cb_password>()}},
        {.function = request<ims_ss_get_call_barring, kQuery>(),
         .method = "GetCallBarring",
         .type = "(iii)",
         .arguments = "(42, 7, -8)",
         .reply_type = kListType,
         .reply = list_of("{'ss_class': <1>, 'ss_status': <2>, 'cb_type': <3>}"),
         .check_data = is_barring,
         .refused_message = "Failed to get barring status: "},
    };
}

} // namespace

std::vector<RequestRow> ss_request_rows() {
    return requests_of(kSs, all_rows());
}

} // namespace test
