// SPDX-License-Identifier: Apache-2.0
// Names for values that the service defines. A number is taken and shown where there is none.
#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace imsctl {

struct NamedValue {
    std::string_view name;
    std::int32_t value;
};
using NamedValues = std::span<const NamedValue>;

// What several kinds of requests take.
inline constexpr NamedValue kSwitch[] = {{"off", 0}, {"on", 1}};
inline constexpr NamedValue kRejectReasons[] = {{"decline", 0}, {"busy", 1}};

// The value's name, or its number.
std::string name_of(NamedValues names, std::int32_t value);

std::vector<std::string> names_of(NamedValues values);

// "voice, video, emergency or a number"
std::string choices(NamedValues names);

// A whole number that fits; nothing else around it.
std::optional<std::int32_t> parse_number(std::string_view text);

// A name or a number.
std::optional<std::int32_t> parse_value(NamedValues names, std::string_view text);

} // namespace imsctl
