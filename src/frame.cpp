// SPDX-License-Identifier: Apache-2.0
#include "frame.hpp"

#include <algorithm>

namespace ims {
namespace {

// D-Bus access denied. Only the code is compared: a refusal may reach us under any error domain.
constexpr int kAccessDenied = G_DBUS_ERROR_ACCESS_DENIED;

bool is_refusal(const Error &error) noexcept {
    return error && error->code == kAccessDenied;
}

bool is_cancelled(const Error &error) noexcept {
    return error && g_error_matches(error.get(), G_IO_ERROR, G_IO_ERROR_CANCELLED) != FALSE;
}

// A method without parameters has no body at all, where an empty tuple would still be one.
GVariant *body(const Variant &tuple) noexcept {
    return g_variant_n_children(tuple.get()) == 0 ? nullptr : tuple.get();
}

int gate(Site site) noexcept {
    bool enabled = false;
    if (system_info_get_custom_bool(IMS_PLATFORM_FEATURE_KEY, &enabled) != 0)
        return operation_failed(site, "Error - Feature getting from System Info");
    if (!enabled) {
        log_error(site, "IMS feature is disabled");
        return IMS_ERROR_NOT_SUPPORTED;
    }
    return IMS_ERROR_NONE;
}

} // namespace

int admit(std::initializer_list<const void *> required, Site site) noexcept {
    if (const int refused = gate(site))
        return refused;
    if (std::find(required.begin(), required.end(), nullptr) != required.end())
        return invalid_parameter(site);
    return IMS_ERROR_NONE;
}

int invalid_parameter(Site site) noexcept {
    log_error(site, "Invalid parameter");
    return IMS_ERROR_INVALID_PARAMETER;
}

int request(ims_h handle, const char *interface, const char *method, const Variant &tuple,
            Response response, Site site) noexcept {
    if (!tuple)
        return invalid_parameter(site);
    auto context = std::make_unique<ims_request_ctx_s>(
        ims_request_ctx_s{handle, response.callback, response.user_data});
    g_dbus_connection_call(handle->connection.get(), kServiceName, handle->object_path.get(),
                           interface, method, body(tuple), nullptr, G_DBUS_CALL_FLAGS_NONE,
                           kRequestTimeoutMs, nullptr, response.handler, context.release());
    return IMS_ERROR_NONE;
}

int query(ims_h handle, const char *interface, const char *method, const Variant &tuple,
          Variant &reply, int timeout_ms, Site site) noexcept {
    if (!tuple)
        return invalid_parameter(site);
    GError *failure = nullptr;
    Variant answer{g_dbus_connection_call_sync(
        handle->connection.get(), kServiceName, handle->object_path.get(), interface, method,
        body(tuple), nullptr, G_DBUS_CALL_FLAGS_NONE, timeout_ms, nullptr, &failure)};
    const Error error{failure};
    if (answer && error)
        return operation_failed(site, "dbus error = %d (%s)", error->code, error->message);
    if (is_refusal(error)) {
        log_error(site, "Permission denied");
        return IMS_ERROR_PERMISSION_DENIED;
    }
    if (!answer)
        return IMS_ERROR_OPERATION_FAILED;
    reply = std::move(answer);
    return IMS_ERROR_NONE;
}

std::uint32_t checked_count(const char *subject, std::uint32_t count, GVariant *list,
                            std::uint32_t capacity, Site site) noexcept {
    const bool is_true = count != 0 && count == g_variant_n_children(list);
    if (!is_true || count > capacity)
        log_warning(site, "%s list count is NOT valid - Count: [%d]", subject, count);
    return is_true ? std::min(count, capacity) : 0;
}

Variant frame::finish(GObject *source, GAsyncResult *outcome, const Completion &done) noexcept {
    GError *failure = nullptr;
    Variant reply{g_dbus_connection_call_finish(G_DBUS_CONNECTION(source), outcome, &failure)};
    const Error error{failure};
    if (reply || is_cancelled(error))
        return reply;
    if (is_refusal(error)) {
        log_error(done.site(), "Permission denied");
        done(IMS_RESPONSE_ACCESS_DENIED);
    } else {
        done(IMS_RESPONSE_FAILED);
    }
    return nullptr;
}

} // namespace ims
