// SPDX-License-Identifier: Apache-2.0
#include "tests/library/reg/reg_rows.hpp"

#include "tests/support/data_checks.hpp"

namespace test {
namespace {

constexpr Module kReg{.unit = "ims_reg.cpp", .interface = "org.kelvo.ims.Registration"};

} // namespace

std::vector<RequestRow> reg_request_rows() {
    const std::vector<RequestRow> rows{
        {.function = request<ims_enable_flight_mode>(),
         .method = "EnableFlightMode",
         .checked = Checked::kNothing},
        {.function = request<ims_register_application>(),
         .method = "RegisterApplication",
         .reply_type = "(ii)",
         .reply = "(0, 9)",
         .check_data = points_to<9>},
    };
    return requests_of(kReg, rows);
}

std::vector<QueryRow> reg_query_rows() {
    const std::vector<QueryRow> rows{
        {.function = query<ims_get_registration_info>(),
         .method = "GetRegistrationInfo",
         .reply_type = "(buuiiii)",
         .reply = "(true, 1, 2, 3, 4, 5, 0)",
         .refused_reply = "(true, 1, 2, 3, 4, 5, 6)",
         .refused_message = "Failed to get registration info: 6"},
    };
    return queries_of(kReg, rows);
}

} // namespace test
