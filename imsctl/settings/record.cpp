// SPDX-License-Identifier: Apache-2.0
#include "imsctl/settings/record.hpp"

#include "imsctl/line/suggestions.hpp"
#include "imsctl/output/failure.hpp"
#include "imsctl/output/values.hpp"

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <fmt/format.h>

namespace imsctl {
namespace {

Value read(std::int32_t number) {
    return std::int64_t{number};
}
Value read(bool flag) {
    return flag;
}
Value read(const char *text) {
    return text == nullptr ? Value() : Value(std::string(text));
}
Value read(const ims_settings_timer_s &timer) {
    if (timer.text != nullptr && parse_number(timer.text))
        return std::int64_t{timer.value};
    return read(timer.text);
}

void write(std::int32_t &number, const Value &value) {
    number = static_cast<std::int32_t>(std::get<std::int64_t>(value));
}
void write(bool &flag, const Value &value) {
    flag = std::get<bool>(value);
}
void write(char *&text, const Value &value) {
    std::free(text);
    text = strdup(std::get<std::string>(value).c_str());
}
void write(ims_settings_timer_s &timer, const Value &value) {
    write(timer.value, value);
    write(timer.text, Value(fmt::to_string(timer.value)));
}

bool has_type(const Value &value, KeyType type) {
    return value.index() == empty_value(type).index();
}

template <class Record>
Assignment<Record> parse_assignment(const std::string &text, const char *hint) {
    const auto equals = text.find('=');
    if (equals == std::string::npos)
        throw Failure(FailureKind::kUsage, fmt::format("{} is not KEY=VALUE", quote(text)), hint);
    const std::string name = text.substr(0, equals);
    const Key<Record> *key = find_key<Record>(name);
    if (key == nullptr)
        throw Failure(FailureKind::kUsage, unknown_key<Record>(name), hint);
    try {
        return {key, value_from_text(type_of(*key), text.substr(equals + 1))};
    } catch (const WrongValue &wrong) {
        throw Failure(FailureKind::kUsage, fmt::format("{}: {}", name, wrong.what()), hint);
    }
}

} // namespace

template <class Record>
std::vector<std::string> key_names() {
    std::vector<std::string> names;
    for (const Key<Record> &key : keys_of<Record>())
        names.emplace_back(key.name);
    return names;
}

template <class Record>
std::vector<std::string> assignment_starts() {
    std::vector<std::string> starts;
    for (const Key<Record> &key : keys_of<Record>())
        if (!is_read_only(key))
            starts.push_back(std::string(key.name) + '=');
    return starts;
}

template <class Record>
const Key<Record> *find_key(std::string_view name) {
    const auto keys = keys_of<Record>();
    const auto found = std::find_if(keys.begin(), keys.end(),
                                    [&](const Key<Record> &key) { return key.name == name; });
    return found == keys.end() ? nullptr : &*found;
}

template <class Record>
std::string unknown_key(std::string_view name) {
    return fmt::format("there is no key {}{}", quote(name),
                       did_you_mean(name, key_names<Record>()));
}

template <class Record>
Value value_of(const Record &record, const Key<Record> &key) {
    return std::visit([&](auto member) { return read(record.*member); }, key.member);
}

template <class Record>
void store(Record &record, const Key<Record> &key, const Value &value) {
    std::visit([&](auto member) { write(record.*member, value); }, key.member);
}

template <class Record>
Fields fields_of(const Record &record, const std::vector<std::string> &names) {
    Fields fields;
    if (names.empty()) {
        for (const Key<Record> &key : keys_of<Record>())
            fields.push_back({key.name, value_of(record, key)});
    }
    for (const std::string &name : names)
        if (const Key<Record> *key = find_key<Record>(name))
            fields.push_back({key->name, value_of(record, *key)});
    return fields;
}

template <class Record>
Assignments<Record> parse_assignments(const std::vector<std::string> &texts, const char *hint) {
    Assignments<Record> assignments;
    for (const std::string &text : texts) {
        const auto next = parse_assignment<Record>(text, hint);
        const auto is_same = [&](const auto &each) { return each.key == next.key; };
        if (std::any_of(assignments.begin(), assignments.end(), is_same))
            throw Failure(FailureKind::kUsage, fmt::format("{} is given twice", next.key->name),
                          hint);
        assignments.push_back(next);
    }
    return assignments;
}

template <class Record>
Changes assign_all(Record &record, const Assignments<Record> &assignments) {
    Changes changes;
    for (const auto &[key, value] : assignments) {
        const Value before = value_of(record, *key);
        if (before == value)
            continue;
        store(record, *key, value);
        changes.push_back({key->name, before, value});
    }
    return changes;
}

template <class Record>
Changes differences(const Record &first, const Record &second) {
    Changes changes;
    for (const Key<Record> &key : keys_of<Record>()) {
        const Value one = value_of(first, key);
        const Value other = value_of(second, key);
        if (one != other)
            changes.push_back({key.name, one, other});
    }
    return changes;
}

template <class Record>
std::vector<std::string_view> fill_gaps(Record &record) {
    std::vector<std::string_view> completed;
    for (const Key<Record> &key : keys_of<Record>()) {
        if (has_type(value_of(record, key), type_of(key)))
            continue;
        store(record, key, empty_value(type_of(key)));
        completed.push_back(key.name);
    }
    return completed;
}

// The two kinds of records that there are.
template std::vector<std::string> key_names<SettingsRecord>();
template std::vector<std::string> key_names<ProfileRecord>();
template std::vector<std::string> assignment_starts<SettingsRecord>();
template std::vector<std::string> assignment_starts<ProfileRecord>();
template const Key<SettingsRecord> *find_key<SettingsRecord>(std::string_view);
template const Key<ProfileRecord> *find_key<ProfileRecord>(std::string_view);
template std::string unknown_key<SettingsRecord>(std::string_view);
template std::string unknown_key<ProfileRecord>(std::string_view);
template Value value_of(const SettingsRecord &, const Key<SettingsRecord> &);
template Value value_of(const ProfileRecord &, const Key<ProfileRecord> &);
template void store(SettingsRecord &, const Key<SettingsRecord> &, const Value &);
template void store(ProfileRecord &, const Key<ProfileRecord> &, const Value &);
template Fields fields_of(const SettingsRecord &, const std::vector<std::string> &);
template Fields fields_of(const ProfileRecord &, const std::vector<std::string> &);
template Assignments<SettingsRecord> parse_assignments(const std::vector<std::string> &,
                                                       const char *);
template Assignments<ProfileRecord> parse_assignments(const std::vector<std::string> &,
                                                      const char *);
template Changes assign_all(SettingsRecord &, const Assignments<SettingsRecord> &);
template Changes assign_all(ProfileRecord &, const Assignments<ProfileRecord> &);
template Changes differences(const SettingsRecord &, const SettingsRecord &);
template Changes differences(const ProfileRecord &, const ProfileRecord &);
template std::vector<std::string_view> fill_gaps(SettingsRecord &);
template std::vector<std::string_view> fill_gaps(ProfileRecord &);

} // namespace imsctl
