// SPDX-License-Identifier: Apache-2.0
// Requests of every kind, with values good and bad, in whatever state the ones before have led to:
// none brings the network down, and what it says of itself stays true.
#include "tests/sim/sms/network.hpp"

#include <algorithm>
#include <cstdio>
#include <iterator>
#include <limits>
#include <random>
#include <set>

namespace sim::test {
namespace {

constexpr int kSlots = 4;
constexpr int kRequests = 4000;

class Anything : public Messages, public testing::WithParamInterface<unsigned> {
  protected:
    Anything() : random_(GetParam()) {}

    int below(int limit) { return std::uniform_int_distribution<int>(0, limit - 1)(random_); }
    template <typename T, std::size_t N>
    T one_of(const T (&values)[N]) {
        return values[below(static_cast<int>(N))];
    }

    int slot() { return below(kSlots); }
    // Mostly a call that exists.
    int session(int slot) {
        const auto calls = calls_.list(slot);
        if (calls.empty() || below(10) == 0)
            return one_of({0, -1, 1, 1000000, std::numeric_limits<int>::max()});
        return calls[static_cast<std::size_t>(below(static_cast<int>(calls.size())))].session_id;
    }
    template <typename T>
    T value() {
        return T{one_of({0, 0, 0, 1, 1, 1, 2, 2, 3, 4, 5, -1, std::numeric_limits<int>::min(),
                         std::numeric_limits<int>::max()})};
    }
    std::string number() {
        if (below(2) == 0)
            return plan_.number_of(slot());
        if (below(8) == 0)
            return one_of({"", "112", "911", "+", "*100#", "alice", "sip:1@x", "tel:;x"});
        return fmt::format("+155502{:02}", below(20));
    }
    std::vector<std::string> numbers() {
        std::vector<std::string> list;
        for (int left = below(4); left > 0; --left)
            list.push_back(number());
        return list;
    }

    tpdu::Octets garbled(tpdu::Octets octets) {
        for (int left = below(3); left > 0 && !octets.empty(); --left)
            octets[static_cast<std::size_t>(below(static_cast<int>(octets.size())))] =
                static_cast<std::uint8_t>(below(256));
        if (below(10) == 0)
            octets.resize(static_cast<std::size_t>(below(200)));
        return octets;
    }
    void write() {
        auto submit = submit_to(fmt::format("+155502{:02}", below(20)), "Hello",
                                static_cast<std::uint8_t>(below(3)));
        if (below(2) == 0)
            submit.destination = must(tpdu::number_address(plan_.number_of(slot())));
        submit.status_report_request = below(2) == 0;
        submit.reject_duplicates = below(4) == 0;
        const auto octets = garbled(must(tpdu::encode(submit)));
        const auto length = below(20) == 0 ? value<int>() : static_cast<int>(octets.size());
        static_cast<void>(centre_.submit(slot(), {octets, length, {}, below(2)}));
    }
    void report() {
        auto octets = below(2) == 0 ? tpdu::Octets{} : garbled({0x00, 0x00});
        const auto length = static_cast<int>(octets.size());
        static_cast<void>(
            centre_.report(slot(), {one_of({0, 0, 22, 127, 128, -1}), octets, length, below(6)}));
    }
    void set_services() {
        const int on = slot();
        const auto target = number();
        const auto length = static_cast<std::int32_t>(target.size());
        static_cast<void>(services_.set_waiting(on, {value<ServiceClass>(), below(2)}));
        static_cast<void>(services_.set_forwarding(on, {value<ServiceClass>(), below(2),
                                                        value<ForwardCondition>(), 5 * below(8),
                                                        length, value<UriType>(), target}));
        static_cast<void>(services_.set_barring(
            on, {value<ServiceClass>(), below(6) == 0 ? 1 : 0, value<BarringType>()}, "0000"));
    }

    void ask();
    void ask_of_a_call(int slot, int id);
    void check(int slot);

