// SPDX-License-Identifier: Apache-2.0
// The video telephony requests, one row each.
#pragma once

#include "tests/support/request_row.hpp"

#include <vector>

namespace test {

std::vector<RequestRow> vt_request_rows();

} // namespace test
