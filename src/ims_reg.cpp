// SPDX-License-Identifier: Apache-2.0
// Registration: the query, two requests, the decoder of the registration signals.
#include "ims_reg.h"

#include "frame.hpp"
#include "notifications.hpp"

using namespace ims;

namespace {

constexpr const char *kInterface = "org.kelvo.ims.Registration";

} // namespace

int ims_get_registration_info(ims_h handle, ims_registration_info_s *info) {
    if (const int refused = admit({handle, info}))
        return refused;
    Variant reply;
    if (const int failed = query(handle, kInterface, "GetRegistrationInfo", pack<"()">(), reply))
        return failed;
    // The only reply whose result comes last.
    std::int32_t result = 1;
    if (!unpack<"(buuiiii)">(reply.get(), info->registered, info->value_1, info->value_2,
                             info->value_3, info->value_4, info->value_5, result))
        return IMS_ERROR_OPERATION_FAILED;
    if (result != 0)
        return operation_failed(here(), "Failed to get registration info: %d", result);
    return IMS_ERROR_NONE;
}

int ims_enable_flight_mode(ims_h handle, ims_response_cb callback, void *user_data) {
    if (const int refused = admit())
        return refused;
    return request(handle, kInterface, "EnableFlightMode", pack<"()">(),
                   {answer<"on_response_enable_flight_mode">, callback, user_data});
}

// Unlike the registration of ims_init(), this one names neither slot nor program, and its
// application id is the callback's: the handle keeps its own.
int ims_register_application(ims_h handle, ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "RegisterApplication", pack<"()">(),
                   {answer<"on_response_register_application", "(ii)", kSecondByPointer>, callback,
                    user_data});
}

namespace {

constexpr Notification kEvents[] = {
    {IMS_NOTI_REG_REGISTRATION_STATUS, "RegistrationStatus",
     emit<"(buuiii)", ims_registration_info_s>},
    {IMS_NOTI_REG_EMERGENCY_REGISTRATION_STATUS, "EmergencyRegistrationStatus",
     emit<"(bui)", ims_emergency_registration_info_s>},
};

} // namespace

constexpr Module ims::kRegModule{kInterface, on_reg_signal_emit_handler, kEvents};

void ims::on_reg_signal_emit_handler(ims_h handle, int noti_id, GVariant *parameters,
                                     const ims_noti_cb_info_s *subscription) {
    if (is_handle(handle) && !emit_row(kRegModule, {handle, noti_id, parameters, subscription}))
        log_warning(here(), "Unknown/Unhandled notification - noti_id: [%d]", noti_id);
}
