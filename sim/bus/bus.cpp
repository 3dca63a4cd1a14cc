// SPDX-License-Identifier: Apache-2.0
#include "sim/bus/bus.hpp"

#include <deque>
#include <fmt/format.h>
#include <mutex>

namespace sim {

namespace {

constexpr const char *kBusName = "org.freedesktop.DBus";
constexpr const char *kBusPath = "/org/freedesktop/DBus";
constexpr const char *kPeersThatLeave =
    "type='signal',sender='org.freedesktop.DBus',interface='org.freedesktop.DBus',"
    "member='NameOwnerChanged',path='/org/freedesktop/DBus',arg2=''";
constexpr guint kDoNotQueue = 4;
constexpr guint kPrimaryOwner = 1;

std::string text_member(GVariant *tuple, gsize index) {
    const auto member = Variant::adopt(g_variant_get_child_value(tuple, index));
    return g_variant_get_string(member.get(), nullptr);
}

bool is_departure(GDBusMessage *message) {
    return g_dbus_message_get_message_type(message) == G_DBUS_MESSAGE_TYPE_SIGNAL &&
           g_strcmp0(g_dbus_message_get_sender(message), kBusName) == 0 &&
           g_strcmp0(g_dbus_message_get_member(message), "NameOwnerChanged") == 0;
}

} // namespace

// Where the connection's own thread leaves messages for the main context. It outlives the bus
// when that thread still holds it.
struct Bus::Inbox {
    std::mutex mutex;
    std::deque<Message> messages;
    GSource *source = nullptr;
    Bus *bus = nullptr;

    static gboolean dispatch(gpointer data) {
        auto &inbox = *static_cast<Inbox *>(data);
        std::deque<Message> arrived;
        {
            const std::lock_guard lock(inbox.mutex);
            arrived.swap(inbox.messages);
            g_source_set_ready_time(inbox.source, -1);
        }
        for (const auto &message : arrived)
            if (inbox.bus)
                inbox.bus->deliver(message.get());
        return G_SOURCE_CONTINUE;
    }

    void put(GDBusMessage *message) {
        const std::lock_guard lock(mutex);
        messages.emplace_back(message);
        if (source)
            g_source_set_ready_time(source, 0);
    }
};

namespace {

GSourceFuncs inbox_source_functions{
    nullptr, nullptr, [](GSource *, GSourceFunc callback, gpointer data) {
                                        return callback(data); },
    nullptr, nullptr, nullptr};

} // namespace

Bus::~Bus() {
    if (inbox_) {
        inbox_->bus = nullptr;
        const std::lock_guard lock(inbox_->mutex);
        if (inbox_->source) {
            g_source_destroy(inbox_->source);
            g_source_unref(inbox_->source);
            inbox_->source = nullptr;
        }
    }
    if (!connection_)
        return;
    if (closed_)
        g_signal_handler_disconnect(connection_.get(), closed_);
    if (filter_)
        g_dbus_connection_remove_filter(connection_.get(), filter_);
    // Replies and signals that were given are sent.
    g_dbus_connection_flush_sync(connection_.get(), nullptr, nullptr);
    g_dbus_connection_close_sync(connection_.get(), nullptr, nullptr);
}

std::optional<std::string> Bus::connect(const std::string &address) {
    ErrorSlot error;
    address_ = address;
    if (address_.empty()) {
        const GText system(g_dbus_address_get_for_bus_sync(G_BUS_TYPE_SYSTEM, nullptr, &error.raw));
        if (!system)
            return error.message();
        address_ = system.get();
    }
    const auto flags =
        static_cast<GDBusConnectionFlags>(G_DBUS_CONNECTION_FLAGS_AUTHENTICATION_CLIENT |
                                          G_DBUS_CONNECTION_FLAGS_MESSAGE_BUS_CONNECTION);
    connection_.reset(g_dbus_connection_new_for_address_sync(address_.c_str(), flags, nullptr,
                                                             nullptr, &error.raw));
    if (!connection_)
        return error.message();
    return std::nullopt;
}

void Bus::listen(Handlers handlers) {
    handlers_ = std::move(handlers);
    inbox_ = std::make_shared<Inbox>();
    inbox_->bus = this;
    inbox_->source = g_source_new(&inbox_source_functions, sizeof(GSource));
    g_source_set_callback(inbox_->source, &Inbox::dispatch, inbox_.get(), nullptr);
    g_source_attach(inbox_->source, g_main_context_get_thread_default());

    filter_ = g_dbus_connection_add_filter(
        connection_.get(), on_message, new std::shared_ptr<Inbox>(inbox_),
        [](gpointer inbox) { delete static_cast<std::shared_ptr<Inbox> *>(inbox); });
    closed_ = g_signal_connect(connection_.get(), "closed", G_CALLBACK(on_closed), this);
    g_dbus_connection_call(connection_.get(), kBusName, kBusPath, kBusName, "AddMatch",
                           g_variant_new("(s)", kPeersThatLeave), nullptr, G_DBUS_CALL_FLAGS_NONE,
                           -1, nullptr, nullptr, nullptr);
}

std::optional<std::string> Bus::own_name(const std::string &name) {
    ErrorSlot error;
    const auto reply = Variant::adopt(g_dbus_connection_call_sync(
        connection_.get(), kBusName, kBusPath, kBusName, "RequestName",
        g_variant_new("(su)", name.c_str(), kDoNotQueue), G_VARIANT_TYPE("(u)"),
        G_DBUS_CALL_FLAGS_NONE, -1, nullptr, &error.raw));
    if (!reply)
        return fmt::format("the bus does not let this process own {}: {}", name, error.message());
    guint32 outcome = 0;
    g_variant_get(reply.get(), "(u)", &outcome);
    if (outcome != kPrimaryOwner)
        return fmt::format("{} is taken: another service runs on this bus", name);
    return std::nullopt;
}

void Bus::send(GDBusMessage *message) {
    // A connection that is lost announces that by itself.
    g_dbus_connection_send_message(connection_.get(), message, G_DBUS_SEND_MESSAGE_FLAGS_NONE,
                                   nullptr, nullptr);
}

// Runs in the connection's own thread.
GDBusMessage *Bus::on_message(GDBusConnection *, GDBusMessage *message, gboolean incoming,
                              gpointer inbox) {
    if (!incoming)
        return message;
    const bool call = g_dbus_message_get_message_type(message) == G_DBUS_MESSAGE_TYPE_METHOD_CALL;
    if (!call && !is_departure(message))
        return message;
    (*static_cast<std::shared_ptr<Inbox> *>(inbox))->put(message);
    return nullptr;
}

void Bus::on_closed(GDBusConnection *, gboolean, GError *error, gpointer bus) {
    const auto &lost = static_cast<Bus *>(bus)->handlers_.lost;
    lost(error ? error->message : "the bus closed the connection");
}

void Bus::deliver(GDBusMessage *message) {
    if (!is_departure(message))
        return handlers_.call(message);
    GVariant *body = g_dbus_message_get_body(message);
    if (body && g_variant_is_of_type(body, G_VARIANT_TYPE("(sss)")) && text_member(body, 2).empty())
        handlers_.peer_gone(text_member(body, 0));
}

} // namespace sim
