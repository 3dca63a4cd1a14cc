// SPDX-License-Identifier: Apache-2.0
// Every event that imsctl knows: its name, its id and the fields of its record.
#pragma once

#include "imsctl/output/fields.hpp"

#include <span>
#include <string_view>

namespace imsctl {

struct FieldRow {
    std::string_view name;
    // Reads one member. A text that the application has to release is released by this.
    Value (*take)(void *record);
};

struct EventRow {
    int id;
    std::string_view name;
    std::string_view module;
    std::span<const FieldRow> fields;
    // What the fields come to, for people; most speak for themselves.
    std::string (*summary)(const Fields &) = nullptr;
};

// One table a file, NAME_events.cpp, in the order of the ids. A new module takes such a file (made
// of event_fields.hpp), a line here and one in all_events().
std::span<const EventRow> registration_events();
std::span<const EventRow> call_events();
std::span<const EventRow> sms_events();
std::span<const EventRow> poc_events();
std::span<const EventRow> login_events();

std::span<const EventRow> all_events();

// nullptr when there is none.
const EventRow *find_event(std::string_view name);
const EventRow *find_event(int id);

std::vector<std::string> event_names();
std::vector<std::string> event_modules();

// To be called once for a record: takes over and releases the texts in it.
Fields take_fields(const EventRow &row, void *record);

} // namespace imsctl
