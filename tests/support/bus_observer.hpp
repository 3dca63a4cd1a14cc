// SPDX-License-Identifier: Apache-2.0
// The arguments with which GDBus is called. The test executables define the functions below, note
// what they are given and pass it on to the real ones.
#pragma once

#include <gio/gio.h>

#include <string>
#include <vector>

namespace test {

// g_dbus_connection_call() and g_dbus_connection_call_sync()
struct ObservedCall {
    bool synchronous;
    std::string bus_name;
    std::string path;
    std::string interface;
    std::string method;
    bool has_reply_type;
    GDBusCallFlags flags;
    int timeout_ms;
    bool has_cancellable;
};

// g_dbus_connection_signal_subscribe() and g_dbus_connection_signal_unsubscribe()
struct ObservedSubscription {
    std::string sender;
    std::string interface;
    std::string member;
    std::string path;
    bool has_argument_filter;
    GDBusSignalFlags flags;
    GDBusSignalCallback callback;
    void *user_data;
    bool has_free_function;
    guint id;
    bool is_ended;
};

// What addressed the IMS service, in order, since the test began.
std::vector<ObservedCall> observed_calls();
std::vector<ObservedSubscription> observed_subscriptions();

// What no bus does, and no caller may fall over. Calls to the service only.
enum class Fault {
    kNone,
    kNothing,          // neither a reply nor an error
    kErrorBesideReply, // a reply, and an error of code 5 with the text "odd"
};

void set_fault(Fault fault);

// Before each test: nothing noted, no fault.
void reset_observer();

} // namespace test
