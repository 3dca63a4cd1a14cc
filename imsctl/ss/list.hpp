// SPDX-License-Identifier: Apache-2.0
// What the get requests of the supplementary services bring: lists of entries.
#pragma once

#include "imsctl/line/requests.hpp"

#include <vector>

namespace imsctl {

struct StatusColumn {
    std::string_view title; // none for a field that people need not see
    NamedValues names;      // of the values; none for texts and plain numbers
};

struct StatusList {
    // One for each field of an entry.
    std::span<const StatusColumn> columns;
    std::vector<Fields> (*entries)(const ims_ss_status_list_s &);
};

extern const StatusList kWaitingList;
extern const StatusList kForwardingList;
extern const StatusList kBarringList;

// Makes the request and shows the list that comes back.
void show_list(Invocation &run, const Start &start, const StatusList &list);

// A table for people.
std::string status_table(const StatusList &list, const std::vector<Fields> &entries);

} // namespace imsctl
