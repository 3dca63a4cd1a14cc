// SPDX-License-Identifier: Apache-2.0
// The registration module's rows through every check, and what its requests do beside that.
#include "tests/library/reg/reg_rows.hpp"
#include "tests/support/declarations.hpp"
#include "tests/support/expectations.hpp"
#include "tests/support/request_checks.hpp"

namespace test {

using ::testing::ValuesIn;

INSTANTIATE_TEST_SUITE_P(Reg, Requests, ValuesIn(reg_request_rows()), row_name<RequestRow>);
INSTANTIATE_TEST_SUITE_P(Reg, RequestGates, ValuesIn(reg_request_rows()), row_name<RequestRow>);
INSTANTIATE_TEST_SUITE_P(Reg, Queries, ValuesIn(reg_query_rows()), row_name<QueryRow>);
INSTANTIATE_TEST_SUITE_P(Reg, QueryGates, ValuesIn(reg_query_rows()), row_name<QueryRow>);

namespace {

TEST(RegRows, CoverEveryDeclaredRequest) {
    EXPECT_EQ(functions_of(reg_request_rows(), reg_query_rows()), declared_functions("ims_reg.h"));
}

class RegRequest : public WithPeer {
  protected:
    // Registrations of ims_init() get 42, those that are asked for get this one.
    void answer_registrations_with(const std::string &text) {
        peer().on(kRegisterApplication, [text](const Call &call) {
            return reply("(ii)", call.signature == "is" ? "(0, 42)" : text);
        });
    }

    // The application id that the handle sends.
    void expect_app_id(ims_h handle, const std::string &id) {
        EXPECT_EQ(ims_logout(handle, nullptr, nullptr), IMS_ERROR_NONE);
        expect_sent(requests().back(), "(i)", "(" + id + ",)");
    }
};

TEST_F(RegRequest, RegisterApplicationHandsTheIdOverAndLeavesTheHandlesAsItWas) {
    answer_registrations_with("(0, 9)");
    expect_app_id(handle_, "42");
    ResponseRecorder recorder{[&](const Response &response, void *data) {
        ASSERT_NE(data, nullptr);
        EXPECT_EQ(*static_cast<std::int32_t *>(data), 9);
        expect_app_id(response.handle, "42");
    }};
    EXPECT_EQ(ims_register_application(handle_, ResponseRecorder::callback, &recorder),
              IMS_ERROR_NONE);
    fence();
    ASSERT_EQ(recorder.count(), 1U);
    EXPECT_EQ(recorder.last().handle, handle_);
    EXPECT_EQ(recorder.last().result, 0);
    expect_app_id(handle_, "42");
}

TEST_F(RegRequest, ARefusedRegisterApplicationHandsTheIdOverToo) {
    answer_registrations_with("(5, -1)");
    ResponseRecorder recorder{[](const Response &, void *data) {
        ASSERT_NE(data, nullptr);
        EXPECT_EQ(*static_cast<std::int32_t *>(data), -1);
    }};
    EXPECT_EQ(ims_register_application(handle_, ResponseRecorder::callback, &recorder),
              IMS_ERROR_NONE);
    fence();
    ASSERT_EQ(recorder.count(), 1U);
    EXPECT_EQ(recorder.last().result, 5);
    expect_app_id(handle_, "42");
    EXPECT_TRUE(take_log().empty());
}

TEST_F(RegRequest, EachHandleRegistersOnItsOwnObject) {
    answer_registrations_with("(0, 9)");
    const ims_h other = init(7);
    EXPECT_EQ(ims_register_application(other, nullptr, nullptr), IMS_ERROR_NONE);
    EXPECT_EQ(ims_enable_flight_mode(other, nullptr, nullptr), IMS_ERROR_NONE);
    const std::vector<Call> sent = requests();
    ASSERT_EQ(sent.size(), 2U);
    for (const Call &call : sent) {
        EXPECT_EQ(call.path, "/org/kelvo/ims/sub7");
        EXPECT_FALSE(call.has_signature);
    }
}

} // namespace
} // namespace test
