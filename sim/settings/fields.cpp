// SPDX-License-Identifier: Apache-2.0
#include "sim/settings/fields.hpp"

namespace sim {

SettingsFields::SettingsFields(std::vector<SettingsField> fields) : fields_(std::move(fields)) {
    for (std::size_t place = 0; place < fields_.size(); ++place)
        places_.emplace(fields_[place].key, place);
}

std::optional<std::size_t> SettingsFields::find(std::string_view key) const {
    const auto found = places_.find(key);
    return found == places_.end() ? std::nullopt : std::optional(found->second);
}

std::size_t SettingsFields::place_of(std::string_view key) const {
    return places_.at(key);
}

SettingsRecord SettingsFields::shipped() const {
    SettingsRecord record;
    for (const auto &field : fields_)
        record.push_back(field.value);
    return record;
}

SettingsRecord SettingsFields::blank() const {
    SettingsRecord record = shipped();
    for (auto &value : record)
        std::visit([](auto &content) { content = {}; }, value);
    return record;
}

} // namespace sim
