// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/glib_ref.hpp"
#include "tests/support/bus_client.hpp"
#include "tests/support/private_bus.hpp"

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

using ::test::PrivateBus;

// ims-sim as a process of its own. A warning or critical of GLib aborts it.
struct Program : ::test::Process {
    explicit Program(const std::vector<std::string> &arguments, Environment environment = {});
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
    void wait_until_gone(const std::string &name) { bus_.wait_until_gone(name); }
    void wait_until_owned(const std::string &name) { bus_.wait_until_owned(name); }

    std::string unique_name() const { return bus_.unique_name(); }
    GDBusConnection *connection() const { return bus_.connection(); }
    void close() { bus_.close(); }

  private:
    std::string next_signal(const std::string &awaited);

    ::test::BusClient bus_;
    std::deque<std::string> signals_;
    guint subscription_ = 0;
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
