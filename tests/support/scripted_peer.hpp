// SPDX-License-Identifier: Apache-2.0
// Plays the IMS service on the private bus with raw messages: records every call and answers as its
// script says. It answers in GDBus's own thread, so also while the test's thread blocks in a query.
#pragma once

#include "tests/support/bus_client.hpp"
#include "tests/support/variant.hpp"

#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

namespace test {

inline constexpr const char *kServiceName = "org.kelvo.ims";
inline constexpr const char *kRegisterApplication =
    "org.kelvo.ims.Registration.RegisterApplication";

// What the peer was asked.
struct Call {
    std::size_t number; // counts all calls from 0; names the call for answer()
    std::string path;
    std::string interface;
    std::string member;
    std::string destination;
    std::string sender;
    std::string signature; // without parentheses
    bool has_signature;    // false for no parameters at all, not even an empty tuple of them
    std::shared_ptr<GVariant> body; // nothing when there were no parameters
};

struct Reply {
    std::shared_ptr<GVariant> body; // nothing for a reply without one
};
struct Failure {
    std::string name;
    std::string message;
};
struct Silence {}; // no answer, unless the test gives one later with answer()
using Answer = std::variant<Reply, Failure, Silence>;

Answer reply(std::string_view type, std::string_view text);
Answer reply_with(GVariant *body);
Answer empty_reply();
Answer failure(std::string name);
// The error name that arrives as a GError of this domain and code.
Answer failure(GQuark domain, int code);

namespace error_name {
inline constexpr const char *kAccessDenied = "org.freedesktop.DBus.Error.AccessDenied";
inline constexpr const char *kFailed = "org.freedesktop.DBus.Error.Failed";
inline constexpr const char *kNoReply = "org.freedesktop.DBus.Error.NoReply";
inline constexpr const char *kTimedOut = "org.freedesktop.DBus.Error.TimedOut";
inline constexpr const char *kUnknownMethod = "org.freedesktop.DBus.Error.UnknownMethod";
} // namespace error_name

class ScriptedPeer {
  public:
    using Responder = std::function<Answer(const Call &)>;

    // Owns the service's name when this returns. Registering an application is answered (0, 42);
    // whatever is not in the script is an unknown method.
    explicit ScriptedPeer(const std::string &address);
    ~ScriptedPeer();
    ScriptedPeer(const ScriptedPeer &) = delete;
    ScriptedPeer &operator=(const ScriptedPeer &) = delete;

    // From now on, calls to "interface.Method" are answered like this.
    void on(const std::string &method, Answer answer);
    void on(const std::string &method, Responder responder);

    // Answers a call that was met with silence.
    void answer(std::size_t number, const Answer &answer);

    std::vector<Call> calls() const;
    std::vector<Call> calls_to(const std::string &method) const;
    // Waits until the method has been called so often, and returns all its calls.
    std::vector<Call> wait_for_calls(const std::string &method, std::size_t count) const;

    BusClient &client() { return client_; }
    void emit_signal(const char *path, const char *interface, const char *member,
                     const Variant &body, const char *destination = nullptr) {
        client_.emit_signal(path, interface, member, body, destination);
    }

  private:
    struct State;

    BusClient client_;
    std::shared_ptr<State> state_;
    guint filter_ = 0;
};

} // namespace test
