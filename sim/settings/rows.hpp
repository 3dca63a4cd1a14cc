// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/settings/fields.hpp"

#include <cstdint>
#include <span>
#include <string_view>
#include <variant>

namespace sim {

// A key of a field table with its shipped value, which also says its type.
struct SettingsRow {
    std::string_view key;
    std::variant<std::int32_t, bool, std::string_view> value;
};

constexpr SettingsRow number(std::string_view key, std::int32_t value) {
    return {key, value};
}
constexpr SettingsRow flag(std::string_view key, bool value) {
    return {key, value};
}
constexpr SettingsRow text(std::string_view key, std::string_view value) {
    return {key, value};
}

SettingValue value_of(const SettingsRow &row);
// The field of a row that travels the same way in all directions.
SettingsField plain_field(const SettingsRow &row, std::string_view suffix = {});

// The last and longest group of the global settings.
std::span<const SettingsRow> operator_rows();

} // namespace sim
