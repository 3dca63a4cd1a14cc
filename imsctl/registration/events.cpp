// SPDX-License-Identifier: Apache-2.0
// What tells of the registration with the network.
#include "imsctl/output/event_fields.hpp"
#include "imsctl/registration/module.hpp"
#include "imsctl/registration/summaries.hpp"

namespace imsctl {
namespace {

constexpr FieldRow kRegistrationFields[] = {
    flag<&ims_registration_info_s::registered>("registered"),
    field<&ims_registration_info_s::value_1>("value_1"),
    field<&ims_registration_info_s::value_2>("value_2"),
    field<&ims_registration_info_s::value_3>("value_3"),
    field<&ims_registration_info_s::value_4>("value_4"),
    field<&ims_registration_info_s::value_5>("value_5"),
};

constexpr FieldRow kEmergencyRegistrationFields[] = {
    flag<&ims_emergency_registration_info_s::registered>("registered"),
    field<&ims_emergency_registration_info_s::value_1>("value_1"),
    field<&ims_emergency_registration_info_s::value_2>("value_2"),
};

constexpr EventRow kRegistrationEvents[] = {
    {IMS_NOTI_REG_REGISTRATION_STATUS, "reg-registration-status", "reg", kRegistrationFields,
     summarise_registration},
    {IMS_NOTI_REG_EMERGENCY_REGISTRATION_STATUS, "reg-emergency-registration-status", "reg",
     kEmergencyRegistrationFields, summarise_emergency_registration},
};

} // namespace

std::span<const EventRow> registration_events() {
    return kRegistrationEvents;
}

} // namespace imsctl
