// SPDX-License-Identifier: Apache-2.0
#include "tests/sim/network.hpp"

#include "tests/sim/bus/contract_signals.hpp"

#include "sim/call/signals.hpp"
#include "sim/ptt/interface.hpp"
#include "sim/registration/interface.hpp"
#include "sim/registration/login_interface.hpp"
#include "sim/sms/interface.hpp"

#include <utility>

namespace sim::test {

namespace {

// Events become signals.
auto recorder(std::map<int, std::vector<std::string>> &events) {
    return [&events](int slot, const auto &event) {
        const Signal signal = to_signal(event);
        expect_as_in_contract(signal);
        events[slot].push_back(std::string(signal.member) + " " + signal.body.print());
    };
}

} // namespace

NetworkTest::NetworkTest()
    : timers_(1, [this] { return now_; }),
      network_({.numbers = {"+15550100", "+15550101", "+15550102", "+15550103"},
                .ring_time = 60s,
                .epoch = kEpoch},
               timers_,
               {.registration = recorder(events_),
                .login = recorder(events_),
                .call = recorder(events_),
                .sms =
                    [this, record = recorder(events_)](int slot, const MessageEvent &event) {
                        record(slot, event);
                        messages_[slot].push_back(event);
                    },
                .ptt = recorder(events_)}) {
    registrations_.start();
    advance(300ms);
    forget_events();
}

void NetworkTest::advance(std::chrono::nanoseconds by) {
    const auto until = now_ + by;
    while (const auto due = timers_.next_due()) {
        if (*due > until)
            break;
        now_ = *due;
        timers_.run_due();
    }
    now_ = until;
}

std::vector<std::string> NetworkTest::take(int slot) {
    return std::exchange(events_[slot], {});
}

void NetworkTest::forget_events() {
    events_.clear();
    messages_.clear();
}

int NetworkTest::dial(int slot, const std::string &number, CallType type) {
    const auto id = calls_.make_call(slot, {number, type, {}});
    EXPECT_TRUE(static_cast<bool>(id)) << id.refusal().reason;
    return id ? *id : 0;
}

NetworkTest::Ends NetworkTest::ring(int from, int to, CallType type) {
    const int caller = dial(from, plan_.number_of(to), type);
    advance(700ms);
    const auto calls = calls_.list(to);
    const bool rings = !calls.empty() && (calls.back().state == CallState::kIncoming ||
                                          calls.back().state == CallState::kWaiting);
    EXPECT_TRUE(rings);
    return {caller, rings ? calls.back().session_id : 0};
}

NetworkTest::Ends NetworkTest::connect(int from, int to, CallType type) {
    const Ends ends = ring(from, to, type);
    expect_accepted(calls_.answer(to, ends.callee, type));
    forget_events();
    return ends;
}

int NetworkTest::connect_party(int slot, const std::string &number) {
    const int id = dial(slot, number);
    advance(2700ms);
    forget_events();
    return id;
}

NetworkTest::Pair NetworkTest::active_and_held(int slot) {
    const int held = connect_party(slot, "+15559001");
    expect_accepted(calls_.hold(slot, held));
    const int active = connect_party(slot, "+15559002");
    forget_events();
    return {active, held};
}

CallState NetworkTest::state(int slot, int id) {
    for (const auto &call : calls_.list(slot))
        if (call.session_id == id)
            return call.state;
    ADD_FAILURE() << "slot " << slot << " has no call " << id;
    return CallState::kDialing;
}

void NetworkTest::lose(int slot) {
    expect_accepted(registrations_.enable_flight_mode(slot));
    forget_events();
}

void NetworkTest::come_back(int slot) {
    registrations_.switch_on(slot);
    advance(300ms);
}

} // namespace sim::test
