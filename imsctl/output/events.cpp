// SPDX-License-Identifier: Apache-2.0
#include "imsctl/output/events.hpp"

#include <algorithm>

namespace imsctl {
namespace {

// In the order of their ids.
std::vector<EventRow> join_tables() {
    std::vector<EventRow> events;
    for (const auto table :
         {registration_events(), call_events(), sms_events(), poc_events(), login_events()})
        events.insert(events.end(), table.begin(), table.end());
    return events;
}

template <class Test>
const EventRow *find_if(Test test) {
    const auto events = all_events();
    const auto row = std::find_if(events.begin(), events.end(), test);
    return row == events.end() ? nullptr : &*row;
}

} // namespace

std::span<const EventRow> all_events() {
    static const std::vector<EventRow> events = join_tables();
    return events;
}

const EventRow *find_event(std::string_view name) {
    return find_if([&](const EventRow &event) { return event.name == name; });
}

const EventRow *find_event(int id) {
    return find_if([&](const EventRow &event) { return event.id == id; });
}

std::vector<std::string> event_names() {
    std::vector<std::string> names;
    for (const EventRow &event : all_events())
        names.emplace_back(event.name);
    return names;
}

std::vector<std::string> event_modules() {
    std::vector<std::string> modules;
    for (const EventRow &event : all_events())
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
