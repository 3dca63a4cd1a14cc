// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <variant>
#include <vector>

namespace sim {

using SettingValue = std::variant<std::int32_t, bool, std::string>;

// The values of one settings set or one profile, in the order of its fields.
using SettingsRecord = std::vector<SettingValue>;

// How a key travels: the letter of its type, or not at all.
enum class Form : char {
    kAbsent = '-',
    kInt = 'i',
    kFlag = 'b',
    kText = 's',
};

struct SettingsField {
    std::string key;
    SettingValue value; // what the shipped record holds; its type is the one that is stored
    Form get;
    Form update;
    Form add;
};

// The fields of one kind of record in wire order, with their places by key.
class SettingsFields {
  public:
    explicit SettingsFields(std::vector<SettingsField> fields);
    SettingsFields(const SettingsFields &) = delete;
    SettingsFields &operator=(const SettingsFields &) = delete;

    std::size_t size() const { return fields_.size(); }
    const SettingsField &operator[](std::size_t place) const { return fields_[place]; }
    std::optional<std::size_t> find(std::string_view key) const;
    // A key that must exist.
    std::size_t place_of(std::string_view key) const;
    auto begin() const { return fields_.begin(); }
    auto end() const { return fields_.end(); }
    SettingsRecord shipped() const;
    // Every number 0, every switch off, every text empty.
    SettingsRecord blank() const;

  private:
    std::vector<SettingsField> fields_;
    std::unordered_map<std::string_view, std::size_t> places_; // keys of the fields themselves
};

const SettingsFields &global_settings_fields();
const SettingsFields &profile_fields();

std::vector<SettingsRecord> shipped_profiles();

} // namespace sim
