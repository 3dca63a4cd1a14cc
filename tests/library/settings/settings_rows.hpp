// SPDX-License-Identifier: Apache-2.0
// The settings module's requests and its queries, one row each. The network environment is not
// among the queries: no result fails it.
#pragma once

#include "tests/support/request_row.hpp"

#include <vector>

namespace test {

std::vector<RequestRow> settings_request_rows();
std::vector<QueryRow> settings_query_rows();

} // namespace test
