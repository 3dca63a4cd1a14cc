// SPDX-License-Identifier: Apache-2.0
#include "imsctl/line/modules.hpp"

#include <algorithm>

namespace imsctl {

Catalogue::Catalogue(std::span<const Module> modules) {
    for (const Module &module : modules) {
        groups_.insert(groups_.end(), module.groups.begin(), module.groups.end());
        for (const auto table : module.verbs)
            verbs_.insert(verbs_.end(), table.begin(), table.end());
        for (const auto table : module.events)
            events_.insert(events_.end(), table.begin(), table.end());
    }
    std::sort(events_.begin(), events_.end(),
              [](const EventRow &a, const EventRow &b) { return a.id < b.id; });
}

std::string_view Catalogue::group_summary(std::string_view path) const {
    const auto row = std::find_if(groups_.begin(), groups_.end(),
                                  [&](const VerbGroup &group) { return group.path == path; });
    return row == groups_.end() ? "" : row->summary;
}

} // namespace imsctl
