// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <cstddef>
#include <utility>
#include <vector>

namespace sim {

// One of these for each slot. Slots count from 0.
template <typename T>
class PerSlot {
  public:
    explicit PerSlot(int slots) : values_(static_cast<std::size_t>(slots)) {}
    PerSlot(int slots, const T &value) : values_(static_cast<std::size_t>(slots), value) {}
    explicit PerSlot(std::vector<T> values) : values_(std::move(values)) {}

    int slots() const { return static_cast<int>(values_.size()); }
    T &operator[](int slot) { return values_[static_cast<std::size_t>(slot)]; }
    const T &operator[](int slot) const { return values_[static_cast<std::size_t>(slot)]; }

    auto begin() { return values_.begin(); }
    auto end() { return values_.end(); }

  private:
    std::vector<T> values_;
};

} // namespace sim
