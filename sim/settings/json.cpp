// SPDX-License-Identifier: Apache-2.0
#include "sim/settings/json.hpp"

#include <limits>
#include <nlohmann/json.hpp>

namespace sim {

namespace {

using Json = nlohmann::ordered_json;

constexpr const char *kFormat = "ims-sim settings";
constexpr int kVersion = 1;

// Why a text is not accepted. Stays within this file.
struct Unacceptable {
    std::string why;
};

template <typename... Args>
[[noreturn]] void reject(fmt::format_string<Args...> text, Args &&...args) {
    throw Unacceptable{fmt::format(text, std::forward<Args>(args)...)};
}

Json record_to_json(const SettingsFields &fields, const SettingsRecord &record) {
    Json object = Json::object();
    for (std::size_t place = 0; place < fields.size(); ++place)
        std::visit([&](const auto &value) { object[fields[place].key] = value; }, record[place]);
    return object;
}

Json records_to_json(const SettingsFields &fields, const std::vector<SettingsRecord> &records) {
    Json list = Json::array();
    for (const auto &record : records)
        list.push_back(record_to_json(fields, record));
    return list;
}

std::int32_t to_number(const Json &value, std::string_view key) {
    using Limits = std::numeric_limits<std::int32_t>;
    if (!value.is_number_integer() ||
        (value.is_number_unsigned() && value.get<std::uint64_t>() > std::uint64_t{Limits::max()}))
        reject("\"{}\" is no 32-bit number", key);
    const auto wide = value.get<std::int64_t>();
    if (wide < Limits::min() || wide > Limits::max())
        reject("\"{}\" is no 32-bit number", key);
    return static_cast<std::int32_t>(wide);
}

SettingValue to_value(const Json &value, const SettingsField &field) {
    if (std::holds_alternative<std::int32_t>(field.value))
        return to_number(value, field.key);
    if (std::holds_alternative<bool>(field.value)) {
        if (!value.is_boolean())
            reject("\"{}\" is neither true nor false", field.key);
        return value.get<bool>();
    }
    if (!value.is_string())
        reject("\"{}\" is no text", field.key);
    auto text = value.get<std::string>();
    // Such a text cannot travel.
    if (text.find('\0') != std::string::npos)
        reject("\"{}\" holds a NUL", field.key);
    return text;
}

SettingsRecord to_record(const Json &object, const SettingsFields &fields) {
    if (!object.is_object())
        reject("an entry is no object");
    SettingsRecord record(fields.size());
    for (const auto &[key, value] : object.items()) {
        const auto place = fields.find(key);
        if (!place)
            reject("there is no key \"{}\"", key);
        record[*place] = to_value(value, fields[*place]);
    }
    // No key stands twice in an object, so a different number of them means a missing one.
    for (const auto &field : fields)
        if (object.size() != fields.size() && !object.contains(field.key))
            reject("the key \"{}\" is missing", field.key);
    return record;
}

const Json &member(const Json &object, const char *key) {
    const auto found = object.find(key);
    if (found == object.end())
        reject("\"{}\" is missing", key);
    return *found;
}

std::vector<SettingsRecord> to_records(const Json &whole, const char *key,
                                       const SettingsFields &fields) {
    const auto &list = member(whole, key);
    if (!list.is_array())
        reject("\"{}\" is no list", key);
    std::vector<SettingsRecord> records;
    for (const auto &object : list)
        records.push_back(to_record(object, fields));
    return records;
}

SlotSettings to_settings(const Json &whole) {
    if (!whole.is_object() || whole.value("format", Json()) != kFormat)
        reject("this is no file of ims-sim's settings");
    if (member(whole, "version") != kVersion)
        reject("its version is not {}", kVersion);
    SlotSettings settings{
        to_number(member(whole, "network_environment"), "network_environment"),
        to_records(whole, "global_settings", global_settings_fields()),
        to_records(whole, "profiles", profile_fields()),
    };
    if (whole.size() != 5)
        reject("it holds more than settings");
    if (const auto contradiction = find_contradiction(settings))
        reject("{}", *contradiction);
    return settings;
}

} // namespace

std::string to_json(const SlotSettings &settings) {
    Json whole;
    whole["format"] = kFormat;
    whole["version"] = kVersion;
    whole["network_environment"] = settings.network_environment;
    whole["global_settings"] = records_to_json(global_settings_fields(), settings.sets);
    whole["profiles"] = records_to_json(profile_fields(), settings.profiles);
    return whole.dump(2) + "\n";
}

Answer<SlotSettings> from_json(const std::string &text) {
    try {
        return to_settings(Json::parse(text));
    } catch (const Unacceptable &reason) {
        return refuse(Result::kFailed, "{}", reason.why);
    } catch (const Json::exception &error) {
        return refuse(Result::kFailed, "{}", error.what());
    }
}

} // namespace sim
