// SPDX-License-Identifier: Apache-2.0
#include "tests/support/with_peer.hpp"

#include "tests/support/glib_ref.hpp"

#include <algorithm>

namespace test {
namespace {

constexpr const char *kFence = "test.Fence";

using Reference = ObjectRef<GDBusConnection>;

} // namespace

SharedConnection::SharedConnection() {
    GError *error = nullptr;
    GDBusConnection *connection = g_bus_get_sync(G_BUS_TYPE_SYSTEM, nullptr, &error);
    if (!connection)
        throw_error("the private bus", error);
    g_dbus_connection_set_exit_on_close(connection, FALSE);
    g_weak_ref_init(&weak_, connection);
    g_object_unref(connection);
}

SharedConnection::~SharedConnection() {
    g_weak_ref_clear(&weak_);
}

GDBusConnection *SharedConnection::held() {
    auto *connection = static_cast<GDBusConnection *>(g_weak_ref_get(&weak_));
    if (!connection)
        throw std::logic_error("nobody holds the shared connection");
    return connection;
}

void SharedConnection::settle() {
    const Reference connection{held()};
    BusClient::settle(connection.get());
}

bool SharedConnection::is_gone() {
    const Reference connection{static_cast<GDBusConnection *>(g_weak_ref_get(&weak_))};
    return connection == nullptr;
}

std::string SharedConnection::unique_name() {
    const Reference connection{held()};
    return g_dbus_connection_get_unique_name(connection.get());
}

void SharedConnection::round_trip(GMainContext *context) {
    const Reference connection{held()};
    bool answered = false;
    g_dbus_connection_call(
        connection.get(), kServiceName, "/fence", kFence, "Fence", nullptr, nullptr,
        G_DBUS_CALL_FLAGS_NONE, -1, nullptr,
        [](GObject *source, GAsyncResult *outcome, gpointer data) {
            GError *error = nullptr;
            const Variant reply{
                g_dbus_connection_call_finish(G_DBUS_CONNECTION(source), outcome, &error)};
            g_clear_error(&error); // any answer will do
            *static_cast<bool *>(data) = true;
        },
        &answered);
    pump_until([&] { return answered; }, "the answer to a fence", context);
}

void WithBus::SetUp() {
    bus_.emplace(policy_rules_, bus_elements_);
    peer_.emplace(bus_->address());
}

void WithBus::TearDown() {
    set_gate(Gate::kOn);
    for (ims_h handle : handles_)
        EXPECT_EQ(ims_deinit(handle), IMS_ERROR_NONE);
    handles_.clear();
    peer_.reset(); // pending requests end here
    if (shared_)
        pump_until([this] { return shared_->is_gone(); },
                   "the library to let go of the shared connection");
    shared_.reset();
    bus_.reset();
}

ims_h WithBus::init(int slot) {
    ims_h handle = nullptr;
    if (const int result = ims_init(slot, &handle); result != IMS_ERROR_NONE)
        throw std::runtime_error("ims_init returns " + std::to_string(result));
    handles_.push_back(handle);
    if (!shared_ || shared_->is_gone())
        shared_.emplace();
    return handle;
}

void WithBus::deinit(ims_h handle) {
    handles_.remove(handle);
    EXPECT_EQ(ims_deinit(handle), IMS_ERROR_NONE);
}

void WithPeer::SetUp() {
    WithBus::SetUp();
    handle_ = init();
}

void WithPeer::listen(ims_h handle, int noti_id, NotificationRecorder &recorder) {
    if (const int result =
            ims_set_notification_cb(handle, noti_id, NotificationRecorder::callback, &recorder);
        result != IMS_ERROR_NONE)
        throw std::runtime_error("ims_set_notification_cb returns " + std::to_string(result));
    shared().settle();
}

void WithBus::fence() {
    peer().client().settle();
    shared().round_trip(g_main_context_get_thread_default());
}

void WithBus::queue_up() {
    peer().client().settle();
    shared().settle();
}

std::vector<Call> WithBus::requests() {
    shared().settle();
    peer().client().settle();
    std::vector<Call> calls = peer().calls();
    // The registrations of ims_init() have parameters; those that an application asks for have
    // none.
    const auto is_other = [](const Call &call) {
        return call.interface == kFence ||
               (call.interface + "." + call.member == kRegisterApplication &&
                call.signature == "is");
    };
    calls.erase(std::remove_if(calls.begin(), calls.end(), is_other), calls.end());
    return calls;
}

std::vector<std::string> messages(const std::vector<LogLine> &lines) {
    std::vector<std::string> texts;
    std::transform(lines.begin(), lines.end(), std::back_inserter(texts),
                   [](const LogLine &line) { return line.message; });
    return texts;
}

} // namespace test
