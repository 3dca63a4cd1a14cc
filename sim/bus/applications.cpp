// SPDX-License-Identifier: Apache-2.0
#include "sim/bus/applications.hpp"

#include <algorithm>

namespace sim {

int Applications::add(int slot, std::string_view connection, std::string_view name) {
    applications_.emplace(next_id_, Application{slot, std::string(connection), std::string(name)});
    return next_id_++;
}

bool Applications::known(int slot, int id) const {
    const auto found = applications_.find(id);
    return found != applications_.end() && found->second.slot == slot;
}

std::optional<int> Applications::latest(int slot, std::string_view connection) const {
    const auto found = std::find_if(applications_.rbegin(), applications_.rend(), [&](auto &entry) {
        return entry.second.slot == slot && entry.second.connection == connection;
    });
    return found == applications_.rend() ? std::nullopt : std::optional(found->first);
}

std::string_view Applications::name_of(std::string_view connection) const {
    const auto found = std::find_if(applications_.rbegin(), applications_.rend(), [&](auto &entry) {
        return entry.second.connection == connection;
    });
    return found == applications_.rend() ? std::string_view() : found->second.name;
}

std::size_t Applications::forget(std::string_view connection) {
    return std::erase_if(applications_,
                         [&](auto &entry) { return entry.second.connection == connection; });
}

} // namespace sim
