// SPDX-License-Identifier: Apache-2.0
#include "tests/library/login/login_rows.hpp"

#include <gtest/gtest.h>

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

} // namespace

std::vector<RequestRow> login_request_rows() {
    return {login_row(), plain_row<ims_logout>(kLogin, "ims_logout", "Logout", "(i)", "(42,)")};
}

std::vector<QueryRow> login_query_rows() {
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

} // namespace test
