// SPDX-License-Identifier: Apache-2.0
// What tells of logins.
#include "imsctl/output/event_fields.hpp"
#include "imsctl/registration/module.hpp"
#include "imsctl/registration/summaries.hpp"

namespace imsctl {
namespace {

constexpr FieldRow kLoginStateFields[] = {
    field<&ims_login_state_s::value_1>("value_1"),
    field<&ims_login_state_s::value_2>("value_2"),
    field<&ims_login_state_s::value_3>("value_3"),
};

constexpr EventRow kLoginEvents[] = {
    {IMS_NOTI_LOGIN_STATE, "login-state", "login", kLoginStateFields, summarise_login},
};

} // namespace

std::span<const EventRow> login_events() {
    return kLoginEvents;
}

} // namespace imsctl
