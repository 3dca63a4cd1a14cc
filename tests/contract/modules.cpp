// SPDX-License-Identifier: Apache-2.0
#include "tests/contract/modules.hpp"

#include "tests/call/call_rows.hpp"
#include "tests/call/event_rows.hpp"
#include "tests/login/event_rows.hpp"
#include "tests/login/login_rows.hpp"
#include "tests/poc/event_rows.hpp"
#include "tests/poc/poc_rows.hpp"
#include "tests/reg/event_rows.hpp"
#include "tests/reg/reg_rows.hpp"
#include "tests/settings/settings_rows.hpp"
#include "tests/sms/event_rows.hpp"
#include "tests/sms/sms_rows.hpp"
#include "tests/ss/ss_rows.hpp"
#include "tests/vt/vt_rows.hpp"
#include "tests/xdm/xdm_rows.hpp"

namespace test {
namespace {

std::vector<RequestRow> joined(std::vector<RequestRow> rows, const std::vector<RequestRow> &more) {
    rows.insert(rows.end(), more.begin(), more.end());
    return rows;
}

} // namespace

std::vector<ModuleRows> all_modules() {
    return {
        {call_request_rows(), call_query_rows(), events_of(kCallEvents, call_event_rows())},
        {login_request_rows(), login_query_rows(), events_of(kLoginEvents, login_event_rows())},
        {joined(poc_call_rows(), poc_message_rows()), {}, events_of(kPocEvents, poc_event_rows())},
        {reg_request_rows(), reg_query_rows(), events_of(kRegEvents, reg_event_rows())},
        {settings_request_rows(), settings_query_rows(), {}},
        {sms_request_rows(), {}, events_of(kSmsEvents, sms_event_rows())},
        {ss_request_rows(), {}, {}},
        {vt_request_rows(), {}, {}},
        {xdm_request_rows(), {}, {}},
    };
}

} // namespace test
