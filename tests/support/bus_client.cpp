// SPDX-License-Identifier: Apache-2.0
#include "tests/support/bus_client.hpp"

#include <stdexcept>

namespace test {
namespace {

constexpr const char *kBusName = "org.freedesktop.DBus";
constexpr const char *kBusPath = "/org/freedesktop/DBus";
constexpr guint32 kPrimaryOwner = 1;

[[noreturn]] void fail(const char *what, GError *error) {
    std::string text = std::string{what} + ": " + (error ? error->message : "no reason given");
    g_clear_error(&error);
    throw std::runtime_error(text);
}

Variant ask_bus(GDBusConnection *connection, const char *method, GVariant *parameters) {
    GError *error = nullptr;
    Variant reply{g_dbus_connection_call_sync(connection, kBusName, kBusPath, kBusName, method,
                                              parameters, nullptr, G_DBUS_CALL_FLAGS_NONE, 20000,
                                              nullptr, &error)};
    if (!reply)
        fail(method, error);
    return reply;
}

} // namespace

BusClient::BusClient(const std::string &address) {
    GError *error = nullptr;
    connection_ = g_dbus_connection_new_for_address_sync(
        address.c_str(),
        static_cast<GDBusConnectionFlags>(G_DBUS_CONNECTION_FLAGS_AUTHENTICATION_CLIENT |
                                          G_DBUS_CONNECTION_FLAGS_MESSAGE_BUS_CONNECTION),
        nullptr, nullptr, &error);
    if (!connection_)
        fail("connecting to the private bus", error);
}

BusClient::~BusClient() {
    g_dbus_connection_close_sync(connection_, nullptr, nullptr);
    g_object_unref(connection_);
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
        fail(member, error);
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

} // namespace test
