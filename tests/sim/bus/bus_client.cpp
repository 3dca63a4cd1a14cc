// SPDX-License-Identifier: Apache-2.0
#include "tests/sim/bus/bus_client.hpp"

#include "sim/bus/service.hpp"
#include "tests/programs/programs.hpp"

#include <algorithm>
#include <csignal>
#include <cstdlib>
#include <stdexcept>

namespace sim::test {

namespace {

constexpr guint kPatienceMilliseconds = 20000;

// Ends the test, and it alone: what it holds is let go of.
template <typename... Args>
[[noreturn]] void give_up(fmt::format_string<Args...> text, Args &&...args) {
    throw std::runtime_error(fmt::format(text, std::forward<Args>(args)...));
}

GObjectPtr<GDataInputStream> lines_of(GInputStream *stream) {
    return GObjectPtr<GDataInputStream>(g_data_input_stream_new(stream));
}

std::optional<std::string> next_line(GDataInputStream *stream) {
    const GText line(g_data_input_stream_read_line(stream, nullptr, nullptr, nullptr));
    return line ? std::optional<std::string>(line.get()) : std::nullopt;
}

} // namespace

std::string slot_path(int slot) {
    return Service::slot_path(slot);
}

Program::Program(const std::vector<std::string> &arguments, const Environment &environment) {
    const GObjectPtr<GSubprocessLauncher> launcher(
        g_subprocess_launcher_new(static_cast<GSubprocessFlags>(G_SUBPROCESS_FLAGS_STDIN_PIPE |
                                                                G_SUBPROCESS_FLAGS_STDOUT_PIPE |
                                                                G_SUBPROCESS_FLAGS_STDERR_PIPE)));
    g_subprocess_launcher_setenv(launcher.get(), "G_DEBUG", "fatal-warnings", TRUE);
    for (const auto &[name, value] : environment)
        g_subprocess_launcher_setenv(launcher.get(), name.c_str(), value.c_str(), TRUE);
    const std::string path = ::test::program("ims-sim");
    std::vector<const char *> argv{path.c_str()};
    for (const auto &argument : arguments)
        argv.push_back(argument.c_str());
    argv.push_back(nullptr);
    ErrorSlot error;
    process_.reset(g_subprocess_launcher_spawnv(launcher.get(), argv.data(), &error.raw));
    if (!process_)
        give_up("cannot start {}: {}", path, error.message());
    output_ = lines_of(g_subprocess_get_stdout_pipe(process_.get()));
    errors_ = lines_of(g_subprocess_get_stderr_pipe(process_.get()));
}

Program::~Program() {
    if (g_subprocess_get_identifier(process_.get())) {
        g_subprocess_force_exit(process_.get());
        g_subprocess_wait(process_.get(), nullptr, nullptr);
    }
}

pid_t Program::pid() const {
    const char *text = g_subprocess_get_identifier(process_.get());
    return text ? std::atoi(text) : -1;
}

void Program::signal(int number) const {
    g_subprocess_send_signal(process_.get(), number);
}

std::string Program::read_line() {
    const auto line = next_line(output_.get());
    EXPECT_TRUE(line) << "no more output";
    return line.value_or("");
}

std::string Program::read_errors(const std::string &until) {
    std::string text;
    while (const auto line = next_line(errors_.get())) {
        text += *line + "\n";
        if (!until.empty() && line->find(until) != std::string::npos)
            return text;
    }
    EXPECT_TRUE(until.empty()) << "\"" << until << "\" does not come; what came is\n" << text;
    return text;
}

void Program::close_input() {
    g_output_stream_close(g_subprocess_get_stdin_pipe(process_.get()), nullptr, nullptr);
}

int Program::wait() {
    g_subprocess_wait(process_.get(), nullptr, nullptr);
    return g_subprocess_get_if_exited(process_.get())
               ? g_subprocess_get_exit_status(process_.get())
               : 128 + g_subprocess_get_term_sig(process_.get());
}

Client::Client(const std::string &address) {
    ErrorSlot error;
    connection_.reset(g_dbus_connection_new_for_address_sync(
        address.c_str(),
        static_cast<GDBusConnectionFlags>(G_DBUS_CONNECTION_FLAGS_AUTHENTICATION_CLIENT |
                                          G_DBUS_CONNECTION_FLAGS_MESSAGE_BUS_CONNECTION),
        nullptr, nullptr, &error.raw));
    if (!connection_)
        give_up("cannot connect to {}: {}", address, error.message());
    subscriptions_[0] = g_dbus_connection_signal_subscribe(
        connection_.get(), kServiceName, nullptr, nullptr, nullptr, nullptr,
        G_DBUS_SIGNAL_FLAGS_NONE,
        [](GDBusConnection *, const gchar *, const gchar *path, const gchar *, const gchar *member,
           GVariant *body, gpointer self) {
            const GText text(g_variant_print(body, FALSE));
            const std::string_view object = path;
            static_cast<Client *>(self)->signals_.push_back(
                fmt::format("{} {} {}", object.substr(object.rfind('/') + 1), member, text.get()));
        },
        this, nullptr);
    // Heard only so that waiting for a name wakes up.
    subscriptions_[1] = g_dbus_connection_signal_subscribe(
        connection_.get(), "org.freedesktop.DBus", "org.freedesktop.DBus", "NameOwnerChanged",
        nullptr, nullptr, G_DBUS_SIGNAL_FLAGS_NONE,
        [](GDBusConnection *, const gchar *, const gchar *, const gchar *, const gchar *,
           GVariant *, gpointer) {},
        nullptr, nullptr);
    // The bus has to know of the subscriptions before anybody says what is to be heard: to ask for
    // them waits for nothing.
    has_owner(kServiceName);
}

Client::~Client() {
    for (const guint subscription : subscriptions_)
        g_dbus_connection_signal_unsubscribe(connection_.get(), subscription);
    close();
}

void Client::close() {
    if (!g_dbus_connection_is_closed(connection_.get()))
        g_dbus_connection_close_sync(connection_.get(), nullptr, nullptr);
}

std::string Client::unique_name() const {
    return g_dbus_connection_get_unique_name(connection_.get());
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
        connection_.get(), message.get(), G_DBUS_SEND_MESSAGE_FLAGS_NONE, kPatienceMilliseconds,
        nullptr, nullptr, &error.raw));
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

