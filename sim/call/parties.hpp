// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/number_plan.hpp"

#include <chrono>
#include <span>
#include <string_view>

// The network's side of a call: who has a number, and what they do with calls to it.
namespace sim {

// What the far end of a call does next.
enum class Action {
    kProceed,    // the network has taken the call
    kAlert,      // the party's telephone rings
    kRingSlot,   // the party is another slot: ring there
    kForward,    // the party has the call forwarded
    kEarlyMedia, // announcement or music before the answer
    kStopTone,   // the alert tone gives way to it
    kAnswer,
    kBusy,
    kDecline,
    kNoAnswer,    // the network gives up ringing
    kUnreachable, // nobody has this number
    kFail,        // the network fails the call
    kHangUp,
    kHold,
    kResume,
    kAskVideo,
    kTone,     // the party presses the key `value`
    kCallBack, // hangs up and calls `value` milliseconds later
};

struct Step {
    std::chrono::milliseconds after;
    Action action;
    int value = 0;
};

// Whoever a number reaches: what it does by itself, step after step, and how it takes requests.
struct Party {
    std::string_view number; // empty: any number
    std::string_view description;
    std::span<const Step> steps;
    bool accepts_changes = true;
};

// The parties with numbers of their own.
std::span<const Party> parties();
// Whom this slot reaches at that number.
const Party &party_at(const NumberPlan &plan, int caller, std::string_view number);

} // namespace sim
