// SPDX-License-Identifier: Apache-2.0
#include "modules.hpp"

#include "call/call_rows.hpp"
#include "call/event_rows.hpp"
#include "login/event_rows.hpp"
#include "login/login_rows.hpp"
#include "poc/event_rows.hpp"
#include "poc/poc_rows.hpp"
#include "reg/event_rows.hpp"
#include "reg/reg_rows.hpp"
#include "settings/settings_rows.hpp"
#include "sms/event_rows.hpp"
#include "sms/sms_rows.hpp"
#include "ss/ss_rows.hpp"
#include "vt/vt_rows.hpp"
#include "xdm/xdm_rows.hpp"

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
