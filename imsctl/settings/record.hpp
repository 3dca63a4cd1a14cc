// SPDX-License-Identifier: Apache-2.0
// Settings sets and profiles, key by key.
#pragma once

#include "imsctl/settings/values.hpp"

#include <memory>
#include <string>
#include <vector>

namespace imsctl {

struct RecordDeleter {
    void operator()(SettingsRecord *record) const {
        ims_global_settings_clear(record);
        delete record;
    }
    void operator()(ProfileRecord *record) const {
        ims_profile_clear(record);
        delete record;
    }
    void operator()(ims_profile_list_s *list) const {
        ims_profile_list_clear(list);
        delete list;
    }
};
template <class Record>
using RecordPtr = std::unique_ptr<Record, RecordDeleter>;

// All zero.
template <class Record>
RecordPtr<Record> new_record() {
    return RecordPtr<Record>(new Record());
}

template <class Record>
struct Assignment {
    const Key<Record> *key;
    Value value;
};
template <class Record>
using Assignments = std::vector<Assignment<Record>>;

template <class Record>
std::vector<std::string> key_names();

// "KEY=" for each key that can be written.
template <class Record>
std::vector<std::string> assignment_starts();

// nullptr for an unknown one.
template <class Record>
const Key<Record> *find_key(std::string_view name);

// `there is no key "x"; did you mean ...`
template <class Record>
std::string unknown_key(std::string_view name);

// monostate for what the service left out. A timer that spells no number is the text that came.
template <class Record>
Value value_of(const Record &record, const Key<Record> &key);

// The value has the key's type.
template <class Record>
void store(Record &record, const Key<Record> &key, const Value &value);

// Of the keys with these names, or of all keys.
template <class Record>
Fields fields_of(const Record &record, const std::vector<std::string> &names = {});

// "KEY=VALUE" texts. Throws a usage failure.
template <class Record>
Assignments<Record> parse_assignments(const std::vector<std::string> &texts, const char *hint);

// What became different by it.
template <class Record>
Changes assign_all(Record &record, const Assignments<Record> &assignments);

template <class Record>
Changes differences(const Record &first, const Record &second);

// Only whole records can be written: gives an empty value to each key without a proper one, and
// says which keys these are.
template <class Record>
std::vector<std::string_view> fill_gaps(Record &record);

} // namespace imsctl
