// SPDX-License-Identifier: Apache-2.0
#include "sim/call/parties.hpp"

#include <algorithm>

namespace sim {

namespace {

using namespace std::chrono_literals;
using enum Action;

// The pace of an ordinary call: accepted by the network, then ringing, then answered.
constexpr auto kAcceptTime = 200ms;
constexpr auto kRouteTime = 500ms;
constexpr auto kAnswerTime = 2000ms;

constexpr Step kProceedStep{kAcceptTime, kProceed};
constexpr Step kAlertStep{kRouteTime, kAlert};
constexpr Step kAnswerStep{kAnswerTime, kAnswer};

constexpr Step kAnswers[] = {kProceedStep, kAlertStep, kAnswerStep};
constexpr Step kAnswersAtOnce[] = {{0ms, kProceed}, {0ms, kAlert}, {0ms, kAnswer}};
constexpr Step kIsSlot[] = {kProceedStep, {kRouteTime, kRingSlot}};
constexpr Step kIsBusy[] = {kProceedStep, {kRouteTime, kBusy}};
constexpr Step kGivesUp[] = {kProceedStep, kAlertStep, {30s, kNoAnswer}};
constexpr Step kFails[] = {kProceedStep, {kRouteTime, kFail}};
constexpr Step kPlaysMusic[] = {
    kProceedStep, {kRouteTime, kEarlyMedia}, {300ms, kStopTone}, kAnswerStep};
constexpr Step kHangsUp[] = {kProceedStep, kAlertStep, kAnswerStep, {3s, kHangUp}};
constexpr Step kForwards[] = {kProceedStep, {kRouteTime, kForward}, kAlertStep, kAnswerStep};
constexpr Step kDeclines[] = {kProceedStep, kAlertStep, {kAnswerTime, kDecline}};
constexpr Step kRingsForEver[] = {kProceedStep, kAlertStep};
constexpr Step kHolds[] = {kProceedStep, kAlertStep, kAnswerStep, {1s, kHold}, {2s, kResume}};
constexpr Step kAsksVideo[] = {kProceedStep, kAlertStep, kAnswerStep, {1s, kAskVideo}};
constexpr Step kDrops[] = {kProceedStep, kAlertStep, kAnswerStep, {3s, kFail}};
constexpr Step kCallsBack[] = {kProceedStep, kAlertStep, kAnswerStep, {1s, kCallBack, 2000}};
constexpr Step kPressesKeys[] = {kProceedStep,       kAlertStep,          kAnswerStep,
                                 {1s, kTone, '1'},   {500ms, kTone, '2'}, {500ms, kTone, '3'},
                                 {500ms, kTone, '#'}};
constexpr Step kNobody[] = {kProceedStep, {kRouteTime, kUnreachable}};

constexpr Party kParties[] = {
    {"+15550200", "is busy", kIsBusy},
    {"+15550201", "rings, and the network gives up after 30 s", kGivesUp},
    {"+15550202", "the network fails the call", kFails},
    {"+15550203", "plays an announcement before it answers", kPlaysMusic},
    {"+15550204", "answers and hangs up 3 s later", kHangsUp},
    {"+15550205", "is forwarded to a party that answers", kForwards},
    {"+15550206", "declines", kDeclines},
    {"+15550207", "rings and is never answered", kRingsForEver},
    {"+15550208", "answers, holds the call after 1 s, resumes it 2 s later", kHolds},
    {"+15550209", "answers and asks for video 1 s later", kAsksVideo},
    {"+15550210", "answers and refuses every change of the call type", kAnswers, false},
    {"+15550211", "is nobody's number", kNobody},
    {"+15550212", "answers; the network drops the call 3 s later", kDrops},
    {"+15550213", "answers, hangs up after 1 s and calls back 2 s later", kCallsBack},
    {"+15550214", "answers and presses 1 2 3 #", kPressesKeys},
};

constexpr Party kEmergencyService{"", "emergency service: answers at once", kAnswersAtOnce, false};
constexpr Party kSlotParty{"", "another slot", kIsSlot};
constexpr Party kOwnNumber{"", "the caller's own number: busy", kIsBusy};
constexpr Party kAnyNumber{"", "answers", kAnswers};

} // namespace

std::span<const Party> parties() {
    return kParties;
}

const Party &party_at(const NumberPlan &plan, int caller, std::string_view number) {
    if (is_emergency(number))
        return kEmergencyService;
    if (const auto slot = plan.slot_of(number))
        return *slot == caller ? kOwnNumber : kSlotParty;
    const auto named = std::ranges::find_if(
        kParties, [&](const Party &party) { return same_number(party.number, number); });
    return named != std::end(kParties) ? *named : kAnyNumber;
}

} // namespace sim
