// SPDX-License-Identifier: Apache-2.0
// Login: two requests, the query, the decoder of the login signal.
#include "ims_login.h"

#include "frame.hpp"
#include "notifications.hpp"

using namespace ims;

namespace {

constexpr const char *kInterface = "org.kelvo.ims.Login";

} // namespace

int ims_login(ims_h handle, const char *text_1, const char *text_2, int32_t value_1,
              ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    // The application id comes last here.
    return request(handle, kInterface, "Login",
                   pack<"(ssii)">(text_1, text_2, value_1, handle->app_id),
                   {answer<"on_response_login">, callback, user_data});
}

int ims_logout(ims_h handle, ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "Logout", pack<"(i)">(handle->app_id),
                   {answer<"on_response_logout">, callback, user_data});
}

int ims_get_login_state(ims_h handle, int32_t value_1, ims_login_state_s *state) {
    if (const int refused = admit({handle, state}))
        return refused;
    Variant reply;
    // The application id comes second here.
    if (const int failed = query(handle, kInterface, "GetLoginState",
                                 pack<"(ii)">(value_1, handle->app_id), reply))
        return failed;
    std::int32_t result = 1;
    if (!unpack<"(iiui)">(reply.get(), result, state->value_1, state->value_2, state->value_3))
        return IMS_ERROR_OPERATION_FAILED;
    if (result != 0)
        return operation_failed(here(), "Failed to get Login Status: [%d]", result);
    return IMS_ERROR_NONE;
}

namespace {

void emit_state(const Event &event) noexcept {
    ims_login_state_s state{};
    Skipped fourth;
    if (event.is_wanted() &&
        event.read<"(iuii)">(state.value_1, state.value_2, state.value_3, fourth))
        event.deliver(&state);
}

constexpr Notification kEvents[] = {
    {IMS_NOTI_LOGIN_STATE, "LoginState", emit_state},
};

} // namespace

constexpr Module ims::kLoginModule{kInterface, on_login_signal_emit_handler, kEvents};

void ims::on_login_signal_emit_handler(ims_h handle, int noti_id, GVariant *parameters,
                                       const ims_noti_cb_info_s *subscription) {
    if (!emit_row(kLoginModule, {handle, noti_id, parameters, subscription}))
        log_warning(here(), "Unknown/Unhandled notification - noti_id: [0x%x]",
                    static_cast<unsigned>(noti_id));
}
