// SPDX-License-Identifier: Apache-2.0
#include "settings_completion.hpp"

#include "settings_record.hpp"

namespace imsctl {
namespace {

template <class Record>
std::vector<std::string> assignable_keys() {
    std::vector<std::string> starts;
    for (const Key<Record> &key : keys_of<Record>())
        if (!is_read_only(key))
            starts.push_back(std::string(key.name) + '=');
    return starts;
}

} // namespace

std::vector<std::string> key_completions(std::string_view group, std::string_view verb) {
    const bool assigns = verb == "set" || verb == "add";
    if (group == "settings" && (assigns || verb == "get"))
        return assigns ? assignable_keys<SettingsRecord>() : key_names<SettingsRecord>();
    if (group == "profile" && (assigns || verb == "show"))
        return assigns ? assignable_keys<ProfileRecord>() : key_names<ProfileRecord>();
    return {};
}

} // namespace imsctl
