// SPDX-License-Identifier: Apache-2.0
#include "tests/library/reg/reg_rows.hpp"

#include <gtest/gtest.h>

namespace test {
namespace {

constexpr Module kReg{"ims_reg.cpp", "org.kelvo.ims.Registration"};

// "(ii)" "(0, 9)"
void is_pointer_to_nine(void *data) {
    ASSERT_NE(data, nullptr);
    EXPECT_EQ(*static_cast<std::int32_t *>(data), 9);
}

} // namespace

std::vector<RequestRow> reg_request_rows() {
    return {
        without_checks(plain_row<ims_enable_flight_mode>(kReg, "ims_enable_flight_mode",
                                                         "EnableFlightMode", "", "")),
        with_reply(plain_row<ims_register_application>(kReg, "ims_register_application",
                                                       "RegisterApplication", "", ""),
                   "(ii)", "(0, 9)", is_pointer_to_nine),
    };
}

std::vector<QueryRow> reg_query_rows() {
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

} // namespace test
