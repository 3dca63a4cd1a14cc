// SPDX-License-Identifier: Apache-2.0
#include "tests/library/sms/sms_rows.hpp"

#include <gtest/gtest.h>

namespace test {
namespace {

constexpr Module kSms{.unit = "ims_sms.cpp", .interface = "org.kelvo.ims.Sms"};

constexpr std::uint8_t kTpdu[] = {1, 0, 255};
constexpr ims_sms_deliver_report_s kReport{-7, kTpdu, sizeof kTpdu, 8};

// Sending rewrites the address of the service centre, so each request needs one of its own.
constexpr ims_sms_send_info_s kSend{kTpdu, sizeof kTpdu, nullptr, 9};

int send_sample(ims_h handle, ims_response_cb callback, void *user_data) {
    std::uint8_t sca[] = {11, 0x91, 0x44, 0x77, 0x58, 0x10, 0x06, 0xF0};
    const ims_sms_send_info_s info{kTpdu, sizeof kTpdu, sca, 9};
    return ims_sms_send_sms(handle, &info, callback, user_data);
}

RequestFunction sending() {
    RequestFunction function = request<ims_sms_send_sms, kSend>();
    function.call = send_sample;
    function.no_handle.call = [](ims_h, ims_response_cb callback, void *user_data) {
        return send_sample(nullptr, callback, user_data);
    };
    return function;
}

} // namespace

std::vector<RequestRow> sms_request_rows() {
    const std::vector<RequestRow> rows{
        {.function = sending(),
         .method = "SendSms",
         .type = "(isisi)",
         .arguments = "(42, 'AQD/', 3, 'B5FEd1gQBvA=', 9)",
         .reply_type = "(iiii)",
         .reply = "(0, 7, 8, 9)"},
        {.function = request<ims_sms_send_deliver_report, kReport>(),
         .method = "SendDeliverReport",
         .type = "(iisii)",
         .arguments = "(42, -7, 'AQD/', 3, 8)",
         .reply_type = "(iiii)",
         .reply = "(0, 7, 8, 9)"},
    };
    return requests_of(kSms, rows);
}

} // namespace test
