// SPDX-License-Identifier: Apache-2.0
// The registration module's rows through every check, and what its requests do beside that.
#include "declarations.hpp"
#include "expectations.hpp"
#include "request_checks.hpp"

namespace test {
namespace {

constexpr Module kReg{"ims_reg.cpp", "org.kelvo.ims.Registration"};

// "(ii)" "(0, 9)"
void is_pointer_to_nine(void *data) {
    ASSERT_NE(data, nullptr);
    EXPECT_EQ(*static_cast<std::int32_t *>(data), 9);
}

std::vector<RequestRow> request_rows() {
    return {
        without_checks(plain_row<ims_enable_flight_mode>(kReg, "ims_enable_flight_mode",
                                                         "EnableFlightMode", "", "")),
        with_reply(plain_row<ims_register_application>(kReg, "ims_register_application",
                                                       "RegisterApplication", "", ""),
                   "(ii)", "(0, 9)", is_pointer_to_nine),
    };
}

std::vector<QueryRow> query_rows() {
    static ims_registration_info_s info;
    QueryRow row;
    row.function = "ims_get_registration_info";
    row.unit = kReg.unit;
    row.interface = kReg.interface;
    row.method = "GetRegistrationInfo";
    row.call = [](ims_h handle) { return ims_get_registration_info(handle, &info); };
    row.call_with_nothing = with_nothing<ims_get_registration_info>;
    row.missing_pointers = {
        {"handle", [](ims_h) { return ims_get_registration_info(nullptr, &info); }},
        {"info", [](ims_h handle) { return ims_get_registration_info(handle, nullptr); }}};
    row.reply_type = "(buuiiii)";
    row.reply = "(true, 1, 2, 3, 4, 5, 0)";
    row.refused_reply = "(true, 1, 2, 3, 4, 5, 6)";
    row.refused_message = "Failed to get registration info: 6";
    return {row};
}

} // namespace

using ::testing::ValuesIn;

INSTANTIATE_TEST_SUITE_P(Reg, Requests, ValuesIn(request_rows()), row_name<RequestRow>);
INSTANTIATE_TEST_SUITE_P(Reg, RequestGates, ValuesIn(request_rows()), row_name<RequestRow>);
INSTANTIATE_TEST_SUITE_P(Reg, Queries, ValuesIn(query_rows()), row_name<QueryRow>);
INSTANTIATE_TEST_SUITE_P(Reg, QueryGates, ValuesIn(query_rows()), row_name<QueryRow>);

namespace {

TEST(RegRows, CoverEveryDeclaredRequest) {
    EXPECT_EQ(functions_of(request_rows(), query_rows()), declared_functions("ims_reg.h"));
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
        is_pointer_to_nine(data);
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
