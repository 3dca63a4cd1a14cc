// SPDX-License-Identifier: Apache-2.0
#include "sim/call/signals.hpp"

#include <algorithm>
#include <gtest/gtest.h>
#include <set>
#include <string_view>
#include <variant>

namespace sim {
namespace {

// One event of each kind: the table that objects describe themselves with must tell the truth.
TEST(CallSignals, HaveTheTypesThatTheTableNames) {
    const CallEvent events[] = {
        CallIncomingInd{},     CallInProgress{},     CallAlerting{},       CallBusy{},
        CallEstablished{},     CallHeld{},           CallResumed{},        CallForwarded{},
        CallEnded{},           CallSwitched{},       CallChangeRequest{},  CallConfNotifyReceived{},
        CallEarlyMediaStart{}, CallStopAlertTone{},  CallError{},          ConferenceEstablished{},
        ParticipantAdded{},    ParticipantRemoved{}, CallUssdIndication{}, CallDtmfEvent{},
    };
    std::set<std::string_view> members;
    for (const auto &event : events) {
        const auto signal = to_signal(event);
        const auto row = std::ranges::find(call_signals(), signal.member, &SignalInfo::member);
        ASSERT_NE(row, call_signals().end()) << signal.member;
        EXPECT_EQ(g_variant_get_type_string(signal.body.get()), row->signature) << signal.member;
        EXPECT_TRUE(members.insert(signal.member).second) << signal.member;
    }
    EXPECT_EQ(members.size(), std::variant_size_v<CallEvent>);
    EXPECT_EQ(members.size(), call_signals().size());
}

TEST(CallSignals, CarryTheirMembersInOrder) {
    EXPECT_EQ(to_signal(CallIncomingInd{
                            3, "tel:+1", CallType::kVideo, "tel:+2", {"a", "b", "c", "d"}, true})
                  .body.print(),
              "(3, 'tel:+1', 1, 'tel:+2', 'a', 'b', 'c', 'd', true)");
    EXPECT_EQ(to_signal(CallResumed{3, true, false, CallType::kVideo}).body.print(),
              "(3, true, false, 1)");
    EXPECT_EQ(to_signal(CallConfNotifyReceived{3, {1, 3}, {"a", "b"}}).body.print(),
              "(3, <[1, 3]>, 2, <['a', 'b']>, 2)");
    EXPECT_EQ(
        to_signal(CallUssdIndication{UssdAnswer::kReplyExpected, 15, 2, "hello"}).body.print(),
        "(2, 15, 2, 'aGVsbG8=')");
    EXPECT_EQ(to_signal(CallEnded{3, EndReason::kBusy}).body.print(), "(3, 2)");
}

} // namespace
} // namespace sim
