// SPDX-License-Identifier: Apache-2.0
// The rows of all modules in one table. A new module is a line here and its files in
// CMakeLists.txt.
#pragma once

#include "tests/support/event_row.hpp"
#include "tests/support/request_row.hpp"

#include <set>
#include <string>
#include <vector>

namespace test {

struct ModuleRows {
    std::vector<RequestRow> requests;
    std::vector<QueryRow> queries;
    std::vector<ModuleEvent> events;
};

std::vector<ModuleRows> all_modules();

} // namespace test
