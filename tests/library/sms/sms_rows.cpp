// SPDX-License-Identifier: Apache-2.0
#include "tests/library/sms/sms_rows.hpp"

#include <gtest/gtest.h>

namespace test {
namespace {

constexpr Module kSms{"ims_sms.cpp", "org.kelvo.ims.Sms"};

constexpr std::uint8_t kTpdu[] = {1, 0, 255};
constexpr ims_sms_deliver_report_s kReport{-7, kTpdu, sizeof kTpdu, 8};

// Each request has an address of its own, because sending rewrites it.
int send_sample(ims_h handle, ims_response_cb callback, void *user_data) {
    std::uint8_t sca[] = {11, 0x91, 0x44, 0x77, 0x58, 0x10, 0x06, 0xF0};
    const ims_sms_send_info_s info{kTpdu, sizeof kTpdu, sca, 9};
    return ims_sms_send_sms(handle, &info, callback, user_data);
}

RequestRow send_row() {
    RequestRow row = named_row<ims_sms_send_sms>(kSms, "ims_sms_send_sms", "SendSms", "(isisi)",
                                                 "(42, 'AQD/', 3, 'B5FEd1gQBvA=', 9)");
    row.call = send_sample;
    row.missing_pointers = {
        {"handle", [](ims_h, ims_response_cb callback,
                      void *user_data) { return send_sample(nullptr, callback, user_data); }},
        {"info", [](ims_h handle, ims_response_cb callback, void *user_data) {
             return ims_sms_send_sms(handle, nullptr, callback, user_data);
         }}};
    return row;
}

} // namespace

std::vector<RequestRow> sms_request_rows() {
    return {with_reply(send_row(), "(iiii)", "(0, 7, 8, 9)"),
            with_reply(record_row<ims_sms_send_deliver_report, kReport>(
                           kSms, "ims_sms_send_deliver_report", "SendDeliverReport", "(iisii)",
                           "(42, -7, 'AQD/', 3, 8)"),
                       "(iiii)", "(0, 7, 8, 9)")};
}

} // namespace test
