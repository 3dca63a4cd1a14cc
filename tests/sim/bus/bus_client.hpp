// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/glib_ref.hpp"
#include "sim/base/private_bus.hpp"

#include <array>
#include <deque>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <memory>
#include <string>
#include <vector>

// The real program on a real bus, as an application sees it.
namespace sim::test {

constexpr const char *kCall = "org.kelvo.ims.Call";
constexpr const char *kLogin = "org.kelvo.ims.Login";
constexpr const char *kPoc = "org.kelvo.ims.Poc";
constexpr const char *kRegistration = "org.kelvo.ims.Registration";
constexpr const char *kSms = "org.kelvo.ims.Sms";
constexpr const char *kSs = "org.kelvo.ims.Ss";
constexpr const char *kVt = "org.kelvo.ims.Vt";
constexpr const char *kXdm = "org.kelvo.ims.Xdm";
constexpr const char *kServiceName = "org.kelvo.ims";

std::string slot_path(int slot);

// ims-sim as a process of its own. What it says on standard error is kept; a warning or critical
// of GLib aborts it.
class Program {
  public:
    using Environment = std::vector<std::pair<std::string, std::string>>;
    explicit Program(const std::vector<std::string> &arguments,
                     const Environment &environment = {});
    ~Program();

    pid_t pid() const;
    void signal(int number) const;
    // The next line of its output, without the line end.
    std::string read_line();
    // Lines of standard error up to one with this text, that one included. Without it, all.
    std::string read_errors(const std::string &until = {});
    void close_input();
    // 128 + N when a signal ended it.
    int wait();

  private:
    GObjectPtr<GSubprocess> process_;
    GObjectPtr<GDataInputStream> output_;
    GObjectPtr<GDataInputStream> errors_;
};

struct Reply {
    std::string body; // as text, when there is no error
    std::string type;
    std::string error;
    std::string text;
    Variant value;
};

// One application: a connection of its own that hears every signal of the service.
class Client {
  public:
    // Hears everything that is said once this returns.
    explicit Client(const std::string &address);
    ~Client();

    // Arguments are the text form of a tuple.
    Reply call(int slot, const char *interface, const char *method,
               const std::string &arguments = "()");
    Reply call(const std::string &path, const char *interface, const char *method, Variant body);
    int register_application(int slot);

    // The next signal of the service that has not been taken yet: "sub0 CallHeld (1, true, 0)".
    std::string next_signal();
    // Takes signals up to the one with this member on this slot.
    std::string wait_for(int slot, const std::string &member);
    // Until this connection has left the bus.
    void wait_until_gone(const std::string &name);
    void wait_until_owned(const std::string &name);

    std::string unique_name() const;
    GDBusConnection *connection() const { return connection_.get(); }
    void close();

  private:
    bool has_owner(const std::string &name);
    std::string next_signal(const std::string &awaited);
    void iterate(const std::string &awaited);

    GObjectPtr<GDBusConnection> connection_;
    std::deque<std::string> signals_;
    std::array<guint, 2> subscriptions_{};
};

// `ims-sim serve` with two slots, both registered, on a bus of its own, with one client that knows
// no application yet.
class Served : public testing::Test {
  protected:
    explicit Served(std::vector<std::string> options = {"--speed", "0"});
    ~Served() override;

    std::unique_ptr<Client> another() { return std::make_unique<Client>(bus_.address()); }

    PrivateBus bus_;
    std::unique_ptr<Program> program_;
    std::unique_ptr<Client> client_;
};

} // namespace sim::test
