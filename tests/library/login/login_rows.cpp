// SPDX-License-Identifier: Apache-2.0
#include "tests/library/login/login_rows.hpp"

#include <gtest/gtest.h>

namespace test {
namespace {

constexpr Module kLogin{.unit = "ims_login.cpp", .interface = "org.kelvo.ims.Login"};

const char *const kUser = "a";
const char *const kPassword = "b";
constexpr std::int32_t kNumber = 1;
constexpr std::int32_t kAsked = 2;

} // namespace

std::vector<RequestRow> login_request_rows() {
    const std::vector<RequestRow> rows{
        {.function = request<ims_login, kUser, kPassword, kNumber>(),
         .method = "Login",
         .type = "(ssii)",
         .arguments = "('a', 'b', 1, 42)",
         .checked = Checked::kHandle},
        {.function = request<ims_logout>(),
         .method = "Logout",
         .type = "(i)",
         .arguments = "(42,)"},
    };
    return requests_of(kLogin, rows);
}

std::vector<QueryRow> login_query_rows() {
    const std::vector<QueryRow> rows{
        {.function = query<ims_get_login_state, kAsked>(),
         .method = "GetLoginState",
         .type = "(ii)",
         .arguments = "(2, 42)",
         .reply_type = "(iiui)",
         .reply = "(0, 1, 2, 3)",
         .refused_reply = "(5, 1, 2, 3)",
         .refused_message = "Failed to get Login Status: [5]"},
    };
    return queries_of(kLogin, rows);
}

} // namespace test
