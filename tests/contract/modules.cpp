// SPDX-License-Identifier: Apache-2.0
#include "tests/contract/modules.hpp"

#include "tests/library/call/call_rows.hpp"
#include "tests/library/call/event_rows.hpp"
#include "tests/library/login/event_rows.hpp"
#include "tests/library/login/login_rows.hpp"
#include "tests/library/poc/event_rows.hpp"
#include "tests/library/poc/poc_rows.hpp"
#include "tests/library/reg/event_rows.hpp"
#include "tests/library/reg/reg_rows.hpp"
#include "tests/library/settings/settings_rows.hpp"
#include "tests/library/sms/event_rows.hpp"
#include "tests/library/sms/sms_rows.hpp"
#include "tests/library/ss/ss_rows.hpp"
#include "tests/library/vt/vt_rows.hpp"
#include "tests/library/xdm/xdm_rows.hpp"

namespace test {
std::vector<ModuleRows> all_modules() {
    return {
        {call_request_rows(), call_query_rows(), events_of(kCallEvents, call_event_rows())},
        {login_request_rows(), login_query_rows(), events_of(kLoginEvents, login_event_rows())},
        {poc_request_rows(), {}, events_of(kPocEvents, poc_event_rows())},
        {reg_request_rows(), reg_query_rows(), events_of(kRegEvents, reg_event_rows())},
        {settings_request_rows(), settings_query_rows(), {}},
        {sms_request_rows(), {}, events_of(kSmsEvents, sms_event_rows())},
        {ss_request_rows(), {}, {}},
        {vt_request_rows(), {}, {}},
        {xdm_request_rows(), {}, {}},
    };
}

} // namespace test
