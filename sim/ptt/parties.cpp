// SPDX-License-Identifier: Apache-2.0
#include "sim/ptt/parties.hpp"

#include "sim/base/number_plan.hpp"

#include <algorithm>

namespace sim {

namespace {

// The same people as on the telephone.
constexpr PttParty kNobody{"+15550211", PttWelcome::kNobody};
constexpr PttParty kParties[] = {
    {"+15550200", PttWelcome::kBusy},
    {"+15550201", PttWelcome::kNeverAnswers},
    {"+15550202", PttWelcome::kFails},
    {"+15550204", PttWelcome::kTakes, PttHabit::kLeaves},
    {"+15550206", PttWelcome::kDeclines},
    {"+15550207", PttWelcome::kNeverAnswers},
    {"+15550209", PttWelcome::kTakes, PttHabit::kAsksVideo},
    {"+15550210", PttWelcome::kTakes, PttHabit::kRefusesChanges},
    kNobody,
    {"+15550213", PttWelcome::kTakes, PttHabit::kEchoes},
    {"+15550214", PttWelcome::kTakes, PttHabit::kTalks},
};
constexpr PttParty kAnyNumber{};

} // namespace

const PttParty &ptt_party_at(std::string_view number) {
    const auto found = std::ranges::find_if(
        kParties, [&](const PttParty &party) { return same_number(party.number, number); });
    return found == std::end(kParties) ? kAnyNumber : *found;
}

const PttParty &ptt_nobody() {
    return kNobody;
}

} // namespace sim
