// SPDX-License-Identifier: Apache-2.0
// The supplementary services' rows through every check, and what the set requests do beside that.
#include "tests/library/ss/ss_rows.hpp"
#include "tests/support/declarations.hpp"
#include "tests/support/expectations.hpp"
#include "tests/support/request_checks.hpp"

#include <climits>
#include <cstddef>

namespace test {

using ::testing::ValuesIn;

INSTANTIATE_TEST_SUITE_P(Ss, Requests, ValuesIn(ss_request_rows()), row_name<RequestRow>);
INSTANTIATE_TEST_SUITE_P(Ss, RequestGates, ValuesIn(ss_request_rows()), row_name<RequestRow>);

namespace {

TEST(SsRows, CoverEveryDeclaredRequest) {
    EXPECT_EQ(functions_of(ss_request_rows()), declared_functions("ims_ss.h"));
}

class SsRequest : public WithPeer {};

TEST_F(SsRequest, NumbersPassThroughUnchecked) {
    for (const std::int32_t value : {INT_MIN, -1, 0, INT_MAX}) {
        const std::string number = std::to_string(value);
        const std::string twice = number + ", " + number;
        const ims_ss_cw_info_s waiting{value, value};
        EXPECT_EQ(ims_ss_set_call_waiting(handle_, &waiting, nullptr, nullptr), IMS_ERROR_NONE);
        expect_sent(requests().back(), "(iii)", "(42, " + twice + ")");
        EXPECT_EQ(ims_ss_get_call_waiting(handle_, value, nullptr, nullptr), IMS_ERROR_NONE);
        expect_sent(requests().back(), "(ii)", "(42, " + number + ")");
        const ims_ss_query_s query{value, value};
        EXPECT_EQ(ims_ss_get_call_forwarding(handle_, &query, nullptr, nullptr), IMS_ERROR_NONE);
        expect_sent(requests().back(), "(iii)", "(42, " + twice + ")");
        EXPECT_EQ(ims_ss_get_call_barring(handle_, &query, nullptr, nullptr), IMS_ERROR_NONE);
        expect_sent(requests().back(), "(iii)", "(42, " + twice + ")");
    }
}

TEST_F(SsRequest, ATargetsLengthIsSentAsStored) {
    for (const std::int32_t length : {INT_MIN, -1, 0, 3, INT_MAX}) {
        const ims_ss_cf_info_s info{1, 2, 3, 4, length, 6, "zo\xc3\xab"};
        EXPECT_EQ(ims_ss_set_call_forwarding(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
        expect_sent(requests().back(), "(iiiiiiis)",
                    "(42, 1, 2, 3, 4, " + std::to_string(length) + ", 6, 'zo\xc3\xab')");
    }
}

TEST_F(SsRequest, NullTextsAreSentAsEmptyOnes) {
    const ims_ss_cf_info_s forwarding{1, 2, 3, 4, 5, 6, nullptr};
    EXPECT_EQ(ims_ss_set_call_forwarding(handle_, &forwarding, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(requests().back(), "(iiiiiiis)", "(42, 1, 2, 3, 4, 5, 6, '')");
    const ims_ss_cb_set_s barring{1, 2, 3, nullptr};
    EXPECT_EQ(ims_ss_set_call_barring(handle_, &barring, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(requests().back(), "(iiiis)", "(42, 1, 2, 3, '')");
}

} // namespace
} // namespace test
