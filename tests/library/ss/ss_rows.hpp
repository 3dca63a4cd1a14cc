// SPDX-License-Identifier: Apache-2.0
// The supplementary services' requests, one row each.
#pragma once

#include "tests/support/request_row.hpp"

#include <vector>

namespace test {

std::vector<RequestRow> ss_request_rows();

} // namespace test
