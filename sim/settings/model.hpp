// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/per_slot.hpp"
#include "sim/base/result.hpp"
#include "sim/settings/fields.hpp"
#include "sim/settings/offered.hpp"

#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace sim {

// All that one slot keeps.
struct SlotSettings {
    std::int32_t network_environment = 0;
    std::vector<SettingsRecord> sets;
    std::vector<SettingsRecord> profiles;

    static SlotSettings shipped();
    bool operator==(const SlotSettings &) const = default;
};

// The settings sets, profiles and network environment of each slot, which the device keeps. A
// request changes all that it names or nothing.
class SettingsModel {
  public:
    // Makes a slot's settings durable. What went wrong, or nothing.
    using Keeper = std::function<std::optional<std::string>(int slot, const SlotSettings &)>;

    static constexpr std::int32_t kLastNetworkEnvironment = 3;

    explicit SettingsModel(int slots);

    int slots() const { return slots_.slots(); }
    const SlotSettings &of(int slot) const { return slots_[slot]; }
    void restore(int slot, SlotSettings settings);
    void keep_with(Keeper keeper) { keeper_ = std::move(keeper); }

    Answer<const SettingsRecord *> find_set(int slot, std::string_view name) const;
    Status update_set(int slot, const OfferedEntries &entries);
    Status add_set(int slot, const OfferedEntries &entries);
    Status delete_set(int slot, std::string_view name);

    Status update_profile(int slot, const OfferedEntries &entries);
    Status add_profile(int slot, const OfferedEntries &entries);
    Status delete_profile(int slot, std::int32_t id);

    Status set_network_environment(int slot, std::int32_t type);

  private:
    // Becomes the slot's state once it is durable.
    Status commit(int slot, SlotSettings next);

    PerSlot<SlotSettings> slots_;
    Keeper keeper_;
};

// What makes kept state impossible, or nothing.
std::optional<std::string> find_contradiction(const SlotSettings &settings);

} // namespace sim
