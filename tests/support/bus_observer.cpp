// SPDX-License-Identifier: Apache-2.0
// Compiled into each test executable, so that these definitions stand in front of GIO's.
#include "tests/support/bus_observer.hpp"

#include <cstring>
#include <mutex>

#include <dlfcn.h>

namespace test {
namespace {

constexpr const char *kService = "org.kelvo.ims";

std::mutex observed_mutex;
std::vector<ObservedCall> noted_calls;
std::vector<ObservedSubscription> noted_subscriptions;
Fault current_fault = Fault::kNone;

std::string text_or_null(const gchar *value) {
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
    const std::lock_guard lock{observed_mutex};
    if (call.bus_name == kService)
        noted_calls.push_back(std::move(call));
}

// Turns what a call really yielded into what the fault wants.
GVariant *spoil(GVariant *reply, GError **error) {
    const std::lock_guard lock{observed_mutex};
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
    const std::lock_guard lock{observed_mutex};
    return noted_calls;
}

std::vector<ObservedSubscription> observed_subscriptions() {
    const std::lock_guard lock{observed_mutex};
    return noted_subscriptions;
}

void set_fault(Fault fault) {
    const std::lock_guard lock{observed_mutex};
    current_fault = fault;
}

void reset_observer() {
    const std::lock_guard lock{observed_mutex};
    current_fault = Fault::kNone;
    noted_calls.clear();
    noted_subscriptions.clear();
}

} // namespace test

extern "C" {

[[gnu::visibility("default")]] void
g_dbus_connection_call(GDBusConnection *connection, const gchar *bus_name, const gchar *object_path,
                       const gchar *interface_name, const gchar *method_name, GVariant *parameters,
                       const GVariantType *reply_type, GDBusCallFlags flags, gint timeout_msec,
                       GCancellable *cancellable, GAsyncReadyCallback callback,
                       gpointer user_data) {
    test::note_call({false, test::text_or_null(bus_name), test::text_or_null(object_path),
                     test::text_or_null(interface_name), test::text_or_null(method_name),
                     reply_type != nullptr, flags, timeout_msec, cancellable != nullptr});
    test::next<decltype(g_dbus_connection_call)>("g_dbus_connection_call")(
        connection, bus_name, object_path, interface_name, method_name, parameters, reply_type,
        flags, timeout_msec, cancellable, callback, user_data);
}

[[gnu::visibility("default")]] GVariant *
g_dbus_connection_call_sync(GDBusConnection *connection, const gchar *bus_name,
                            const gchar *object_path, const gchar *interface_name,
                            const gchar *method_name, GVariant *parameters,
                            const GVariantType *reply_type, GDBusCallFlags flags, gint timeout_msec,
                            GCancellable *cancellable, GError **error) {
    test::note_call({true, test::text_or_null(bus_name), test::text_or_null(object_path),
                     test::text_or_null(interface_name), test::text_or_null(method_name),
                     reply_type != nullptr, flags, timeout_msec, cancellable != nullptr});
    GVariant *reply =
        test::next<decltype(g_dbus_connection_call_sync)>("g_dbus_connection_call_sync")(
            connection, bus_name, object_path, interface_name, method_name, parameters, reply_type,
            flags, timeout_msec, cancellable, error);
    return test::is_service(bus_name) ? test::spoil(reply, error) : reply;
}

[[gnu::visibility("default")]] GVariant *
g_dbus_connection_call_finish(GDBusConnection *connection, GAsyncResult *outcome, GError **error) {
    GVariant *reply = test::next<decltype(g_dbus_connection_call_finish)>(
        "g_dbus_connection_call_finish")(connection, outcome, error);
    return test::spoil(reply, error);
}

[[gnu::visibility("default")]] guint g_dbus_connection_signal_subscribe(
    GDBusConnection *connection, const gchar *sender, const gchar *interface_name,
    const gchar *member, const gchar *object_path, const gchar *arg0, GDBusSignalFlags flags,
    GDBusSignalCallback callback, gpointer user_data, GDestroyNotify user_data_free_func) {
    const guint id = test::next<decltype(g_dbus_connection_signal_subscribe)>(
        "g_dbus_connection_signal_subscribe")(connection, sender, interface_name, member,
                                              object_path, arg0, flags, callback, user_data,
                                              user_data_free_func);
    if (test::is_service(sender)) {
        const std::lock_guard lock{test::observed_mutex};
        test::noted_subscriptions.push_back(
            {test::text_or_null(sender), test::text_or_null(interface_name),
             test::text_or_null(member), test::text_or_null(object_path), arg0 != nullptr, flags,
             callback, user_data, user_data_free_func != nullptr, id, false});
    }
    return id;
}

[[gnu::visibility("default")]] void
g_dbus_connection_signal_unsubscribe(GDBusConnection *connection, guint subscription_id) {
    {
        const std::lock_guard lock{test::observed_mutex};
        for (auto &subscription : test::noted_subscriptions)
            if (subscription.id == subscription_id)
                subscription.is_ended = true;
    }
    test::next<decltype(g_dbus_connection_signal_unsubscribe)>(
        "g_dbus_connection_signal_unsubscribe")(connection, subscription_id);
}
}