    std::mt19937 random_;
    std::map<int, std::set<int>> ended_;
};

void Anything::ask_of_a_call(int slot, int id) {
    switch (below(15)) {
    case 0:
        return static_cast<void>(calls_.end(slot, id));
    case 1:
        return static_cast<void>(calls_.reject(slot, id, value<RejectReason>()));
    case 2:
        return static_cast<void>(calls_.hold(slot, id));
    case 3:
        return static_cast<void>(calls_.resume(slot, id));
    case 4:
        return static_cast<void>(changes_.change(slot, id, value<CallType>()));
    case 5:
        return static_cast<void>(changes_.accept(slot, id));
    case 6:
        return static_cast<void>(changes_.reject(slot, id));
    case 7:
        return static_cast<void>(calls_.add_participant(slot, id, session(slot)));
    case 8:
        return static_cast<void>(calls_.remove_participant(slot, id, session(slot)));
    case 9:
        return static_cast<void>(calls_.invite(slot, id, number(), value<CallType>()));
    case 10:
        return static_cast<void>(
            calls_.modify_conference(slot, id, value<ConferenceChange>(), numbers()));
    case 11:
        return static_cast<void>(calls_.start_nway(slot, id, session(slot), value<CallType>()));
    case 12:
        return static_cast<void>(media_.send_dtmf(slot, id, one_of({"", "1", "1*#D", "x"})));
    case 13:
        return static_cast<void>(below(2) == 0 ? radio_.handover_started(slot, id)
                                               : radio_.handover_failed(slot, id));
    default:
        return static_cast<void>(calls_.answer(slot, id, value<CallType>()));
    }
}

void Anything::ask() {
    const int on = slot();
    switch (below(16)) {
    case 0:
    case 1:
    case 2:
        return static_cast<void>(calls_.make_call(on, {number(), value<CallType>(), {}}));
    case 3:
        return static_cast<void>(calls_.start_conference(on, value<CallType>(), numbers()));
    case 4:
        static_cast<void>(calls_.swap(on));
        return static_cast<void>(calls_.merge(on));
    case 5:
        return write();
    case 6:
        return report();
    case 7:
        return set_services();
    case 8:
        return static_cast<void>(calls_.set_auto_response(on, value<AutoResponse>(), value<int>()));
    case 9:
        if (below(4) == 0)
            static_cast<void>(registrations_.enable_flight_mode(on));
        return registrations_.switch_on(slot());
    case 10:
        return static_cast<void>(ussd_.send(on, value<UssdRequest>(), below(300),
                                            one_of({"*101#", "1", "3", "", "x/y"})));
    case 11:
        return advance(std::chrono::milliseconds(one_of({1, 200, 500, 2000, 31000, 100000})));
    default:
        return ask_of_a_call(on, session(on));
    }
}

void Anything::check(int slot) {
    int active = 0;
    int held = 0;
    int set_up = 0;
    for (const auto &call : calls_.list(slot)) {
        EXPECT_FALSE(ended_[slot].contains(call.session_id)) << call.session_id << " has ended";
        const bool member = call.conference && !call.peer_uri.starts_with("sip:conference-");
        if (member)
            continue;
        active += call.state == CallState::kActive || call.state == CallState::kHeldByPeer;
        held += call.state == CallState::kHeld;
        set_up += call.state < CallState::kActive;
    }
    EXPECT_LE(active, 1);
    EXPECT_LE(held, 1);
    EXPECT_LE(set_up, 1);
    for (const auto &event : take(slot)) {
        int id = 0;
        if (std::sscanf(event.c_str(), "CallEnded (%d", &id) == 1) {
            EXPECT_TRUE(ended_[slot].insert(id).second) << id << " ends twice";
        }
    }
    messages_[slot].clear();
}

TEST_P(Anything, LeavesTheNetworkInOrder) {
    for (int i = 0; i < kRequests && !HasFailure(); ++i) {
        ask();
        for (int slot = 0; slot < kSlots; ++slot)
            check(slot);
    }
    // Otherwise the requests have shown nothing.
    for (int slot = 0; slot < kSlots; ++slot)
        EXPECT_GT(ended_[slot].size(), 10U);
    for (int slot = 0; slot < kSlots; ++slot) {
        static_cast<void>(registrations_.enable_flight_mode(slot));
        EXPECT_TRUE(calls_.list(slot).empty());
    }
    // Nothing that was begun goes on for ever: the last to end are messages that nobody gets.
    advance(std::chrono::hours(24 * 500));
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

INSTANTIATE_TEST_SUITE_P(Seeds, Anything, testing::Range(1U, 9U));

} // namespace
} // namespace sim::test
