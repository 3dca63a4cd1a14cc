// SPDX-License-Identifier: Apache-2.0
// What is known of an event: its name, its id and the fields of its record.
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

// nullptr when there is none.
const EventRow *find_event(std::span<const EventRow> events, int id);

std::vector<std::string> event_names(std::span<const EventRow> events);
std::vector<std::string> event_modules(std::span<const EventRow> events);

// To be called once for a record: takes over and releases the texts in it.
Fields take_fields(const EventRow &row, void *record);

} // namespace imsctl