void Client::iterate(const std::string &awaited) {
    bool late = false;
    GSource *limit = g_timeout_source_new(kPatienceMilliseconds);
    g_source_set_callback(
        limit,
        [](gpointer data) -> gboolean {
            *static_cast<bool *>(data) = true;
            return G_SOURCE_REMOVE;
        },
        &late, nullptr);
    g_source_attach(limit, nullptr);
    const GSourceGuard guard(limit);
    g_main_context_iteration(nullptr, TRUE);
    if (late)
        give_up("waited in vain for {}", awaited);
}

std::string Client::next_signal() {
    return next_signal("any signal");
}

std::string Client::next_signal(const std::string &awaited) {
    while (signals_.empty())
        iterate(awaited);
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

void Client::wait_until_gone(const std::string &name) {
    while (has_owner(name))
        iterate(name + " to leave the bus");
}

void Client::wait_until_owned(const std::string &name) {
    while (!has_owner(name))
        iterate(name + " to come to the bus");
}

bool Client::has_owner(const std::string &name) {
    const auto reply = Variant::adopt(g_dbus_connection_call_sync(
        connection_.get(), "org.freedesktop.DBus", "/org/freedesktop/DBus", "org.freedesktop.DBus",
        "NameHasOwner", g_variant_new("(s)", name.c_str()), G_VARIANT_TYPE("(b)"),
        G_DBUS_CALL_FLAGS_NONE, -1, nullptr, nullptr));
    gboolean owned = FALSE;
    if (reply)
        g_variant_get(reply.get(), "(b)", &owned);
    return owned != FALSE;
}

Served::Served(std::vector<std::string> options) {
    if (const auto error = bus_.start())
        give_up("{}", *error);
    options.insert(options.begin(), {"serve", "--verbose", "--address", bus_.address()});
    client_ = std::make_unique<Client>(bus_.address());
    program_ = std::make_unique<Program>(options);
    client_->wait_until_owned(kServiceName);
    // So that what a test hears next is of its own doing.
    for (const int slot : {0, 1})
        client_->wait_for(slot, "RegistrationStatus");
}

Served::~Served() {
    program_->signal(SIGTERM);
    EXPECT_EQ(program_->wait(), 0) << program_->read_errors();
}

} // namespace sim::test
