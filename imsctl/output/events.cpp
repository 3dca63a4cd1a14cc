// SPDX-License-Identifier: Apache-2.0
#include "imsctl/output/events.hpp"

#include <algorithm>

namespace imsctl {

const EventRow *find_event(std::span<const EventRow> events, int id) {
    const auto row = std::find_if(events.begin(), events.end(),
                                  [&](const EventRow &event) { return event.id == id; });
    return row == events.end() ? nullptr : &*row;
}

std::vector<std::string> event_names(std::span<const EventRow> events) {
    std::vector<std::string> names;
    for (const EventRow &event : events)
        names.emplace_back(event.name);
    return names;
}

std::vector<std::string> event_modules(std::span<const EventRow> events) {
    std::vector<std::string> modules;
    for (const EventRow &event : events)
        if (modules.empty() || modules.back() != event.module)
            modules.emplace_back(event.module);
    return modules;
}

Fields take_fields(const EventRow &row, void *record) {
    Fields fields;
    for (const FieldRow &field : row.fields)
        fields.push_back({field.name, field.take(record)});
    return fields;
}

} // namespace imsctl
