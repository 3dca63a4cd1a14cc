// SPDX-License-Identifier: Apache-2.0
// The call module's requests and its query, one row each.
#pragma once

#include "tests/support/request_row.hpp"

#include <vector>

namespace test {

std::vector<RequestRow> call_request_rows();
std::vector<QueryRow> call_query_rows();

} // namespace test
