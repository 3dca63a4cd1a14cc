// SPDX-License-Identifier: Apache-2.0
// Compiled into each test executable, so that these definitions stand in front of GIO's.
#include "tests/support/bus_observer.hpp"

#include <cstring>
#include <mutex>

#include <dlfcn.h>

#define TEST_EXPORT __attribute__((visibility("default")))

namespace test {
namespace {

constexpr const char *kService = "org.kelvo.ims";

std::mutex mutex;
std::vector<ObservedCall> calls;
std::vector<ObservedSubscription> subscriptions;
Fault current_fault = Fault::kNone;

std::string text(const gchar *value) {
    return value ? value : "(NULL)";
}

bool is_service(const gchar *name) {
    return name && std::strcmp(name, kService) == 0;
}

template <typename Function>
Function *next(const char *name) {
    return reinterpret_cast<Function *>(dlsym(RTLD_NEXT, name));
}

void note_call(ObservedCall call) {
    const std::lock_guard lock{mutex};
    if (call.bus_name == kService)
        calls.push_back(std::move(call));
}

// Turns what a call really yielded into what the fault wants.
GVariant *spoil(GVariant *reply, GError **error) {
    const std::lock_guard lock{mutex};
    if (current_fault == Fault::kNothing) {
        if (reply)
            g_variant_unref(reply);
        g_clear_error(error);
        return nullptr;
    }
    if (current_fault == Fault::kErrorBesideReply && reply)
        g_set_error_literal(error, G_IO_ERROR, 5, "odd");
    return reply;
}

} // namespace

std::vector<ObservedCall> observed_calls() {
    const std::lock_guard lock{mutex};
    return calls;
}

std::vector<ObservedSubscription> observed_subscriptions() {
    const std::lock_guard lock{mutex};
    return subscriptions;
}

void set_fault(Fault fault) {
    const std::lock_guard lock{mutex};
    current_fault = fault;
}

void reset_observer() {
    const std::lock_guard lock{mutex};
    current_fault = Fault::kNone;
    calls.clear();
    subscriptions.clear();
}

} // namespace test

extern "C" {

TEST_EXPORT void g_dbus_connection_call(GDBusConnection *connection, const gchar *bus_name,
                                        const gchar *object_path, const gchar *interface_name,
                                        const gchar *method_name, GVariant *parameters,
                                        const GVariantType *reply_type, GDBusCallFlags flags,
                                        gint timeout_msec, GCancellable *cancellable,
                                        GAsyncReadyCallback callback, gpointer user_data) {
    test::note_call({false, test::text(bus_name), test::text(object_path),
                     test::text(interface_name), test::text(method_name), reply_type != nullptr,
                     flags, timeout_msec, cancellable != nullptr});
    test::next<decltype(g_dbus_connection_call)>("g_dbus_connection_call")(
        connection, bus_name, object_path, interface_name, method_name, parameters, reply_type,
        flags, timeout_msec, cancellable, callback, user_data);
}

TEST_EXPORT GVariant *g_dbus_connection_call_sync(GDBusConnection *connection,
                                                  const gchar *bus_name, const gchar *object_path,
                                                  const gchar *interface_name,
                                                  const gchar *method_name, GVariant *parameters,
                                                  const GVariantType *reply_type,
                                                  GDBusCallFlags flags, gint timeout_msec,
                                                  GCancellable *cancellable, GError **error) {
    test::note_call({true, test::text(bus_name), test::text(object_path),
                     test::text(interface_name), test::text(method_name), reply_type != nullptr,
                     flags, timeout_msec, cancellable != nullptr});
    GVariant *reply =
        test::next<decltype(g_dbus_connection_call_sync)>("g_dbus_connection_call_sync")(
            connection, bus_name, object_path, interface_name, method_name, parameters, reply_type,
            flags, timeout_msec, cancellable, error);
    return test::is_service(bus_name) ? test::spoil(reply, error) : reply;
}

TEST_EXPORT GVariant *g_dbus_connection_call_finish(GDBusConnection *connection,
                                                    GAsyncResult *outcome, GError **error) {
    GVariant *reply = test::next<decltype(g_dbus_connection_call_finish)>(
        "g_dbus_connection_call_finish")(connection, outcome, error);
    return test::spoil(reply, error);
}

TEST_EXPORT guint g_dbus_connection_signal_subscribe(
    GDBusConnection *connection, const gchar *sender, const gchar *interface_name,
    const gchar *member, const gchar *object_path, const gchar *arg0, GDBusSignalFlags flags,
    GDBusSignalCallback callback, gpointer user_data, GDestroyNotify user_data_free_func) {
    const guint id = test::next<decltype(g_dbus_connection_signal_subscribe)>(
        "g_dbus_connection_signal_subscribe")(connection, sender, interface_name, member,
                                              object_path, arg0, flags, callback, user_data,
                                              user_data_free_func);
    if (test::is_service(sender)) {
        const std::lock_guard lock{test::mutex};
        test::subscriptions.push_back({test::text(sender), test::text(interface_name),
                                       test::text(member), test::text(object_path), arg0 != nullptr,
                                       flags, callback, user_data, user_data_free_func != nullptr,
                                       id, false});
    }
    return id;
}

TEST_EXPORT void g_dbus_connection_signal_unsubscribe(GDBusConnection *connection,
                                                      guint subscription_id) {
    {
        const std::lock_guard lock{test::mutex};
        for (auto &subscription : test::subscriptions)
            if (subscription.id == subscription_id)
                subscription.is_ended = true;
    }
    test::next<decltype(g_dbus_connection_signal_unsubscribe)>(
        "g_dbus_connection_signal_unsubscribe")(connection, subscription_id);
}
}
