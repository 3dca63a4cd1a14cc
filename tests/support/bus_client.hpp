// SPDX-License-Identifier: Apache-2.0
// A raw connection to the private bus: signals of any kind, from anybody.
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

    GDBusConnection *connection() const { return connection_; }

  private:
    GDBusConnection *connection_ = nullptr;
};

} // namespace test
