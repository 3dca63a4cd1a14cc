// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/foreign_value.hpp"

#include <cstdint>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

namespace sim {

struct GroupEntry;
// Entries in the order in which they came; a key may come twice.
using GroupDictionary = std::vector<GroupEntry>;
using GroupDictionaries = std::vector<GroupDictionary>;

// What a key of a document holds, wherever it came from.
struct GroupValue {
    std::variant<std::int64_t, bool, std::string, GroupDictionary, GroupDictionaries, ForeignValue>
        content;
};

struct GroupEntry {
    std::string key;
    GroupValue value;
};

// A document has the keys in which it is written, and others for some in which it is read.
enum class GroupForm { kWritten, kRead };

// The name of one place in both forms.
struct GroupKey {
    constexpr GroupKey(const char *both) : written(both), read(both) {}
    constexpr GroupKey(const char *when_written, const char *when_read)
        : written(when_written), read(when_read) {}

    constexpr std::string_view in(GroupForm form) const {
        return form == GroupForm::kWritten ? written : read;
    }

    std::string_view written;
    std::string_view read;
};

} // namespace sim
