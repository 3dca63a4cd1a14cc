// SPDX-License-Identifier: Apache-2.0
// One row for each signal: what the service sends and what the application gets. The same checks
// run over every row of every module.
#pragma once

#include <ostream>
#include <set>
#include <span>
#include <vector>

namespace test {

struct EventRow {
    const char *name = nullptr;
    int id = 0;
    const char *member = nullptr;
    const char *type = nullptr;
    const char *value = nullptr;
    // Looks at the record and releases what the application takes over.
    void (*check)(const void *event) = nullptr;
};

struct EventModule {
    const char *unit = nullptr;      // "ims_call.cpp"
    const char *interface = nullptr; // "org.kelvo.ims.Call"
    const char *decoder = nullptr;   // "on_call_signal_emit_handler"
};

struct ModuleEvent {
    EventModule module;
    EventRow row;
};

inline void PrintTo(const ModuleEvent &event, std::ostream *out) {
    *out << event.row.name;
}

inline std::vector<ModuleEvent> events_of(const EventModule &module,
                                          std::span<const EventRow> rows) {
    std::vector<ModuleEvent> events;
    for (const EventRow &row : rows)
        events.push_back({module, row});
    return events;
}

inline std::set<int> ids_of(std::span<const EventRow> rows) {
    std::set<int> ids;
    for (const EventRow &row : rows)
        ids.insert(row.id);
    return ids;
}

template <typename Record>
const Record &as(const void *event) {
    return *static_cast<const Record *>(event);
}

} // namespace test
