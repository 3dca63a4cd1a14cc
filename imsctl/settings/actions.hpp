// SPDX-License-Identifier: Apache-2.0
// What the verbs about settings sets and those about profiles share.
#pragma once

#include "imsctl/line/requests.hpp"
#include "imsctl/settings/record.hpp"

#include <span>

namespace imsctl {

template <class Record>
using Write = int (*)(ims_h, const Record *, ims_response_cb, void *);

Argument<bool> secrets_flag(Arguments &arguments);

// Shows all keys that a record has.
template <class Record>
Action list_keys();

RecordPtr<SettingsRecord> read_set(Client &client, const std::string &name);

// A key that an assignment cannot be about.
struct FixedKey {
    std::string_view name;
    std::string_view why;
};

// Throws a usage failure.
template <class Record>
void refuse_fixed(const Assignments<Record> &assignments, std::span<const FixedKey> fixed,
                  const char *hint);

// Sends a whole record. Says so when it was not whole.
template <class Record>
void send_record(Invocation &run, Write<Record> write, Record &record);

// Says which read-only keys do not get the values that they should have.
void note_not_written(const Invocation &run, const std::vector<std::string_view> &keys);

// Sends the record with the assignments carried out, unless nothing is different then.
template <class Record>
Changes change_record(Invocation &run, Write<Record> update, Record &record,
                      const Assignments<Record> &assignments);

// Changes as the result of a verb about `which` record.
void show_changes(Invocation &run, const Field &which, const Changes &changes, const Shown &shown);

} // namespace imsctl
