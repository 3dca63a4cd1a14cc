// SPDX-License-Identifier: Apache-2.0
#include "bench/protocol.hpp"
#include "bench/side.hpp"

#include <cstring>

namespace bench {
namespace {

constexpr int kTimeoutMs = 60000;
constexpr gint32 kAppId = 1;

void on_reply(GObject *source, GAsyncResult *outcome, gpointer answers) {
    const Variant reply{g_dbus_connection_call_finish(G_DBUS_CONNECTION(source), outcome, nullptr)};
    gint32 result = 1;
    gint32 session = 0;
    if (reply)
        g_variant_get(reply.get(), "(ii)", &result, &session);
    static_cast<Arrivals *>(answers)->add(result == 0, session);
}

void request(const Client &client, const ims_call_make_info_s &info, Arrivals &answers) {
    g_dbus_connection_call(
        client.connection(), kServiceName, kObjectPath, kCallInterface, "MakeCall",
        g_variant_new("(isissss)", kAppId, info.number, info.call_type, info.text_1, info.text_2,
                      info.text_3, info.text_4),
        nullptr, G_DBUS_CALL_FLAGS_NONE, kTimeoutMs, nullptr, on_reply, &answers);
}

void read_field(const char *key, GVariant *value, ims_call_info_s &call) {
    if (std::strcmp(key, "session_id") == 0)
        call.session_id = g_variant_get_int32(value);
    else if (std::strcmp(key, "peer_uri") == 0)
        call.peer_uri = g_variant_dup_string(value, nullptr);
    else if (std::strcmp(key, "call_type") == 0)
        call.call_type = g_variant_get_int32(value);
    else if (std::strcmp(key, "bmocall") == 0)
        call.bmocall = g_variant_get_boolean(value) != FALSE;
    else if (std::strcmp(key, "call_state") == 0)
        call.call_state = g_variant_get_int32(value);
    else if (std::strcmp(key, "bconfcall") == 0)
        call.bconfcall = g_variant_get_boolean(value) != FALSE;
}

bool query(const Client &client, ims_call_list_info_s &list) {
    const Variant reply{
        g_dbus_connection_call_sync(client.connection(), kServiceName, kObjectPath, kCallInterface,
                                    "CallListInfo", g_variant_new("(i)", kAppId), nullptr,
                                    G_DBUS_CALL_FLAGS_NONE, kTimeoutMs, nullptr, nullptr)};
    if (!reply)
        return false;
    gint32 result = 1;
    GVariantIter *calls = nullptr;
    g_variant_get(reply.get(), "(iuaa{sv})", &result, &list.count, &calls);
    GVariantIter *fields = nullptr;
    for (ims_call_info_s *call = list.entries; g_variant_iter_loop(calls, "a{sv}", &fields);
         ++call) {
        char *key = nullptr;
        GVariant *value = nullptr;
        while (g_variant_iter_loop(fields, "{sv}", &key, &value))
            read_field(key, value, *call);
    }
    g_variant_iter_free(calls);
    return result == 0;
}

void on_signal(GDBusConnection *, const char *, const char *, const char *, const char *,
               GVariant *parameters, gpointer events) {
    gint32 session = 0;
    gint32 reason = 0;
    g_variant_get(parameters, "(ii)", &session, &reason);
    static_cast<Arrivals *>(events)->add(true, session);
}

guint subscribe(const Client &client, Arrivals &events) {
    return g_dbus_connection_signal_subscribe(
        client.connection(), kServiceName, kCallInterface, kCallEndedSignal, kObjectPath, nullptr,
        G_DBUS_SIGNAL_FLAGS_NONE, on_signal, &events, nullptr);
}

void unsubscribe(const Client &client, guint subscription) {
    g_dbus_connection_signal_unsubscribe(client.connection(), subscription);
}

} // namespace

const Side kBareSide{"bare", request, query, subscribe, unsubscribe};

} // namespace bench
