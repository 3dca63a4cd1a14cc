// SPDX-License-Identifier: Apache-2.0
#include "sim/settings/rows.hpp"

namespace sim {

namespace {

Form form_of(const SettingValue &value) {
    constexpr Form kForms[] = {Form::kInt, Form::kFlag, Form::kText};
    return kForms[value.index()];
}

} // namespace

SettingValue value_of(const SettingsRow &row) {
    if (const auto *number = std::get_if<std::int32_t>(&row.value))
        return *number;
    if (const auto *flag = std::get_if<bool>(&row.value))
        return *flag;
    return std::string(std::get<std::string_view>(row.value));
}

SettingsField plain_field(const SettingsRow &row, std::string_view suffix) {
    SettingValue value = value_of(row);
    const Form form = form_of(value);
    return {std::string(row.key).append(suffix), std::move(value), form, form, form};
}

} // namespace sim
