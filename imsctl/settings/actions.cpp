// SPDX-License-Identifier: Apache-2.0
#include "imsctl/settings/actions.hpp"

#include <fmt/format.h>
#include <fmt/ranges.h>
#include <nlohmann/json.hpp>

namespace imsctl {

Argument<bool> secrets_flag(Arguments &arguments) {
    return arguments.flag("--show-secrets", "show passwords in text, too");
}

template <class Record>
Action list_keys() {
    return [](Invocation &run) {
        Json array = Json::array();
        std::vector<std::string> lines;
        for (const Key<Record> &key : keys_of<Record>()) {
            const std::string_view type = to_string(type_of(key));
            const bool writable = !is_read_only(key);
            array.push_back({{"key", std::string(key.name)},
                             {"type", std::string(type)},
                             {"writable", writable}});
            lines.push_back(fmt::format("{} {}{}", key.name, type, writable ? "" : " read-only"));
        }
        run.output().result({{"keys", array}}, fmt::format("{}", fmt::join(lines, "\n")));
    };
}

RecordPtr<SettingsRecord> read_set(Client &client, const std::string &name) {
    auto record = new_record<SettingsRecord>();
    try {
        client.query([&](ims_h handle) {
            return ims_get_global_settings_info(handle, name.c_str(), record.get());
        });
    } catch (Failure &failure) {
        // The library does not tell a service that refuses from one that is silent.
        if (failure.kind == FailureKind::kUnreachable)
            failure.hint = fmt::format("is there a settings set called {}?", quote(name));
        throw;
    }
    // The set is addressed by its name when it is written.
    if (record->name == nullptr)
        store(*record, *find_key<SettingsRecord>("name"), name);
    return record;
}

template <class Record>
void refuse_fixed(const Assignments<Record> &assignments, std::span<const FixedKey> fixed,
                  const char *hint) {
    for (const Assignment<Record> &assignment : assignments)
        for (const FixedKey &key : fixed)
            if (assignment.key->name == key.name)
                throw Failure(FailureKind::kUsage,
                              fmt::format("{} cannot be set: {}", key.name, key.why), hint);
}

template <class Record>
void send_record(Invocation &run, Write<Record> write, Record &record) {
    const auto completed = fill_gaps(record);
    if (!completed.empty())
        run.output().note(fmt::format("the service gave no value for {}: written as empty or 0",
                                      fmt::join(completed, ", ")));
    run.client().request(with_record(write, record));
}

void note_not_written(const Invocation &run, const std::vector<std::string_view> &keys) {
    if (!keys.empty())
        run.output().note(fmt::format("not written, because the service takes no value: {}",
                                      fmt::join(keys, ", ")));
}

template <class Record>
Changes change_record(Invocation &run, Write<Record> update, Record &record,
                      const Assignments<Record> &assignments) {
    Changes changes = assign_all(record, assignments);
    if (!changes.empty())
        send_record(run, update, record);
    return changes;
}

void show_changes(Invocation &run, const Field &which, const Changes &changes, const Shown &shown) {
    Json object = Json::object();
    add_json(object, {which});
    object["changed"] = to_json(changes, "from", "to");
    run.output().result(object,
                        changes.empty() ? "nothing to change" : shown.changes(changes, "->"));
}

template Action list_keys<SettingsRecord>();
template Action list_keys<ProfileRecord>();
template void refuse_fixed(const Assignments<SettingsRecord> &, std::span<const FixedKey>,
                           const char *);
template void refuse_fixed(const Assignments<ProfileRecord> &, std::span<const FixedKey>,
                           const char *);
template void send_record(Invocation &, Write<SettingsRecord>, SettingsRecord &);
template void send_record(Invocation &, Write<ProfileRecord>, ProfileRecord &);
template Changes change_record(Invocation &, Write<SettingsRecord>, SettingsRecord &,
                               const Assignments<SettingsRecord> &);
template Changes change_record(Invocation &, Write<ProfileRecord>, ProfileRecord &,
                               const Assignments<ProfileRecord> &);

} // namespace imsctl
