// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/result.hpp"

#include <chrono>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

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
bool is_emergency(std::string_view number);

// A called number as it may be written: plain with or without separators, tel: or sip:.
Answer<std::string> parse_number(std::string_view text);
std::string to_uri(std::string_view number);
bool same_number(std::string_view a, std::string_view b);
// Users are the same when their uris are, or the telephone numbers in them.
bool same_user(std::string_view a, std::string_view b);

// Which number reaches whom.
class NumberPlan {
  public:
    explicit NumberPlan(std::vector<std::string> slot_numbers)
        : slot_numbers_(std::move(slot_numbers)) {}

    static std::string default_slot_number(int slot);

    int slots() const { return static_cast<int>(slot_numbers_.size()); }
    const std::string &number_of(int slot) const;
    std::optional<int> slot_of(std::string_view number) const;
    // Whom this slot reaches at that number.
    const Party &party(int caller, std::string_view number) const;

  private:
    std::vector<std::string> slot_numbers_;
};

} // namespace sim
