// SPDX-License-Identifier: Apache-2.0
#include "imsctl/output/values.hpp"

#include <algorithm>
#include <charconv>
#include <fmt/format.h>

namespace imsctl {

std::string name_of(NamedValues names, std::int32_t value) {
    const auto row = std::find_if(names.begin(), names.end(),
                                  [&](const NamedValue &each) { return each.value == value; });
    return row == names.end() ? fmt::to_string(value) : std::string(row->name);
}

std::vector<std::string> names_of(NamedValues values) {
    std::vector<std::string> names;
    for (const NamedValue &each : values)
        names.emplace_back(each.name);
    return names;
}

std::string choices(NamedValues names) {
    std::string text;
    for (const NamedValue &each : names)
        text += fmt::format("{}{}", text.empty() ? "" : ", ", each.name);
    return text + " or a number";
}

std::optional<std::int32_t> parse_number(std::string_view text) {
    std::int32_t number = 0;
    const char *end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), end, number);
    if (error != std::errc() || stop != end)
        return std::nullopt;
    return number;
}

std::optional<std::int32_t> parse_value(NamedValues names, std::string_view text) {
    const auto row = std::find_if(names.begin(), names.end(),
                                  [&](const NamedValue &each) { return each.name == text; });
    return row == names.end() ? parse_number(text) : row->value;
}

} // namespace imsctl
