// SPDX-License-Identifier: Apache-2.0
#include "sim/base/number_plan.hpp"

#include <algorithm>
#include <array>

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
constexpr Party kAnybody{"", "answers", kAnswers};

constexpr std::array<std::string_view, 2> kEmergencyNumbers = {"112", "911"};
constexpr std::size_t kMaxDigits = 20;

constexpr std::string_view kDigits = "0123456789";
constexpr std::string_view kSeparators = " -.()";

} // namespace

std::span<const Party> parties() {
    return kParties;
}

bool is_emergency(std::string_view number) {
    return std::ranges::any_of(kEmergencyNumbers,
                               [&](std::string_view one) { return same_number(one, number); });
}

Answer<std::string> parse_number(std::string_view text) {
    std::string_view rest = text;
    if (rest.starts_with("tel:"))
        rest.remove_prefix(4);
    else if (rest.starts_with("sip:")) {
        rest.remove_prefix(4);
        const auto at = rest.find('@');
        if (at == std::string_view::npos || at + 1 == rest.size())
            return refuse(Result::kInvalidArgument, "\"{}\" lacks the host: write sip:NUMBER@HOST",
                          text);
        rest = rest.substr(0, at);
    }
    rest = rest.substr(0, rest.find(';'));

    std::string number;
    for (const char letter : rest) {
        if (kDigits.find(letter) != std::string_view::npos || (letter == '+' && number.empty()))
            number += letter;
        else if (letter == '*' || letter == '#')
            return refuse(Result::kInvalidArgument,
                          "\"{}\" is a service code, not a number: send it with SendUssd", text);
        else if (kSeparators.find(letter) == std::string_view::npos)
            return refuse(Result::kInvalidArgument,
                          "\"{}\" is no number: write digits with an optional leading +, "
                          "tel:NUMBER or sip:NUMBER@HOST",
                          text);
    }
    const auto digits = number.size() - (number.starts_with('+') ? 1 : 0);
    if (digits == 0)
        return refuse(Result::kInvalidArgument, "the called number \"{}\" has no digits", text);
    if (digits > kMaxDigits)
        return refuse(Result::kInvalidArgument, "\"{}\" has {} digits; {} are the most", text,
                      digits, kMaxDigits);
    return number;
}

std::string to_uri(std::string_view number) {
    return fmt::format("tel:{}", number);
}

bool same_number(std::string_view a, std::string_view b) {
    const auto bare = [](std::string_view number) {
        return number.substr(number.starts_with('+') ? 1 : 0);
    };
    return bare(a) == bare(b);
}

bool same_user(std::string_view a, std::string_view b) {
    if (a == b)
        return true;
    const auto number = parse_number(a);
    const auto other = parse_number(b);
    return number && other && same_number(*number, *other);
}

std::string NumberPlan::default_slot_number(int slot) {
    return fmt::format("+155501{:02}", slot);
}

const std::string &NumberPlan::number_of(int slot) const {
    return slot_numbers_.at(static_cast<std::size_t>(slot));
}

std::optional<int> NumberPlan::slot_of(std::string_view number) const {
    for (int slot = 0; slot < slots(); ++slot)
        if (same_number(number_of(slot), number))
            return slot;
    return std::nullopt;
}

const Party &NumberPlan::party(int caller, std::string_view number) const {
    if (is_emergency(number))
        return kEmergencyService;
    if (const auto slot = slot_of(number))
        return *slot == caller ? kOwnNumber : kSlotParty;
    const auto named = std::ranges::find_if(
        kParties, [&](const Party &party) { return same_number(party.number, number); });
    return named != std::end(kParties) ? *named : kAnybody;
}

} // namespace sim
