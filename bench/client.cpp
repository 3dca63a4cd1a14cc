// SPDX-License-Identifier: Apache-2.0
#include "bench/client.hpp"

#include "bench/protocol.hpp"

#include <stdexcept>

namespace bench {

Client::Client() : connection_{g_bus_get_sync(G_BUS_TYPE_SYSTEM, nullptr, nullptr)} {
    if (!connection_)
        throw std::runtime_error("no bus");
    // The bus ends before this process does.
    g_dbus_connection_set_exit_on_close(connection_.get(), FALSE);
    if (ims_init(0, &handle_) != IMS_ERROR_NONE)
        throw std::runtime_error("ims_init() failed");
}

Client::~Client() {
    ims_deinit(handle_);
}

void Client::tell_peer(const char *method, GVariant *parameters) const {
    // Without a callback GDBus asks for no reply.
    g_dbus_connection_call(connection_.get(), kServiceName, kObjectPath, kPeerInterface, method,
                           parameters, nullptr, G_DBUS_CALL_FLAGS_NONE, -1, nullptr, nullptr,
                           nullptr);
}

void Client::flush() const {
    if (!g_dbus_connection_flush_sync(connection_.get(), nullptr, nullptr))
        throw std::runtime_error("the bus is gone");
}

} // namespace bench
