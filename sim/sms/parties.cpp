// SPDX-License-Identifier: Apache-2.0
#include "sim/sms/parties.hpp"

#include "sim/base/number_plan.hpp"

#include <algorithm>

namespace sim {

namespace {

constexpr SubmitRefusal kUnassignedNumber{1, 0xC3, false};
constexpr SubmitRefusal kCentreBusy{42, 0xC0, true};
constexpr SubmitRefusal kCentreFails{38, 0xC2, true};

constexpr MessageParty kNobody{"+15550211", MessageFate::kRefusedByCentre, kUnassignedNumber};

// The same people as on the telephone.
constexpr MessageParty kParties[] = {
    {"+15550200", MessageFate::kRefusedByCentre, kCentreBusy},
    {"+15550201", MessageFate::kNeverReachable},
    {"+15550202", MessageFate::kRefusedByCentre, kCentreFails},
    {"+15550206", MessageFate::kRefusedByParty},
    kNobody,
    {"+15550213", MessageFate::kEchoed},
};

constexpr MessageParty kAnyNumber{"", MessageFate::kReceived};

} // namespace

const MessageParty &message_party_at(std::string_view number) {
    const auto found = std::ranges::find_if(
        kParties, [&](const MessageParty &party) { return same_number(party.number, number); });
    return found == std::end(kParties) ? kAnyNumber : *found;
}

const MessageParty &message_nobody() {
    return kNobody;
}

} // namespace sim
