// SPDX-License-Identifier: Apache-2.0
#include "tests/support/bus_client.hpp"

#include "tests/support/glib_ref.hpp"
#include "tests/support/pump.hpp"

#include <optional>

namespace test {
namespace {

constexpr const char *kBusName = "org.freedesktop.DBus";
constexpr const char *kBusPath = "/org/freedesktop/DBus";
constexpr guint32 kPrimaryOwner = 1;

Variant ask_bus(GDBusConnection *connection, const char *method, GVariant *parameters) {
    GError *error = nullptr;
    Variant reply{g_dbus_connection_call_sync(connection, kBusName, kBusPath, kBusName, method,
                                              parameters, nullptr, G_DBUS_CALL_FLAGS_NONE, 20000,
                                              nullptr, &error)};
    if (!reply)
        throw_error(method, error);
    return reply;
}

// What the bus says, from now on, of who has a name.
struct OwnerWatch {
    OwnerWatch(GDBusConnection *watching, const std::string &name)
        : connection{watching}, subscription{g_dbus_connection_signal_subscribe(
                                    watching, kBusName, kBusName, "NameOwnerChanged", kBusPath,
                                    name.c_str(), G_DBUS_SIGNAL_FLAGS_NONE, on_change, this,
                                    nullptr)} {}
    ~OwnerWatch() { g_dbus_connection_signal_unsubscribe(connection, subscription); }
    OwnerWatch(const OwnerWatch &) = delete;
    OwnerWatch &operator=(const OwnerWatch &) = delete;

    static void on_change(GDBusConnection *, const gchar *, const gchar *, const gchar *,
                          const gchar *, GVariant *parameters, gpointer watch) {
        const gchar *owner = nullptr;
        g_variant_get(parameters, "(&s&s&s)", nullptr, nullptr, &owner);
        static_cast<OwnerWatch *>(watch)->owned = *owner != '\0';
    }

    GDBusConnection *connection;
    std::optional<bool> owned;
    guint subscription;
};

} // namespace

BusClient::BusClient(const std::string &address) {
    GError *error = nullptr;
    connection_ = g_dbus_connection_new_for_address_sync(
        address.c_str(),
        static_cast<GDBusConnectionFlags>(G_DBUS_CONNECTION_FLAGS_AUTHENTICATION_CLIENT |
                                          G_DBUS_CONNECTION_FLAGS_MESSAGE_BUS_CONNECTION),
        nullptr, nullptr, &error);
    if (!connection_)
        throw_error("connecting to the private bus", error);
}

BusClient::~BusClient() {
    close();
    g_object_unref(connection_);
}

void BusClient::close() {
    if (!g_dbus_connection_is_closed(connection_))
        g_dbus_connection_close_sync(connection_, nullptr, nullptr);
}

void BusClient::emit_signal(const char *path, const char *interface, const char *member,
                            const Variant &body, const char *destination) {
    GDBusMessage *message = g_dbus_message_new_signal(path, interface, member);
    if (destination)
        g_dbus_message_set_destination(message, destination);
    if (body)
        g_dbus_message_set_body(message, body.get());
    GError *error = nullptr;
    const bool sent = g_dbus_connection_send_message(
        connection_, message, G_DBUS_SEND_MESSAGE_FLAGS_NONE, nullptr, &error);
    g_object_unref(message);
    if (!sent)
        throw_error(member, error);
}

void BusClient::settle(GDBusConnection *connection) {
    ask_bus(connection, "GetId", nullptr);
}

void BusClient::reload_bus_configuration() {
    ask_bus(connection_, "ReloadConfig", nullptr);
}

bool BusClient::own_name(const char *name) {
    const Variant reply =
        ask_bus(connection_, "RequestName", g_variant_new("(su)", name, guint32{0}));
    guint32 outcome = 0;
    g_variant_get(reply.get(), "(u)", &outcome);
    return outcome == kPrimaryOwner;
}

void BusClient::release_name(const char *name) {
    ask_bus(connection_, "ReleaseName", g_variant_new("(s)", name));
}

bool BusClient::has_owner(const std::string &name) {
    const Variant reply = ask_bus(connection_, "NameHasOwner", g_variant_new("(s)", name.c_str()));
    gboolean owned = FALSE;
    g_variant_get(reply.get(), "(b)", &owned);
    return owned != FALSE;
}

void BusClient::wait_for_owner(const std::string &name, bool owned) {
    // Asked for behind the subscription, so that no change is missed.
    const OwnerWatch watch{connection_, name};
    if (has_owner(name) == owned)
        return;
    pump_until([&] { return watch.owned == owned; },
               name + (owned ? " to come to the bus" : " to leave the bus"),
               g_main_context_get_thread_default());
}

} // namespace test
