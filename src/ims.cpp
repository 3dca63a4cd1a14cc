// SPDX-License-Identifier: Apache-2.0
// Handle and connection, notification registry, routing.
#include "ims.h"

#include "frame.hpp"
#include "notifications.hpp"

#include <cerrno>
#include <cstring>
#include <new>

namespace ims {
namespace {

constexpr const char *kObjectPathPrefix = "/org/kelvo/ims";
constexpr int kRegisterTimeoutMs = kRequestTimeoutMs / 10;

// Releases a client's parts in the order in which they depend on each other: the table's
// subscriptions live on the connection.
struct ClientReleaser {
    void operator()(ims_client_s *client) const noexcept {
        client->object_path.reset();
        client->noti_table.reset();
        client->connection.reset();
        *client = {};
        delete client;
    }
};
using Client = std::unique_ptr<ims_client_s, ClientReleaser>;

constexpr const Module *kModules[] = {&kRegModule, &kCallModule, &kSmsModule, &kPocModule,
                                      &kLoginModule};

// A signal as the table of subscriptions has it.
Text signal_text(const char *interface, const char *member) noexcept {
    return Text{g_strdup_printf("%s:%s", interface, member)};
}

// The signal that brings an event.
struct Signal {
    const Module *module;
    const Notification *row;

    // As the table of subscriptions has it.
    Text text() const noexcept { return signal_text(module->interface, row->member); }
};

// NULL for an id that nobody can ask for.
Signal find_signal(int noti_id) noexcept {
    for (const Module *module : kModules) {
        const Notification *row = module->find(noti_id);
        if (row != nullptr && row->member != nullptr)
            return {module, row};
    }
    return {};
}

// GDBus delivers what is waiting only while the subscription lasts, so its record is there.
void on_signal_callback(GDBusConnection *, const char *, const char *, const char *interface,
                        const char *member, GVariant *parameters, gpointer user_data) noexcept {
    const auto *subscription = static_cast<const ims_noti_cb_info_s *>(user_data);
    if (subscription == nullptr) {
        log_error(here(), "Invalid parameter");
        return;
    }
    // Another signal than the one that was subscribed to goes where the table says.
    if (!g_str_equal(member, subscription->row->member) ||
        !g_str_equal(interface, subscription->module->interface)) {
        const Text noti_str = signal_text(interface, member);
        subscription = static_cast<const ims_noti_cb_info_s *>(
            g_hash_table_lookup(subscription->handle->noti_table.get(), noti_str.get()));
        if (subscription == nullptr) {
            log_error(here(), "can't find noti_str(%s) callback info", noti_str.get());
            return;
        }
    }
    subscription->module->decode(subscription->handle, subscription->row->id, parameters,
                                 subscription);
}

// For g_hash_table_foreach_remove(): TRUE removes the entry.
gboolean unsubscribe_entry(gpointer, gpointer value, gpointer connection) noexcept {
    g_dbus_connection_signal_unsubscribe(
        static_cast<GDBusConnection *>(connection),
        static_cast<const ims_noti_cb_info_s *>(value)->subscription_id);
    return TRUE;
}

} // namespace
} // namespace ims

using namespace ims;

int ims_init(int slot, ims_h *handle) {
    if (const int refused = admit({handle}))
        return refused;
    Client client{new (std::nothrow) ims_client_s{}};
    if (!client)
        return operation_failed(here(), "Memory allocation failed!");
    GError *failure = nullptr;
    client->connection.reset(g_bus_get_sync(G_BUS_TYPE_SYSTEM, nullptr, &failure));
    const Error error{failure};
    if (!client->connection)
        return operation_failed(here(), "Error creating dbus connection: %s\n",
                                error ? error->message : "");
    client->object_path.reset(g_strdup_printf("%s/sub%d", kObjectPathPrefix, slot));
    client->noti_table.reset(g_hash_table_new_full(g_str_hash, g_str_equal, g_free, g_free));

    // A program's name is bytes; a D-Bus text is UTF-8.
    const Text program{g_utf8_make_valid(program_invocation_name, -1)};
    Variant reply;
    if (const int failed = query(client.get(), kRegModule.interface, "RegisterApplication",
                                 pack<"(is)">(slot, program.get()), reply, kRegisterTimeoutMs))
        return failed;
    std::int32_t result = 1;
    if (!unpack<"(ii)">(reply.get(), result, client->app_id))
        return IMS_ERROR_OPERATION_FAILED;
    if (result != 0)
        return operation_failed(here(), "Failed to get registration info: %d", result);
    *handle = client.release();
    return IMS_ERROR_NONE;
}

int ims_deinit(ims_h handle) {
    if (const int refused = admit({handle}))
        return refused;
    const Client client{handle};
    g_hash_table_foreach_remove(client->noti_table.get(), unsubscribe_entry,
                                client->connection.get());
    return IMS_ERROR_NONE;
}

int ims_set_notification_cb(ims_h handle, int noti_id, ims_notification_cb callback,
                            void *user_data) {
    if (const int refused = admit({reinterpret_cast<const void *>(callback), handle}))
        return refused;
    const Signal signal = find_signal(noti_id);
    if (signal.row == nullptr)
        return invalid_parameter();
    Text noti_str = signal.text();
    if (g_hash_table_contains(handle->noti_table.get(), noti_str.get())) {
        log_error(here(), "noti_str[%s] is already registered", noti_str.get());
        return IMS_ERROR_INVALID_PARAMETER;
    }
    auto *subscription = g_new(ims_noti_cb_info_s, 1);
    *subscription = {0, callback, user_data, handle, signal.module, signal.row};
    subscription->subscription_id = g_dbus_connection_signal_subscribe(
        handle->connection.get(), kServiceName, signal.module->interface, signal.row->member,
        handle->object_path.get(), nullptr, G_DBUS_SIGNAL_FLAGS_NONE, on_signal_callback,
        subscription, nullptr);
    g_hash_table_insert(handle->noti_table.get(), noti_str.release(), subscription);
    return IMS_ERROR_NONE;
}

int ims_unset_notification_cb(ims_h handle, int noti_id) {
    if (const int refused = admit({handle}))
        return refused;
    if (!handle->connection)
        return invalid_parameter();
    const Signal signal = find_signal(noti_id);
    if (signal.row == nullptr)
        return invalid_parameter();
    const Text noti_str = signal.text();
    const auto *subscription = static_cast<const ims_noti_cb_info_s *>(
        g_hash_table_lookup(handle->noti_table.get(), noti_str.get()));
    if (subscription == nullptr) {
        log_error(here(), "noti hasn't registered");
        return IMS_ERROR_INVALID_PARAMETER;
    }
    g_dbus_connection_signal_unsubscribe(handle->connection.get(), subscription->subscription_id);
    if (!g_hash_table_remove(handle->noti_table.get(), noti_str.get()))
        return operation_failed(here(), "Fail to deregister noti_str [%s]", noti_str.get());
    return IMS_ERROR_NONE;
}
