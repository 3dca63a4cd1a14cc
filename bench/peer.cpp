// SPDX-License-Identifier: Apache-2.0
// Answers in the service's place, as cheaply as GDBus lets it: straight from the connection's own
// thread. A call is given the session that the caller sent as its call type, so that the caller
// can tell every answer apart.
#include "bench/owned.hpp"
#include "bench/protocol.hpp"

#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <string_view>
#include <vector>

namespace {

using bench::Connection;
using bench::MainLoop;
using bench::Message;
using bench::Variant;

constexpr std::int32_t kCallsInList = 2;

GVariant *call_list() {
    GVariantBuilder calls;
    g_variant_builder_init(&calls, G_VARIANT_TYPE("aa{sv}"));
    for (std::int32_t session = 1; session <= kCallsInList; ++session) {
        g_variant_builder_open(&calls, G_VARIANT_TYPE_VARDICT);
        const auto add = [&calls](const char *key, GVariant *value) {
            g_variant_builder_add(&calls, "{sv}", key, value);
        };
        add("session_id", g_variant_new_int32(session));
        add("peer_uri", g_variant_new_string("sip:+15550100@ims.example"));
        add("call_type", g_variant_new_int32(1));
        add("bmocall", g_variant_new_boolean(TRUE));
        add("call_state", g_variant_new_int32(3));
        add("bconfcall", g_variant_new_boolean(FALSE));
        g_variant_builder_close(&calls);
    }
    return g_variant_new("(iuaa{sv})", 0, kCallsInList, &calls);
}

class Peer {
  public:
    explicit Peer(GDBusConnection *connection) : connection_{connection} {}

    void take(GDBusMessage *call) {
        const std::string_view method{g_dbus_message_get_member(call)};
        GVariant *body = g_dbus_message_get_body(call);
        if (method == "MakeCall")
            take_call(call);
        else if (method == "CallListInfo")
            reply(call, call_list());
        else if (method == "RegisterApplication")
            reply(call, g_variant_new("(ii)", 0, 1));
        else if (method == bench::kGetSettingsMethod)
            reply(call, g_variant_new("(i@a{sv})", 0, settings_.get()));
        else if (method == bench::kUpdateSettingsMethod)
            take_settings(call, body);
        else if (method == bench::kServeMethod)
            settings_.reset(g_variant_get_child_value(body, 0));
        else if (method == bench::kEmitMethod)
            emit(body);
        else if (method == bench::kHoldMethod)
            hold(body);
    }

  private:
    void send(const Message &message) {
        g_dbus_connection_send_message(connection_, message.get(), G_DBUS_SEND_MESSAGE_FLAGS_NONE,
                                       nullptr, nullptr);
    }

    void reply(GDBusMessage *call, GVariant *body) {
        const Message answer{g_dbus_message_new_method_reply(call)};
        g_dbus_message_set_body(answer.get(), body);
        send(answer);
    }

    void take_call(GDBusMessage *call) {
        if (is_holding_)
            held_.emplace_back(static_cast<GDBusMessage *>(g_object_ref(call)));
        else
            answer(call);
    }

    void answer(GDBusMessage *call) {
        std::int32_t session = 0;
        g_variant_get(g_dbus_message_get_body(call), "(isissss)", nullptr, nullptr, &session,
                      nullptr, nullptr, nullptr, nullptr);
        reply(call, g_variant_new("(ii)", 0, session));
    }

    void take_settings(GDBusMessage *call, GVariant *body) {
        const Variant settings{g_variant_get_child_value(body, 0)};
        const bool is_full =
            g_variant_n_children(settings.get()) == g_variant_n_children(settings_.get());
        reply(call, g_variant_new("(i)", is_full ? 0 : 1));
    }

    void emit(GVariant *body) {
        guint32 count = 0;
        std::int32_t first = 0;
        g_variant_get(body, "(ui)", &count, &first);
        for (guint32 at = 0; at < count; ++at) {
            const Message signal{g_dbus_message_new_signal(
                bench::kObjectPath, bench::kCallInterface, bench::kCallEndedSignal)};
            g_dbus_message_set_body(signal.get(),
                                    g_variant_new("(ii)", first + static_cast<gint32>(at), 0));
            send(signal);
        }
    }

    void hold(GVariant *body) {
        gboolean is_holding = FALSE;
        g_variant_get(body, "(b)", &is_holding);
        is_holding_ = is_holding != FALSE;
        if (is_holding_)
            return;
        for (const Message &call : held_)
            answer(call.get());
        held_.clear();
    }

    GDBusConnection *connection_;
    std::vector<Message> held_;
    Variant settings_;
    bool is_holding_ = false;
};

GDBusMessage *on_message(GDBusConnection *, GDBusMessage *message, gboolean is_incoming,
                         gpointer peer) {
    if (!is_incoming || g_dbus_message_get_message_type(message) != G_DBUS_MESSAGE_TYPE_METHOD_CALL)
        return message;
    const Message call{message};
    static_cast<Peer *>(peer)->take(call.get());
    return nullptr;
}

} // namespace

int main() {
    GError *failure = nullptr;
    const Connection connection{g_bus_get_sync(G_BUS_TYPE_SYSTEM, nullptr, &failure)};
    if (!connection)
        g_error("%s", failure->message);
    Peer peer{connection.get()};
    g_dbus_connection_add_filter(connection.get(), on_message, &peer, nullptr);
    const Variant owner{g_dbus_connection_call_sync(
        connection.get(), "org.freedesktop.DBus", "/org/freedesktop/DBus", "org.freedesktop.DBus",
        "RequestName", g_variant_new("(su)", bench::kServiceName, 0), G_VARIANT_TYPE("(u)"),
        G_DBUS_CALL_FLAGS_NONE, -1, nullptr, &failure)};
    if (!owner)
        g_error("%s", failure->message);
    std::puts("ready");
    std::fflush(stdout);
    const MainLoop loop{g_main_loop_new(nullptr, FALSE)};
    g_main_loop_run(loop.get());
    return EXIT_SUCCESS;
}
