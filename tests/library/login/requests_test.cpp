// SPDX-License-Identifier: Apache-2.0
// The login module's rows through every check, and what its requests do beside that.
#include "tests/library/login/login_rows.hpp"
#include "tests/support/declarations.hpp"
#include "tests/support/expectations.hpp"
#include "tests/support/request_checks.hpp"

namespace test {

using ::testing::ValuesIn;

INSTANTIATE_TEST_SUITE_P(Login, Requests, ValuesIn(login_request_rows()), row_name<RequestRow>);
INSTANTIATE_TEST_SUITE_P(Login, RequestGates, ValuesIn(login_request_rows()), row_name<RequestRow>);
INSTANTIATE_TEST_SUITE_P(Login, Queries, ValuesIn(login_query_rows()), row_name<QueryRow>);
INSTANTIATE_TEST_SUITE_P(Login, QueryGates, ValuesIn(login_query_rows()), row_name<QueryRow>);

namespace {

TEST(LoginRows, CoverEveryDeclaredRequest) {
    EXPECT_EQ(functions_of(login_request_rows(), login_query_rows()),
              declared_functions("ims_login.h"));
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
