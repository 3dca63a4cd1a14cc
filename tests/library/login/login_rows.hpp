// SPDX-License-Identifier: Apache-2.0
// The login module's requests and its query, one row each.
#pragma once

#include "tests/support/request_row.hpp"

#include <vector>

namespace test {

std::vector<RequestRow> login_request_rows();
std::vector<QueryRow> login_query_rows();

} // namespace test
