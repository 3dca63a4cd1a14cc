// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/per_slot.hpp"
#include "sim/base/result.hpp"

#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace sim {

bool is_emergency(std::string_view number);

// A called number as it may be written: plain with or without separators, tel: or sip:.
Answer<std::string> parse_number(std::string_view text);
std::string to_uri(std::string_view number);
bool same_number(std::string_view a, std::string_view b);
// Users are the same when their uris are, or the telephone numbers in them.
bool same_user(std::string_view a, std::string_view b);

// The network's: which number is which slot's.
class NumberPlan {
  public:
    explicit NumberPlan(std::vector<std::string> slot_numbers)
        : slot_numbers_(std::move(slot_numbers)) {}

    static std::string default_slot_number(int slot);

    int slots() const { return slot_numbers_.slots(); }
    const std::string &number_of(int slot) const;
    std::optional<int> slot_of(std::string_view number) const;

  private:
    PerSlot<std::string> slot_numbers_;
};

} // namespace sim
