// SPDX-License-Identifier: Apache-2.0
// The fixture of the wire tests: a private bus, a scripted peer and a handle.
#pragma once

#include "ims.h"
#include "tests/support/platform_capture.hpp"
#include "tests/support/private_bus.hpp"
#include "tests/support/pump.hpp"
#include "tests/support/recorders.hpp"
#include "tests/support/scripted_peer.hpp"

#include <gtest/gtest.h>

#include <list>
#include <memory>
#include <optional>

namespace test {

inline constexpr int kSlot = 3;
inline constexpr const char *kPath = "/org/kelvo/ims/sub3";
inline constexpr int kAppId = 42;

// The process's shared system-bus connection, as far as somebody holds it. Ends the process no more
// when the bus ends.
class SharedConnection {
  public:
    // Finds, or makes, the connection; holds no reference to it.
    SharedConnection();
    ~SharedConnection();
    SharedConnection(const SharedConnection &) = delete;
    SharedConnection &operator=(const SharedConnection &) = delete;

    // What this connection sent has been handled by the bus: its signal subscriptions are in force.
    void settle();
    bool is_gone();
    std::string unique_name();

    // Runs the context until a method call made now has been answered by the service.
    void round_trip(GMainContext *context);

  private:
    GDBusConnection *held();

    GWeakRef weak_;
};

// A bus and a peer.
class WithBus : public ::testing::Test {
  protected:
    void SetUp() override;
    void TearDown() override;

    // For bus rules of a test's own: set before SetUp(), in the constructor.
    std::string policy_rules_;
    // And further elements of its configuration.
    std::string bus_elements_;

    // Handles that are released at the end, unless the test did so.
    ims_h init(int slot = kSlot);
    void deinit(ims_h handle);

    // For tests that release a handle themselves.
    void forget(ims_h handle) { handles_.remove(handle); }

    ScriptedPeer &peer() { return *peer_; }
    PrivateBus &bus() { return *bus_; }
    SharedConnection &shared() { return *shared_; }

    // For requests that may outlive the body of the test.
    ResponseRecorder &lasting_recorder() { return recorders_.emplace_back(); }

    // Everything that the peer sent to the thread-default context up to now has been delivered:
    // replies and signals keep their order, so it is enough to see one more reply.
    void fence();

    // Everything that the peer sent up to now waits in its main context, where nothing has run yet.
    void queue_up();

    // What reached the peer beside registrations and fences; waits for what is under way.
    std::vector<Call> requests();

    std::optional<PrivateBus> bus_;
    std::optional<ScriptedPeer> peer_;

  private:
    std::optional<SharedConnection> shared_;
    std::list<ims_h> handles_;
    std::list<ResponseRecorder> recorders_;
};

// A handle of slot 3 as well, whose application id is 42.
class WithPeer : public WithBus {
  protected:
    void SetUp() override;

    // As if the peer sent it from the handle's object.
    void emit(const char *interface, const char *member, const Variant &body) {
        peer().emit_signal(kPath, interface, member, body);
    }

    // Asks for an event; the subscription is in force when this returns.
    void listen(int noti_id, NotificationRecorder &recorder) { listen(handle_, noti_id, recorder); }
    void listen(ims_h handle, int noti_id, NotificationRecorder &recorder);

    ims_h handle_ = nullptr;
};

// The messages alone, for comparing with what is expected.
std::vector<std::string> messages(const std::vector<LogLine> &lines);

} // namespace test
