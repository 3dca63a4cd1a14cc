// SPDX-License-Identifier: Apache-2.0
#include "sim/settings/entries.hpp"

#include <algorithm>
#include <charconv>

namespace sim {

namespace {

using Offered = decltype(OfferedEntry::value);

std::string type_of(const Offered &value) {
    if (const auto *foreign = std::get_if<ForeignValue>(&value))
        return foreign->type;
    constexpr std::string_view kTypes[] = {"i", "b", "s"};
    return std::string(kTypes[value.index()]);
}

std::size_t index_of(Form form) {
    return form == Form::kInt ? 0U : form == Form::kFlag ? 1U : 2U;
}

// What is stored for an entry whose type is the one that its key travels with.
Answer<SettingValue> stored_value(const SettingsField &field, const Offered &value) {
    const auto *text = std::get_if<std::string>(&value);
    if (text && std::holds_alternative<std::int32_t>(field.value)) {
        const auto number = parse_decimal(*text);
        if (!number)
            return refuse(Result::kInvalidArgument, "{} spells no 32-bit number: \"{}\"", field.key,
                          *text);
        return SettingValue(*number);
    }
    if (text)
        return SettingValue(*text);
    if (const auto *number = std::get_if<std::int32_t>(&value))
        return SettingValue(*number);
    return SettingValue(std::get<bool>(value));
}

Answer<SettingValue> check_entry(const SettingsField &field, Form form, const Offered &value) {
    if (form == Form::kAbsent)
        return refuse(Result::kInvalidArgument, "{} can only be read", field.key);
    if (value.index() != index_of(form))
        return refuse(Result::kInvalidArgument, "{} is \"{}\" here, and \"{}\" came", field.key,
                      static_cast<char>(form), type_of(value));
    return stored_value(field, value);
}

} // namespace

std::optional<std::int32_t> parse_decimal(std::string_view text) {
    std::int32_t number = 0;
    const auto *const end = text.data() + text.size();
    const auto [parsed, error] = std::from_chars(text.data(), end, number);
    return error == std::errc() && parsed == end ? std::optional(number) : std::nullopt;
}

Answer<SettingsChanges> check_entries(const SettingsFields &fields, Form SettingsField::*direction,
                                      const OfferedEntries &entries) {
    SettingsChanges changes;
    for (const auto &entry : entries) {
        const auto place = fields.find(entry.key);
        if (!place)
            return refuse(Result::kInvalidArgument, "there is no key \"{}\"", entry.key);
        const auto &field = fields[*place];
        auto value = check_entry(field, field.*direction, entry.value);
        if (!value)
            return value.refusal();
        const auto earlier =
            std::ranges::find(changes, *place, &SettingsChanges::value_type::first);
        if (earlier == changes.end())
            changes.emplace_back(*place, *value);
        // Clients write two keys a second time, with the value that they had.
        else if (earlier->second != *value)
            return refuse(Result::kInvalidArgument, "{} comes twice, with different values",
                          field.key);
    }
    return changes;
}

} // namespace sim
