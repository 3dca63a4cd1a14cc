// SPDX-License-Identifier: Apache-2.0
// The registration module's requests and its query, one row each.
#pragma once

#include "tests/support/request_row.hpp"

#include <vector>

namespace test {

std::vector<RequestRow> reg_request_rows();
std::vector<QueryRow> reg_query_rows();

} // namespace test
