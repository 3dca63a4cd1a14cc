// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/settings/model.hpp"

namespace sim::test {

// A value for this place that differs from place to place and from what is shipped.
inline SettingValue sample_value(const SettingsField &field, std::size_t place, int variation = 0) {
    if (std::holds_alternative<std::int32_t>(field.value))
        return static_cast<std::int32_t>(place) * 1001 - 70000 + variation;
    if (const auto *flag = std::get_if<bool>(&field.value))
        return !*flag;
    return fmt::format("text {} \"ä\\n\" {}", place, variation);
}

inline SettingsRecord sample_record(const SettingsFields &fields, const std::string &name,
                                    int variation = 0) {
    SettingsRecord record;
    for (std::size_t place = 0; place < fields.size(); ++place)
        record.push_back(sample_value(fields[place], place, variation));
    record[fields.place_of("name")] = name;
    return record;
}

// An entry as clients write it.
inline OfferedEntry entry_of(const SettingsField &field, Form form, const SettingValue &value) {
    if (const auto *number = std::get_if<std::int32_t>(&value)) {
        if (form == Form::kText)
            return {field.key, std::to_string(*number)};
        return {field.key, *number};
    }
    if (const auto *flag = std::get_if<bool>(&value))
        return {field.key, *flag};
    return {field.key, std::get<std::string>(value)};
}

// A whole record as clients write it: what cannot be written is replaced by the key before it.
inline OfferedEntries entries_of(const SettingsFields &fields, Form SettingsField::*direction,
                                 const SettingsRecord &record) {
    OfferedEntries entries;
    for (std::size_t place = 0; place < fields.size(); ++place) {
        const auto written = fields[place].*direction == Form::kAbsent ? place - 1 : place;
        entries.push_back(entry_of(fields[written], fields[written].*direction, record[written]));
    }
    return entries;
}

} // namespace sim::test
