// SPDX-License-Identifier: Apache-2.0
#include "tests/support/scripted_peer.hpp"

#include "tests/support/glib_ref.hpp"
#include "tests/support/pump.hpp"

#include <condition_variable>
#include <map>
#include <mutex>
#include <stdexcept>

namespace test {
namespace {

std::string text_or_empty(const gchar *value) {
    return value ? value : "";
}

std::shared_ptr<GVariant> shared(GVariant *value) {
    return value ? std::shared_ptr<GVariant>{g_variant_ref_sink(value), g_variant_unref} : nullptr;
}

using Message = ObjectRef<GDBusMessage>;

Call read_call(GDBusMessage *message) {
    return {0,
            text_or_empty(g_dbus_message_get_path(message)),
            text_or_empty(g_dbus_message_get_interface(message)),
            text_or_empty(g_dbus_message_get_member(message)),
            text_or_empty(g_dbus_message_get_destination(message)),
            text_or_empty(g_dbus_message_get_sender(message)),
            text_or_empty(g_dbus_message_get_signature(message)),
            g_dbus_message_get_header(message, G_DBUS_MESSAGE_HEADER_FIELD_SIGNATURE) != nullptr,
            shared(g_dbus_message_get_body(message))};
}

void send(GDBusConnection *connection, GDBusMessage *question, const Answer &answer) {
    Message message;
    if (const auto *reply = std::get_if<Reply>(&answer)) {
        message.reset(g_dbus_message_new_method_reply(question));
        if (reply->body)
            g_dbus_message_set_body(message.get(), reply->body.get());
    } else if (const auto *failure = std::get_if<Failure>(&answer)) {
        message.reset(g_dbus_message_new_method_error_literal(question, failure->name.c_str(),
                                                              failure->message.c_str()));
    } else {
        return;
    }
    g_dbus_connection_send_message(connection, message.get(), G_DBUS_SEND_MESSAGE_FLAGS_NONE,
                                   nullptr, nullptr);
}

} // namespace

// The filter may still run while the peer ends, so it shares what it works on.
struct ScriptedPeer::State {
    void take(GDBusConnection *connection, GDBusMessage *message);
    std::vector<Call> calls_to(const std::string &method) const; // with the lock held

    std::mutex mutex;
    std::condition_variable called;
    std::map<std::string, Responder> script;
    std::vector<Call> calls;
    std::vector<Message> questions; // the same order as calls
};

void ScriptedPeer::State::take(GDBusConnection *connection, GDBusMessage *message) {
    Responder responder;
    Call call = read_call(message);
    {
        const std::lock_guard lock{mutex};
        call.number = calls.size();
        const auto found = script.find(call.interface + "." + call.member);
        if (found != script.end())
            responder = found->second;
        calls.push_back(call);
        questions.emplace_back(static_cast<GDBusMessage *>(g_object_ref(message)));
        called.notify_all();
    }
    send(connection, message, responder ? responder(call) : failure(error_name::kUnknownMethod));
}

std::vector<Call> ScriptedPeer::State::calls_to(const std::string &method) const {
    std::vector<Call> wanted;
    for (const Call &call : calls)
        if (call.interface + "." + call.member == method)
            wanted.push_back(call);
    return wanted;
}

Answer reply(std::string_view type, std::string_view text) {
    return Reply{shared(parse(type, text).get())};
}

Answer reply_with(GVariant *body) {
    return Reply{shared(body)};
}

Answer empty_reply() {
    return Reply{nullptr};
}

Answer failure(std::string name) {
    return Failure{std::move(name), "as the script says"};
}

Answer failure(GQuark domain, int code) {
    GError *error = g_error_new_literal(domain, code, "as the script says");
    gchar *name = g_dbus_error_encode_gerror(error);
    Answer answer = failure(std::string{name});
    g_free(name);
    g_error_free(error);
    return answer;
}

ScriptedPeer::ScriptedPeer(const std::string &address)
    : client_{address}, state_{std::make_shared<State>()} {
    on(kRegisterApplication, reply("(ii)", "(0, 42)"));
    using SharedState = std::shared_ptr<State>;
    filter_ = g_dbus_connection_add_filter(
        client_.connection(),
        [](GDBusConnection *connection, GDBusMessage *message, gboolean incoming,
           gpointer data) -> GDBusMessage * {
            if (!incoming ||
                g_dbus_message_get_message_type(message) != G_DBUS_MESSAGE_TYPE_METHOD_CALL)
                return message;
            const Message taken{message};
            (*static_cast<SharedState *>(data))->take(connection, message);
            return nullptr;
        },
        new SharedState{state_}, [](gpointer data) { delete static_cast<SharedState *>(data); });
    if (!client_.own_name(kServiceName))
        throw std::runtime_error("the service's name is taken");
}

ScriptedPeer::~ScriptedPeer() {
    g_dbus_connection_remove_filter(client_.connection(), filter_);
}

void ScriptedPeer::on(const std::string &method, Answer answer) {
    on(method, [answer = std::move(answer)](const Call &) { return answer; });
}

void ScriptedPeer::on(const std::string &method, Responder responder) {
    const std::lock_guard lock{state_->mutex};
    state_->script.insert_or_assign(method, std::move(responder));
}

void ScriptedPeer::answer(std::size_t number, const Answer &answer) {
    const std::lock_guard lock{state_->mutex};
    send(client_.connection(), state_->questions.at(number).get(), answer);
}

std::vector<Call> ScriptedPeer::calls() const {
    const std::lock_guard lock{state_->mutex};
    return state_->calls;
}

std::vector<Call> ScriptedPeer::calls_to(const std::string &method) const {
    const std::lock_guard lock{state_->mutex};
    return state_->calls_to(method);
}

std::vector<Call> ScriptedPeer::wait_for_calls(const std::string &method, std::size_t count) const {
    std::unique_lock lock{state_->mutex};
    std::vector<Call> so_far;
    const bool came = state_->called.wait_for(lock, kDeadline, [&] {
        so_far = state_->calls_to(method);
        return so_far.size() >= count;
    });
    if (!came)
        throw DeadlineExceeded("waited in vain for call " + std::to_string(count) + " to " +
                               method);
    return so_far;
}

} // namespace test
