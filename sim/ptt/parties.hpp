// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <string_view>

// The network's side of push-to-talk: who has a number, and how they take what comes to it.
namespace sim {

// How a party of the network takes an invitation, a message or a file.
enum class PttWelcome { kTakes, kBusy, kDeclines, kNeverAnswers, kNobody, kFails };
// What it does once it takes part.
enum class PttHabit { kListens, kLeaves, kTalks, kAsksVideo, kRefusesChanges, kEchoes };

struct PttParty {
    std::string_view number; // empty: any number
    PttWelcome welcome = PttWelcome::kTakes;
    PttHabit habit = PttHabit::kListens;
};

const PttParty &ptt_party_at(std::string_view number);
// For a name that no number belongs to.
const PttParty &ptt_nobody();

} // namespace sim
