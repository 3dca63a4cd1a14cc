// SPDX-License-Identifier: Apache-2.0
#include "tests/sim/bus/bus_client.hpp"

#include "sim/bus/service.hpp"
#include "tests/programs/programs.hpp"
#include "tests/support/pump.hpp"

#include <algorithm>
#include <csignal>
#include <cstdlib>
#include <stdexcept>

namespace sim::test {

namespace {

constexpr guint kPatienceMilliseconds = 20000;

} // namespace

std::string slot_path(int slot) {
    return Service::slot_path(slot);
}

Program::Program(const std::vector<std::string> &arguments, Environment environment)
    : Process{::test::program("ims-sim", arguments),
              (environment.emplace("G_DEBUG", "fatal-warnings"), environment),
              {.has_input = true}} {}

Client::Client(const std::string &address) : bus_{address} {
    subscription_ = g_dbus_connection_signal_subscribe(
        connection(), kServiceName, nullptr, nullptr, nullptr, nullptr, G_DBUS_SIGNAL_FLAGS_NONE,
        [](GDBusConnection *, const gchar *, const gchar *path, const gchar *, const gchar *member,
           GVariant *body, gpointer self) {
            const GText text(g_variant_print(body, FALSE));
            const std::string_view object = path;
            static_cast<Client *>(self)->signals_.push_back(
                fmt::format("{} {} {}", object.substr(object.rfind('/') + 1), member, text.get()));
        },
        this, nullptr);
    // The bus has to know of the subscription before anybody says what is to be heard.
    bus_.settle();
}

Client::~Client() {
    g_dbus_connection_signal_unsubscribe(connection(), subscription_);
}

Reply Client::call(int slot, const char *interface, const char *method,
                   const std::string &arguments) {
    ErrorSlot error;
    GVariant *body = g_variant_parse(nullptr, arguments.c_str(), nullptr, nullptr, &error.raw);
    if (!body) {
        ADD_FAILURE() << arguments << ": " << error.message();
        return {};
    }
    return call(slot_path(slot), interface, method, Variant::adopt(body));
}

Reply Client::call(const std::string &path, const char *interface, const char *method,
                   Variant body) {
    const GObjectPtr<GDBusMessage> message(
        g_dbus_message_new_method_call(kServiceName, path.c_str(), interface, method));
    g_dbus_message_set_body(message.get(), body.get());
    ErrorSlot error;
    const GObjectPtr<GDBusMessage> answer(g_dbus_connection_send_message_with_reply_sync(
        connection(), message.get(), G_DBUS_SEND_MESSAGE_FLAGS_NONE, kPatienceMilliseconds, nullptr,
        nullptr, &error.raw));
    if (!answer) {
        ADD_FAILURE() << method << ": " << error.message();
        return {};
    }
    Reply reply;
    GVariant *content = g_dbus_message_get_body(answer.get());
    reply.value = Variant(content ? content : g_variant_new_tuple(nullptr, 0));
    if (g_dbus_message_get_message_type(answer.get()) == G_DBUS_MESSAGE_TYPE_ERROR) {
        reply.error = g_dbus_message_get_error_name(answer.get());
        reply.text = g_variant_get_string(
            Variant::adopt(g_variant_get_child_value(content, 0)).get(), nullptr);
        return reply;
    }
    reply.body = reply.value.print();
    reply.type = g_variant_get_type_string(reply.value.get());
    return reply;
}

int Client::register_application(int slot) {
    const auto reply =
        call(slot, kRegistration, "RegisterApplication", fmt::format("({}, 'test')", slot));
    gint32 result = -1;
    gint32 id = -1;
    if (reply.type == "(ii)")
        g_variant_get(reply.value.get(), "(ii)", &result, &id);
    EXPECT_EQ(result, 0) << reply.error << " " << reply.text;
    return id;
}

std::string Client::next_signal() {
    return next_signal("any signal");
}

std::string Client::next_signal(const std::string &awaited) {
    ::test::pump_until([this] { return !signals_.empty(); }, awaited);
    std::string signal = signals_.front();
    signals_.pop_front();
    return signal;
}

std::string Client::wait_for(int slot, const std::string &member) {
    const auto prefix = fmt::format("sub{} {} ", slot, member);
    for (;;) {
        std::string signal = next_signal(prefix);
        if (signal.starts_with(prefix))
            return signal.substr(prefix.size());
    }
}

Served::Served(std::vector<std::string> options) {
    options.insert(options.begin(), {"serve", "--verbose", "--address", bus_.address()});
    client_ = std::make_unique<Client>(bus_.address());
    program_ = std::make_unique<Program>(options);
    client_->wait_until_owned(kServiceName);
    // So that what a test hears next is of its own doing.
    for (const int slot : {0, 1})
        client_->wait_for(slot, "RegistrationStatus");
}

Served::~Served() {
    program_->send_signal(SIGTERM);
    EXPECT_EQ(program_->wait(), 0) << program_->read_errors();
}

} // namespace sim::test
