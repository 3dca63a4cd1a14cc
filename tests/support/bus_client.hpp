// SPDX-License-Identifier: Apache-2.0
// A connection to a message bus that is the test's alone. Who makes a BusClient owns the
// connection; it is closed at the end, or by close().
#pragma once

#include "tests/support/variant.hpp"

#include <gio/gio.h>

#include <string>

namespace test {

class BusClient {
  public:
    explicit BusClient(const std::string &address);
    ~BusClient();
    BusClient(const BusClient &) = delete;
    BusClient &operator=(const BusClient &) = delete;

    void close();

    // No body: a signal without parameters. A destination: sent to that connection alone.
    void emit_signal(const char *path, const char *interface, const char *member,
                     const Variant &body, const char *destination = nullptr);

    // The bus has handled everything that this connection sent before.
    void settle() { settle(connection_); }
    static void settle(GDBusConnection *connection);

    // The bus reads its configuration anew; its policies hold for all connections at once.
    void reload_bus_configuration();

    // Whether the bus gave the name to this connection.
    bool own_name(const char *name);
    void release_name(const char *name);

    // Whether anybody has it; the waits run the thread-default main context until somebody or
    // nobody does. A connection's unique name is had until the connection has left the bus.
    bool has_owner(const std::string &name);
    void wait_until_owned(const std::string &name) { wait_for_owner(name, true); }
    void wait_until_gone(const std::string &name) { wait_for_owner(name, false); }

    std::string unique_name() const { return g_dbus_connection_get_unique_name(connection_); }
    GDBusConnection *connection() const { return connection_; }

  private:
    void wait_for_owner(const std::string &name, bool owned);

    GDBusConnection *connection_ = nullptr;
};

} // namespace test
