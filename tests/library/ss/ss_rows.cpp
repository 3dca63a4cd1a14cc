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

constexpr Module kSs{"ims_ss.cpp", "org.kelvo.ims.Ss"};

constexpr ims_ss_cw_info_s kWaiting{1, -2};
constexpr ims_ss_cf_info_s kForwarding{1, -2, 3, 4, 5, 6, "tel:+4912345"};
constexpr ims_ss_cb_set_s kBarring{1, -2, 3, "0000"};
constexpr ims_ss_query_s kQuery{7, -8};

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

// A get request: its data is a list, and a refusal is logged and brings none.
RequestRow with_list(RequestRow row, const char *dictionary, void (*check_data)(void *),
                     const char *refused_message) {
    row.reply_type = "(iuaa{sv})";
    row.reply = std::string{"(0, 1, ["} + dictionary + "])";
    row.check_data = check_data;
    row.refused_message = refused_message;
    return row;
}

} // namespace

std::vector<RequestRow> ss_request_rows() {
    using Forwarding = ims_ss_cf_info_s;
    using Barring = ims_ss_cb_set_s;
    return {
        without_checks(record_row<ims_ss_set_call_waiting, kWaiting>(
            kSs, "ims_ss_set_call_waiting", "SetCallWaiting", "(iii)", "(42, 1, -2)")),
        with_list(without_checks(value_row<ims_ss_get_call_waiting, 7>(
                      kSs, "ims_ss_get_call_waiting", "GetCallWaiting", "(ii)", "(42, 7)")),
                  "{'ss_class': <1>, 'ss_status': <2>}", is_waiting,
                  "Failed to get waiting status: "),
        with_bad_texts(
            record_row<ims_ss_set_call_forwarding, kForwarding>(
                kSs, "ims_ss_set_call_forwarding", "SetCallForwarding", "(iiiiiiis)",
                "(42, 1, -2, 3, 4, 5, 6, 'tel:+4912345')"),
            {bad_text<ims_ss_set_call_forwarding, kForwarding, &Forwarding::cf_uri>("cf_uri")}),
        with_list(record_row<ims_ss_get_call_forwarding, kQuery>(kSs, "ims_ss_get_call_forwarding",
                                                                 "GetCallForwarding", "(iii)",
                                                                 "(42, 7, -8)"),
                  "{'ss_class': <1>, 'ss_status': <2>, 'cf_type': <3>, 'cf_uri': <'tel:1'>}",
                  is_forwarding, "Failed to get forwarding status: "),
        with_bad_texts(
            record_row<ims_ss_set_call_barring, kBarring>(kSs, "ims_ss_set_call_barring",
                                                          "SetCallBarring", "(iiiis)",
                                                          "(42, 1, -2, 3, '0000')"),
            {bad_text<ims_ss_set_call_barring, kBarring, &Barring::cb_password>("cb_password")}),
        with_list(record_row<ims_ss_get_call_barring, kQuery>(
                      kSs, "ims_ss_get_call_barring", "GetCallBarring", "(iii)", "(42, 7, -8)"),
                  "{'ss_class': <1>, 'ss_status': <2>, 'cb_type': <3>}", is_barring,
                  "Failed to get barring status: "),
    };
}

} // namespace test
