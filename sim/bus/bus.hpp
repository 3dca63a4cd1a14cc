// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/glib_ref.hpp"

#include <functional>
#include <optional>
#include <string>

namespace sim {

using Message = GObjectPtr<GDBusMessage>;

// A connection to a bus on the level of messages: whatever arrives is handed over unjudged, and
// whatever is given is sent, so that a stand-in can also say what no honest service would.
class Bus {
  public:
    struct Handlers {
        std::function<void(GDBusMessage *call)> call;
        std::function<void(const std::string &connection)> peer_gone;
        std::function<void(const std::string &why)> lost;
    };

    Bus() = default;
    Bus(const Bus &) = delete;
    Bus &operator=(const Bus &) = delete;
    ~Bus();

    // No address: the system bus. What went wrong, or nothing.
    std::optional<std::string> connect(const std::string &address);
    // Calls arrive from now on, in order, in the main context of this thread.
    void listen(Handlers handlers);
    std::optional<std::string> own_name(const std::string &name);

    void send(GDBusMessage *message);
    const std::string &address() const { return address_; }

  private:
    struct Inbox;
    static GDBusMessage *on_message(GDBusConnection *connection, GDBusMessage *message,
                                    gboolean incoming, gpointer inbox);
    static void on_closed(GDBusConnection *connection, gboolean remote_peer_vanished, GError *error,
                          gpointer bus);
    void deliver(GDBusMessage *message);

    std::string address_;
    GObjectPtr<GDBusConnection> connection_;
    std::shared_ptr<Inbox> inbox_;
    Handlers handlers_;
    guint filter_ = 0;
    gulong closed_ = 0;
};

} // namespace sim
