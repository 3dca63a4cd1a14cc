// SPDX-License-Identifier: Apache-2.0
// The login module's rows through every check, and what its requests do beside that.
#include "declarations.hpp"
#include "expectations.hpp"
#include "request_checks.hpp"

namespace test {
namespace {

constexpr Module kLogin{"ims_login.cpp", "org.kelvo.ims.Login"};

RequestRow login_row() {
    RequestRow row =
        named_row<ims_login>(kLogin, "ims_login", "Login", "(ssii)", "('a', 'b', 1, 42)");
    row.call = [](ims_h handle, ims_response_cb callback, void *user_data) {
        return ims_login(handle, "a", "b", 1, callback, user_data);
    };
    row.missing_pointers = {{"handle", [](ims_h, ims_response_cb callback, void *user_data) {
                                 return ims_login(nullptr, "a", "b", 1, callback, user_data);
                             }}};
    row.bad_texts = {{"text_1",
                      [](ims_h handle, ims_response_cb callback, void *user_data) {
                          return ims_login(handle, kNotUtf8, "b", 1, callback, user_data);
                      }},
                     {"text_2", [](ims_h handle, ims_response_cb callback, void *user_data) {
                          return ims_login(handle, "a", kNotUtf8, 1, callback, user_data);
                      }}};
    return row;
}

std::vector<RequestRow> request_rows() {
    return {login_row(), plain_row<ims_logout>(kLogin, "ims_logout", "Logout", "(i)", "(42,)")};
}

std::vector<QueryRow> query_rows() {
    static ims_login_state_s state;
    QueryRow row;
    row.function = "ims_get_login_state";
    row.unit = kLogin.unit;
    row.interface = kLogin.interface;
    row.method = "GetLoginState";
    row.sent_type = "(ii)";
    row.sent = "(2, 42)";
    row.call = [](ims_h handle) { return ims_get_login_state(handle, 2, &state); };
    row.call_with_nothing = with_nothing<ims_get_login_state>;
    row.missing_pointers = {
        {"handle", [](ims_h) { return ims_get_login_state(nullptr, 2, &state); }},
        {"state", [](ims_h handle) { return ims_get_login_state(handle, 2, nullptr); }}};
    row.reply_type = "(iiui)";
    row.reply = "(0, 1, 2, 3)";
    row.refused_reply = "(5, 1, 2, 3)";
    row.refused_message = "Failed to get Login Status: [5]";
    return {row};
}

} // namespace

using ::testing::ValuesIn;

INSTANTIATE_TEST_SUITE_P(Login, Requests, ValuesIn(request_rows()), row_name<RequestRow>);
INSTANTIATE_TEST_SUITE_P(Login, RequestGates, ValuesIn(request_rows()), row_name<RequestRow>);
INSTANTIATE_TEST_SUITE_P(Login, Queries, ValuesIn(query_rows()), row_name<QueryRow>);
INSTANTIATE_TEST_SUITE_P(Login, QueryGates, ValuesIn(query_rows()), row_name<QueryRow>);

namespace {

TEST(LoginRows, CoverEveryDeclaredRequest) {
    EXPECT_EQ(functions_of(request_rows(), query_rows()), declared_functions("ims_login.h"));
}

class LoginRequest : public WithPeer {};

TEST_F(LoginRequest, LoginSendsTheApplicationIdLast) {
    peer().on(kRegisterApplication, reply("(ii)", "(0, 4)"));
    EXPECT_EQ(ims_login(init(), "a", "b", 1, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(requests().back(), "(ssii)", "('a', 'b', 1, 4)");
}

TEST_F(LoginRequest, LogoutSendsTheApplicationIdAlone) {
    peer().on(kRegisterApplication, reply("(ii)", "(0, 4)"));
    EXPECT_EQ(ims_logout(init(), nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(requests().back(), "(i)", "(4,)");
}

TEST_F(LoginRequest, LoginSendsItsArgumentsAsTheyAre) {
    EXPECT_EQ(ims_login(handle_, "zo\xc3\xab@example.org", "", -2147483647 - 1, nullptr, nullptr),
              IMS_ERROR_NONE);
    expect_sent(requests().back(), "(ssii)", "('zo\xc3\xab@example.org', '', -2147483648, 42)");
    EXPECT_EQ(ims_login(handle_, " ", "\xe2\x82\xac'\"\\\n", 2147483647, nullptr, nullptr),
              IMS_ERROR_NONE);
    expect_sent(requests().back(), "(ssii)", "(' ', '\xe2\x82\xac\\'\"\\\\\\n', 2147483647, 42)");
}

TEST_F(LoginRequest, ANullTextDoesNoHarmAndIsSentAsAnEmptyOne) {
    EXPECT_EQ(ims_login(handle_, nullptr, nullptr, 1, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(requests().back(), "(ssii)", "('', '', 1, 42)");
}

} // namespace
} // namespace test
